// Depth and layout conversions: the noise table and its first use from many
// threads, the values that pin each formula, the whole 16-bit domain at every
// dither setting, and results that do not depend on how rows are split.
#include <gtest/gtest.h>

#include <climits>
#include <cmath>
#include <limits>
#include <string>
#include <thread>
#include <vector>

#include "adapters/signatures.h"
#include "tests/plugin_entries.h"
#include "host/reference/dither_noise.h"
#include "host/reference_routines.h"
#include "tables/dither_noise.h"

namespace {

using namespace halideqk::sig;

using test::Entry;
using test::kSets;

// Every 16-bit value once, as a 256 x 256 image.
std::vector<u16> AllValues() {
    std::vector<u16> v(65536);
    for (int i = 0; i < 65536; ++i) v[i] = u16(i);
    return v;
}

TEST(NoiseTable, FollowsTheGenerator) {
    const uint16_t *t = halideqk::DitheredNoiseTable::GetNoiseTable();
    EXPECT_EQ(t[0], 16384);
    EXPECT_EQ(t[1], 27614);
    EXPECT_EQ(t[2], 10043);
    EXPECT_EQ(t[3], 4541);
    // Schrage's step equals the plain 64-bit product everywhere it is used.
    int32_t x = int32_t(halideqk::DitheredNoiseTable::kSeed);
    for (int i = 0; i < 20000; ++i) {
        const int32_t next = halideqk::DitheredNoiseTable::Next(x);
        ASSERT_EQ(int64_t(next), int64_t(x) * 16807 % 2147483647);
        x = next;
    }
    // The whole table equals the host's own build of it.
    const uint16_t *h = host_ref::DitherTable();
    for (int i = 0; i < halideqk::DitheredNoiseTable::kSize; ++i) ASSERT_EQ(t[i], h[i]) << i;
    EXPECT_EQ(halideqk::kDitherPhase, 2026);
}

// Several host threads make the first dithered call at the same moment; the
// table is built once and every thread's result is the host's.
TEST(NoiseTable, ConcurrentFirstUseBuildsOneCorrectTable) {
    const int n = 130;
    std::vector<u16> src(n * n);
    for (int i = 0; i < n * n; ++i) src[i] = u16(i * 2654435761u % 32769u);
    std::vector<u8> want(n * n);
    host_ref::Gray16toGray8(src.data(), want.data(), n, n, 2 * n, n, 1);

    for (const char *set : kSets) {
        auto *f = Entry<Gray16toGray8>(set, "Gray16toGray8");
        ASSERT_NE(f, nullptr);
        constexpr int kThreads = 8;
        std::vector<std::vector<u8>> out(kThreads, std::vector<u8>(n * n));
        std::vector<std::thread> threads;
        for (int t = 0; t < kThreads; ++t)
            threads.emplace_back([&, t] { f(src.data(), out[t].data(), n, n, 2 * n, n, 1); });
        for (auto &th : threads) th.join();
        for (int t = 0; t < kThreads; ++t) EXPECT_EQ(out[t], want) << set << " thread " << t;
    }
    EXPECT_EQ(halideqk::DitheredNoiseTable::GetNoiseTable(), halideqk::DitheredNoiseTable::GetNoiseTable());
}

TEST(Gray16toGray8, WholeDomainAtEveryDitherSetting) {
    const std::vector<u16> src = AllValues();
    for (u8 dither : {0, 1, 255}) {
        std::vector<u8> want(65536);
        host_ref::Gray16toGray8(src.data(), want.data(), 256, 256, 512, 256, dither);
        for (const char *set : kSets) {
            std::vector<u8> got(65536, 0xCD);
            Entry<Gray16toGray8>(set, "Gray16toGray8")(src.data(), got.data(), 256, 256, 512, 256, dither);
            EXPECT_EQ(got, want) << set << " dither " << int(dither);
        }
    }
}

TEST(RGB48toRGB24, WholeDomainOnEachPlane) {
    const std::vector<u16> r = AllValues();
    std::vector<u16> g(r.rbegin(), r.rend()), b(65536);
    for (int i = 0; i < 65536; ++i) b[i] = u16(i * 40503u);
    for (u8 dither : {0, 7}) {
        std::vector<u8> wr(65536), wg(65536), wb(65536);
        host_ref::RGB48toRGB24(r.data(), g.data(), b.data(), wr.data(), wg.data(), wb.data(), 256, 256, 512,
                               256, dither);
        for (const char *set : kSets) {
            std::vector<u8> gr(65536), gg(65536), gb(65536);
            Entry<RGB48toRGB24>(set, "RGB48toRGB24")(r.data(), g.data(), b.data(), gr.data(), gg.data(),
                                                    gb.data(), 256, 256, 512, 256, dither);
            EXPECT_EQ(gr, wr) << set;
            EXPECT_EQ(gg, wg) << set;
            EXPECT_EQ(gb, wb) << set;
        }
    }
}

// Values that pin the rules, each repeated over a 70 x 70 image so the
// vector body, the tail and the row strips all see it.
TEST(Gray16toGray8, PinnedValues) {
    struct Case { u16 v; u8 dither; int want; };  // want < 0: only 0 or 255 noted below
    const Case cases[] = {{0, 0, 0},       {128, 0, 1},   {16384, 0, 128}, {32767, 0, 255},
                          {32768, 0, 255}, {0, 1, 0},     {32768, 1, 255}, {65535, 0, 254}};
    const int n = 70;
    for (const char *set : kSets)
        for (const Case &c : cases) {
            std::vector<u16> src(n * n, c.v);
            std::vector<u8> out(n * n);
            Entry<Gray16toGray8>(set, "Gray16toGray8")(src.data(), out.data(), n, n, 2 * n, n, c.dither);
            for (int i = 0; i < n * n; ++i)
                ASSERT_EQ(out[i], c.want) << set << " v " << c.v << " dither " << int(c.dither) << " at " << i;
        }
}

TEST(Gray32toGray8, PinnedValuesAndValuesOutsideTheScale) {
    const float nan = std::numeric_limits<float>::quiet_NaN(), inf = std::numeric_limits<float>::infinity();
    struct Case { float v; int want; };
    const Case cases[] = {{0.5f, 128}, {1.0f, 255}, {1.5f, 255}, {-0.2f, 0}, {1.0f / 255.0f, 1},
                          {0.0f, 0},   {nan, 0},    {-nan, 0},   {inf, 255}, {-inf, 0}, {1e30f, 255}};
    const int n = 70;
    for (const char *set : kSets)
        for (const Case &c : cases) {
            // A guard byte after the image: nothing past the row is written.
            std::vector<float> src(n * n, c.v);
            std::vector<u8> out(n * n + 1, 0xA5);
            Entry<Gray32toGray8>(set, "Gray32toGray8")(src.data(), out.data(), n, n, 4 * n, n, 0);
            for (int i = 0; i < n * n; ++i) ASSERT_EQ(out[i], c.want) << set << " v " << c.v << " at " << i;
            EXPECT_EQ(out[n * n], 0xA5);
            // Dithered, the ends of the scale stay put.
            if (c.want == 0 || c.want == 255) {
                Entry<Gray32toGray8>(set, "Gray32toGray8")(src.data(), out.data(), n, n, 4 * n, n, 1);
                for (int i = 0; i < n * n; ++i) ASSERT_EQ(out[i], c.want) << set << " dithered v " << c.v;
            }
        }
}

TEST(Gray8toGray16, EveryByte) {
    std::vector<u8> src(256);
    for (int i = 0; i < 256; ++i) src[i] = u8(i);
    for (const char *set : kSets) {
        std::vector<u16> out(256);
        Entry<Gray8toGray16>(set, "Gray8toGray16")(src.data(), out.data(), 1, 256, 256, 512);
        EXPECT_EQ(out[0], 0);
        EXPECT_EQ(out[128], 16448);
        EXPECT_EQ(out[255], 32768);
        for (int v = 0; v < 256; ++v) ASSERT_EQ(out[v], (v * 32768 + 127) / 255) << set << " " << v;
    }
}

// Every 16-bit value under each scale pair, exact against the 64-bit formula.
TEST(ScaledGray16toGray16, WholeDomainUnderEachScale) {
    const int scales[][2] = {{65535, 32768}, {32768, 255}, {255, 32768}, {1, 32768}, {3, 1 << 22},
                             {65535, 65535}, {40000, 1},   {100, -5},    {7, INT_MAX}, {12345, 54321}};
    for (const char *set : kSets)
        for (const auto &sc : scales) {
            std::vector<u16> data = AllValues();
            Entry<ScaledGray16>(set, "ScaledGray16toGray16")(data.data(), sc[0], sc[1], 256, 256, 512);
            for (int v = 0; v < 65536; ++v) {
                const int64_t q = v > sc[0] ? sc[1] : (int64_t(v) * sc[1] + sc[0] / 2) / sc[0];
                ASSERT_EQ(data[v], u16(q)) << set << " " << sc[0] << "->" << sc[1] << " v " << v;
            }
        }
    // The documented points.
    u16 p[] = {65535, 32768, 1, 2, 65534};
    Entry<ScaledGray16>("avx2", "ScaledGray16toGray16")(p, 65535, 32768, 1, 5, 10);
    EXPECT_EQ(std::vector<u16>(p, p + 5), (std::vector<u16>{32768, 16384, 1, 1, 32767}));
}

// A scale maximum below 1 describes no scale: the data is left alone instead
// of being divided by zero.
TEST(ScaledGray16toGray16, NoScaleLeavesDataAlone) {
    for (const char *set : kSets)
        for (int sourceMax : {0, -1, INT_MIN}) {
            std::vector<u16> data = AllValues();
            Entry<ScaledGray16>(set, "ScaledGray16toGray16")(data.data(), sourceMax, 32768, 256, 256, 512);
            EXPECT_EQ(data, AllValues()) << set << " sourceMax " << sourceMax;
        }
}

TEST(Interleave4to4, BytesInPlaneOrder) {
    for (const char *set : kSets) {
        const int n = 67;
        std::vector<u8> a(n * n, 1), b(n * n, 2), c(n * n, 3), d(n * n, 4);
        std::vector<u32> out(n * n + 1, 0xDEADBEEF);
        Entry<Interleave4to4>(set, "Interleave4to4")(a.data(), b.data(), c.data(), d.data(), out.data(), n, n,
                                                    n, 4 * n);
        for (int i = 0; i < n * n; ++i) ASSERT_EQ(out[i], 0x04030201u) << set << " at " << i;
        EXPECT_EQ(out[n * n], 0xDEADBEEFu);
        // Sizes that are negative ints write nothing.
        Entry<Interleave4to4>(set, "Interleave4to4")(a.data(), b.data(), c.data(), d.data(), out.data(),
                                                    u32(-1), n, n, 4 * n);
        Entry<Interleave4to4>(set, "Interleave4to4")(a.data(), b.data(), c.data(), d.data(), out.data(), n,
                                                    0x80000000u, n, 4 * n);
        EXPECT_EQ(out[0], 0x04030201u);
    }
}

// The noise of a pixel depends only on its position: a call split into row
// strips, one on the calling thread and one too narrow to be split agree on
// the columns they share, in both sets.
TEST(Dither, ResultDoesNotDependOnTheSplit) {
    const int rows = 200, wide = 300, narrow = 64;
    std::vector<u16> src(rows * wide);
    for (size_t i = 0; i < src.size(); ++i) src[i] = u16(i * 2654435761u % 32769u);
    std::vector<float> fsrc(src.size());
    for (size_t i = 0; i < src.size(); ++i) fsrc[i] = src[i] / 32768.0f;
    for (const char *set : kSets) {
        std::vector<u8> a(rows * wide), b(rows * narrow), fa(rows * wide), fb(rows * narrow);
        Entry<Gray16toGray8>(set, "Gray16toGray8")(src.data(), a.data(), rows, wide, 2 * wide, wide, 1);
        Entry<Gray16toGray8>(set, "Gray16toGray8")(src.data(), b.data(), rows, narrow, 2 * wide, narrow, 1);
        Entry<Gray32toGray8>(set, "Gray32toGray8")(fsrc.data(), fa.data(), rows, wide, 4 * wide, wide, 1);
        Entry<Gray32toGray8>(set, "Gray32toGray8")(fsrc.data(), fb.data(), rows, narrow, 4 * wide, narrow, 1);
        for (int y = 0; y < rows; ++y)
            for (int x = 0; x < narrow; ++x) {
                ASSERT_EQ(a[y * wide + x], b[y * narrow + x]) << set << " at " << x << "," << y;
                ASSERT_EQ(fa[y * wide + x], fb[y * narrow + x]) << set << " float at " << x << "," << y;
            }
    }
}

}  // namespace
