// Rectangle blends at the values that pin their rules, through both routine
// sets' entries: one pixel per row of each table, every pixel of a table in a
// single call so the vector paths see them too.
#include <gtest/gtest.h>

#include <cstring>
#include <random>
#include <string>
#include <vector>

#include "adapters/signatures.h"
#include "tests/plugin_entries.h"
#include "host/reference/blend_math.h"
#include "tables/soft_light.h"

namespace {

using halideqk::sig::ConstDstMask8;
using halideqk::sig::SrcDst8;
using halideqk::sig::SrcDstMask16;
using halideqk::sig::SrcDstMask8;
using halideqk::sig::SrcDstMaskF;

using test::Entry;
using test::kSets;

template <typename T>
struct Pixel {
    const char *routine;
    T s, d, m, want;
};

// Runs every pixel of `cases` for one routine as one row of a single call.
template <typename T, typename Sig>
void Check(const std::vector<Pixel<T>> &cases) {
    for (const char *set : kSets) {
        for (const Pixel<T> &c : cases) {
            Sig *f = Entry<Sig>(set, c.routine);
            if (!f) continue;
            // The pixel sits at several positions of a 70-sample row (vector
            // body and scalar tail) over 70 rows (several strips).
            const int n = 70;
            std::vector<T> s(n * n, c.s), d(n * n, c.d), m(n * n, c.m);
            f(s.data(), d.data(), m.data(), n, n, n * sizeof(T), n * sizeof(T), n * sizeof(T));
            for (int i = 0; i < n * n; ++i)
                ASSERT_EQ(d[i], c.want) << set << " " << c.routine << " s " << +c.s << " d " << +c.d
                                        << " m " << +c.m << " at " << i;
        }
    }
}

TEST(NormalScreenMultiply, LeaveOrReplaceAtTheEnds) {
    Check<uint8_t, SrcDstMask8>({
        {"BlendRect", 77, 200, 255, 77},      {"BlendRect", 77, 200, 0, 200},
        {"BlendRect", 0, 200, 128, 100},      {"BlendRect", 200, 0, 128, 100},
        {"ScreenBlend", 0, 93, 255, 93},      {"ScreenBlend", 255, 93, 255, 255},
        {"MultiplyBlend", 255, 93, 255, 93},  {"MultiplyBlend", 0, 93, 255, 0},
        {"DarkenOnly", 10, 93, 255, 10},      {"DarkenOnly", 200, 93, 255, 93},
        {"LightenOnly", 10, 93, 255, 93},     {"LightenOnly", 200, 93, 255, 200},
    });
}

TEST(HardLightOverlaySoftLight, PinTheirBranchConstants) {
    Check<uint8_t, SrcDstMask8>({
        {"HardLightBlend", 128, 77, 255, 77},   // screen255(0, d) = d
        {"HardLightBlend", 255, 0, 255, 254},   // doubled source taken modulo 256
        {"HardLightBlend", 64, 255, 255, 128},  // mul255(128, 255)
        {"OverlayBlend", 0, 255, 255, 255},     {"OverlayBlend", 100, 255, 37, 255},
        {"OverlayBlend", 255, 0, 255, 0},       {"OverlayBlend", 200, 64, 255, 100},
        {"SoftLightBlend", 128, 64, 255, 64},   {"SoftLightBlend", 128, 200, 255, 200},
        {"SoftLightBlend", 255, 64, 255, 128},  // 64 + mul255(64, 254)
        {"SoftLightBlend", 0, 128, 255, 64},    // 128 - mul255(64, 255)
        {"SoftLightBlend", 0, 255, 255, 255},   // burnDelta[255] = 0
    });
}

TEST(ThresholdAndReverse, SwitchAndWeighTheDestination) {
    Check<uint8_t, SrcDstMask8>({
        {"ThresholdBlend", 9, 99, 127, 99},   {"ThresholdBlend", 9, 99, 128, 9},
        {"ThresholdBlend", 9, 99, 0, 99},     {"ThresholdBlend", 9, 99, 255, 9},
        {"ReverseBlend", 10, 200, 0, 10},     {"ReverseBlend", 10, 200, 255, 200},
        {"ReverseBlend", 10, 200, 128, 105},  {"ReverseBlend", 200, 10, 128, 105},
        {"ReverseBlend", 50, 50, 77, 50},
    });
}

TEST(Deep, MixesWithOneRounding) {
    Check<uint16_t, SrcDstMask16>({
        {"BlendRectDeep", 32768, 0, 16384, 16384},   {"BlendRectDeep", 1234, 30000, 32768, 1234},
        {"BlendRectDeep", 1234, 30000, 0, 30000},    {"ScreenBlendDeep", 0, 777, 32768, 777},
        {"ScreenBlendDeep", 32768, 777, 32768, 32768}, {"MultiplyBlendDeep", 32768, 777, 32768, 777},
        {"MultiplyBlendDeep", 16384, 16384, 32768, 8192},
    });
}

TEST(Float, MixesWithoutClamping) {
    Check<float, SrcDstMaskF>({
        {"BlendRectFloat", 1.0f, 0.0f, 0.5f, 0.5f},
        {"BlendRectFloat", 1.0f, 0.0f, 2.0f, 2.0f},
        {"BlendRectFloat", 0.0f, 1.0f, 1.5f, -0.5f},
        {"BlendRectFloat", 0.25f, 0.75f, 0.0f, 0.75f},
    });
}

// A Const call uses only the low byte of its value and equals the plain call
// over a source plane of that byte.
TEST(ConstVariants, UseTheLowByteLikeAPlaneOfIt) {
    const char *const pairs[][2] = {
        {"ScreenBlendConst", "ScreenBlend"},       {"MultiplyBlendConst", "MultiplyBlend"},
        {"DarkenOnlyConst", "DarkenOnly"},         {"LightenOnlyConst", "LightenOnly"},
        {"HardLightConst", "HardLightBlend"},      {"OverlayBlendConst", "OverlayBlend"},
        {"SoftLightConst", "SoftLightBlend"},      {"ThresholdBlendConst", "ThresholdBlend"},
    };
    std::mt19937 rng(5);
    const int rows = 67, columns = 131;
    for (const char *set : kSets)
        for (const auto &p : pairs)
            for (int16_t value : {int16_t(0x1FF), int16_t(-1), int16_t(0x180), int16_t(0x7F00), int16_t(0x42)}) {
                std::vector<uint8_t> d(rows * columns), m(d.size());
                for (auto &v : d) v = uint8_t(rng());
                for (auto &v : m) v = uint8_t(rng());
                std::vector<uint8_t> viaPlane = d, s(d.size(), uint8_t(value & 0xFF));
                Entry<ConstDstMask8>(set, p[0])(value, d.data(), m.data(), rows, columns, columns, columns);
                Entry<SrcDstMask8>(set, p[1])(s.data(), viaPlane.data(), m.data(), rows, columns, columns,
                                              columns, columns);
                ASSERT_EQ(d, viaPlane) << set << " " << p[0] << " value " << value;
            }
}

TEST(SolidVariants, EqualThePlainCallUnderAnOpaqueMask) {
    const char *const pairs[][2] = {
        {"HardLightSolid", "HardLightBlend"},
        {"OverlayBlendSolid", "OverlayBlend"},
        {"SoftLightSolid", "SoftLightBlend"},
    };
    std::mt19937 rng(6);
    const int rows = 70, columns = 99;
    for (const char *set : kSets)
        for (const auto &p : pairs) {
            std::vector<uint8_t> s(rows * columns), d(s.size()), m(s.size(), 255);
            for (auto &v : s) v = uint8_t(rng());
            for (auto &v : d) v = uint8_t(rng());
            std::vector<uint8_t> viaMask = d;
            Entry<SrcDst8>(set, p[0])(s.data(), d.data(), rows, columns, columns, columns);
            Entry<SrcDstMask8>(set, p[1])(s.data(), viaMask.data(), m.data(), rows, columns, columns,
                                          columns, columns);
            ASSERT_EQ(d, viaMask) << set << " " << p[0];
        }
}

TEST(SoftLightTables, HaveTheirShapeAndMatchAnIndependentBuild) {
    const uint8_t *dodge = halideqk::DodgeDelta(), *burn = halideqk::BurnDelta();
    EXPECT_EQ(0, std::memcmp(dodge, host_ref::DodgeDelta(), 256));
    EXPECT_EQ(0, std::memcmp(burn, host_ref::BurnDelta(), 256));
    EXPECT_EQ(burn[128], 64);
    EXPECT_EQ(burn[0], 0);
    EXPECT_EQ(burn[255], 0);
    EXPECT_EQ(dodge[64], 64);
    EXPECT_EQ(dodge[255], 0);
    const uint8_t firstDodge[] = {0, 3, 6, 9, 11, 14}, lastDodge[] = {2, 2, 1, 1, 0, 0};
    EXPECT_EQ(0, std::memcmp(dodge, firstDodge, 6));
    EXPECT_EQ(0, std::memcmp(dodge + 250, lastDodge, 6));
    for (int d = 0; d < 256; ++d) {
        EXPECT_EQ(burn[d] == 64, d >= 120 && d <= 135) << d;
        EXPECT_EQ(dodge[d] == 64, d >= 54 && d <= 71) << d;
        EXPECT_LE(burn[d], 64);
        EXPECT_LE(dodge[d], 64);
        // Soft light can never leave 0..255.
        EXPECT_LE(d + dodge[d], 255) << d;
        EXPECT_LE(burn[d], d) << d;
    }
}

}  // namespace
