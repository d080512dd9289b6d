// Conversions to 8 bits with optional ordered dither, n(x, y) the noise:
//   Gray16toGray8  out = low 8 bits of (v * 255 + n) >> 15, in 32-bit integers
//   RGB48toRGB24   the same on three planes, one noise value per pixel
//   Gray32toGray8  out = trunc((clamp(v, 0, 1) * 8355840 + n) * 2^-15), in
//                  single precision without fused multiply-adds, so both
//                  routine sets agree with each other and with the host; a
//                  NaN sample converts as 0.
// Arguments: sources, "noisePtr" (the 8192-entry table), the dither flag, the
// noise phase, then the outputs.  The (first) source's extents choose the
// schedule: the noise is defined before the outputs, and the adapter gives
// every image of a call the same extents.
#include "kernels/common/dither_noise.h"
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

Expr DitherTo8(const Expr &v, const Expr &n) {
    return cast<uint8_t>((cast<int32_t>(v) * 255 + n) >> 15);
}

Expr FloatTo8(const Expr &v, const Expr &n) {
    Expr c = select(is_nan(v), 0.0f, clamp(v, 0.0f, 1.0f));
    Expr t = c * 8355840.0f + cast<float>(n);
    return cast<uint8_t>(cast<int32_t>(strict_float(t * (1.0f / 32768.0f))));
}

// One plane of samples of type T to 8 bits, each sample through Convert.
template <typename T, Expr (*Convert)(const Expr &, const Expr &)>
class PlaneTo8 : public Generator<PlaneTo8<T, Convert>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(PlaneTo8);

    Input<Buffer<T>> src{"src", 2};
    Input<Buffer<uint16_t>> noisePtr{"noisePtr", 1};
    Input<bool> dither{"dither"};
    Input<int32_t> phase{"phase"};
    Output<Buffer<uint8_t>> output{"output", 2};

    void generate() {
        Var x("x"), y("y");
        Expr columns = src.dim(0).extent(), rows = src.dim(1).extent();
        halideqk::DitherNoise noise(noisePtr, dither, phase, columns);
        output(x, y) = Convert(src(x, y), noise.at(x, y));
        noise.schedule(output, x, y, columns, rows, halideqk::vector_lanes(this->get_target(), UInt(8)));
    }
};

using Gray16toGray8 = PlaneTo8<uint16_t, DitherTo8>;
using Gray32toGray8 = PlaneTo8<float, FloatTo8>;

class RGB48toRGB24 : public Generator<RGB48toRGB24> {
public:
    Input<Buffer<uint16_t>> r{"rPtr", 2};
    Input<Buffer<uint16_t>> g{"gPtr", 2};
    Input<Buffer<uint16_t>> b{"bPtr", 2};
    Input<Buffer<uint16_t>> noisePtr{"noisePtr", 1};
    Input<bool> dither{"dither"};
    Input<int32_t> phase{"phase"};
    Output<Func> output{"output", {UInt(8), UInt(8), UInt(8)}, 2};

    void generate() {
        Var x("x"), y("y");
        Expr columns = r.dim(0).extent(), rows = r.dim(1).extent();
        halideqk::DitherNoise noise(noisePtr, dither, phase, columns);
        Func n("n");
        n(x, y) = noise.at(x, y);
        output(x, y) = {DitherTo8(r(x, y), n(x, y)), DitherTo8(g(x, y), n(x, y)),
                        DitherTo8(b(x, y), n(x, y))};
        noise.schedule(output, x, y, columns, rows, halideqk::vector_lanes(get_target(), UInt(8)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(Gray16toGray8, Gray16toGray8)
HALIDE_REGISTER_GENERATOR(RGB48toRGB24, RGB48toRGB24)
HALIDE_REGISTER_GENERATOR(Gray32toGray8, Gray32toGray8)
