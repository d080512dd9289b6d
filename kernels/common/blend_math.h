// The rounded arithmetic every blend kernel shares, as Halide expressions.
// 8-bit helpers keep every intermediate in 16-bit lanes; Deep helpers in
// 32-bit lanes.  All results are exact: they equal the rounded rational
// values, with no dependence on vector width or position.
#pragma once

#include "Halide.h"

namespace halideqk {

using Halide::Expr;

// a * b / 255 rounded to nearest, for a, b in 0..255.
inline Expr mul255(Expr a, Expr b) {
    using Halide::cast;
    Expr t = cast<uint16_t>(a) * cast<uint16_t>(b) + cast<uint16_t>(128);
    return cast<uint8_t>((t + (t >> 8)) >> 8);
}

// a + b - a * b / 255.
inline Expr screen255(Expr a, Expr b) {
    using Halide::cast;
    return cast<uint8_t>(cast<uint8_t>(a) + cast<uint8_t>(b) - mul255(a, b));
}

// d + (b - d) * w / 255 rounded to nearest: the magnitude is rounded and the
// sign put back, so the result always lies between d and b.
inline Expr interp255(Expr d, Expr b, Expr w) {
    using Halide::cast;
    using Halide::select;
    d = cast<uint8_t>(d);
    b = cast<uint8_t>(b);
    return select(b > d, cast<uint8_t>(d + mul255(b - d, w)), cast<uint8_t>(d - mul255(d - b, w)));
}

// (255 * n + q / 2) / q, for n in 0..255 and q in 1..255.
inline Expr rdiv255(Expr n, Expr q) {
    using Halide::cast;
    Expr q16 = cast<uint16_t>(q);
    return cast<uint8_t>((cast<uint16_t>(n) * cast<uint16_t>(255) + q16 / 2) / q16);
}

// Deep: (a * b + 16384) >> 15.
inline Expr mul32768(Expr a, Expr b) {
    using Halide::cast;
    return (cast<uint32_t>(a) * cast<uint32_t>(b) + cast<uint32_t>(16384)) >> 15;
}

// Deep mix of b into d under m in 0..32768, one rounding.
inline Expr deep_mix(Expr d, Expr b, Expr m) {
    using Halide::cast;
    Expr m32 = cast<uint32_t>(m);
    return cast<uint16_t>(((cast<uint32_t>(32768) - m32) * cast<uint32_t>(d) + cast<uint32_t>(b) * m32 +
                           cast<uint32_t>(16384)) >>
                          15);
}

// Float mix: (b - d) * m + d, unclamped.
inline Expr float_mix(Expr d, Expr b, Expr m) { return (b - d) * m + d; }

}  // namespace halideqk
