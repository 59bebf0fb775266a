#!/usr/bin/env bash
# Builds and runs all tests, with warnings as errors.
set -euo pipefail

usage() {
    cat <<'END'
usage: test.sh [--long] [PRESET ...]
       test.sh --cluster
       test.sh --packages
       test.sh windows | libcxx

Presets: release unless given, whose tests also run on libraries built with the sanitizers; asan
(everything built with them, the tests too) and debug. --long adds the tests labelled "long",
which the asan preset always leaves out. --cluster runs studies on Slurm and Snakemake instead, as
root and in namespaces of its own; it installs both. --packages builds all packages twice, and, as root,
installs them into a fresh Debian system in a folder. windows builds the program for Windows and runs it
under Wine; libcxx builds it with clang and libc++, and runs its tests. Both compare the golden decks.
END
}

cd "$(dirname "${BASH_SOURCE[0]}")"
select=(--label-exclude '^long$')
presets=()
cluster=false
packages=false
for argument in "$@"; do
    case $argument in
        --long) select=() ;;
        --cluster) cluster=true ;;
        --packages) packages=true ;;
        -h | --help) usage; exit 0 ;;
        -*) usage >&2; exit 2 ;;
        *) presets+=("$argument") ;;
    esac
done
if $cluster; then
    scripts/install-dependencies.sh cluster
    scripts/build.sh release qrxdeck
    exec python3 tests/cluster/cluster_test.py build/release/tools/qrxdeck
fi
if $packages; then
    scripts/install-dependencies.sh packages python
    scripts/install-dependencies.sh viewer || echo "test.sh: the page can't be built here; the packages lack it" >&2
    exec python3 tests/packages/packages_test.py .
fi
# They have no test programs of their own: what they built is run as it is.
case ${presets[*]-} in
    windows)
        scripts/install-dependencies.sh build windows
        scripts/build-windows.sh
        scripts/build.sh windows qrx_deck_tests -DQRX_BUILD_TESTS=ON
        exec python3 tests/windows/windows_test.py . build/windows build/windows-package/qrxdeck-*-windows-x86_64.zip
        ;;
    libcxx)
        scripts/install-dependencies.sh build libcxx
        scripts/build.sh libcxx all
        build/libcxx/tests/decks/qrx_deck_tests --gtest_brief=1
        PYTHONDONTWRITEBYTECODE=1 python3 tests/programs/qrxdeck_test.py build/libcxx/tools/qrxdeck
        exec python3 tests/libcxx/golden_decks_test.py . build/libcxx/tools/qrxdeck build/libcxx/examples/two_instances
        ;;
esac
[ ${#presets[@]} -gt 0 ] || presets=(release)

scripts/install-dependencies.sh test python
# Without npm's registry all else is tested, and the page's tests say that they are skipped.
scripts/install-dependencies.sh viewer || echo "test.sh: the page can't be built here; its tests are skipped" >&2
# Without its packages the manual isn't built; what it shows is tried all the same.
scripts/install-dependencies.sh docs || echo "test.sh: the manual can't be built here; that test is skipped" >&2
for preset in "${presets[@]}"; do
    echo "== $preset"
    sanitized=OFF
    [ "$preset" != release ] || sanitized=ON
    scripts/build.sh "$preset" all -DQRX_BUILD_TESTS=ON -DQRX_WARNINGS_AS_ERRORS=ON -DQRX_SANITIZED_TESTS="$sanitized"
    ctest --preset "$preset" --parallel "$(nproc)" --no-tests=error ${select[@]+"${select[@]}"}
done
