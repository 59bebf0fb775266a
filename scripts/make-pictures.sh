#!/usr/bin/env bash
# Makes the README's picture and the expected pictures of the page's tests anew; look at them before you commit them.
set -euo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
qrxdeck=${1-$root/build/release/tools/qrxdeck}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

"$qrxdeck" view "$root/examples/bracket/bracket.json" -o "$scratch/bracket.html"
node "$root/viewer/picture.mjs" "$scratch/bracket.html" "$root/docs/view.png" 1280x760
node "$root/viewer/test/browser.mjs" "$qrxdeck" "$root" --pictures "the pictures of all examples"
