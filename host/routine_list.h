// The manifest as the reference host sees it: every built routine with its
// slots, the host's own routine, and the check for its signature.
#pragma once

#include <ostream>
#include <string>
#include <vector>

#include "frame/suites.h"
#include "host/cases.h"
#include "host/workloads.h"

namespace host {

struct RoutineInfo {
    const char *name;
    const char *signature;
    halideqk::Suite suite;
    std::vector<int> slots;
    void *reference;  // the host's scalar routine
    // Runs the signature's cases with `reference` against `candidate`; float
    // results may differ by `ulps` units in the last place.
    Outcome (*check)(void *reference, void *candidate, Rng &rng, int ulps);
    // Builds a benchmark workload for any routine of this signature.
    Workload (*workload)(void *routine, int rows, int columns);
};

const std::vector<RoutineInfo> &BuiltRoutines();

// Test output names a routine by its name.
inline void PrintTo(const RoutineInfo &r, std::ostream *os) { *os << r.name; }

struct ManifestRow {
    const char *name;
    const char *signature;
    halideqk::Suite suite;
    std::vector<int> slots;
    bool built;
};
// Every row of the manifest, built or not.
const std::vector<ManifestRow> &ManifestRows();

std::string SlotText(const RoutineInfo &r);

// Units in the last place a float result of routine set `set` ("sse41" or
// "avx2") may differ from the host's; integer results never differ.
inline int FloatUlpsAllowed(const std::string &set) { return set == "avx2" ? 1 : 0; }

}  // namespace host
