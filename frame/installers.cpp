// The installers: one per host suite, in start-up order.  The kernel
// installers copy routine-set entries into the slots the manifest gives them,
// from the AVX2+FMA set when the processor has both, else from the SSE4.1
// set when it has SSE4.1, else not at all.
#include <initializer_list>

#include "adapters/routine_set.h"
#include "frame/entry.h"
#include "frame/features.h"
#include "frame/noise.h"
#include "frame/suites.h"

namespace {

using halideqk::Suite;

// Stores every built routine of `suite` from the chosen set into `table`.
template <Suite S>
void InstallSuite() {
    const halideqk::RoutineSet set = halideqk::ChosenRoutineSet();
    if (set == halideqk::RoutineSet::None) return;
    const bool avx2 = set == halideqk::RoutineSet::AVX2;
    void **table = nullptr;
    switch (S) {
#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    case Suite::Word: table = halideQKGlobal##Word##Routines; break;
#include "frame/suites.def"
#undef QK_SUITE
        case Suite::None: return;
    }

#define QK_BRACE(...) {__VA_ARGS__}
#define QK_TODO(...)
#define QK_BUILT(Name, Sig, SuiteWord, Slots, ...)                                            \
    if constexpr (Suite::SuiteWord == S) {                                                    \
        void *entry = avx2 ? reinterpret_cast<void *>(halide_avx2::HalideQK##Name)            \
                           : reinterpret_cast<void *>(halide_sse41::HalideQK##Name);          \
        for (int slot : std::initializer_list<int> QK_BRACE Slots) table[slot] = entry;       \
    }
#include "adapters/routines.def"
#undef QK_BUILT
#undef QK_TODO
#undef QK_BRACE
    (void)avx2;
    (void)table;
}

}  // namespace

extern "C" {

int HalideQKInitializeCoreSuite(ExtensionRecord *) {
    halideQKGlobalCoreRoutines[3] = reinterpret_cast<void *>(&HalideQKCoreNoiseHook);
    halideqk::BuildDivisionTable();
    return 1;
}

// These suites are looked up and saved, but the plug-in replaces nothing in them.
int HalideQKInitializeFileSuite(ExtensionRecord *) { return 1; }
int HalideQKInitializeSelectSuite(ExtensionRecord *) { return 1; }
int HalideQKInitializeResampleSuite(ExtensionRecord *) { return 1; }
int HalideQKInitializeDisplaySuite(ExtensionRecord *) { return 1; }
int HalideQKInitializeRasterSuite(ExtensionRecord *) { return 1; }

int HalideQKInitializeFilterSuite(ExtensionRecord *) { InstallSuite<Suite::Filter>(); return 1; }
int HalideQKInitializeMemorySuite(ExtensionRecord *) { InstallSuite<Suite::Memory>(); return 1; }
int HalideQKInitializePaintSuite(ExtensionRecord *) { InstallSuite<Suite::Paint>(); return 1; }
int HalideQKInitializeBlendSuite(ExtensionRecord *) { InstallSuite<Suite::Blend>(); return 1; }
int HalideQKInitializeConvertSuite(ExtensionRecord *) { InstallSuite<Suite::Convert>(); return 1; }

}  // extern "C"
