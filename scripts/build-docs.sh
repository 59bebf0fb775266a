#!/usr/bin/env bash
# Builds the manual: the class reference from runs of the program, the C++ API by Doxygen, the site by Sphinx.
set -euo pipefail

usage() {
    cat <<'END'
usage: build-docs.sh [--fast] [--qrxdeck PROGRAM] [FOLDER]

The site stands in FOLDER/html (default: build/docs/html). Links within it and its spelling are checked too,
unless --fast is given. The program is built when none is given and none stands in build/release.
What is missing: scripts/install-dependencies.sh docs
END
}

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
qrxdeck=
folder=$root/build/docs
fast=false
while [ $# -gt 0 ]; do
    case $1 in
        --fast) fast=true ;;
        --qrxdeck) qrxdeck=$(realpath "${2?}"); shift ;;
        -h | --help) usage; exit 0 ;;
        -*) usage >&2; exit 2 ;;
        *) folder=$1 ;;
    esac
    shift
done

# Debian's packages are those of its own interpreter, whatever else is first in the path.
python=/usr/bin/python3
for module in sphinx myst_parser breathe furo sphinxcontrib.spelling; do
    if ! "$python" -c "import $module" 2>/dev/null; then
        echo "build-docs.sh: no $module: scripts/install-dependencies.sh docs" >&2
        exit 3
    fi
done
command -v doxygen >/dev/null || { echo "build-docs.sh: no doxygen: scripts/install-dependencies.sh docs" >&2; exit 3; }

if [ -z "$qrxdeck" ]; then
    qrxdeck=$root/build/release/tools/qrxdeck
    [ -x "$qrxdeck" ] || "$root/scripts/build.sh" release qrxdeck
fi

mkdir -p "$folder"
folder=$(cd "$folder" && pwd)
source=$folder/source
rm -rf "$source" "$folder/xml" "$folder/html" "$folder/spelling"
mkdir -p "$source"
# What pages link to stands beside them.
cp -r "$root"/{docs,examples,CMakeLists.txt,README.md,CHANGELOG.md,CONTRIBUTING.md,SECURITY.md} "$source"
export PYTHONDONTWRITEBYTECODE=1

"$python" "$root/docs/generate_classes.py" "$qrxdeck" "$root" "$source/docs/reference"

# The headers that the pages of the API show.
headers=$(cd "$root" && echo QRXZptIfwOif.m/src/deck/oif_{Writer,DeckLines}.h foundation/qio_Device.h \
    whole_file/whf_File.h deck_checks/dck_Check.h store_interface/findings/fnd_Finding.h \
    store_interface/model/{odb_Odb,odiK_Model,odiK_Mesh,odiK_Datum}.h \
    store_interface/propagation/{kprC_PropagatingObject,mdl_PropAttr}.h \
    foundation/{cow_String,cow_List,cow_Map,cow_2DArray,cow_CountedHld,nex_Exception}.h)
(cd "$root" && doxygen - <<END
PROJECT_NAME = qrxdeck
INPUT = $headers
OUTPUT_DIRECTORY = $folder
STRIP_FROM_PATH = $root
GENERATE_XML = YES
GENERATE_HTML = NO
GENERATE_LATEX = NO
XML_PROGRAMLISTING = NO
EXTRACT_ALL = NO
JAVADOC_AUTOBRIEF = YES
MACRO_EXPANSION = YES
WARN_IF_UNDOCUMENTED = NO
WARN_AS_ERROR = YES
QUIET = YES
END
)

sphinx() {
    QRX_DOXYGEN_XML=$folder/xml "$python" -m sphinx -q -W --keep-going -d "$folder/doctrees" "$@"
}
sphinx -b html "$source/docs" "$folder/html"
"$python" "$root/docs/check_site.py" "$folder/html"
if ! $fast; then
    sphinx -b linkcheck "$source/docs" "$folder/links"
    QRX_DOCS_SPELLING=1 sphinx -b spelling -d "$folder/spelling/doctrees" "$source/docs" "$folder/spelling" || {
        find "$folder/spelling" -name '*.spelling' -exec cat {} + >&2
        exit 1
    }
fi
echo "$folder/html/index.html"
