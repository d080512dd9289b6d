#!/usr/bin/env bash
# Install, build, and pass every test: the release build, then the same tests
# under the address and undefined-behaviour sanitizers; the benchmark target
# is built and smoke-run (not timed).
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
"$root/scripts/install-deps.sh"

"$root/scripts/build.sh" "$root/build"
(cd "$root/build" && ctest --output-on-failure -j"$(nproc)")
"$root/build/bench/halideqk_bench" --benchmark_filter='/(1|64)/' --benchmark_min_time=0.01 >/dev/null

"$root/scripts/build.sh" "$root/build-sanitize" -DHALIDEQK_SANITIZE=ON -DHALIDEQK_BUILD_BENCH=OFF
(cd "$root/build-sanitize" && ctest --output-on-failure -j"$(nproc)")
echo "all tests passed"
