// The reference host's own routines: one plain scalar loop per routine,
// written from its formula.  They are what the host's tables hold before the
// plug-in starts, the oracle of every bit-exactness check, and the baseline
// of every benchmark.  Each has exactly the host signature of its row.
#pragma once

#include "adapters/signatures.h"

namespace host_ref {
#define QK_TODO(...)
#define QK_BUILT(Name, Sig, Suite, Slots, ...) halideqk::sig::Sig Name;
#include "adapters/routines.def"
#undef QK_BUILT
#undef QK_TODO
}  // namespace host_ref

namespace host {
// Sits in every host slot the plug-in does not replace; never called.
void NotReplaced();
}  // namespace host
