// The two routine sets: one exported, writable entry per built routine and
// instruction set, holding the address of that routine's adapter.
#pragma once

#include "adapters/signatures.h"

#define QK_TODO(...)
#define QK_BUILT(Name, Sig, Suite, Slots, ...) extern halideqk::sig::Sig *HalideQK##Name;
namespace halide_sse41 {
#include "adapters/routines.def"
template <typename T>
const T &OpaqueMaskValue();
}  // namespace halide_sse41
namespace halide_avx2 {
#include "adapters/routines.def"
template <typename T>
const T &OpaqueMaskValue();
}  // namespace halide_avx2
#undef QK_BUILT
#undef QK_TODO
