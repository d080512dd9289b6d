#include "frame/noise.h"

extern "C" {
const uint8_t *gNoiseData = nullptr;
const uint8_t *gNoisePtr = nullptr;
uint32_t gNoiseLength = 0;
uint32_t gNoiseWrap = 0;
const uint8_t *gNoiseLimit = nullptr;

const uint8_t *HalideQKGetNoiseTable() { return gNoiseData; }
}
