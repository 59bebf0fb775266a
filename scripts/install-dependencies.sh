#!/usr/bin/env bash
# Installs what is missing of the Debian packages that a task needs; touches nothing when all are there.
set -euo pipefail

usage() {
    cat <<'END'
usage: install-dependencies.sh [build|test|bench|dev|viewer|cluster|python|docs|packages|windows|libcxx] ...

  build   compiler, build tools and libraries of qrxdeck (default)
  test    build, and what the tests need
  bench   build, and what the benchmarks need
  dev     all of these, and the clang tools
  viewer  build, and what the page of "qrxdeck view" is built and tested with: node, a browser, and the packages
          of viewer/package-lock.json
  cluster test, and the schedulers that run the shards of studies
  python  build, and what the package for Python is built, used and tested with
  docs    build, and what the manual is built and checked with
  packages  build, and what packages are built and tested with
  windows   build, and what qrxdeck.exe is built and tested with
  libcxx    build, and clang with its own standard library
END
}

build=(g++ cmake ninja-build nlohmann-json3-dev libcli11-dev libpugixml-dev zlib1g-dev libhdf5-dev libssl-dev)
test=(mold libgtest-dev librapidcheck-dev locales pkg-config python3 python3-jsonschema bash-completion zsh fish groff-base)
bench=(libbenchmark-dev libfmt-dev libsimdjson-dev gmsh)
dev=(clang clang-tidy clang-format)

cluster=(slurmctld slurmd slurm-client munge snakemake iproute2 util-linux)
python=(python3 python3-dev python3-pip python3-venv pybind11-dev python3-pybind11 python3-numpy python3-pytest mypy)
docs=(doxygen python3-sphinx python3-myst-parser python3-breathe furo python3-sphinxcontrib.spelling hunspell-en-gb)

packages=(dpkg-dev gzip xz-utils lintian debootstrap python3)
windows=(g++-mingw-w64-x86-64-posix libz-mingw-w64-dev googletest wine64 wine unzip python3)
libcxx=(clang-16 libc++-16-dev libc++abi-16-dev googletest python3)

viewer=(chromium)
# Other sources of node than Debian's have npm in one package with it, and don't bear Debian's npm beside it.
command -v node >/dev/null && command -v npm >/dev/null || viewer+=(nodejs npm)

[ $# -gt 0 ] || set -- build
with_page=false
wanted=("${build[@]}")
for task in "$@"; do
    case $task in
        build) ;;
        test) wanted+=("${test[@]}") ;;
        bench) wanted+=("${bench[@]}") ;;
        dev) wanted+=("${test[@]}" "${bench[@]}" "${dev[@]}" "${python[@]}" "${docs[@]}") ;;
        cluster) wanted+=("${test[@]}" "${cluster[@]}") ;;
        python) wanted+=("${python[@]}") ;;
        docs) wanted+=("${docs[@]}") ;;
        packages) wanted+=("${packages[@]}") ;;
        windows) wanted+=("${windows[@]}") ;;
        libcxx) wanted+=("${libcxx[@]}") ;;
        viewer) wanted+=("${viewer[@]}") && with_page=true ;;
        -h | --help) usage; exit 0 ;;
        *) usage >&2; exit 2 ;;
    esac
done

# What is pinned in the lock file, and nothing when that is there already.
install_page_packages() {
    local viewer_dir
    viewer_dir=$(cd "$(dirname "${BASH_SOURCE[0]}")/../viewer" && pwd)
    if [ "$viewer_dir/node_modules/.package-lock.json" -nt "$viewer_dir/package-lock.json" ]; then return; fi
    npm ci --prefix "$viewer_dir" --no-audit --no-fund
    touch "$viewer_dir/node_modules/.package-lock.json"
}

if ! command -v dpkg-query >/dev/null; then
    echo "install-dependencies: not a Debian system; make sure that these are there: ${wanted[*]}" >&2
    if $with_page && command -v npm >/dev/null; then install_page_packages; fi
    exit 0
fi

missing=()
for package in "${wanted[@]}"; do
    status=$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null || true)
    [ "$status" = installed ] || missing+=("$package")
done
if [ ${#missing[@]} -eq 0 ]; then
    if $with_page; then install_page_packages; fi
    exit 0
fi

as_root=()
if [ "$(id -u)" -ne 0 ]; then
    if ! command -v sudo >/dev/null; then
        echo "install-dependencies: needs root or sudo; run as root: apt-get install ${missing[*]}" >&2
        exit 1
    fi
    as_root=(sudo)
fi

apt() {
    ${as_root[@]+"${as_root[@]}"} env DEBIAN_FRONTEND=noninteractive apt-get -q -o DPkg::Lock::Timeout=300 "$@"
}

echo "installing: ${missing[*]}"
apt update
apt install -y --no-install-recommends "${missing[@]}"
if $with_page; then install_page_packages; fi
