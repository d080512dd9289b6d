#include <string>

#include "host/commands.h"
#include "host/routine_list.h"

namespace host {

int Verify(const Plugin &plugin, HostRecord &record, std::FILE *out) {
    const bool avx2 = plugin.routine("avx2", "SetRect") != nullptr;  // exported at all?
    (void)avx2;
    int failures = 0;
    std::fprintf(out, "%-22s %-14s %-22s %-22s %s\n", "routine", "slots", "SSE4.1", "AVX2", "slot");
    for (const RoutineInfo &r : BuiltRoutines()) {
        std::string cells[2];
        const char *sets[] = {"sse41", "avx2"};
        void *entries[2] = {};
        for (int s = 0; s < 2; ++s) {
            entries[s] = plugin.routine(sets[s], r.name);
            if (entries[s] == nullptr) {
                cells[s] = "FAIL not exported";
                ++failures;
                continue;
            }
            Rng rng(2024 + s);
            Outcome o = r.check(r.reference, entries[s], rng, FloatUlpsAllowed(sets[s]));
            failures += o.failures != 0;
            cells[s] = o.failures == 0 ? "pass (" + std::to_string(o.runs) + " cases)"
                                       : "FAIL " + o.firstFailure;
        }

        // A patched slot holds the chosen set's entry, and running it through
        // the table matches the host as well.
        std::string slot = "-";
        if (r.suite != halideqk::Suite::None) {
            void *chosen = record.table(r.suite)[r.slots.front()];
            bool ok = chosen == entries[0] || chosen == entries[1];
            for (int s : r.slots) ok = ok && record.table(r.suite)[s] == chosen;
            if (ok) {
                Rng rng(99);
                ok = r.check(r.reference, chosen, rng, FloatUlpsAllowed(sets[chosen == entries[1]])).failures == 0;
            }
            slot = ok ? (chosen == entries[1] ? "AVX2" : "SSE4.1") : "FAIL";
            failures += !ok;
        }
        std::fprintf(out, "%-22s %-14s %-22s %-22s %s\n", r.name, SlotText(r).c_str(),
                     cells[0].c_str(), cells[1].c_str(), slot.c_str());
    }

    // Every slot the manifest does not give a built routine is still the host's.
    int untouchedBad = 0;
    for (const halideqk::SuiteInfo &info : halideqk::kSuites) {
        for (int i = 0; i < info.copyLength; ++i) {
            bool listed = info.suite == halideqk::Suite::Core && i == 3;
            for (const RoutineInfo &r : BuiltRoutines())
                if (r.suite == info.suite)
                    for (int s : r.slots) listed = listed || s == i;
            if (!listed && record.table(info.suite)[i] != record.pristine(info.suite)[i]) ++untouchedBad;
        }
    }
    std::fprintf(out, "unlisted slots changed: %d\n", untouchedBad);
    failures += untouchedBad;
    std::fprintf(out, "verify: %s (%d failure%s)\n", failures ? "FAILED" : "all passed", failures,
                 failures == 1 ? "" : "s");
    return failures;
}

}  // namespace host
