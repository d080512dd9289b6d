#include <cmath>

#include "host/reference/blend_math.h"

namespace host_ref {

namespace {

// burn: d(255 - d)/255 rounded; dodge: 255 (D(x) - x) rounded half up with
// D(x) = ((16x - 12)x + 4)x up to x = 1/4 and sqrt(x) above.
struct Tables {
    uint8_t dodge[256], burn[256];
    Tables() {
        for (int d = 0; d < 256; ++d) {
            burn[d] = uint8_t(std::lround(d * (255.0 - d) / 255.0));
            const double x = d / 255.0;
            const double D = x <= 0.25 ? ((16 * x - 12) * x + 4) * x : std::sqrt(x);
            dodge[d] = uint8_t(std::floor(255.0 * (D - x) + 0.5));
        }
    }
};

const Tables &Get() {
    static const Tables tables;
    return tables;
}

}  // namespace

const uint8_t *DodgeDelta() { return Get().dodge; }
const uint8_t *BurnDelta() { return Get().burn; }

}  // namespace host_ref
