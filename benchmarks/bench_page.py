#!/usr/bin/env python3
"""The page of a large mesh, each figure beside its yardstick in one run.

usage: bench_page.py QRXDECK [HEXAHEDRA_A_SIDE [FOLDER]]   (100 a side, a million, by default)

Printed are time and memory of `view` beside those of `write` of the same model, in turn, the sizes of the page and of one
of an empty model, and the time to the first picture in Chromium with software rendering beside that of the empty page.
"""

import json
import os
import pathlib
import shutil
import statistics
import subprocess
import sys
import tempfile
import time

ROOT = pathlib.Path(__file__).resolve().parent.parent
ROUNDS = 5


def write_model(path, side):
    """A cube of hexahedra, held below and pressed from above."""
    row, layer = side + 1, (side + 1) ** 2
    nodes, elements = row ** 3, side ** 3
    top = elements - side * side
    with open(path, "w", encoding="ascii") as file:
        file.write('{"format": "qrx-model/1", "models": {"Default Model": {"parts": {"CUBE": {"mesh": {"nodes": '
                   f'{{"labels": {{"from": 1, "to": {nodes}}}, "coordinates": [')
        for k in range(row):
            for j in range(row):
                file.write(("," if j + k else "") + ",".join(f"[{i},{j},{k}]" for i in range(row)))
        file.write(']}, "elements": [{"type": "C3D8", "labels": {"from": 1, "to": %d}, "connectivity": [' % elements)
        for k in range(side):
            for j in range(side):
                first = 1 + row * j + layer * k
                file.write(("," if j + k else "") + ",".join(
                    f"[{a},{a + 1},{a + row + 1},{a + row},{a + layer},{a + layer + 1},{a + layer + row + 1},{a + layer + row}]"
                    for a in range(first, first + side)))
        file.write(']}], "sets": [{"name": "ALL", "kind": "element", "labels": {"from": 1, "to": %d}}, ' % elements)
        file.write('{"name": "FOOT", "kind": "node", "labels": {"from": 1, "to": %d}}, ' % layer)
        file.write('{"name": "TOP", "kind": "surface", "facets": [')
        file.write(",".join(f'[{label},"S2"]' for label in range(top + 1, elements + 1)))
        rest = {"sectionAssignments": [{"region": "ALL", "sectionName": "Solid"}]}
        model = {"assembly": {"instances": {"CUBE-1": {"part": "CUBE"}}},
                 "sections": {"Solid": {"class": "HomogenousSolidSection", "materialName": "Steel"}},
                 "materials": {"Steel": {"elastic": {"table": [[210000, 0.3]]}}},
                 "steps": [{"name": "Initial", "class": "InitialStep"}, {"name": "Press", "class": "StaticStep"}],
                 "boundaryConditions": {"Foot": {"class": "TypeBC", "region": "CUBE-1.FOOT",
                                                 "states": {"Initial": {"typeName": "PINNED"}}}},
                 "loads": {"Press": {"class": "Pressure", "region": "CUBE-1.TOP",
                                     "states": {"Press": {"magnitude": 1}}}}}
        file.write("]}]}, " + json.dumps(rest)[1:] + "}, " + json.dumps(model)[1:] + "}}\n")


def run(program, *arguments):
    """Seconds and the peak memory in MiB of a run."""
    start = time.monotonic()
    child = subprocess.Popen([program, *map(str, arguments)], stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
    _, status, usage = os.wait4(child.pid, 0)
    if status != 0:
        raise SystemExit(f"{arguments[0]} ended with {status}")
    return time.monotonic() - start, usage.ru_maxrss / 1024


def middle(runs):
    return [statistics.median(column) for column in zip(*runs)]


def first_pictures(pages):
    node = shutil.which("node")
    if node is None or shutil.which(os.environ.get("QRX_CHROMIUM", "chromium")) is None:
        print("  first picture       skipped: there is no node or no chromium")
        return
    told = subprocess.run([node, ROOT / "viewer/first_picture.mjs", str(ROUNDS), *map(str, pages)], check=True,
                          stdout=subprocess.PIPE, text=True).stdout
    large, small = (json.loads(line) for line in told.splitlines())
    print(f"  first picture       {statistics.median(large['picture']):6.0f} ms   (3000), best {min(large['picture'])}; "
          f"{statistics.median(small['picture']):.0f} ms of the empty page")
    print(f"  memory of its script {max(large['heap']) / 2**20:5.0f} MiB")


def main():
    program = os.path.abspath(sys.argv[1])
    side = int(sys.argv[2]) if len(sys.argv) > 2 else 100
    folder = pathlib.Path(sys.argv[3] if len(sys.argv) > 3 else tempfile.mkdtemp(prefix="qrx-bench-"))
    folder.mkdir(exist_ok=True)
    model, page, empty, empty_page = (folder / name for name in ("cube.json", "cube.html", "empty.json", "empty.html"))
    try:
        write_model(model, side)
        empty.write_text('{"format": "qrx-model/1", "models": {"Default Model": {}}}')
        run(program, "view", empty, "-o", empty_page)
        views, writes = [], []
        for _ in range(ROUNDS):
            views.append(run(program, "view", model, "-o", page))
            writes.append(run(program, "write", model, "--output-dir", folder))
        (seconds, memory), (write_seconds, write_memory) = middle(views), middle(writes)
        load = pathlib.Path("/proc/loadavg").read_text().split()[0]
        print(f"page of {side ** 3} hexahedra, medians of {ROUNDS}, load {load}:")
        print(f"  view                {seconds:6.2f} s    write {write_seconds:6.2f} s    ratio {seconds / write_seconds:5.2f}   (2)")
        print(f"  memory              {memory:6.0f} MiB  write {write_memory:6.0f} MiB  ratio {memory / write_memory:5.2f}   (1.5)")
        print(f"  page                {page.stat().st_size / 1e6:6.2f} MB   (8)")
        print(f"  empty page          {empty_page.stat().st_size / 1e3:6.0f} kB   (700)")
        first_pictures([page, empty_page])
    finally:
        if len(sys.argv) <= 3:
            shutil.rmtree(folder)


if __name__ == "__main__":
    main()
