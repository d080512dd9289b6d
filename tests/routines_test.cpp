// Every built routine of both sets against the host's own routine, over the
// awkward shapes of its signature, in guarded memory; and the two sets against
// each other.
#include <gtest/gtest.h>

#include <set>

#include "host/plugin.h"
#include "host/reference_routines.h"
#include "host/routine_list.h"
#include "tests/plugin_entries.h"

namespace {

using test::ThePlugin;

class BuiltRoutine : public ::testing::TestWithParam<host::RoutineInfo> {};

TEST_P(BuiltRoutine, MatchesTheHostBitForBitInBothSets) {
    const host::RoutineInfo &r = GetParam();
    for (const char *set : {"sse41", "avx2"}) {
        void *entry = ThePlugin().routine(set, r.name);
        ASSERT_NE(entry, nullptr) << set << " does not export " << r.name;
        host::Rng rng(11);
        const host::Outcome o = r.check(r.reference, entry, rng, host::FloatUlpsAllowed(set));
        EXPECT_GT(o.runs, 0);
        EXPECT_EQ(o.failures, 0) << set << ": " << o.firstFailure;
    }
}

TEST_P(BuiltRoutine, BothSetsAgree) {
    const host::RoutineInfo &r = GetParam();
    host::Rng rng(12);
    const host::Outcome o =
        r.check(ThePlugin().routine("sse41", r.name), ThePlugin().routine("avx2", r.name), rng, 1);
    EXPECT_EQ(o.failures, 0) << o.firstFailure;
}

INSTANTIATE_TEST_SUITE_P(All, BuiltRoutine, ::testing::ValuesIn(host::BuiltRoutines()),
                         [](const auto &info) { return std::string(info.param.name); });

const host::RoutineInfo &Find(const std::string &name) {
    for (const host::RoutineInfo &r : host::BuiltRoutines())
        if (name == r.name) return r;
    std::abort();
}

// Correct, except that it also writes the first byte of each row's padding.
void SetRectIntoThePadding(u8 *dst, int rows, int columns, int rowBytes, u8 value) {
    for (int y = 0; y < rows; ++y) {
        u8 *row = dst + long(y) * rowBytes;
        for (int x = 0; x < columns; ++x) row[x] = value;
        if (columns > 0 && rowBytes > columns && y + 1 < rows) row[columns] = value;
    }
}

// Correct, except that it writes one byte past the last row.
void SetRectPastTheEnd(u8 *dst, int rows, int columns, int rowBytes, u8 value) {
    host_ref::SetRect(dst, rows, columns, rowBytes, value);
    if (rows > 0 && columns > 0 && rowBytes > 0) dst[long(rows - 1) * rowBytes + columns] = value;
}

TEST(Checks, CatchAWriteIntoTheRowPadding) {
    const host::RoutineInfo &r = Find("SetRect");
    host::Rng rng(1);
    EXPECT_GT(r.check(r.reference, reinterpret_cast<void *>(&SetRectIntoThePadding), rng, 0).failures, 0);
}

TEST(ChecksDeathTest, AnOverrunFaultsOnTheGuardPage) {
    const host::RoutineInfo &r = Find("SetRect");
    EXPECT_DEATH(
        {
            host::Rng rng(1);
            r.check(r.reference, reinterpret_cast<void *>(&SetRectPastTheEnd), rng, 0);
        },
        "");
}

TEST(Manifest, ListsEveryRoutineAndSlotOnce) {
    const auto &rows = host::ManifestRows();
    EXPECT_EQ(rows.size(), 246u);
    std::set<std::string> names;
    std::set<std::pair<int, int>> slots;
    int slotCount = 0, unslotted = 0;
    for (const auto &row : rows) {
        EXPECT_TRUE(names.insert(row.name).second) << row.name;
        if (row.suite == halideqk::Suite::None) {
            EXPECT_TRUE(row.slots.empty()) << row.name;
            ++unslotted;
        }
        for (int s : row.slots) {
            EXPECT_TRUE(slots.insert({int(row.suite), s}).second) << row.name << " slot " << s;
            EXPECT_LT(s, halideqk::InfoOf(row.suite).copyLength);
            ++slotCount;
        }
    }
    EXPECT_EQ(slotCount, 161);
    EXPECT_EQ(unslotted, 100);
}

TEST(Manifest, BuiltRoutinesAreExportedAndPendingOnesAreNot) {
    for (const auto &row : host::ManifestRows()) {
        for (const char *set : {"sse41", "avx2"}) {
            const bool exported = ThePlugin().routine(set, row.name) != nullptr;
            EXPECT_EQ(exported, row.built) << set << " " << row.name;
        }
    }
}

}  // namespace
