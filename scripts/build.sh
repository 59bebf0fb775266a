#!/usr/bin/env bash
# Configures a preset and builds a target on all cores: build.sh PRESET TARGET [-DNAME=VALUE ...]
# It builds from nothing as fast as can be; who edits sources builds with `cmake --build` and QRX_UNITY_BUILD off.
set -euo pipefail

if [ $# -lt 2 ]; then
    echo "usage: build.sh PRESET TARGET [-DNAME=VALUE ...]" >&2
    exit 2
fi
preset=$1
target=$2
shift 2

cd "$(dirname "${BASH_SOURCE[0]}")/.."
# A compiler cache takes precompiled headers only when it may rely on their defines and times.
export CCACHE_SLOPPINESS=${CCACHE_SLOPPINESS-pch_defines,time_macros}
cmake --preset "$preset" -DCMAKE_CXX_COMPILER_LAUNCHER="$(command -v ccache || true)" -DQRX_UNITY_BUILD=ON "$@"
cmake --build --preset "$preset" --target "$target" --parallel "$(nproc)"
