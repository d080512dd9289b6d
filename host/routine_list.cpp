#include "host/routine_list.h"

#include "host/reference_routines.h"

namespace host {

namespace {

template <typename Sig>
Outcome Check(void *reference, void *candidate, Rng &rng, int ulps) {
    return CasesFor<Sig>::run(reinterpret_cast<Sig *>(reference), reinterpret_cast<Sig *>(candidate),
                              rng, ulps);
}

}  // namespace

#define QK_BRACE(...) {__VA_ARGS__}

const std::vector<RoutineInfo> &BuiltRoutines() {
    static const std::vector<RoutineInfo> list = {
#define QK_TODO(...)
#define QK_BUILT(Name, Sig, SuiteWord, Slots, ...)                                          \
    {#Name, #Sig, halideqk::Suite::SuiteWord, std::vector<int> QK_BRACE Slots,               \
     reinterpret_cast<void *>(&host_ref::Name), &Check<halideqk::sig::Sig>,       \
     &MakeWorkload<halideqk::sig::Sig>},
#include "adapters/routines.def"
#undef QK_BUILT
#undef QK_TODO
    };
    return list;
}

const std::vector<ManifestRow> &ManifestRows() {
    static const std::vector<ManifestRow> rows = {
#define QK_TODO(Name, Sig, SuiteWord, Slots) \
    {#Name, #Sig, halideqk::Suite::SuiteWord, std::vector<int> QK_BRACE Slots, false},
#define QK_BUILT(Name, Sig, SuiteWord, Slots, ...) \
    {#Name, #Sig, halideqk::Suite::SuiteWord, std::vector<int> QK_BRACE Slots, true},
#include "adapters/routines.def"
#undef QK_BUILT
#undef QK_TODO
    };
    return rows;
}

std::string SlotText(const RoutineInfo &r) {
    if (r.suite == halideqk::Suite::None) return "-";
    std::string text = halideqk::InfoOf(r.suite).word;
    for (size_t i = 0; i < r.slots.size(); ++i) text += (i ? "," : " ") + std::to_string(r.slots[i]);
    return text;
}

}  // namespace host
