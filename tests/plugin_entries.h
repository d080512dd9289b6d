// The plug-in as the tests load it, and its routine-set entries by name.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "host/plugin.h"

namespace test {

inline const host::Plugin &ThePlugin() {
    static host::Plugin plugin(host::DefaultPluginPath());
    return plugin;
}

// The entry `name` of routine set `set`, typed as `Sig`; a missing entry
// fails the test and comes back null.
template <typename Sig>
Sig *Entry(const char *set, const std::string &name) {
    void *p = ThePlugin().routine(set, name);
    if (!p) ADD_FAILURE() << set << " does not export " << name;
    return reinterpret_cast<Sig *>(p);
}

inline const char *const kSets[] = {"sse41", "avx2"};

}  // namespace test
