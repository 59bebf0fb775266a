#!/usr/bin/env bash
# Builds qrxdeck and writes the deck of a model into the current folder.
set -euo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
if [ $# -gt 1 ] || [[ ${1-} == -* ]]; then
    echo "usage: quickstart.sh [MODEL.json]    (default: the bracket in examples/)" >&2
    exit 2
fi
model=${1-$root/examples/bracket/bracket.json}
if [ ! -f "$model" ]; then
    echo "quickstart: no such file: $model" >&2
    exit 1
fi

"$root/scripts/install-dependencies.sh" build
"$root/scripts/build.sh" release qrxdeck -DQRX_BUILD_TESTS=OFF
"$root/build/release/tools/qrxdeck" write "$model" --output-dir .

see="build/release/tools/qrxdeck view $model --open"
[ -d "$root/viewer/node_modules" ] || see="scripts/install-dependencies.sh viewer, quickstart.sh again, then $see"
echo "To see the model: $see"
