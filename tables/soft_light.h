// The soft-light delta tables, indexed by the destination value d:
//   burnDelta[d]  = d * (255 - d) / 255, rounded to nearest
//   dodgeDelta[d] = 255 * (D(d / 255) - d / 255), rounded half up, where
//                   D(x) = ((16x - 12)x + 4)x for x <= 1/4, sqrt(x) otherwise.
// Built once, on first use, and never changed.
#pragma once

#include <cstdint>

namespace halideqk {
const uint8_t *DodgeDelta();
const uint8_t *BurnDelta();
}  // namespace halideqk
