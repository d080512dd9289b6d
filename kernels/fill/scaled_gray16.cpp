// ScaledGray16toGray16, in place: a 16-bit sample v on the scale 0..sourceMax
// moves to the scale 0..targetMax:
//   v > sourceMax:  targetMax
//   otherwise:      (v * targetMax + sourceMax / 2) / sourceMax, truncated
// Results keep their low 16 bits.  The caller guarantees sourceMax >= 1.
//
// When 0 <= targetMax and sourceMax * targetMax <= 2^40 (every scale the
// program uses, and more), the quotient comes from double precision:
//   q = trunc(v * (targetMax / sourceMax) + (sourceMax / 2 + 1/2) / sourceMax).
// The true quotient is k + r / sourceMax with 0 <= r < sourceMax; the extra
// 1 / (2 sourceMax) keeps the sum at least that far from any integer, and the
// rounding error of the double arithmetic (about q * 2^-51) is far smaller,
// so the truncation is exact.  Other arguments take an exact 64-bit path.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

class ScaledGray16toGray16 : public Generator<ScaledGray16toGray16> {
public:
    Input<Buffer<uint16_t>> src{"src", 2};
    Input<int32_t> sourceMax{"sourceMax"};
    Input<int32_t> targetMax{"targetMax"};
    Output<Buffer<uint16_t>> output{"output", 2};

    void generate() {
        Var x("x"), y("y");
        // A sample above sourceMax is taken as sourceMax, so no lane of either
        // path can overflow.  With targetMax >= 0 that sample's quotient is
        // exactly targetMax (sourceMax / 2 < sourceMax), so the fast path
        // needs no select; the exact path selects targetMax itself.
        Expr limit = cast<uint16_t>(clamp(sourceMax, 0, 65535));
        Expr vv = cast<int32_t>(min(src(x, y), limit));
        Expr half = sourceMax / 2;  // sourceMax >= 1, so floor and truncation agree

        // Fast path: double precision, two operations per sample.
        Expr slope = cast<double>(targetMax) / cast<double>(sourceMax);
        Expr offset = (cast<double>(half) + Expr(0.5)) / cast<double>(sourceMax);
        Expr quick = cast<int32_t>(cast<double>(vv) * slope + offset);

        // Exact path: 64-bit numerator, division truncated toward zero.
        Expr wide = cast<int64_t>(vv) * cast<int64_t>(targetMax) + cast<int64_t>(half);
        Expr d = cast<int64_t>(sourceMax);
        Expr exact = select(cast<int32_t>(src(x, y)) > sourceMax, targetMax,
                            cast<int32_t>(select(wide >= 0, wide / d, -((-wide) / d))));

        Expr fits = targetMax >= 0 &&
                    cast<int64_t>(sourceMax) * cast<int64_t>(targetMax) <= Expr(int64_t(1) << 40);
        Expr scaled = select(fits, quick, exact);
        // Keep the low 16 bits explicitly: a float-to-integer conversion is
        // undefined out of its type's range, so the quotient must not be
        // narrowed straight to 16 bits.
        output(x, y) = cast<uint16_t>(scaled & 0xFFFF);

        const int lanes = halideqk::vector_lanes(get_target(), UInt(8));
        Expr columns = output.dim(0).extent(), rows = output.dim(1).extent();
        halideqk::schedule_rows(output.specialize(fits), x, y, columns, rows, lanes);
        halideqk::schedule_rows(output, x, y, columns, rows, lanes);
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(ScaledGray16toGray16, ScaledGray16toGray16)
