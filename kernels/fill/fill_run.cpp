// SetBytes, SetShorts, Set32Bit: dst[i] = value over a one-dimensional run.
#include "kernels/common/schedule.h"

namespace {

using namespace Halide;

template <typename T>
class FillRun : public Generator<FillRun<T>> {
public:
    HALIDEQK_TEMPLATE_GENERATOR(FillRun<T>);

    Input<T> value{"value"};
    Output<Buffer<T>> dst{"dst", 1};

    void generate() {
        Var x("x");
        dst(x) = value;

        halideqk::schedule_run(dst, x, halideqk::vector_lanes(this->get_target(), type_of<T>()));
    }
};

using SetBytes = FillRun<uint8_t>;
using SetShorts = FillRun<uint16_t>;
using Set32Bit = FillRun<uint32_t>;

}  // namespace

HALIDE_REGISTER_GENERATOR(SetBytes, SetBytes)
HALIDE_REGISTER_GENERATOR(SetShorts, SetShorts)
HALIDE_REGISTER_GENERATOR(Set32Bit, Set32Bit)
