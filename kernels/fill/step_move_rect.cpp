// StepMoveRect, StepMoveRectDeep, StepMoveRectFloat: dst(x, y) = src(x, y)
// where sample (x, y) of an image lies at base + y * rowStride + x * step,
// all counted in elements.  Packed rows (both steps 1) get dense vector
// loads and stores; other steps gather and scatter.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

template <typename T>
class StepMove : public Generator<StepMove<T>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(StepMove<T>);

    Input<Buffer<T>> src{"src", 2};
    Input<int32_t> srcStep{"srcStep"};
    Input<int32_t> dstStep{"dstStep"};
    Output<Buffer<T>> dst{"dst", 2};

    void generate() {
        Var x("x"), y("y");
        dst(x, y) = src(x, y);

        // The column strides are the steps, not 1.
        src.dim(0).set_stride(srcStep);
        dst.dim(0).set_stride(dstStep);

        const int lanes = halideqk::vector_lanes(this->get_target(), type_of<T>());
        Expr columns = dst.dim(0).extent(), rows = dst.dim(1).extent();
        Var yo("yo"), yi("yi");
        Expr packed = srcStep == 1 && dstStep == 1;
        Expr large = rows >= halideqk::kMinParallelExtent && columns >= halideqk::kMinParallelExtent;
        dst.specialize(packed && large)
            .split(y, yo, yi, halideqk::kStripRows, TailStrategy::GuardWithIf)
            .parallel(yo)
            .vectorize(x, lanes, TailStrategy::GuardWithIf);
        dst.specialize(packed).vectorize(x, lanes, TailStrategy::GuardWithIf);
        dst.specialize(large)
            .split(y, yo, yi, halideqk::kStripRows, TailStrategy::GuardWithIf)
            .parallel(yo)
            .vectorize(x, lanes, TailStrategy::GuardWithIf);
        dst.vectorize(x, lanes, TailStrategy::GuardWithIf);
    }
};

using StepMoveRect = StepMove<uint8_t>;
using StepMoveRectDeep = StepMove<uint16_t>;
using StepMoveRectFloat = StepMove<float>;

}  // namespace

HALIDE_REGISTER_GENERATOR(StepMoveRect, StepMoveRect)
HALIDE_REGISTER_GENERATOR(StepMoveRectDeep, StepMoveRectDeep)
HALIDE_REGISTER_GENERATOR(StepMoveRectFloat, StepMoveRectFloat)
