#define QK_SET avx2
#define QK_SET_NAMESPACE halide_avx2
#include "adapters/routine_set.inc"
