// The core slot-3 hook records the host's noise buffer and hands the call on,
// every argument intact, to the routine it replaced.
#include <gtest/gtest.h>

#include <cstdarg>

#include "frame/noise.h"
#include "frame/suites.h"

namespace {

struct Received {
    const uint8_t *p;
    uint32_t n, w;
    int a3, a4, a5;
    long a6, a7;  // passed on the stack
    double d[10];  // d[8], d[9] on the stack
    int calls = 0;
} gGot;

// A host slot-3 routine with more arguments than the three the hook reads:
// general registers, stack slots and vector registers.
long WideRoutine(const uint8_t *p, uint32_t n, uint32_t w, int a3, int a4, int a5, long a6,
                 long a7, double d0, double d1, double d2, double d3, double d4, double d5,
                 double d6, double d7, double d8, double d9) {
    gGot = {p, n, w, a3, a4, a5, a6, a7, {d0, d1, d2, d3, d4, d5, d6, d7, d8, d9}, gGot.calls + 1};
    return 0x1234567890L + a7;
}

// A variadic one: the count of vector registers travels in %al.
double VariadicRoutine(const uint8_t *, uint32_t, uint32_t count, ...) {
    va_list args;
    va_start(args, count);
    double sum = 0;
    for (uint32_t i = 0; i < count; ++i) sum += va_arg(args, double);
    va_end(args);
    return sum;
}

class NoiseHook : public ::testing::Test {
protected:
    void SetUp() override { saved_ = halideQKOriginalCoreQKTable[3]; }
    void TearDown() override { halideQKOriginalCoreQKTable[3] = saved_; }
    void *saved_;
};

TEST_F(NoiseHook, RecordsTheBufferAndForwardsEveryArgument) {
    halideQKOriginalCoreQKTable[3] = reinterpret_cast<void *>(&WideRoutine);
    auto hook = reinterpret_cast<decltype(&WideRoutine)>(&HalideQKCoreNoiseHook);
    static const uint8_t noise[2048] = {};

    const long result = hook(noise, 1000, 512, -3, 4, 5, 1L << 40, -77, 0.5, 1.5, 2.5, 3.5, 4.5,
                             5.5, 6.5, 7.5, 8.5, 9.5);
    EXPECT_EQ(result, 0x1234567890L - 77);
    EXPECT_EQ(gGot.calls, 1);
    EXPECT_EQ(gGot.p, noise);
    EXPECT_EQ(gGot.n, 1000u);
    EXPECT_EQ(gGot.w, 512u);
    EXPECT_EQ(gGot.a3, -3);
    EXPECT_EQ(gGot.a4, 4);
    EXPECT_EQ(gGot.a5, 5);
    EXPECT_EQ(gGot.a6, 1L << 40);
    EXPECT_EQ(gGot.a7, -77);
    for (int i = 0; i < 10; ++i) EXPECT_EQ(gGot.d[i], i + 0.5);

    EXPECT_EQ(HalideQKGetNoiseTable(), noise);
    EXPECT_EQ(gNoiseData, noise);
    EXPECT_EQ(gNoisePtr, noise);
    EXPECT_EQ(gNoiseLength, 1000u);
    EXPECT_EQ(gNoiseWrap, 512u);
    EXPECT_EQ(gNoiseLimit, noise + 512);
}

TEST_F(NoiseHook, KeepsTheVariadicRegisterCount) {
    halideQKOriginalCoreQKTable[3] = reinterpret_cast<void *>(&VariadicRoutine);
    auto hook = reinterpret_cast<decltype(&VariadicRoutine)>(&HalideQKCoreNoiseHook);
    static const uint8_t noise[16] = {};
    EXPECT_EQ(hook(noise, 16, 3u, 1.0, 2.0, 4.0), 7.0);
    EXPECT_EQ(hook(noise, 16, 9u, 1.0, 1.0, 1.0, 1.0, 1.0, 1.0, 1.0, 1.0, 1.0), 9.0);
}

TEST_F(NoiseHook, WrapIsUnsignedWhenFormingTheLimit) {
    halideQKOriginalCoreQKTable[3] = reinterpret_cast<void *>(&WideRoutine);
    auto hook = reinterpret_cast<decltype(&WideRoutine)>(&HalideQKCoreNoiseHook);
    const uint8_t *p = reinterpret_cast<const uint8_t *>(uintptr_t(0x10000000));
    hook(p, 1, 0x80000000u, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0);
    EXPECT_EQ(gNoiseLimit, p + 0x80000000ul);
}

}  // namespace
