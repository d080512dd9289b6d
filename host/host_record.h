// The reference host's side of start-up: the eleven suites with their routine
// tables, the core routines the plug-in relies on, and the extension record
// that lists them.
#pragma once

#include <cstdint>
#include <vector>

#include "frame/extension_record.h"
#include "frame/suites.h"

namespace host {

// What the host's own core slot-3 routine last received.
struct NoiseAnnouncement {
    const uint8_t *data = nullptr;
    uint32_t length = 0;
    uint32_t wrap = 0;
    int calls = 0;
};
extern NoiseAnnouncement gLastNoise;

// The host's core slot-3 routine: takes its noise buffer's address, size and
// wrap distance, records them, and answers the size.
uint32_t HostNoiseRoutine(const uint8_t *data, uint32_t length, uint32_t wrap);

class HostRecord {
public:
    // Builds all eleven suites at their versions and minimum revisions, each
    // table exactly as long as the plug-in's saved copy, each slot holding the
    // host's own routine (the reference routine of a built routine in its
    // slots, a routine the plug-in never replaces elsewhere).
    HostRecord();

    ExtensionRecord *record() { return reinterpret_cast<ExtensionRecord *>(words_.data()); }

    // The table of `suite`, and the copy taken before start-up.
    void **table(halideqk::Suite suite) { return tables_[int(suite)].data(); }
    const std::vector<void *> &pristine(halideqk::Suite suite) const {
        return pristine_[int(suite)];
    }
    void snapshot();  // re-takes every pristine copy

    // Record editing for start-up tests.
    SuiteRecord &suite(int index);
    void setSuiteCount(int32_t count);
    void appendSuite(const SuiteRecord &record);

    // The host's noise buffer, announced through core slot 3.
    const std::vector<uint8_t> &noise() const { return noise_; }
    void announceNoise();

private:
    void rebuildRecord();

    std::vector<std::vector<void *>> tables_;
    std::vector<std::vector<void *>> pristine_;
    std::vector<SuiteRecord> suites_;
    std::vector<uint64_t> words_;  // the extension record, 8-byte aligned
    std::vector<uint8_t> noise_;
};

}  // namespace host

namespace host {

// The core suite's slot-5 routine: hands out the suites offered here.
struct AcquireLog {
    int calls = 0;
    uint32_t caller = 0;
    uint32_t suiteId = 0;
    bool outWasNull = false;
};
extern AcquireLog gAcquireLog;
void OfferThroughAcquire(const SuiteRecord &record);
void ClearAcquirable();
unsigned char HostAcquireSuite(uint32_t caller, uint32_t suiteId, SuiteRecord **out);

}  // namespace host
