#include "frame/features.h"

#include <algorithm>

#include "frame/cpuinfo.h"

extern "C" {
uint8_t gHalideSSE2Support = 0;
uint8_t gHalideSSE3Support = 0;
uint8_t gHalideSSSE3Support = 0;
uint8_t gHalideSSE41Support = 0;
uint8_t gHalideAVXSupport = 0;
uint8_t gHalideAVX2Support = 0;
uint8_t gHalideFMASupport = 0;
}

namespace halideqk {

void DetectFeatures() {
    struct Link {
        uint8_t *flag;
        bool (*query)();
    };
    const Link chain[] = {
        {&gHalideSSE2Support, [] { return bool(CPUINFO::SSE2Available()); }},
        {&gHalideSSE3Support, [] { return bool(CPUINFO::SSE3Available()); }},
        {&gHalideSSSE3Support, [] { return bool(CPUINFO::SSSE3Available()); }},
        {&gHalideSSE41Support, [] { return bool(CPUINFO::SSE4_1Available()); }},
        {&gHalideAVXSupport, [] { return bool(CPUINFO::AVXAvailable()); }},
        {&gHalideAVX2Support, [] { return bool(CPUINFO::AVX2Available()); }},
        {&gHalideFMASupport, [] { return bool(CPUINFO::FMAAvailable()); }},
    };
    bool present = true;
    for (const Link &link : chain) {
        present = present && link.query();
        *link.flag = present ? 1 : 0;
    }
}

RoutineSet ChosenRoutineSet() {
    if (gHalideAVX2Support == 1 && gHalideFMASupport == 1) return RoutineSet::AVX2;
    if (gHalideSSE41Support == 1) return RoutineSet::SSE41;
    return RoutineSet::None;
}

const char *RoutineSetName(RoutineSet set) {
    switch (set) {
        case RoutineSet::AVX2: return "AVX2+FMA";
        case RoutineSet::SSE41: return "SSE4.1";
        case RoutineSet::None: break;
    }
    return "none";
}

int WorkerThreads(uint32_t logical, uint32_t physical) {
    const uint32_t threads = logical <= 28 ? logical : std::min(logical, physical);
    return static_cast<int>(threads);
}

}  // namespace halideqk
