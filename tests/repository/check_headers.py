#!/usr/bin/env python3
"""Compiles every header of the libraries as if it stood alone, twice in its source.

A source holds several, each of which includes all that stand before it, so that none finds what it should have
included itself. The standard library's headers that many include are parsed once for all; whether a header includes
what it takes of that library is looked up in a table: each std:: name, and the headers that give it.

usage: check_headers.py REPOSITORY COMPILER [FLAG ...]
"""

import collections
import concurrent.futures
import os
import pathlib
import re
import subprocess
import sys
import tempfile

from check_layers import DECK_WRITER

FOLDERS = ["platform", "foundation", "store_interface", "keyword_layer", DECK_WRITER, "deck_checks", "whole_file", "mesh_file",
           "model_file", "deck_reader", "view_page", "study"]
MANY = 4

# Containers and strings give these too.
SIZES = "cstddef string string_view vector span map set array cstring cstdio utility unordered_map"
TRAITS = "type_traits utility"
ATOMICS = "atomic"
GIVEN_BY = {
    "size_t": SIZES, "ptrdiff_t": "cstddef iterator", "max_align_t": "cstddef",
    "uint8_t": "cstdint", "uint16_t": "cstdint", "uint32_t": "cstdint", "uint64_t": "cstdint",
    "int8_t": "cstdint", "int16_t": "cstdint", "int32_t": "cstdint", "int64_t": "cstdint",
    "string": "string", "to_string": "string", "string_view": "string_view string",
    "vector": "vector", "span": "span", "map": "map", "set": "set", "list": "list", "deque": "deque",
    "array": "array", "bitset": "bitset", "unordered_map": "unordered_map", "unordered_set": "unordered_set", "hash": "functional string",
    "optional": "optional", "nullopt": "optional", "variant": "variant", "monostate": "variant",
    "get_if": "variant", "holds_alternative": "variant", "visit": "variant", "function": "functional",
    "less": "functional map set", "tuple": "tuple", "get": "tuple utility variant map", "tie": "tuple",
    "unique_ptr": "memory", "shared_ptr": "memory", "make_unique": "memory", "make_shared": "memory",
    "weak_ptr": "memory", "static_pointer_cast": "memory", "addressof": "memory",
    "move": "utility memory vector string map", "pair": "utility map vector", "swap": "utility", "exchange": "utility",
    "forward": "utility", "declval": "utility", "in_place_type": "utility", "index_sequence": "utility",
    "sort": "algorithm", "stable_sort": "algorithm", "min": "algorithm", "max": "algorithm", "copy": "algorithm",
    "copy_n": "algorithm", "equal": "algorithm", "fill": "algorithm", "find": "algorithm", "find_if": "algorithm",
    "count": "algorithm", "count_if": "algorithm", "any_of": "algorithm", "all_of": "algorithm",
    "lower_bound": "algorithm", "upper_bound": "algorithm", "transform": "algorithm", "move_backward": "algorithm",
    "swap_ranges": "algorithm", "partial_sum": "numeric", "clamp": "algorithm", "ranges": "ranges algorithm",
    "begin": "iterator vector string span array map", "end": "iterator vector string span array map",
    "prev": "iterator", "next": "iterator", "distance": "iterator", "input_iterator_tag": "iterator",
    "forward_iterator_tag": "iterator", "random_access_iterator_tag": "iterator", "iterator_traits": "iterator",
    "default_sentinel_t": "iterator", "default_sentinel": "iterator", "back_inserter": "iterator",
    "numeric_limits": "limits", "initializer_list": "initializer_list vector string",
    "ostream": "ostream sstream iosfwd fstream", "ofstream": "fstream", "ifstream": "fstream",
    "ostringstream": "sstream", "istringstream": "sstream", "filesystem": "filesystem",
    "memcpy": "cstring", "memset": "cstring", "memchr": "cstring", "memcmp": "cstring", "strlen": "cstring",
    "strcmp": "cstring", "malloc": "cstdlib", "realloc": "cstdlib", "free": "cstdlib", "abort": "cstdlib",
    "fclose": "cstdio", "FILE": "cstdio", "fopen": "cstdio", "snprintf": "cstdio", "fabs": "cmath", "sqrt": "cmath",
    "isfinite": "cmath", "bad_alloc": "new", "launder": "new", "partial_sum": "numeric", "same_as": "concepts", "nothrow": "new", "bit_cast": "bit", "popcount": "bit", "countr_zero": "bit", "endian": "bit",
    "exception": "exception stdexcept", "exception_ptr": "exception", "current_exception": "exception",
    "logic_error": "stdexcept", "runtime_error": "stdexcept", "invalid_argument": "stdexcept",
    "strong_ordering": "compare", "mutex": "mutex", "lock_guard": "mutex", "unique_lock": "mutex", "thread": "thread",
    "condition_variable": "condition_variable", "jthread": "thread", "atomic": ATOMICS,
    "from_chars": "charconv", "from_chars_result": "charconv", "to_chars": "charconv", "chrono": "chrono", "source_location": "source_location",
}
for trait in ("is_constructible_v is_final_v is_enum_v enable_if_t remove_reference_t remove_cvref_t remove_const_t "
              "is_trivially_destructible_v is_trivially_copyable_v is_member_object_pointer_v is_base_of_v "
              "is_abstract_v is_same_v conditional_t decay_t is_arithmetic_v is_integral_v is_floating_point_v "
              "underlying_type_t invoke_result_t is_invocable_v true_type false_type void_t is_default_constructible_v "
              "is_convertible_v is_signed_v is_unsigned_v make_unsigned_t integral_constant").split():
    GIVEN_BY[trait] = TRAITS
