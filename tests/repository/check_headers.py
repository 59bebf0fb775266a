#!/usr/bin/env python3
"""Compiles every header of the libraries alone, twice in one source.

usage: check_headers.py REPOSITORY COMPILER [FLAG ...]
"""

import concurrent.futures
import os
import pathlib
import subprocess
import sys

from check_layers import DECK_WRITER

FOLDERS = ["foundation", "store_interface", "keyword_layer", DECK_WRITER, "deck_checks", "whole_file", "mesh_file",
           "model_file", "deck_reader", "view_page"]


def headers(root):
    """The headers, by the paths that they are included under."""
    for folder in FOLDERS:
        base = root / DECK_WRITER if folder == DECK_WRITER else root
        for header in sorted((root / folder).rglob("*.h")):
            yield header.relative_to(base).as_posix()


def main():
    if len(sys.argv) < 3:
        sys.exit(__doc__.strip())
    root = pathlib.Path(sys.argv[1])
    command = [*sys.argv[2:], "-fsyntax-only", "-I", root, "-I", root / DECK_WRITER, "-x", "c++", "-"]

    def compile_alone(header):
        source = f'#include "{header}"\n' * 2
        return subprocess.run(command, input=source, text=True, capture_output=True)

    names = list(headers(root))
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        results = list(pool.map(compile_alone, names))
    failed = [(name, result) for name, result in zip(names, results) if result.returncode != 0]
    for name, result in failed:
        print(f"{name} does not compile alone:\n{result.stderr}")
    print(f"{len(names)} headers, {len(failed)} findings")
    sys.exit(1 if failed or not names else 0)


if __name__ == "__main__":
    main()
