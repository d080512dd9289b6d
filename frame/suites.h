// The host suites the plug-in needs, and the process-wide state start-up
// keeps for each: the live routine table and a saved copy of it.
#pragma once

#include <cstdint>

#include "frame/extension_record.h"

namespace halideqk {

enum class Suite {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) Word,
#include "frame/suites.def"
#undef QK_SUITE
    None,  // routines that no installer places in a slot
};

struct SuiteInfo {
    Suite suite;
    const char *word;
    uint32_t id;
    int version;
    int minRevision;
    int copyLength;
};

inline constexpr SuiteInfo kSuites[] = {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    {Suite::Word, #Word, FourCC(Id), Version, MinRevision, CopyLength},
#include "frame/suites.def"
#undef QK_SUITE
};
inline constexpr int kSuiteCount = sizeof(kSuites) / sizeof(kSuites[0]);

constexpr const SuiteInfo &InfoOf(Suite s) { return kSuites[static_cast<int>(s)]; }

}  // namespace halideqk

extern "C" {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    extern void **halideQKGlobal##Word##Routines;            \
    extern void *halideQKOriginal##Word##QKTable[CopyLength];
#include "frame/suites.def"
#undef QK_SUITE
}
