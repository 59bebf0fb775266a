#!/usr/bin/env bash
# Builds and runs all tests, with warnings as errors.
set -euo pipefail

usage() {
    cat <<'END'
usage: test.sh [--long] [PRESET ...]

Presets: release and asan unless given; debug too. --long adds the tests labelled "long",
which the asan preset always leaves out.
END
}

cd "$(dirname "${BASH_SOURCE[0]}")"
select=(--label-exclude '^long$')
presets=()
for argument in "$@"; do
    case $argument in
        --long) select=() ;;
        -h | --help) usage; exit 0 ;;
        -*) usage >&2; exit 2 ;;
        *) presets+=("$argument") ;;
    esac
done
[ ${#presets[@]} -gt 0 ] || presets=(release asan)

scripts/install-dependencies.sh test
for preset in "${presets[@]}"; do
    echo "== $preset"
    scripts/build.sh "$preset" all -DQRX_BUILD_TESTS=ON -DQRX_WARNINGS_AS_ERRORS=ON
    ctest --preset "$preset" --parallel "$(nproc)" --no-tests=error ${select[@]+"${select[@]}"}
done
