// The shared rounded arithmetic, compiled for this machine with the same
// vector widths the pipelines use, against the plain rational formulas over
// the whole 8-bit domain and a dense sample of the 16-bit one.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <vector>

#include "Halide.h"
#include "kernels/common/blend_math.h"

namespace {

using Halide::Buffer;
using Halide::cast;
using Halide::Expr;
using Halide::Func;
using Halide::Var;

// a/b rounded to nearest with halves up, for a >= 0 and b > 0.
int64_t RoundDiv(int64_t a, int64_t b) { return (2 * a + b) / (2 * b); }

Var x("x"), y("y"), z("z");

// The routine sets' wider target, named rather than detected: the JIT's host
// detection can pick instructions this processor's virtual machine lacks.
const Halide::Target kTarget("x86-64-linux-avx-avx2-fma-f16c-sse41");

// Realizes a uint8 function of (x, y) over 256x256, vectorized.
Buffer<uint8_t> Table2(Expr e) {
    Func f;
    f(x, y) = cast<uint8_t>(e);
    f.vectorize(x, 32);
    return f.realize({256, 256}, kTarget);
}

TEST(Mul255, EqualsTheRoundedQuotientEverywhere) {
    Buffer<uint8_t> out = Table2(halideqk::mul255(cast<uint8_t>(x), cast<uint8_t>(y)));
    for (int a = 0; a < 256; ++a)
        for (int b = 0; b < 256; ++b) ASSERT_EQ(out(a, b), RoundDiv(a * b, 255)) << a << " " << b;
    EXPECT_EQ(out(255, 255), 255);
    EXPECT_EQ(out(1, 128), 1);
    EXPECT_EQ(out(1, 127), 0);
    EXPECT_EQ(out(128, 128), 64);
}

TEST(Screen255, IsTheComplementOfTheProductOfComplements) {
    Buffer<uint8_t> out = Table2(halideqk::screen255(cast<uint8_t>(x), cast<uint8_t>(y)));
    for (int a = 0; a < 256; ++a)
        for (int b = 0; b < 256; ++b) ASSERT_EQ(out(a, b), a + b - RoundDiv(a * b, 255)) << a << " " << b;
}

TEST(Interp255, IsTheRoundedMixForEveryDestinationBlendAndWeight) {
    Func f;
    f(x, y, z) = halideqk::interp255(cast<uint8_t>(x), cast<uint8_t>(y), cast<uint8_t>(z));
    f.vectorize(x, 32);
    Buffer<uint8_t> out = f.realize({256, 256, 256}, kTarget);
    for (int w = 0; w < 256; ++w)
        for (int b = 0; b < 256; ++b)
            for (int d = 0; d < 256; ++d) {
                // d + (b - d) w / 255 rounded; the numerator below is never negative.
                const int64_t want = (510 * d + 2 * (b - d) * w + 255) / 510;
                ASSERT_EQ(out(d, b, w), want) << "d " << d << " b " << b << " w " << w;
            }
    EXPECT_EQ(out(200, 0, 128), 100);
    EXPECT_EQ(out(0, 200, 128), 100);
}

TEST(Rdiv255, FitsItsLanesForEveryNumeratorAndDivisor) {
    Buffer<uint8_t> out = Table2(halideqk::rdiv255(cast<uint8_t>(x), cast<uint8_t>(max(y, 1))));
    for (int n = 0; n < 256; ++n)
        for (int q = 1; q < 256; ++q) {
            const int64_t want = (255 * n + q / 2) / q;
            // Beyond 255 the mode's own saturation applies; only compare what a byte holds.
            if (want > 255) continue;
            ASSERT_EQ(out(n, q), want) << n << " " << q;
        }
}

// 16-bit operands: every value from 0 to 32768 against a strided sample.
std::vector<int> DeepSamples(int step = 97) {
    std::vector<int> v;
    for (int a = 0; a <= 32768; a += step) v.push_back(a);
    for (int a : {1, 2, 127, 128, 255, 256, 16383, 16384, 16385, 32767, 32768}) v.push_back(a);
    return v;
}

TEST(Mul32768, IsTheProductRoundedHalfUp) {
    const std::vector<int> bs = DeepSamples();
    Buffer<int32_t> bv(int(bs.size()));
    for (size_t i = 0; i < bs.size(); ++i) bv(int(i)) = bs[i];
    Func f;
    f(x, y) = cast<uint16_t>(halideqk::mul32768(cast<uint16_t>(x), cast<uint16_t>(bv(y))));
    f.vectorize(x, 16);
    Buffer<uint16_t> out = f.realize({32769, int(bs.size())}, kTarget);
    for (int a = 0; a <= 32768; ++a)
        for (size_t j = 0; j < bs.size(); ++j)
            ASSERT_EQ(out(a, int(j)), (int64_t(a) * bs[j] + 16384) >> 15) << a << " " << bs[j];
}

TEST(DeepMix, IsOneRoundedWeightedSum) {
    const std::vector<int> s = DeepSamples(211);
    Buffer<int32_t> sv(int(s.size()));
    for (size_t i = 0; i < s.size(); ++i) sv(int(i)) = s[i];
    const int n = int(s.size());
    Func f;
    f(x, y, z) = halideqk::deep_mix(cast<uint16_t>(sv(x)), cast<uint16_t>(sv(y)), cast<uint16_t>(sv(z)));
    f.vectorize(x, 8, Halide::TailStrategy::GuardWithIf);
    Buffer<uint16_t> out = f.realize({n, n, n}, kTarget);
    for (int k = 0; k < n; ++k)
        for (int j = 0; j < n; ++j)
            for (int i = 0; i < n; ++i) {
                const int64_t d = s[i], b = s[j], m = s[k];
                ASSERT_EQ(out(i, j, k), ((32768 - m) * d + b * m + 16384) >> 15) << d << " " << b << " " << m;
            }
    // Full weight gives the blend value, none the destination.
    for (int i = 0; i < n; ++i) {
        const int full = int(std::find(s.begin(), s.end(), 32768) - s.begin());
        const int none = int(std::find(s.begin(), s.end(), 0) - s.begin());
        EXPECT_EQ(out(i, 3, full), s[3]);
        EXPECT_EQ(out(i, 3, none), s[i]);
    }
}

}  // namespace
