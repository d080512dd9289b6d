// PluginMain and start-up: find and save the host's suites, detect the
// processor, install the routines, size the worker pool.
#include <cstring>

#include "HalideRuntime.h"
#include "frame/cpuinfo.h"
#include "frame/entry.h"
#include "frame/features.h"
#include "frame/startup_testing.h"
#include "frame/suites.h"

extern "C" {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    void **halideQKGlobal##Word##Routines = nullptr;         \
    void *halideQKOriginal##Word##QKTable[CopyLength] = {};
#include "frame/suites.def"
#undef QK_SUITE
}

namespace {

// Set once a start-up has installed the routines.  A second start-up would
// save tables that already hold the plug-in's routines (and the hook would
// then forward to itself), so it is answered with success and does nothing.
bool gStartedUp = false;

void **&LiveTable(halideqk::Suite suite) {
    switch (suite) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    case halideqk::Suite::Word: return halideQKGlobal##Word##Routines;
#include "frame/suites.def"
#undef QK_SUITE
        case halideqk::Suite::None: break;
    }
    __builtin_unreachable();
}

void **SavedCopy(halideqk::Suite suite) {
    switch (suite) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    case halideqk::Suite::Word: return halideQKOriginal##Word##QKTable;
#include "frame/suites.def"
#undef QK_SUITE
        case halideqk::Suite::None: break;
    }
    __builtin_unreachable();
}

// Looks every suite up in order and saves it; false at the first one missing
// or too old.  Copies already taken stay in place.
bool SaveSuites(ExtensionRecord *record) {
    for (const halideqk::SuiteInfo &info : halideqk::kSuites) {
        SuiteRecord *suite = FindSuite(record, info.id, info.version);
        if (suite == nullptr || suite->revision < info.minRevision) return false;
        std::memcpy(SavedCopy(info.suite), suite->routines, sizeof(void *) * info.copyLength);
        LiveTable(info.suite) = suite->routines;
    }
    return true;
}

void RunInstallers(ExtensionRecord *record) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) HalideQKInitialize##Word##Suite(record);
#include "frame/suites.def"
#undef QK_SUITE
}

}  // namespace

extern "C" void HalideQKDoInitialize(ExtensionRecord *record, int16_t *result) {
    if (gStartedUp) {
        *result = kResultOK;
        return;
    }
    if (!SaveSuites(record)) {
        *result = kResultStartupFailed;
        return;
    }
    *result = kResultOK;

    halideqk::DetectFeatures();
    RunInstallers(record);
    halide_set_num_threads(halideqk::WorkerThreads(CPUINFO::GetNumberofLogicalProcessors(),
                                                   CPUINFO::GetNumberofPhysicalProcessors()));
    gStartedUp = true;
    *result = kResultOK;
}

extern "C" void HalideQKDoTerminate() {}

void halideqk::ResetStartupForTesting() { gStartedUp = false; }

extern "C" void PluginMain(int32_t selector, ExtensionRecord *record, void *, int16_t *result) {
    *result = kResultOK;
    switch (selector) {
        case kSelectorAbout:
        case kSelectorShutdown:
            return;
        case kSelectorStartup:
            HalideQKDoInitialize(record, result);
            return;
        default:
            *result = kResultBadSelector;
            return;
    }
}
