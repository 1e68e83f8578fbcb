#!/usr/bin/env bash
# Builds the library and the reference host, then runs the demo.
set -euo pipefail
here=$(cd "$(dirname "$0")/.." && pwd)
"$here/scripts/setup.sh"
"$here/scripts/build.sh" "$here/build" plain
"$here/build/host/demo/tsdemo"
