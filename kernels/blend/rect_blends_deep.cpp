// 16-bit (0..32768) rectangle blends, mixed by the Deep mix under the mask.
#include "kernels/common/blend_math.h"
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;
using halideqk::deep_mix;
using halideqk::mul32768;

enum class Mode { Normal, Screen, Multiply };

template <Mode M>
class RectBlend16 : public Generator<RectBlend16<M>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(RectBlend16<M>);

    Input<Buffer<uint16_t>> src{"src", 2};
    Input<Buffer<uint16_t>> dst{"dst", 2};
    Input<Buffer<uint16_t>> mask{"mask", 2};
    Output<Buffer<uint16_t>> output{M == Mode::Normal   ? "BlendRectDeep_casted_output"
                                    : M == Mode::Screen ? "ScreenBlendDeep_casted_output"
                                                        : "MultiplyBlendDeep_casted_output",
                                    2};

    void generate() {
        Var x("x"), y("y");
        Expr s = cast<uint32_t>(src(x, y)), d = cast<uint32_t>(dst(x, y));
        Expr b = M == Mode::Normal ? s : M == Mode::Screen ? s + d - mul32768(s, d) : mul32768(s, d);
        output(x, y) = deep_mix(d, b, mask(x, y));

        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(this->get_target(), UInt(16)));
    }
};

using BlendRectDeep = RectBlend16<Mode::Normal>;
using ScreenBlendDeep = RectBlend16<Mode::Screen>;
using MultiplyBlendDeep = RectBlend16<Mode::Multiply>;

// Float: (s - d) * m + d, unclamped.  Kept strict so the AVX2 target does not
// fuse it into one multiply-add: where s and d nearly cancel, a fused result
// can differ from the rounded product-then-sum by many units in the last place.
class BlendRectFloat : public Generator<BlendRectFloat> {
public:
    Input<Buffer<float>> src{"src", 2};
    Input<Buffer<float>> dst{"dst", 2};
    Input<Buffer<float>> mask{"mask", 2};
    Output<Buffer<float>> output{"BlendRectFloat_casted_output", 2};

    void generate() {
        Var x("x"), y("y");
        output(x, y) = Halide::strict_float(halideqk::float_mix(dst(x, y), src(x, y), mask(x, y)));

        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(get_target(), Float(32)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(BlendRectDeep, BlendRectDeep)
HALIDE_REGISTER_GENERATOR(ScreenBlendDeep, ScreenBlendDeep)
HALIDE_REGISTER_GENERATOR(MultiplyBlendDeep, MultiplyBlendDeep)
HALIDE_REGISTER_GENERATOR(BlendRectFloat, BlendRectFloat)
