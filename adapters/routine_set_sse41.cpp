#define QK_SET sse41
#define QK_SET_NAMESPACE halide_sse41
#include "adapters/routine_set.inc"
