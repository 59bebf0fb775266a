#!/usr/bin/env bash
# Builds the packages: the Debian ones, an archive of program and library, and an archive of the sources.
set -euo pipefail

usage() {
    cat <<'END'
usage: build-packages.sh [FOLDER]

Writes qrxdeck_VERSION_ARCH.deb, libqrxptinputfilewriter-dev_VERSION_ARCH.deb, python3-qrx_VERSION_ARCH.deb (where Python
has what it takes: install-dependencies.sh python), qrxdeck-VERSION-linux-ARCH.tar.gz and, in a clone without changes,
qrxdeck-VERSION-sources.tar.gz into the folder (default: build/packages).

The same sources make the same files to the last bit, with the same compiler and libraries. What stands in them as
their time is SOURCE_DATE_EPOCH, or else the time of the commit.
END
}
case ${1-} in
    -h | --help) usage; exit 0 ;;
    -*) usage >&2; exit 2 ;;
esac

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
folder=${1-$root/build/packages}
mkdir -p "$folder"
folder=$(cd "$folder" && pwd)
cd "$root"
# Of a clone its last commit's; an archive of the sources has it in this file.
if [ -z "${SOURCE_DATE_EPOCH-}" ]; then
    SOURCE_DATE_EPOCH=$(sed -n 's/^set(qrx_archived_time "\([0-9]*\)")$/\1/p' cmake/QrxCommit.cmake)
    [ -n "$SOURCE_DATE_EPOCH" ] || SOURCE_DATE_EPOCH=$(git log -1 --format=%ct)
    export SOURCE_DATE_EPOCH
fi
umask 022

python=OFF
if /usr/bin/python3 -c "import pybind11, numpy, sysconfig, os; \
assert os.path.exists(os.path.join(sysconfig.get_path('include'), 'Python.h'))" 2>/dev/null; then
    python=ON
else
    echo "build-packages: no python3-qrx; scripts/install-dependencies.sh python gets what it takes" >&2
fi
scripts/build.sh package all -DQRX_BUILD_PYTHON="$python" -DPython_EXECUTABLE=/usr/bin/python3
(cd build/package && cpack -B "$folder" && rm -rf "$folder/_CPack_Packages")

if [ -e .git ] && git diff --quiet HEAD; then
    version=$(sed -n 's/^project(.* VERSION \([0-9.]*\) .*/\1/p' CMakeLists.txt)
    git archive --format=tar --prefix="qrxdeck-$version/" HEAD | gzip -9n > "$folder/qrxdeck-$version-sources.tar.gz"
fi
ls -l "$folder"
