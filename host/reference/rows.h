// Row addressing of the host's images: a 16-bit or float image's row bytes
// count bytes, and rows step by that value shifted right by the element
// size's log2 (an arithmetic shift, so upward rows stay negative).
#pragma once

#include <cstdint>

namespace host_ref {

template <typename T>
T *Row(T *base, int y, int rowBytes) {
    constexpr int shift = sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : 2;
    return base + static_cast<intptr_t>(y) * (rowBytes >> shift);
}

}  // namespace host_ref
