// Start-up as the host drives it: result codes, suite lookup, saved copies,
// installation under injected processor features, worker-pool sizing.
#include <gtest/gtest.h>

#include <cstring>
#include <set>
#include <utility>

#include "HalideRuntime.h"
#include "adapters/routine_set.h"
#include "frame/entry.h"
#include "frame/features.h"
#include "frame/noise.h"
#include "frame/startup_testing.h"
#include "frame/suites.h"
#include "host/host_record.h"
#include "host/routine_list.h"
#include "tests/fake_sysctl.h"

namespace {

using halideqk::Suite;

constexpr int kMemorySetRectDeepSlot = 66;

int CurrentThreads() {
    const int n = halide_set_num_threads(1);
    halide_set_num_threads(n);
    return n;
}

void ClearSavedCopies() {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength)                       \
    std::memset(halideQKOriginal##Word##QKTable, 0, sizeof(halideQKOriginal##Word##QKTable)); \
    halideQKGlobal##Word##Routines = nullptr;
#include "frame/suites.def"
#undef QK_SUITE
    for (uint8_t *flag : {&gHalideSSE2Support, &gHalideSSE3Support, &gHalideSSSE3Support,
                          &gHalideSSE41Support, &gHalideAVXSupport, &gHalideAVX2Support,
                          &gHalideFMASupport})
        *flag = 0;
}

void **SavedCopy(Suite s) {
    switch (s) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    case Suite::Word: return halideQKOriginal##Word##QKTable;
#include "frame/suites.def"
#undef QK_SUITE
        default: return nullptr;
    }
}

void **LiveTable(Suite s) {
    switch (s) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    case Suite::Word: return halideQKGlobal##Word##Routines;
#include "frame/suites.def"
#undef QK_SUITE
        default: return nullptr;
    }
}

class Startup : public ::testing::Test {
protected:
    void SetUp() override {
        halideqk::ResetStartupForTesting();
        ClearSavedCopies();
        host::ClearAcquirable();
        host::gAcquireLog = {};
    }
    void TearDown() override { halideqk::ResetStartupForTesting(); }

    int16_t Run(int32_t selector = kSelectorStartup) {
        int16_t result = 12345;
        PluginMain(selector, host.record(), nullptr, &result);
        return result;
    }
    bool TablesUntouched() {
        for (const auto &info : halideqk::kSuites)
            for (int i = 0; i < info.copyLength; ++i)
                if (host.table(info.suite)[i] != host.pristine(info.suite)[i]) return false;
        return true;
    }
    void *Slot(Suite s, int i) { return host.table(s)[i]; }

    host::HostRecord host;
};

TEST_F(Startup, SelectorsOtherThanStartupDoNothing) {
    EXPECT_EQ(Run(kSelectorAbout), kResultOK);
    EXPECT_EQ(Run(kSelectorShutdown), kResultOK);
    EXPECT_EQ(Run(3), kResultBadSelector);
    EXPECT_EQ(Run(-1), kResultBadSelector);
    EXPECT_TRUE(TablesUntouched());
    EXPECT_EQ(halideQKGlobalCoreRoutines, nullptr);
    HalideQKDoTerminate();
    EXPECT_TRUE(TablesUntouched());
}

TEST_F(Startup, SavesEveryTableThenInstalls) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    EXPECT_EQ(Run(), kResultOK);
    for (const auto &info : halideqk::kSuites) {
        EXPECT_EQ(0, std::memcmp(SavedCopy(info.suite), host.pristine(info.suite).data(),
                                 sizeof(void *) * info.copyLength))
            << info.word;
        EXPECT_EQ(LiveTable(info.suite), host.table(info.suite)) << info.word;
    }
    EXPECT_EQ(halideQKGlobalBlendRoutines, host.table(Suite::Blend));
    EXPECT_EQ(halideQKOriginalCoreQKTable[3], reinterpret_cast<void *>(&host::HostNoiseRoutine));
    EXPECT_EQ(Slot(Suite::Core, 3), reinterpret_cast<void *>(&HalideQKCoreNoiseHook));
    EXPECT_EQ(Slot(Suite::Memory, kMemorySetRectDeepSlot),
              reinterpret_cast<void *>(halide_avx2::HalideQKSetRectDeep));

    // The host announces its noise through the hook and its own routine still runs.
    const int before = host::gLastNoise.calls;
    host.announceNoise();
    EXPECT_EQ(host::gLastNoise.calls, before + 1);
    EXPECT_EQ(host::gLastNoise.data, host.noise().data());
    EXPECT_EQ(HalideQKGetNoiseTable(), host.noise().data());
    EXPECT_EQ(pDivTable[1 * 256 + 2], 128);
}

