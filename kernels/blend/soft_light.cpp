// 8-bit soft light through the dodge and burn delta tables:
//   s >= 128: d + mul255(mul255(dodgeDelta[d], 2s - 256), m)
//   s <  128: d - mul255(mul255(burnDelta[d], 255 - 2s), m)
// The result stays in 0..255 because d + dodgeDelta[d] <= 255 and
// burnDelta[d] <= d.
#include "kernels/common/blend_math.h"
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;
using halideqk::mul255;

template <typename Traits>
class SoftLight8 : public Generator<SoftLight8<Traits>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(SoftLight8<Traits>);

    Input<Buffer<uint8_t>> src{"src", Traits::kSrcDims};
    Input<Buffer<uint8_t>> dst{"dst", 2};
    Input<Buffer<uint8_t>> mask{"mask", Traits::kMaskDims};
    Input<Buffer<uint8_t>> dodgeDelta{"dodgeDelta", 1};
    Input<Buffer<uint8_t>> burnDelta{"burnDelta", 1};
    Output<Buffer<uint8_t>> output{Traits::kOutput, 2};

    void generate() {
        Var x("x"), y("y");
        Expr s = halideqk::at(src, Traits::kSrcDims, x, y);
        Expr m = halideqk::at(mask, Traits::kMaskDims, x, y);
        Expr d = dst(x, y);
        if (Traits::kSrcDims == 0) {
            // One source value for the whole call: its 256 deltas are built
            // once, and each sample does a single lookup.
            Var i("i");
            Func delta("delta");
            delta(i) = select(s >= 128, mul255(dodgeDelta(i), cast<uint8_t>(s * 2)),
                              mul255(burnDelta(i), cast<uint8_t>(255 - s * 2)));
            Expr dd = delta(cast<int32_t>(d));
            output(x, y) = select(s >= 128, cast<uint8_t>(d + mul255(dd, m)),
                                  cast<uint8_t>(d - mul255(dd, m)));
            delta.compute_root().bound(i, 0, 256);
        } else {
            Expr dodge = mul255(dodgeDelta(cast<int32_t>(d)), cast<uint8_t>(s * 2));
            Expr burn = mul255(burnDelta(cast<int32_t>(d)), cast<uint8_t>(255 - s * 2));
            output(x, y) = select(s >= 128, cast<uint8_t>(d + mul255(dodge, m)),
                                  cast<uint8_t>(d - mul255(burn, m)));
        }
        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(this->get_target(), UInt(8)));
    }
};

}  // namespace

#define QK_SOFT_LIGHT(Name, SrcDims, MaskDims)                         \
    namespace {                                                        \
    struct Name##Traits {                                              \
        static constexpr int kSrcDims = SrcDims, kMaskDims = MaskDims; \
        static constexpr const char *kOutput = #Name "_casted_output"; \
    };                                                                 \
    using Name = SoftLight8<Name##Traits>;                             \
    }                                                                  \
    HALIDE_REGISTER_GENERATOR(Name, Name)

QK_SOFT_LIGHT(SoftLight, 2, 2)
QK_SOFT_LIGHT(SoftLightConst, 0, 2)
QK_SOFT_LIGHT(SoftLightSolid, 2, 0)
