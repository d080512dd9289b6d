// A scripted machine for tests: while a FakeSysctl lives, every system query
// of the plug-in is answered from its table (unknown keys: ENOENT), and the
// CPU information is re-read from it.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <vector>

class FakeSysctl {
public:
    // SSE2, SSE3, SSSE3, SSE4.1, SSE4.2, AVX, AVX2, FMA (and MMX, SSE, FPU) present.
    static const std::vector<std::string> kAllFeatures;

    FakeSysctl();  // an empty machine: every key is unknown
    ~FakeSysctl();

    void SetInt(const std::string &key, uint32_t value);
    void SetU64(const std::string &key, uint64_t value);
    void SetString(const std::string &key, const std::string &value);  // stored with its NUL
    void SetBytes(const std::string &key, std::vector<uint8_t> value);
    void Remove(const std::string &key);

    // Sets each "hw.optional.*" key named (short names: "sse4_1", "avx2_0", ...) to 1.
    void SetFeatures(const std::vector<std::string> &features);
    void SetProcessors(uint32_t logical, uint32_t physical);

    int queries(const std::string &key) const;  // calls made for `key`

private:
    static int Answer(const char *name, void *oldp, size_t *oldlenp, void *newp, size_t newlen);
    std::map<std::string, std::vector<uint8_t>> values_;
    std::map<std::string, int> queries_;
};
