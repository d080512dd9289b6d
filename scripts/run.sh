#!/usr/bin/env bash
# The main job: install, build, then let the reference host load the plug-in,
# verify every patched slot and routine against its own, and print the speed table.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
"$root/scripts/install-deps.sh"
"$root/scripts/build.sh" "$root/build"
"$root/build/host/halideqk_host" all "$@"
