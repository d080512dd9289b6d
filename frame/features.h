// Processor feature flags, filled once at start-up, one byte each (1 = present).
#pragma once

#include <cstdint>

extern "C" {
extern uint8_t gHalideSSE2Support;
extern uint8_t gHalideSSE3Support;
extern uint8_t gHalideSSSE3Support;
extern uint8_t gHalideSSE41Support;
extern uint8_t gHalideAVXSupport;
extern uint8_t gHalideAVX2Support;
extern uint8_t gHalideFMASupport;
}

namespace halideqk {

// Queries the features as a chain SSE2 -> SSE3 -> SSSE3 -> SSE4.1 -> AVX ->
// AVX2 -> FMA: a link is asked only when the one before it answered yes, and
// a no clears its own flag and every later one.
void DetectFeatures();

// The instruction set whose routines the installers place.
enum class RoutineSet { None, SSE41, AVX2 };
RoutineSet ChosenRoutineSet();
const char *RoutineSetName(RoutineSet set);

// Worker-pool size for L logical and P physical processors: L when L <= 28,
// otherwise min(L, P).
int WorkerThreads(uint32_t logical, uint32_t physical);

}  // namespace halideqk
