// MoveRect: dst(x, y) = src(x, y), each image with its own row stride.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

class MoveRect : public Generator<MoveRect> {
public:
    Input<Buffer<uint8_t>> src{"src", 2};
    Output<Buffer<uint8_t>> dst{"dst", 2};

    void generate() {
        Var x("x"), y("y");
        dst(x, y) = src(x, y);

        halideqk::schedule_rows(dst, x, y, dst.dim(0).extent(), dst.dim(1).extent(),
                                halideqk::vector_lanes(get_target(), UInt(8)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(MoveRect, MoveRect)
