// Where the host keeps its noise bytes, as announced through core slot 3,
// and the division table the 8-bit brush kernels read.
#pragma once

#include <cstdint>

extern "C" {
extern const uint8_t *gNoiseData;
extern const uint8_t *gNoisePtr;
extern uint32_t gNoiseLength;
extern uint32_t gNoiseWrap;
extern const uint8_t *gNoiseLimit;

// 256 x 256 rounded quotients, entry (a, b) at a * 256 + b.
extern uint8_t pDivTable[256 * 256];

// Routine placed in core slot 3: records (p, n, w) and tail-calls the host's
// own slot-3 routine with every argument it received.
void HalideQKCoreNoiseHook();

const uint8_t *HalideQKGetNoiseTable();
int HalideInitAsmLoops();
}

namespace halideqk {
void BuildDivisionTable();
}