for order in "relaxed acquire release acq_rel seq_cst".split():
    GIVEN_BY["memory_order_" + order] = ATOMICS


def headers(root):
    """The headers, by the paths that they are included under."""
    for folder in FOLDERS:
        base = root / DECK_WRITER if folder == DECK_WRITER else root
        for header in sorted((root / folder).rglob("*.h")):
            # Those of another system compile there alone.
            if "windows" in header.relative_to(base).parts:
                continue
            yield header.relative_to(base).as_posix()


class Includes:
    """What headers include of the standard library, themselves or through others of the tree."""

    def __init__(self, root):
        self.bases = [root, root / DECK_WRITER]
        self.known = {}
        self.closures = {}

    def text(self, name):
        for base in self.bases:
            if (base / name).is_file():
                return (base / name).read_text(encoding="utf-8")
        return None

    def closure(self, name):
        """The header and all of the tree that comes with it."""
        if name not in self.closures:
            self.closures[name] = found = {name}
            for other in re.findall(r'^ *# *include "([^"]+)"', self.text(name) or "", re.MULTILINE):
                found |= self.closure(other)
        return self.closures[name]

    def standard(self, name):
        if name not in self.known:
            self.known[name] = {header for other in self.closure(name) for header in self.own(other)}
        return self.known[name]

    def chains(self, names):
        """All the headers in lists, within which each comes with all before it."""
        def size(name):
            return len(self.closure(name))

        left = set(names)
        for name in sorted(names, key=size, reverse=True):
            chain = []
            while name in left:
                left.remove(name)
                chain.insert(0, name)
                name = max(self.closure(name) & left, key=lambda other: (size(other), other), default=None)
            if chain:
                yield chain

    def frequent(self, names):
        """The standard library's headers that many of the headers include themselves."""
        counts = collections.Counter(header for name in names for header in self.own(name))
        standard = {header for given in GIVEN_BY.values() for header in given.split()}
        return sorted(header for header, count in counts.items() if count >= MANY and header in standard)

    def own(self, name):
        return re.findall(r"^ *# *include <([\w/.]+)>", self.text(name) or "", re.MULTILINE)

    def missing(self, name):
        """Names of the standard library that the header takes without including what gives them."""
        code = re.sub(r'//[^\n]*|/\*.*?\*/|"(?:[^"\\\n]|\\.)*"', "", self.text(name), flags=re.DOTALL)
        for used in sorted(set(re.findall(r"\bstd::(\w+)", code))):
            given = GIVEN_BY.get(used)
            if given is None:
                yield f"{name}: std::{used} stands in no row of the table in {pathlib.Path(__file__).name}"
            elif not self.standard(name) & set(given.split()):
                yield f"{name}: std::{used} needs <{given.split()[0]}>"


def main():
    if len(sys.argv) < 3:
        sys.exit(__doc__.strip())
    root = pathlib.Path(sys.argv[1])
    names = list(headers(root))
    includes = Includes(root)
    findings = [finding for name in names for finding in includes.missing(name)]

    with tempfile.TemporaryDirectory() as folder:
        common = pathlib.Path(folder) / "common.h"
        common.write_text("".join(f"#include <{header}>\n" for header in includes.frequent(names)))
        flags = [*sys.argv[2:], "-I", root, "-I", root / DECK_WRITER, "-x"]
        subprocess.run([*flags, "c++-header", common, "-o", f"{common}.gch"], check=True)

        def compile_chain(chain):
            source = "".join(f'#include "{header}"\n' * 2 for header in chain)
            return subprocess.run([*flags, "c++", "-include", common, "-fsyntax-only", "-"], input=source, text=True,
                                  capture_output=True)

        with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
            chains = list(includes.chains(names))
            results = list(pool.map(compile_chain, chains))
    findings += [f"{', '.join(chain)}: not all compile alone:\n{result.stderr}"
                 for chain, result in zip(chains, results) if result.returncode != 0]
    for finding in findings:
        print(finding)
    print(f"{len(names)} headers, {len(findings)} findings")
    sys.exit(1 if findings or not names else 0)


if __name__ == "__main__":
    main()
