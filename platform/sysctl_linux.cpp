#include <cpuid.h>
#include <dirent.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <cstring>
#include <fstream>
#include <set>
#include <string>
#include <utility>

#include "platform/sysctl.h"

namespace qk_platform {

namespace {

SysctlFn gOverride = nullptr;

struct Cpuid {
    unsigned a = 0, b = 0, c = 0, d = 0;
};

Cpuid Leaf(unsigned leaf, unsigned sub = 0) {
    Cpuid r;
    if (!__get_cpuid_count(leaf, sub, &r.a, &r.b, &r.c, &r.d)) r = {};
    return r;
}

bool Bit(unsigned word, int bit) { return (word >> bit) & 1u; }

// AVX state must be enabled by the OS (XMM and YMM in XCR0), not just reported.
bool AvxUsable() {
    const Cpuid l1 = Leaf(1);
    if (!Bit(l1.c, 28) || !Bit(l1.c, 27)) return false;
    unsigned lo, hi;
    __asm__ volatile("xgetbv" : "=a"(lo), "=d"(hi) : "c"(0));
    return (lo & 0x6) == 0x6;
}

long ReadNumber(const std::string &path, long fallback) {
    std::ifstream in(path);
    long v;
    return (in >> v) ? v : fallback;
}

std::string ReadWord(const std::string &path) {
    std::ifstream in(path);
    std::string s;
    in >> s;
    return s;
}

// Online CPUs, and distinct (package, core) pairs among them.
std::pair<uint32_t, uint32_t> ProcessorCounts() {
    const long online = sysconf(_SC_NPROCESSORS_ONLN);
    const uint32_t logical = online > 0 ? uint32_t(online) : 1;
    std::set<std::pair<long, long>> cores;
    if (DIR *dir = opendir("/sys/devices/system/cpu")) {
        while (dirent *e = readdir(dir)) {
            const std::string name = e->d_name;
            if (name.size() < 4 || name.compare(0, 3, "cpu") != 0 ||
                name.find_first_not_of("0123456789", 3) != std::string::npos)
                continue;
            const std::string base = "/sys/devices/system/cpu/" + name;
            if (ReadNumber(base + "/online", 1) == 0) continue;
            const long package = ReadNumber(base + "/topology/physical_package_id", -1);
            const long core = ReadNumber(base + "/topology/core_id", -1);
            if (package < 0 || core < 0) continue;
            cores.insert({package, core});
        }
        closedir(dir);
    }
    const uint32_t physical = cores.empty() ? logical : uint32_t(cores.size());
    return {logical, physical};
}

uint64_t FrequencyHz() {
    const long khz = ReadNumber("/sys/devices/system/cpu/cpu0/cpufreq/cpuinfo_max_freq", 0);
    if (khz > 0) return uint64_t(khz) * 1000;
    std::ifstream in("/proc/cpuinfo");
    std::string line;
    while (std::getline(in, line)) {
        if (line.compare(0, 7, "cpu MHz") == 0) {
            const size_t colon = line.find(':');
            if (colon != std::string::npos) return uint64_t(std::stod(line.substr(colon + 1)) * 1e6);
        }
    }
    return 0;
}

// Size in bytes of the first cache of `level` whose type is one of `types`.
uint64_t CacheSize(int level, const char *type) {
    for (int i = 0; i < 16; ++i) {
        const std::string base = "/sys/devices/system/cpu/cpu0/cache/index" + std::to_string(i);
        const long l = ReadNumber(base + "/level", -1);
        if (l < 0) break;
        const std::string t = ReadWord(base + "/type");
        if (l != level || (t != type && t != "Unified")) continue;
        std::string size = ReadWord(base + "/size");  // e.g. "32K"
        if (size.empty()) return 0;
        uint64_t scale = 1;
        const char unit = size.back();
        if (unit == 'K') scale = 1024;
        if (unit == 'M') scale = 1024 * 1024;
        if (unit == 'K' || unit == 'M') size.pop_back();
        return uint64_t(std::stoull(size)) * scale;
    }
    return 0;
}

std::string Vendor() {
    const Cpuid l0 = Leaf(0);
    char text[13] = {};
    std::memcpy(text, &l0.b, 4);
    std::memcpy(text + 4, &l0.d, 4);
    std::memcpy(text + 8, &l0.c, 4);
    return text;
}

int Answer(const void *value, size_t size, void *oldp, size_t *oldlenp) {
    if (oldlenp == nullptr) {
        errno = EINVAL;
        return -1;
    }
    if (oldp != nullptr) std::memcpy(oldp, value, std::min(*oldlenp, size));
    *oldlenp = oldp != nullptr ? std::min(*oldlenp, size) : size;
    return 0;
}

int Answer32(uint32_t v, void *oldp, size_t *oldlenp) { return Answer(&v, sizeof v, oldp, oldlenp); }
int Answer64(uint64_t v, void *oldp, size_t *oldlenp) { return Answer(&v, sizeof v, oldp, oldlenp); }

int Machine(const char *name, void *oldp, size_t *oldlenp, void *newp, size_t) {
    if (newp != nullptr) {
        errno = EPERM;
        return -1;
    }
    const std::string key = name ? name : "";
    const Cpuid l1 = Leaf(1);
    const unsigned maxLeaf = Leaf(0).a;
    const Cpuid l7 = maxLeaf >= 7 ? Leaf(7, 0) : Cpuid{};
    const bool avx = AvxUsable();

    if (key == "hw.logicalcpu") return Answer32(ProcessorCounts().first, oldp, oldlenp);
    if (key == "hw.physicalcpu") return Answer32(ProcessorCounts().second, oldp, oldlenp);
    if (key == "hw.cpufrequency") return Answer64(FrequencyHz(), oldp, oldlenp);
    if (key == "machdep.cpu.stepping") return Answer32(l1.a & 0xF, oldp, oldlenp);
    if (key == "machdep.cpu.model") return Answer32((l1.a >> 4) & 0xF, oldp, oldlenp);
    if (key == "machdep.cpu.family") return Answer32((l1.a >> 8) & 0xF, oldp, oldlenp);
    if (key == "machdep.cpu.extmodel") return Answer32((l1.a >> 16) & 0xF, oldp, oldlenp);
    if (key == "machdep.cpu.extfamily") return Answer32((l1.a >> 20) & 0xFF, oldp, oldlenp);
    if (key == "machdep.cpu.vendor") {
        const std::string v = Vendor();
        return Answer(v.c_str(), v.size() + 1, oldp, oldlenp);
    }
    if (key == "hw.l1icachesize") return Answer64(CacheSize(1, "Instruction"), oldp, oldlenp);
    if (key == "hw.l2cachesize") return Answer64(CacheSize(2, "Unified"), oldp, oldlenp);

    struct Flag {
        const char *key;
        bool present;
    };
    const Flag flags[] = {
        {"hw.optional.mmx", Bit(l1.d, 23)},
        {"hw.optional.sse", Bit(l1.d, 25)},
        {"hw.optional.sse2", Bit(l1.d, 26)},
        {"hw.optional.sse3", Bit(l1.c, 0)},
        {"hw.optional.supplementalsse3", Bit(l1.c, 9)},
        {"hw.optional.sse4_1", Bit(l1.c, 19)},
        {"hw.optional.sse4_2", Bit(l1.c, 20)},
        {"hw.optional.avx1_0", avx},
        {"hw.optional.avx2_0", avx && Bit(l7.b, 5)},
        {"hw.optional.fma", avx && Bit(l1.c, 12)},
        {"hw.optional.floatingpoint", Bit(l1.d, 0)},
    };
    for (const Flag &f : flags)
        if (key == f.key) return Answer32(f.present ? 1 : 0, oldp, oldlenp);

    errno = ENOENT;
    return -1;
}

}  // namespace

int sysctlbyname(const char *name, void *oldp, size_t *oldlenp, void *newp, size_t newlen) {
    return (gOverride ? gOverride : Machine)(name, oldp, oldlenp, newp, newlen);
}

void SetSysctlForTesting(SysctlFn fn) { gOverride = fn; }

}  // namespace qk_platform
