// The plug-in's exported entry points.
#pragma once

#include <cstdint>

#include "frame/extension_record.h"

inline constexpr int16_t kResultOK = 0;
inline constexpr int16_t kResultStartupFailed = -30900;
inline constexpr int16_t kResultBadSelector = -30300;

inline constexpr int32_t kSelectorAbout = 0;
inline constexpr int32_t kSelectorStartup = 1;
inline constexpr int32_t kSelectorShutdown = 2;

extern "C" {
void PluginMain(int32_t selector, ExtensionRecord *record, void *unused, int16_t *result);
void HalideQKDoInitialize(ExtensionRecord *record, int16_t *result);
void HalideQKDoTerminate();
SuiteRecord *FindSuite(ExtensionRecord *record, uint32_t id, int version);

#define QK_SUITE(Word, Id, Version, MinRevision, CopyLength) \
    int HalideQKInitialize##Word##Suite(ExtensionRecord *record);
#include "frame/suites.def"
#undef QK_SUITE
}
