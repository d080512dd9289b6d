// The mask value that applies an effect fully, per sample depth.
#pragma once

#include "adapters/signatures.h"

namespace halideqk {
template <typename T>
inline constexpr T kOpaqueMask = T();
template <>
inline constexpr u8 kOpaqueMask<u8> = 255;
template <>
inline constexpr u16 kOpaqueMask<u16> = 32768;
template <>
inline constexpr float kOpaqueMask<float> = 1.0f;
}  // namespace halideqk
