#include "tables/soft_light.h"

#include <array>
#include <cmath>

namespace halideqk {

namespace {

struct SoftLightTables {
    std::array<uint8_t, 256> dodge{}, burn{};
    SoftLightTables() {
        for (int d = 0; d < 256; ++d) {
            burn[d] = static_cast<uint8_t>((d * (255 - d) + 127) / 255);
            const double x = d / 255.0;
            const double D = x <= 0.25 ? ((16 * x - 12) * x + 4) * x : std::sqrt(x);
            dodge[d] = static_cast<uint8_t>(std::floor(255.0 * (D - x) + 0.5));
        }
    }
};

const SoftLightTables &Tables() {
    static const SoftLightTables tables;
    return tables;
}

}  // namespace

const uint8_t *DodgeDelta() { return Tables().dodge.data(); }
const uint8_t *BurnDelta() { return Tables().burn.data(); }

}  // namespace halideqk
