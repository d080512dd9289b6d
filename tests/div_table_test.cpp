#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

#include "frame/noise.h"

namespace {

uint8_t Div(int a, int b) { return pDivTable[a * 256 + b]; }

TEST(DivisionTable, EveryEntryIsTheRoundedClampedQuotient) {
    ASSERT_EQ(HalideInitAsmLoops(), 1);
    for (int a = 0; a < 256; ++a) {
        for (int b = 0; b < 256; ++b) {
            // a/b on the 0..255 scale, nearest with halves up, clamped; 0/0 = 0.
            int expected;
            if (a == 0) expected = 0;
            else if (b == 0) expected = 255;
            else expected = std::min(255.0, std::floor(255.0 * a / b + 0.5));
            ASSERT_EQ(Div(a, b), expected) << "a=" << a << " b=" << b;
        }
    }
}

TEST(DivisionTable, PinnedValues) {
    HalideInitAsmLoops();
    EXPECT_EQ(Div(0, 0), 0);
    EXPECT_EQ(Div(0, 200), 0);
    EXPECT_EQ(Div(1, 0), 255);
    EXPECT_EQ(Div(1, 1), 255);
    EXPECT_EQ(Div(1, 2), 128);
    EXPECT_EQ(Div(1, 3), 85);
    EXPECT_EQ(Div(100, 200), 128);
    EXPECT_EQ(Div(128, 255), 128);
    EXPECT_EQ(Div(254, 255), 254);
    for (int b = 0; b < 256; ++b) EXPECT_EQ(Div(255, b), 255);
    for (int a = 1; a < 255; ++a)
        for (int b = a + 1; b < 256; ++b) ASSERT_LE(Div(a, b), 254);
}

}  // namespace
