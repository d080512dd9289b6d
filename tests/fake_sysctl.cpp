#include "tests/fake_sysctl.h"

#include <cerrno>
#include <cstring>

#include "frame/cpuinfo.h"
#include "platform/sysctl.h"

namespace {
FakeSysctl *gActive = nullptr;
}

const std::vector<std::string> FakeSysctl::kAllFeatures = {
    "mmx", "sse", "sse2", "sse3", "supplementalsse3", "sse4_1", "sse4_2", "avx1_0", "avx2_0", "fma",
    "floatingpoint"};

FakeSysctl::FakeSysctl() {
    gActive = this;
    qk_platform::SetSysctlForTesting(&FakeSysctl::Answer);
    halideqk::CpuInfoResetForTesting();
    SetProcessors(2, 2);
}

FakeSysctl::~FakeSysctl() {
    qk_platform::SetSysctlForTesting(nullptr);
    gActive = nullptr;
    halideqk::CpuInfoResetForTesting();
}

void FakeSysctl::SetBytes(const std::string &key, std::vector<uint8_t> value) {
    values_[key] = std::move(value);
}

void FakeSysctl::SetInt(const std::string &key, uint32_t value) {
    std::vector<uint8_t> bytes(sizeof value);
    std::memcpy(bytes.data(), &value, sizeof value);
    SetBytes(key, bytes);
}

void FakeSysctl::SetU64(const std::string &key, uint64_t value) {
    std::vector<uint8_t> bytes(sizeof value);
    std::memcpy(bytes.data(), &value, sizeof value);
    SetBytes(key, bytes);
}

void FakeSysctl::SetString(const std::string &key, const std::string &value) {
    SetBytes(key, std::vector<uint8_t>(value.c_str(), value.c_str() + value.size() + 1));
}

void FakeSysctl::Remove(const std::string &key) { values_.erase(key); }

void FakeSysctl::SetFeatures(const std::vector<std::string> &features) {
    for (const std::string &f : features) SetInt("hw.optional." + f, 1);
}

void FakeSysctl::SetProcessors(uint32_t logical, uint32_t physical) {
    SetInt("hw.logicalcpu", logical);
    SetInt("hw.physicalcpu", physical);
}

int FakeSysctl::queries(const std::string &key) const {
    auto it = queries_.find(key);
    return it == queries_.end() ? 0 : it->second;
}

int FakeSysctl::Answer(const char *name, void *oldp, size_t *oldlenp, void *, size_t) {
    ++gActive->queries_[name];
    auto it = gActive->values_.find(name);
    if (it == gActive->values_.end()) {
        errno = ENOENT;
        return -1;
    }
    const std::vector<uint8_t> &v = it->second;
    if (oldp == nullptr) {
        *oldlenp = v.size();
        return 0;
    }
    const size_t n = std::min(*oldlenp, v.size());
    std::memcpy(oldp, v.data(), n);
    *oldlenp = n;
    return 0;
}
