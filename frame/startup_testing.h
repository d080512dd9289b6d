// Test seam: lets one process run start-up against several fake hosts.
#pragma once

namespace halideqk {
// Forgets that a start-up succeeded (the host tables are not restored).
void ResetStartupForTesting();
}  // namespace halideqk
