// Interleave4to4: four 8-bit planes into one 32-bit pixel,
//   out = s1 + 256 s2 + 65536 s3 + 16777216 s4,
// so the pixel's bytes in memory are s1, s2, s3, s4.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

class Interleave4to4 : public Generator<Interleave4to4> {
public:
    Input<Buffer<uint8_t>> s1{"sPtr1", 2};
    Input<Buffer<uint8_t>> s2{"sPtr2", 2};
    Input<Buffer<uint8_t>> s3{"sPtr3", 2};
    Input<Buffer<uint8_t>> s4{"sPtr4", 2};
    Output<Buffer<uint32_t>> output{"output", 2};

    void generate() {
        Var x("x"), y("y");
        auto w = [&](const Input<Buffer<uint8_t>> &s, int shift) {
            return cast<uint32_t>(s(x, y)) << shift;
        };
        output(x, y) = w(s1, 0) | w(s2, 8) | w(s3, 16) | w(s4, 24);
        halideqk::schedule_rows(output, x, y, output.dim(0).extent(), output.dim(1).extent(),
                                halideqk::vector_lanes(get_target(), UInt(8)));
    }
};

}  // namespace

HALIDE_REGISTER_GENERATOR(Interleave4to4, Interleave4to4)
