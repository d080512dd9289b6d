// Loading the plug-in the way the editor does, and reaching its exports.
#pragma once

#include <cstdint>
#include <string>

#include "frame/extension_record.h"

namespace host {

class Plugin {
public:
    // dlopen()s the library at `path`; aborts with a message if it cannot.
    explicit Plugin(const std::string &path);

    void pluginMain(int32_t selector, ExtensionRecord *record, int16_t *result) const;

    // Any exported symbol, or null.
    void *symbol(const char *name) const;

    // The value of a routine-set entry, halide_<set>::HalideQK<name>, or null
    // when the plug-in does not export it.  `set` is "sse41" or "avx2".
    void *routine(const std::string &set, const std::string &name) const;

private:
    void *handle_ = nullptr;
    using MainProc = void (*)(int32_t, ExtensionRecord *, void *, int16_t *);
    MainProc main_ = nullptr;
};

// Where the build put the plug-in (overridable with HALIDEQK_PLUGIN).
std::string DefaultPluginPath();

}  // namespace host
