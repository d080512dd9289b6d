// The host's suite list, as the host lays it out in memory.
#pragma once

#include <cstddef>
#include <cstdint>

// One suite: a four-character id (first character in the most significant
// byte), an exact version, a revision, and the host's routine table.
struct SuiteRecord {
    uint32_t id;
    int16_t version;
    uint16_t revision;
    void **routines;
};

// The record the host passes to PluginMain: a field the plug-in ignores, the
// number of suite records, then the records one after another.
struct ExtensionRecord {
    uint32_t reserved;
    int32_t suiteCount;
    SuiteRecord suites[1];  // suiteCount records follow in the host's memory
};

static_assert(sizeof(SuiteRecord) == 16, "suite records are 16 bytes");
static_assert(offsetof(SuiteRecord, version) == 4 && offsetof(SuiteRecord, revision) == 6 &&
                  offsetof(SuiteRecord, routines) == 8,
              "suite record layout");
static_assert(offsetof(ExtensionRecord, suiteCount) == 4 && offsetof(ExtensionRecord, suites) == 8,
              "extension record layout");

// Packs a four-character code the way suite ids are packed: 'core' -> 0x636F7265.
constexpr uint32_t FourCC(const char (&code)[5]) {
    return (uint32_t(uint8_t(code[0])) << 24) | (uint32_t(uint8_t(code[1])) << 16) |
           (uint32_t(uint8_t(code[2])) << 8) | uint32_t(uint8_t(code[3]));
}

// The core suite's slot-5 routine, through which FindSuite asks the host for a
// suite it did not list: caller code, wanted id, and where to put the record.
using SuiteAcquireProc = unsigned char (*)(uint32_t caller, uint32_t suiteId, SuiteRecord **out);
