// 8-bit rectangle blends: a blend value B of source s and destination d,
// mixed into d under the mask m, written back in place.  Const pipelines
// read a zero-dimensional source, Solid ones a zero-dimensional mask.
#include "kernels/common/blend_math.h"
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;
using halideqk::interp255;
using halideqk::mul255;
using halideqk::screen255;

enum class Mode { Normal, Screen, Multiply, Darken, Lighten, HardLight, Overlay, Threshold, Reverse };

Expr Blended(Mode mode, Expr s, Expr d, Expr m) {
    switch (mode) {
        case Mode::Normal: return interp255(d, s, m);
        case Mode::Screen: return interp255(d, screen255(s, d), m);
        case Mode::Multiply: return interp255(d, mul255(s, d), m);
        case Mode::Darken: return interp255(d, min(s, d), m);
        case Mode::Lighten: return interp255(d, max(s, d), m);
        case Mode::HardLight: {
            // The screen branch doubles s modulo 256: s = 255 over d = 0 gives 254.
            Expr doubled = cast<uint8_t>(s * 2);
            return interp255(d, select(s < 128, mul255(doubled, d), screen255(doubled, d)), m);
        }
        case Mode::Overlay: {
            // The screen branch uses 2d - 255, so d = 255 stays 255.
            Expr b = select(d < 128, mul255(cast<uint8_t>(d * 2), s),
                            screen255(cast<uint8_t>(cast<uint16_t>(d) * 2 - 255), s));
            return interp255(d, b, m);
        }
        case Mode::Threshold: return select(m >= 128, s, d);
        case Mode::Reverse: {
            // The mask weights the destination: m = 0 gives s, m = 255 gives d.
            Expr up = cast<uint8_t>(s + mul255(d - s, m));
            Expr down = cast<uint8_t>(d + mul255(s - d, 255 - m));
            return select(m == 0, s, m == 255, d, d > s, up, s > d, down, d);
        }
    }
    return Expr();
}

template <typename Traits>
class RectBlend8 : public Generator<RectBlend8<Traits>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(RectBlend8<Traits>);

    Input<Buffer<uint8_t>> src{"src", Traits::kSrcDims};
    Input<Buffer<uint8_t>> dst{"dst", 2};
    Input<Buffer<uint8_t>> mask{"mask", Traits::kMaskDims};
    Output<Buffer<uint8_t>> output{Traits::kOutput, 2};

    void generate() {
        Var x("x"), y("y");
        Expr s = halideqk::at(src, Traits::kSrcDims, x, y);
        Expr m = halideqk::at(mask, Traits::kMaskDims, x, y);
        output(x, y) = Blended(Traits::kMode, s, dst(x, y), m);

        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(this->get_target(), UInt(8)));
    }
};

}  // namespace

#define QK_RECT_BLEND(Name, ModeName, SrcDims, MaskDims, OutputName)   \
    namespace {                                                        \
    struct Name##Traits {                                              \
        static constexpr Mode kMode = Mode::ModeName;                  \
        static constexpr int kSrcDims = SrcDims, kMaskDims = MaskDims; \
        static constexpr const char *kOutput = OutputName;             \
    };                                                                 \
    using Name = RectBlend8<Name##Traits>;                             \
    }                                                                  \
    HALIDE_REGISTER_GENERATOR(Name, Name)

QK_RECT_BLEND(BlendRect, Normal, 2, 2, "BlendRect_casted_output")
QK_RECT_BLEND(ScreenBlend, Screen, 2, 2, "ScreenBlend_casted_output")
QK_RECT_BLEND(ScreenBlendConst, Screen, 0, 2, "ScreenBlendConst_casted_output")
QK_RECT_BLEND(MultiplyBlend, Multiply, 2, 2, "MultiplyBlend_casted_output")
QK_RECT_BLEND(MultiplyBlendConst, Multiply, 0, 2, "MultiplyBlendConst_casted_output")
QK_RECT_BLEND(DarkenOnly, Darken, 2, 2, "DarkenOnly_casted_output")
QK_RECT_BLEND(DarkenOnlyConst, Darken, 0, 2, "DarkenOnlyConst_casted_output")
QK_RECT_BLEND(LightenOnly, Lighten, 2, 2, "LightenOnly_casted_output")
QK_RECT_BLEND(LightenOnlyConst, Lighten, 0, 2, "LightenOnlyConst_casted_output")
QK_RECT_BLEND(HardLightBlend, HardLight, 2, 2, "HardLightBlend_casted_output")
QK_RECT_BLEND(HardLightConst, HardLight, 0, 2, "HardLightConst_casted_output")
QK_RECT_BLEND(HardLightSolid, HardLight, 2, 0, "HardLightSolid_casted_output")
QK_RECT_BLEND(OverlayBlend, Overlay, 2, 2, "OverlayBlend_casted_output")
QK_RECT_BLEND(OverlayBlendConst, Overlay, 0, 2, "OverlayBlendConst_casted_output")
QK_RECT_BLEND(OverlayBlendSolid, Overlay, 2, 0, "OverlayBlendSolid_casted_output")
QK_RECT_BLEND(ThresholdBlend, Threshold, 2, 2, "ThresholdBlend_output")
QK_RECT_BLEND(ThresholdBlendConst, Threshold, 0, 2, "ThresholdBlend_output")
QK_RECT_BLEND(ReverseBlend, Reverse, 2, 2, "ReverseBlend_output")
