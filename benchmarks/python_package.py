#!/usr/bin/env python3
"""Times of the package for Python, each beside its yardstick, in one run.

usage: python_package.py [--nodes N] [--deck-program PROGRAM]

Every figure is the least of several, taken in turn with its yardstick. PROGRAM is the built qrxdeck; its own time for
writing, without reading, is what it tells with --json.
"""

import argparse
import gc
import io
import json
import os
import pathlib
import subprocess
import sys
import tempfile
import time

import numpy as np

import qrx


def hexahedra(side):
    """The points and cells of a cube of side^3 cells."""
    axis = np.arange(side + 1, dtype=np.float32)
    z, y, x = np.meshgrid(axis, axis, axis, indexing="ij")
    points = np.ascontiguousarray(np.column_stack([x.ravel(), y.ravel(), z.ravel()]))
    n = side + 1
    k, j, i = np.meshgrid(np.arange(side), np.arange(side), np.arange(side), indexing="ij")
    first = (i + n * (j + n * k)).ravel().astype(np.int32)
    steps = np.array([0, 1, n + 1, n, n * n, n * n + 1, n * n + n + 1, n * n + n], dtype=np.int32)
    return points, np.ascontiguousarray(first[:, None] + steps)


def took(work):
    gc.collect()
    begin = time.perf_counter()
    work()
    return time.perf_counter() - begin


def least(works, repeats=5):
    """The least time of each work, taken in turn."""
    times = [[] for _ in works]
    for _ in range(repeats):
        for place, work in enumerate(works):
            times[place].append(took(work))
    return [min(each) for each in times]


def told(what, seconds, limit=None):
    print(f"{what:<62} {seconds:9.4f} s" + (f"   (at most {limit})" if limit else ""), flush=True)


def mesh_from_arrays(points, cells):
    made, copied = least([lambda: qrx.Mesh(points, {"C3D8": cells}), lambda: (points.copy(), cells.copy())])
    told(f"mesh of {len(points)} nodes and {len(cells)} hexahedra", made)
    told("  the arrays copied once, by numpy", copied)
    told("  beyond that", made - copied, "0.1 s")


def model_of(points, cells):
    model = qrx.Model(heading="Cube")
    mesh = qrx.Mesh(points, {"C3D8": cells}, cell_sets={"ALL": np.arange(len(cells))})
    part = model.add_part("CUBE", mesh)
    part.assign("ALL", "Solid")
    model.sections["Solid"] = qrx.HomogenousSolidSection(material="Steel")
    model.materials["Steel"] = qrx.Material(elastic=[[210e3, 0.3]])
    model.add_instance("CUBE-1", part)
    return model


def deck(model, folder, program):
    target = os.path.join(folder, "python.inp")
    store = model._store()
    whole, alone = least([lambda: model.write(target), lambda: store.write_deck(target)], 3)
    told(f"deck of {os.path.getsize(target) / 1e6:.0f} MB from Python, model to file", whole)
    told("  the same store by the library's writer alone", alone)
    print(f"  ratio {whole / alone:.3f} (at most 1.05)")
    if program:
        program = os.path.abspath(program)
        model.save(os.path.join(folder, "cube.json"))
        run = subprocess.run(
            [program, "write", "cube.json", "--job", "program", "--json"], cwd=folder, capture_output=True, check=True
        )
        told("  the program's own time, checks included", json.loads(run.stdout)["written"]["seconds"])
        assert pathlib.Path(target).read_bytes() == pathlib.Path(folder, "program.inp").read_bytes()


def savetxt(points):
    labels = np.arange(1, len(points) + 1)
    model = qrx.Model()
    model.add_part("P", qrx.Mesh(points, {}))
    model.add_instance("P-1", "P")
    store = model._store()

    def by_numpy():
        np.savetxt(io.BytesIO(), np.column_stack([labels, points]), fmt="%7d, %12.9g, %12.9g, %12.9g")

    # Both to memory: the disk is nobody's merit.
    mine, numpys = least([lambda: store.write_deck_to(io.BytesIO().write), by_numpy], 3)
    told("node block by the package", mine)
    told("  numpy.savetxt of the same numbers", numpys)
    print(f"  ratio {numpys / mine:.1f} (at least 20)")


def loads(count):
    def build():
        model = qrx.Model()
        for number in range(count):
            model.loads[f"Load-{number}"] = (
                qrx.ConcentratedForce("P-1.TIP").at("Pull", component1=1.0, component2=float(number)).end_at("Rest")
            )
        return model

    (plain,) = least([build], 3)
    told(f"{count} loads with two states each", plain, "0.5 s")
    model = build()
    model.add_part("P", qrx.Mesh([[0, 0, 0]], {}, point_sets={"TIP": [0]}))
    model.add_instance("P-1", "P")
    model.add_step(qrx.StaticStep("Pull"))
    model.add_step(qrx.StaticStep("Rest"))
    told("  their store", least([model._store], 3)[0])


def imports():
    code = "import time; begin = time.perf_counter(); import qrx; print(time.perf_counter() - begin)"
    command = [sys.executable, "-c", code]
    times = [float(subprocess.run(command, capture_output=True, check=True).stdout) for _ in range(9)]
    told("import qrx", min(times), "0.1 s")


def main():
    options = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    options.add_argument("--nodes", type=int, default=1000000)
    options.add_argument("--deck-program")
    given = options.parse_args()
    side = round(given.nodes ** (1 / 3))
    points, cells = hexahedra(side)
    imports()
    mesh_from_arrays(points, cells)
    loads(10000)
    with tempfile.TemporaryDirectory() as folder:
        savetxt(points)
        deck(model_of(points, cells), folder, given.deck_program)


if __name__ == "__main__":
    main()
