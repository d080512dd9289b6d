// Gray8toGray16: out = (v * 32768 + 127) / 255, so 0 -> 0 and 255 -> 32768.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

class Gray8toGray16 : public Generator<Gray8toGray16> {
public:
    Input<Buffer<uint8_t>> src{"src", 2};
    Output<Buffer<uint16_t>> output{"output", 2};

    void generate() {
        Var x("x"), y("y");
        output(x, y) = cast<uint16_t>((cast<uint32_t>(src(x, y)) * 32768 + 127) / 255);
        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(get_target(), UInt(8)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(Gray8toGray16, Gray8toGray16)
