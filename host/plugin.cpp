#include "host/plugin.h"

#include <dlfcn.h>

#include <cstdio>
#include <cstdlib>

namespace host {

Plugin::Plugin(const std::string &path) {
    handle_ = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (handle_ == nullptr) {
        std::fprintf(stderr, "cannot load plug-in %s: %s\n", path.c_str(), dlerror());
        std::exit(2);
    }
    main_ = reinterpret_cast<MainProc>(dlsym(handle_, "PluginMain"));
    if (main_ == nullptr) {
        std::fprintf(stderr, "%s exports no PluginMain\n", path.c_str());
        std::exit(2);
    }
}

void Plugin::pluginMain(int32_t selector, ExtensionRecord *record, int16_t *result) const {
    main_(selector, record, nullptr, result);
}

void *Plugin::symbol(const char *name) const { return dlsym(handle_, name); }

void *Plugin::routine(const std::string &set, const std::string &name) const {
    // Itanium mangling of the namespace-scope variable halide_<set>::HalideQK<name>.
    const std::string ns = "halide_" + set;
    const std::string var = "HalideQK" + name;
    const std::string mangled =
        "_ZN" + std::to_string(ns.size()) + ns + std::to_string(var.size()) + var + "E";
    void **entry = static_cast<void **>(dlsym(handle_, mangled.c_str()));
    return entry == nullptr ? nullptr : *entry;
}

std::string DefaultPluginPath() {
    if (const char *env = std::getenv("HALIDEQK_PLUGIN")) return env;
    return HALIDEQK_PLUGIN_PATH;
}

}  // namespace host
