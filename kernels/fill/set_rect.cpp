// SetRect, SetRectDeep: every sample of a rectangle = value.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

template <typename T>
class FillRect : public Generator<FillRect<T>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(FillRect<T>);

    Input<T> value{"value"};
    Output<Buffer<T>> dst{"dst", 2};

    void generate() {
        Var x("x"), y("y");
        dst(x, y) = value;

        halideqk::schedule_rows(dst, x, y, dst.dim(0).extent(), dst.dim(1).extent(),
                                halideqk::vector_lanes(this->get_target(), type_of<T>()));
    }
};

using SetRect = FillRect<uint8_t>;
using SetRectDeep = FillRect<uint16_t>;

}  // namespace

HALIDE_REGISTER_GENERATOR(SetRect, SetRect)
HALIDE_REGISTER_GENERATOR(SetRectDeep, SetRectDeep)
