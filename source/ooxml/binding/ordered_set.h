#pragma once
#include <cstddef>
#include <vector>

namespace quire::ooxml {

// Document order of a repeated choice: one slot number per child, so that children of
// several kinds are written back in the order they were read.
using c_order = std::vector<unsigned short>;

// Position in `order` of occurrence `occurrence` of `slot`, or order.size().
inline std::size_t order_position(const c_order& order, unsigned short slot, std::size_t occurrence) {
    std::size_t seen = 0;
    for (std::size_t i = 0; i < order.size(); ++i) {
        if (order[i] == slot && seen++ == occurrence) return i;
    }
    return order.size();
}

// A child inserted as occurrence `occurrence` of its slot goes where that occurrence was,
// or after the last child of its slot, or at the end.
inline void order_insert(c_order& order, unsigned short slot, std::size_t occurrence) {
    std::size_t at = order_position(order, slot, occurrence);
    if (at == order.size()) {
        for (std::size_t i = order.size(); i > 0; --i) {
            if (order[i - 1] == slot) {
                at = i;
                break;
            }
        }
    }
    order.insert(order.begin() + static_cast<std::ptrdiff_t>(at), slot);
}

inline void order_erase(c_order& order, unsigned short slot, std::size_t occurrence) {
    const std::size_t at = order_position(order, slot, occurrence);
    if (at < order.size()) order.erase(order.begin() + static_cast<std::ptrdiff_t>(at));
}

inline void order_clear(c_order& order, unsigned short slot) {
    std::size_t kept = 0;
    for (unsigned short s : order) {
        if (s != slot) order[kept++] = s;
    }
    order.resize(kept);
}

}  // namespace quire::ooxml