TEST_F(Startup, ASecondStartupDoesNothingAndSucceeds) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    ASSERT_EQ(Run(), kResultOK);
    ASSERT_EQ(Run(), kResultOK);
    // The saved slot 3 is still the host's routine, so the hook cannot call itself.
    EXPECT_EQ(halideQKOriginalCoreQKTable[3], reinterpret_cast<void *>(&host::HostNoiseRoutine));
    const int before = host::gLastNoise.calls;
    host.announceNoise();
    EXPECT_EQ(host::gLastNoise.calls, before + 1);
}

TEST_F(Startup, NoSuitesFails) {
    host.setSuiteCount(0);
    EXPECT_EQ(Run(), kResultStartupFailed);
    host.setSuiteCount(-4);
    EXPECT_EQ(Run(), kResultStartupFailed);
    EXPECT_TRUE(TablesUntouched());
}

TEST_F(Startup, ARevisionBelowTheMinimumStopsAfterTheEarlierCopies) {
    host.suite(6).revision = 320;  // 'blnd' needs 321
    EXPECT_EQ(Run(), kResultStartupFailed);
    EXPECT_TRUE(TablesUntouched());
    EXPECT_EQ(halideQKGlobalSelectRoutines, host.table(Suite::Select));
    EXPECT_EQ(halideQKOriginalCoreQKTable[3], reinterpret_cast<void *>(&host::HostNoiseRoutine));
    EXPECT_EQ(0, std::memcmp(halideQKOriginalSelectQKTable, host.pristine(Suite::Select).data(),
                             sizeof(halideQKOriginalSelectQKTable)));
    EXPECT_EQ(halideQKGlobalBlendRoutines, nullptr);
    EXPECT_EQ(halideQKOriginalBlendQKTable[0], nullptr);
    EXPECT_EQ(gHalideSSE2Support, 0) << "features are not queried after a failure";
}

TEST_F(Startup, VersionsMustMatchExactlyUnlessTheHostSuppliesOne) {
    host.suite(1).version = 8;  // 'filt' 8 is not 'filt' 9
    EXPECT_EQ(Run(), kResultStartupFailed);
    EXPECT_EQ(host::gAcquireLog.calls, 1);
    EXPECT_EQ(host::gAcquireLog.caller, FourCC("QKXT"));
    EXPECT_EQ(host::gAcquireLog.suiteId, FourCC("filt"));
    EXPECT_TRUE(host::gAcquireLog.outWasNull);

    // The acquire routine offers version 9: start-up goes on.
    SuiteRecord filter = host.suite(1);
    filter.version = 9;
    host::OfferThroughAcquire(filter);
    halideqk::ResetStartupForTesting();
    EXPECT_EQ(Run(), kResultOK);
    EXPECT_EQ(halideQKGlobalFilterRoutines, host.table(Suite::Filter));
}

TEST_F(Startup, AnAcquiredRecordOfAnotherVersionIsMissing) {
    SuiteRecord filter = host.suite(1);
    host.suite(1).id = FourCC("xxxx");
    filter.version = 8;
    host::OfferThroughAcquire(filter);
    EXPECT_EQ(Run(), kResultStartupFailed);
    EXPECT_EQ(host::gAcquireLog.calls, 1);
}

// ---- FindSuite on hand-made records

struct Record {
    uint32_t reserved = 0;
    int32_t count = 0;
    SuiteRecord suites[4];
};

void *gCoreA[8], *gCoreB[8];
int gCallsA = 0, gCallsB = 0;
SuiteRecord gOffered{FourCC("filt"), 9, 311, nullptr};
unsigned char AcquireA(uint32_t, uint32_t, SuiteRecord **out) {
    ++gCallsA;
    *out = &gOffered;
    return 1;
}
unsigned char AcquireB(uint32_t, uint32_t, SuiteRecord **out) {
    ++gCallsB;
    *out = &gOffered;
    return 1;
}
unsigned char AcquireFailsButStores(uint32_t, uint32_t, SuiteRecord **out) {
    *out = &gOffered;
    return 0;
}

TEST(FindSuite, TakesTheFirstOfTwoEqualRecords) {
    Record r;
    r.count = 2;
    r.suites[0] = {FourCC("memo"), 4, 158, gCoreA};
    r.suites[1] = {FourCC("memo"), 4, 200, gCoreB};
    EXPECT_EQ(FindSuite(reinterpret_cast<ExtensionRecord *>(&r), FourCC("memo"), 4), &r.suites[0]);
}

