#include <cstdint>

#include "frame/entry.h"
#include "host/commands.h"

namespace host {

namespace {

uint8_t Flag(const Plugin &plugin, const char *name) {
    auto *flag = static_cast<const uint8_t *>(plugin.symbol(name));
    return flag ? *flag : 0;
}

// The worker count start-up chose, read back without changing it.
int WorkerThreads(const Plugin &plugin) {
    auto set = reinterpret_cast<int (*)(int)>(plugin.symbol("halide_set_num_threads"));
    if (set == nullptr) return -1;
    const int threads = set(1);
    set(threads);
    return threads;
}

}  // namespace

bool StartupSummary(const Plugin &plugin, HostRecord &record, std::FILE *out) {
    int16_t result = 1;
    plugin.pluginMain(kSelectorStartup, record.record(), &result);
    std::fprintf(out, "start-up result: %d\n", result);
    if (result != kResultOK) return false;

    const char *names[] = {"SSE2", "SSE3", "SSSE3", "SSE41", "AVX", "AVX2", "FMA"};
    std::fprintf(out, "features:");
    for (const char *n : names) {
        const std::string symbol = std::string("gHalide") + n + "Support";
        std::fprintf(out, " %s=%d", n, Flag(plugin, symbol.c_str()));
    }
    const bool avx2 = Flag(plugin, "gHalideAVX2Support") && Flag(plugin, "gHalideFMASupport");
    const bool sse41 = Flag(plugin, "gHalideSSE41Support");
    std::fprintf(out, "\nroutine set: %s\n", avx2 ? "AVX2+FMA" : sse41 ? "SSE4.1" : "none");
    std::fprintf(out, "worker threads: %d\n", WorkerThreads(plugin));

    std::fprintf(out, "slots patched:");
    for (const halideqk::SuiteInfo &info : halideqk::kSuites) {
        int changed = 0;
        for (int i = 0; i < info.copyLength; ++i)
            changed += record.table(info.suite)[i] != record.pristine(info.suite)[i];
        std::fprintf(out, " %s=%d", info.word, changed);
    }
    std::fprintf(out, "\n");
    return true;
}

}  // namespace host
