// Bounds that keep hostile archives from exhausting memory or time.
#pragma once

#include <cstdint>

namespace quire::zip {

// Deflate cannot expand data by more than 1032:1 (a 258-byte match in two
// bits); a declared size beyond that, plus a small allowance for tiny
// entries, cannot be the true size of a deflated entry.
constexpr std::uint64_t maxDeflateRatio = 1032;
constexpr std::uint64_t deflateRatioAllowance = 4096;

// Default ceiling for one entry extracted into memory.
constexpr std::uint64_t defaultMaxMemoryEntrySize = std::uint64_t(1) << 30;   // 1 GiB

// Transfer buffer between storage and codec.
constexpr std::size_t defaultTransferBufferSize = 0x10000;

} // namespace quire::zip
