// The processor and system queries the plug-in makes, answered on this
// platform without sysctlbyname: the same keys, filled from cpuid and the
// kernel's view of the CPU topology.
#pragma once

#include <cstddef>

namespace qk_platform {

// Same contract as sysctlbyname: with oldp null, writes the value's size to
// *oldlenp and returns 0; with oldp set, copies min(*oldlenp, size) bytes and
// returns 0.  An unknown key returns -1 with errno ENOENT; setting values
// (newp) is not supported (-1, EPERM).
int sysctlbyname(const char *name, void *oldp, size_t *oldlenp, void *newp, size_t newlen);

using SysctlFn = int (*)(const char *name, void *oldp, size_t *oldlenp, void *newp, size_t newlen);

// Test seam: routes every query to `fn` instead of the machine; nullptr
// restores the machine.
void SetSysctlForTesting(SysctlFn fn);

}  // namespace qk_platform