TEST(FindSuite, AsksTheLastCoreRecordAndOnlyFromRevisionFive) {
    gCoreA[5] = reinterpret_cast<void *>(&AcquireA);
    gCoreB[5] = reinterpret_cast<void *>(&AcquireB);
    Record r;
    r.count = 2;
    r.suites[0] = {FourCC("core"), 4, 14, gCoreA};
    r.suites[1] = {FourCC("core"), 4, 5, gCoreB};
    auto *ext = reinterpret_cast<ExtensionRecord *>(&r);
    gCallsA = gCallsB = 0;
    EXPECT_EQ(FindSuite(ext, FourCC("filt"), 9), &gOffered);
    EXPECT_EQ(gCallsA, 0);
    EXPECT_EQ(gCallsB, 1);

    r.suites[1].revision = 4;  // the last core record is too old to ask
    EXPECT_EQ(FindSuite(ext, FourCC("filt"), 9), nullptr);
    EXPECT_EQ(gCallsA + gCallsB, 1);

    r.suites[1].version = 3;  // no longer a core 4 record: the first one is asked
    EXPECT_EQ(FindSuite(ext, FourCC("filt"), 9), &gOffered);
    EXPECT_EQ(gCallsA, 1);

    EXPECT_EQ(FindSuite(ext, FourCC("filt"), 8), nullptr) << "acquired version is checked";
    gCoreA[5] = reinterpret_cast<void *>(&AcquireFailsButStores);
    EXPECT_EQ(FindSuite(ext, FourCC("filt"), 9), nullptr) << "a zero answer is a failure";
}

// ---- installation under injected processors

class Install : public Startup {};

TEST_F(Install, Avx2AndFmaGetTheAvx2Set) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    ASSERT_EQ(Run(), kResultOK);
    EXPECT_EQ(halideqk::ChosenRoutineSet(), halideqk::RoutineSet::AVX2);
    EXPECT_EQ(Slot(Suite::Memory, kMemorySetRectDeepSlot),
              reinterpret_cast<void *>(halide_avx2::HalideQKSetRectDeep));
}

TEST_F(Install, Avx2WithoutFmaGetsTheSse41Set) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    fake.SetInt("hw.optional.fma", 0);
    ASSERT_EQ(Run(), kResultOK);
    EXPECT_EQ(gHalideAVX2Support, 1);
    EXPECT_EQ(gHalideFMASupport, 0);
    EXPECT_EQ(Slot(Suite::Memory, kMemorySetRectDeepSlot),
              reinterpret_cast<void *>(halide_sse41::HalideQKSetRectDeep));
}

TEST_F(Install, NoSse41KeepsTheHostRoutinesButHooksTheCore) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    fake.SetInt("hw.optional.sse4_1", 0);
    ASSERT_EQ(Run(), kResultOK);
    EXPECT_EQ(gHalideSSSE3Support, 1);
    EXPECT_EQ(gHalideSSE41Support, 0);
    EXPECT_EQ(gHalideAVX2Support, 0) << "a broken chain clears every later flag";
    EXPECT_EQ(gHalideFMASupport, 0);
    EXPECT_EQ(Slot(Suite::Core, 3), reinterpret_cast<void *>(&HalideQKCoreNoiseHook));
    for (Suite s : {Suite::Filter, Suite::Memory, Suite::Paint, Suite::Blend, Suite::Convert})
        for (int i = 0; i < halideqk::InfoOf(s).copyLength; ++i)
            ASSERT_EQ(Slot(s, i), host.pristine(s)[i]) << halideqk::InfoOf(s).word << " " << i;
}

TEST_F(Install, OnlyListedSlotsChange) {
    FakeSysctl fake;
    fake.SetFeatures(FakeSysctl::kAllFeatures);
    ASSERT_EQ(Run(), kResultOK);
    // Exactly the core noise slot and the slots of built routines change.
    std::set<std::pair<halideqk::Suite, int>> expected{{halideqk::Suite::Core, 3}};
    for (const auto &row : host::ManifestRows())
        if (row.built)
            for (int slot : row.slots) expected.insert({row.suite, slot});
    for (const auto &info : halideqk::kSuites)
        for (int i = 0; i < info.copyLength; ++i) {
            const bool changed = Slot(info.suite, i) != host.pristine(info.suite)[i];
            EXPECT_EQ(changed, expected.count({info.suite, i}) == 1) << info.word << " slot " << i;
        }
}

TEST(WorkerThreads, LogicalUpTo28ElsePhysical) {
    EXPECT_EQ(halideqk::WorkerThreads(32, 16), 16);
    EXPECT_EQ(halideqk::WorkerThreads(28, 14), 28);
    EXPECT_EQ(halideqk::WorkerThreads(32, 32), 32);
    EXPECT_EQ(halideqk::WorkerThreads(29, 40), 29);
    EXPECT_EQ(halideqk::WorkerThreads(1, 1), 1);
}

TEST_F(Startup, SizesThePoolFromTheInjectedCounts) {
    const int before = CurrentThreads();
    {
        FakeSysctl fake;
        fake.SetFeatures(FakeSysctl::kAllFeatures);
        fake.SetProcessors(32, 16);
        ASSERT_EQ(Run(), kResultOK);
        EXPECT_EQ(CurrentThreads(), 16);
    }
    halideqk::ResetStartupForTesting();
    {
        FakeSysctl fake;
        fake.SetFeatures(FakeSysctl::kAllFeatures);
        fake.SetProcessors(6, 3);
        ASSERT_EQ(Run(), kResultOK);
        EXPECT_EQ(CurrentThreads(), 6);
    }
    halide_set_num_threads(before);
}

}  // namespace
