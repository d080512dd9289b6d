// Suite lookup: the host's own list first, then the core suite's acquire routine.
#include "frame/entry.h"

namespace {

constexpr uint32_t kCoreId = FourCC("core");
constexpr int kCoreAcquireVersion = 4;
constexpr uint16_t kCoreAcquireMinRevision = 5;
constexpr int kCoreAcquireSlot = 5;
constexpr uint32_t kCallerCode = FourCC("QKXT");

}  // namespace

extern "C" SuiteRecord *FindSuite(ExtensionRecord *record, uint32_t id, int version) {
    const int32_t count = record->suiteCount;
    if (count < 1) return nullptr;

    SuiteRecord *core = nullptr;  // the last 'core' version 4 record in the list
    for (int32_t i = 0; i < count; ++i) {
        SuiteRecord *suite = &record->suites[i];
        if (suite->id == id && suite->version == version) return suite;
        if (suite->id == kCoreId && suite->version == kCoreAcquireVersion) core = suite;
    }

    if (core == nullptr || core->revision < kCoreAcquireMinRevision) return nullptr;

    auto acquire = reinterpret_cast<SuiteAcquireProc>(core->routines[kCoreAcquireSlot]);
    SuiteRecord *found = nullptr;
    if (acquire(kCallerCode, id, &found) == 0) return nullptr;
    if (found == nullptr || found->version != version) return nullptr;
    return found;
}
