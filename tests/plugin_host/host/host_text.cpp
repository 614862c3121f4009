#include "host_text.h"

#include "test_host.h"

namespace testhost {

namespace {
// Windows Latin-1 differs from ISO Latin-1 in 0x80-0x9F; the common ones are enough here.
char32_t windows1252(unsigned char c) {
    switch (c) {
        case 0x80: return 0x20AC;
        case 0x85: return 0x2026;
        case 0x91: return 0x2018;
        case 0x92: return 0x2019;
        case 0x93: return 0x201C;
        case 0x94: return 0x201D;
        case 0x96: return 0x2013;
        case 0x97: return 0x2014;
        default: return c;
    }
}

void putUtf8(std::string& out, char32_t c) {
    if (c < 0x80) {
        out += static_cast<char>(c);
    } else if (c < 0x800) {
        out += static_cast<char>(0xC0 | (c >> 6));
        out += static_cast<char>(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
        out += static_cast<char>(0xE0 | (c >> 12));
        out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (c & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | (c >> 18));
        out += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
        out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (c & 0x3F));
    }
}
}  // namespace

bool decodeText(const std::string& bytes, uint32_t encoding, std::vector<char32_t>& out) {
    out.clear();
    const auto* b = reinterpret_cast<const unsigned char*>(bytes.data());
    size_t n = bytes.size();
    switch (encoding) {
        case kUtf8:
            for (size_t i = 0; i < n;) {
                unsigned char c = b[i];
                int extra = c < 0x80 ? 0 : (c >> 5) == 6 ? 1 : (c >> 4) == 14 ? 2 : (c >> 3) == 30 ? 3 : -1;
                if (extra < 0 || i + extra >= n + (extra == 0 ? 1 : 0)) return false;
                char32_t cp = extra == 0 ? c : c & (0x3F >> extra);
                for (int k = 1; k <= extra; ++k) {
                    if (i + k >= n || (b[i + k] & 0xC0) != 0x80) return false;
                    cp = (cp << 6) | (b[i + k] & 0x3F);
                }
                out.push_back(cp);
                i += extra + 1;
            }
            return true;
        case kUtf16:
            for (size_t i = 0; i + 1 < n; i += 2) {
                char32_t u = b[i] | (b[i + 1] << 8);
                if (u >= 0xD800 && u <= 0xDBFF && i + 3 < n) {
                    char32_t low = b[i + 2] | (b[i + 3] << 8);
                    u = 0x10000 + ((u - 0xD800) << 10) + (low - 0xDC00);
                    i += 2;
                }
                out.push_back(u);
            }
            return true;
        case kUtf32:
            for (size_t i = 0; i + 3 < n; i += 4)
                out.push_back(b[i] | (b[i + 1] << 8) | (b[i + 2] << 16) | (static_cast<char32_t>(b[i + 3]) << 24));
            return true;
        case kAscii:
        case kMacRoman:
            for (size_t i = 0; i < n; ++i) out.push_back(b[i] < 0x80 ? b[i] : U'?');
            return true;
        case kLatin1Iso:
            for (size_t i = 0; i < n; ++i) out.push_back(b[i]);
            return true;
        case kLatin1Windows:
            for (size_t i = 0; i < n; ++i) out.push_back(windows1252(b[i]));
            return true;
        default:
            return false;  // text without a known encoding cannot be converted
    }
}

std::string encodeText(const std::vector<char32_t>& cps, uint32_t encoding) {
    std::string out;
    switch (encoding) {
        case kUtf8:
            for (char32_t c : cps) putUtf8(out, c);
            break;
        case kUtf16:
            for (char32_t c : cps) {
                auto unit = [&](char32_t u) {
                    out += static_cast<char>(u & 0xFF);
                    out += static_cast<char>(u >> 8);
                };
                if (c >= 0x10000) {
                    unit(0xD800 + ((c - 0x10000) >> 10));
                    unit(0xDC00 + ((c - 0x10000) & 0x3FF));
                } else {
                    unit(c);
                }
            }
            break;
        case kUtf32:
            for (char32_t c : cps)
                for (int k = 0; k < 4; ++k) out += static_cast<char>((c >> (8 * k)) & 0xFF);
            break;
        default:
            for (char32_t c : cps) out += static_cast<char>(c < (encoding == kAscii || encoding == kMacRoman ? 0x80u : 0x100u) ? c : '?');
    }
    return out;
}

}  // namespace testhost
