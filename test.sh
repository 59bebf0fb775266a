#!/usr/bin/env bash
# Builds and runs all tests, with warnings as errors.
set -euo pipefail

usage() {
    cat <<'END'
usage: test.sh [--long] [PRESET ...]

Presets: release unless given, whose tests also run on libraries built with the sanitizers; asan
(everything built with them, the tests too) and debug. --long adds the tests labelled "long",
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
[ ${#presets[@]} -gt 0 ] || presets=(release)

scripts/install-dependencies.sh test
for preset in "${presets[@]}"; do
    echo "== $preset"
    sanitized=OFF
    [ "$preset" != release ] || sanitized=ON
    scripts/build.sh "$preset" all -DQRX_BUILD_TESTS=ON -DQRX_WARNINGS_AS_ERRORS=ON -DQRX_SANITIZED_TESTS="$sanitized"
    ctest --preset "$preset" --parallel "$(nproc)" --no-tests=error ${select[@]+"${select[@]}"}
done
