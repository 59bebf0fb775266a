#!/usr/bin/env python3
"""Fails on an include that breaks the order of the layers, or of the rooms (folders) within a layer.

usage: check_layers.py REPOSITORY
"""

import pathlib
import re
import sys

DECK_WRITER = "QRXZptIfwOif.m/src"
CORE = ["platform", "foundation", "store_interface", "keyword_layer", DECK_WRITER, "deck_checks", "whole_file"]

# What a layer may include besides its own headers.
ALLOWED = {
    "platform": [],
    "foundation": ["platform"],
    "store_interface": ["foundation"],
    "keyword_layer": ["foundation", "store_interface"],
    DECK_WRITER: ["foundation", "store_interface", "keyword_layer"],
    "deck_checks": ["foundation", "store_interface", "keyword_layer", DECK_WRITER],
    "whole_file": ["platform", "foundation"],
    "mesh_file": ["platform", "foundation"],
    "deck_reader": ["platform", "foundation"],
    "model_file": ["platform", "foundation", "store_interface", "mesh_file", "deck_reader"],
    "view_page": ["foundation", "store_interface", "keyword_layer", DECK_WRITER],
    "study": CORE + ["model_file"],
    "tools": CORE + ["mesh_file", "model_file", "deck_reader", "view_page", "study"],
    "python": CORE + ["mesh_file", "model_file", "deck_reader", "view_page", "study", "tools"],
}
# The rooms of a layer, lowest first: a room includes its own headers and those of the rooms before it. Rooms of
# one line don't know each other.
ROOMS = {
    "store_interface": [
        ["records"],
        ["findings"],
        ["regions"],
        ["records/amplitudes", "records/materials", "records/part_attributes", "records/sections",
         "records/steps"],
        ["propagation"],
        ["records/conditions", "records/interactions", "records/constraints", "records/output"],
        ["model"],
        ["catalogue"],
    ],
    DECK_WRITER: [
        ["base"],
        ["mesh", "amplitudes", "materials"],
        ["sections"],
        ["connectors"],
        ["assembly", "steps", "conditions", "constraints"],
        ["interactions"],
        ["output"],
        ["deck"],
    ],
}
LIBRARIES = {
    "mesh_file": ["pugixml.hpp", "zlib.h", "hdf5.h"],
    "model_file": ["nlohmann/"],
    "view_page": ["nlohmann/"],
    "study": ["openssl/sha.h"],
    "tools": ["nlohmann/", "CLI/"],
    "python": ["nlohmann/", "pybind11/"],
}

STANDARD = set("""
    algorithm any array atomic barrier bit bitset charconv chrono codecvt compare complex concepts
    condition_variable coroutine deque exception execution filesystem format forward_list fstream functional
    future initializer_list iomanip ios iosfwd iostream istream iterator latch limits list locale map memory
    memory_resource mutex new numbers numeric optional ostream queue random ranges ratio regex
    scoped_allocator semaphore set shared_mutex source_location span sstream stack stdexcept stop_token
    streambuf string string_view syncstream system_error thread tuple type_traits typeindex typeinfo
    unordered_map unordered_set utility valarray variant vector version
    cassert cctype cerrno cfenv cfloat cinttypes climits clocale cmath csetjmp csignal cstdarg cstddef
    cstdint cstdio cstdlib cstring ctime cuchar cwchar cwctype
    """.split())
# The operating system's own headers, for the output device and the programs.
SYSTEM = {"aclapi.h", "dirent.h", "fcntl.h", "io.h", "process.h", "shellapi.h", "unistd.h", "windows.h", "sys/file.h",
          "sys/ioctl.h", "sys/mman.h", "sys/resource.h", "sys/single_threaded.h", "sys/stat.h", "sys/types.h", "sys/uio.h",
          "sys/wait.h", "sys/xattr.h"}
SYSTEM_LAYERS = {"foundation", "platform"}

# What instructions of the processor are reached through, each with a portable way beside it.
PROCESSOR = {"emmintrin.h"}

INCLUDE = re.compile(r'^\s*#\s*include\s*(?:"([^"]*)"|<([^>]*)>|(\S.*))')


def layer_of_header(root, path):
    """The layer whose header a quoted include names, or None."""
    for layer in ALLOWED:
        if layer != DECK_WRITER and path.startswith(layer + "/"):
            return layer if (root / path).is_file() else None
    return DECK_WRITER if "/" in path and (root / DECK_WRITER / path).is_file() else None


def room_of(layer, path):
    """The level and the name of the room of a file, given by its path below the layer; None for no room."""
    folder = str(pathlib.PurePosixPath(path).parent)
    for level, rooms in enumerate(ROOMS[layer]):
        if folder in rooms:
            return level, folder
    return None


def room_finding(layer, file, quoted):
    """What is wrong with an include between rooms of one layer, or None. Paths are below the layer."""
    if layer not in ROOMS:
        return None
    own = room_of(layer, file)
    if own is None:
        return f"{layer} has no room for {file}"
    other = room_of(layer, quoted)
    if other is None or other[1] == own[1] or other[0] < own[0]:
        return None
    return f'{own[1]} may not include {other[1]} ("{quoted}")'


def finding(root, layer, file, quoted, angled):
    """What is wrong with an include of a file of the layer, or None."""
    if quoted is not None:
        target = layer_of_header(root, quoted)
        if target is None:
            return f'"{quoted}" names no header by its path'
        if target != layer and target not in ALLOWED[layer]:
            return f'{layer} may not include {target} ("{quoted}")'
        return room_finding(layer, file, quoted.removeprefix(layer + "/")) if target == layer else None
    if angled is None:
        return "the name of an included file must be written out"
    if angled in STANDARD or angled in PROCESSOR or angled in SYSTEM and layer in SYSTEM_LAYERS:
        return None
    if any(angled.startswith(library) for library in LIBRARIES.get(layer, [])):
        return None
    return f"{layer} may not include <{angled}>"


def findings(root):
    """All findings of a tree, as "file:line: text", and the number of files read."""
    found = []
    count = 0
    for layer in ALLOWED:
        for file in sorted((root / layer).rglob("*")):
            if file.suffix not in (".h", ".cpp", ".inl", ".inc"):
                continue
            count += 1
            for number, line in enumerate(file.read_text(encoding="utf-8").splitlines(), 1):
                match = INCLUDE.match(line)
                below = file.relative_to(root / layer).as_posix()
                text = finding(root, layer, below, match[1], match[2]) if match else None
                if text:
                    found.append(f"{file.relative_to(root)}:{number}: {text}")
    return found, count


def main():
    if len(sys.argv) != 2:
        sys.exit(__doc__.strip())
    found, count = findings(pathlib.Path(sys.argv[1]))
    print("\n".join(found + [f"{count} files, {len(found)} findings"]))
    sys.exit(1 if found or count == 0 else 0)


if __name__ == "__main__":
    main()
