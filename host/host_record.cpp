#include "host/host_record.h"

#include <cstring>
#include <initializer_list>

#include "host/reference_routines.h"

namespace host {

NoiseAnnouncement gLastNoise;
AcquireLog gAcquireLog;

namespace {

std::vector<SuiteRecord> gAcquirable;

constexpr int kCoreNoiseSlot = 3;
constexpr int kCoreAcquireSlot = 5;
constexpr uint32_t kNoiseBytes = 1 << 16;

}  // namespace

void NotReplaced() {}

uint32_t HostNoiseRoutine(const uint8_t *data, uint32_t length, uint32_t wrap) {
    gLastNoise.data = data;
    gLastNoise.length = length;
    gLastNoise.wrap = wrap;
    ++gLastNoise.calls;
    return length;
}

void OfferThroughAcquire(const SuiteRecord &record) { gAcquirable.push_back(record); }
void ClearAcquirable() { gAcquirable.clear(); }

unsigned char HostAcquireSuite(uint32_t caller, uint32_t suiteId, SuiteRecord **out) {
    ++gAcquireLog.calls;
    gAcquireLog.caller = caller;
    gAcquireLog.suiteId = suiteId;
    gAcquireLog.outWasNull = *out == nullptr;
    for (SuiteRecord &record : gAcquirable) {
        if (record.id == suiteId) {
            *out = &record;
            return 1;
        }
    }
    return 0;
}

HostRecord::HostRecord() {
    using halideqk::Suite;
    for (const halideqk::SuiteInfo &info : halideqk::kSuites) {
        tables_.emplace_back(info.copyLength, reinterpret_cast<void *>(&NotReplaced));
        suites_.push_back(SuiteRecord{info.id, int16_t(info.version), uint16_t(info.minRevision),
                                      nullptr});
    }
    for (size_t i = 0; i < suites_.size(); ++i) suites_[i].routines = tables_[i].data();

    void **core = table(Suite::Core);
    core[kCoreNoiseSlot] = reinterpret_cast<void *>(&HostNoiseRoutine);
    core[kCoreAcquireSlot] = reinterpret_cast<void *>(&HostAcquireSuite);

#define QK_BRACE(...) {__VA_ARGS__}
#define QK_TODO(...)
#define QK_BUILT(Name, Sig, SuiteWord, Slots, ...)                                       \
    if (Suite::SuiteWord != Suite::None) {                                               \
        for (int slot : std::initializer_list<int> QK_BRACE Slots)                       \
            table(Suite::SuiteWord)[slot] = reinterpret_cast<void *>(&host_ref::Name);   \
    }
#include "adapters/routines.def"
#undef QK_BUILT
#undef QK_TODO
#undef QK_BRACE

    noise_.resize(kNoiseBytes);
    uint32_t state = 12345;
    for (uint8_t &b : noise_) {
        state = state * 1103515245u + 12345u;
        b = uint8_t(state >> 24);
    }
    rebuildRecord();
    snapshot();
}

void HostRecord::snapshot() {
    pristine_.clear();
    for (auto &t : tables_) pristine_.push_back(t);
}

SuiteRecord &HostRecord::suite(int index) { return reinterpret_cast<SuiteRecord *>(words_.data() + 1)[index]; }

void HostRecord::setSuiteCount(int32_t count) {
    int32_t *fields = reinterpret_cast<int32_t *>(words_.data());
    fields[1] = count;
}

void HostRecord::appendSuite(const SuiteRecord &record) {
    suites_.push_back(record);
    rebuildRecord();
}

void HostRecord::rebuildRecord() {
    words_.assign(1 + 2 * suites_.size(), 0);
    int32_t *fields = reinterpret_cast<int32_t *>(words_.data());
    fields[1] = int32_t(suites_.size());
    std::memcpy(words_.data() + 1, suites_.data(), suites_.size() * sizeof(SuiteRecord));
}

void HostRecord::announceNoise() {
    auto announce = reinterpret_cast<uint32_t (*)(const uint8_t *, uint32_t, uint32_t)>(
        table(halideqk::Suite::Core)[kCoreNoiseSlot]);
    announce(noise_.data(), uint32_t(noise_.size()), uint32_t(noise_.size()));
}

}  // namespace host
