#!/usr/bin/env bash
# Configures and builds one flavour of the tree.
#   scripts/build.sh DIR [plain|asan|tsan] [extra cmake args...]
# TSM_TARGETS, when set, names the targets to build instead of all.
set -euo pipefail
here=$(cd "$(dirname "$0")/.." && pwd)
dir=$1; flavour=${2:-plain}; shift 2 || shift $#
cmake -S "$here" -B "$dir" -G Ninja -DCMAKE_BUILD_TYPE=Release \
      -DTSM_SANITIZE="$flavour" "$@" >/dev/null
cmake --build "$dir" -j "$(nproc)" ${TSM_TARGETS:+--target $TSM_TARGETS}
