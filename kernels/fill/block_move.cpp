// BlockMove: dst[i] = src[i] over a one-dimensional run of bytes.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

class BlockMove : public Generator<BlockMove> {
public:
    Input<Buffer<uint8_t>> src{"src", 1};
    Output<Buffer<uint8_t>> dst{"dst", 1};

    void generate() {
        Var x("x");
        dst(x) = src(x);

        halideqk::schedule_run(dst, x, halideqk::vector_lanes(get_target(), UInt(8)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(BlockMove, BlockMove)
