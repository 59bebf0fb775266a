#!/usr/bin/env python3
"""Formats every model below some folders: the second time must change nothing, and the deck must stay the same.

usage: format_test.py QRXDECK FOLDER ...
"""

import json
import pathlib
import shutil
import subprocess
import sys
import tempfile


def run(program, *words, cwd):
    return subprocess.run([program, *map(str, words)], cwd=cwd, capture_output=True)


def deck_of(program, model, folder, job):
    """The exit code and the deck, or the error without the model's name."""
    result = run(program, "write", model, "--job", job, cwd=folder)
    deck = folder / (job + ".inp")
    errors = [line for line in result.stderr.decode().replace(str(model), "").splitlines() if ": warning: " not in line and ": note: " not in line]
    return result.returncode, deck.read_bytes() if deck.exists() else None, errors


def problem_of(program, model, folder):
    """What is wrong with the formatted model; None when all is well."""
    for mesh in model.parent.rglob("*.*"):
        # Paths of mesh files are relative to the model file.
        copy = folder / mesh.relative_to(model.parent)
        if mesh.suffix in (".msh", ".unv") and not copy.exists():
            copy.parent.mkdir(exist_ok=True)
            shutil.copy(mesh, copy)
    first = run(program, "format", model, cwd=folder)
    if first.returncode == 1:
        return None if run(program, "check", model, cwd=folder).returncode == 1 else "is right but not formatted"
    if first.returncode != 0:
        return f"format ends with {first.returncode}"
    json.loads(first.stdout)
    formatted = folder / "formatted.json"
    formatted.write_bytes(first.stdout)
    second = run(program, "format", formatted, cwd=folder)
    if second.stdout != first.stdout:
        return "changes when it is formatted twice"
    if second.stderr.count(b"comments") or run(program, "format", "--check", formatted, cwd=folder).returncode != 0:
        return "is not in canonical form when it has been formatted"
    before = deck_of(program, model, folder, "before")
    after = deck_of(program, formatted, folder, "after")
    return None if before == after else "gives another deck when it has been formatted"


def main():
    program = str(pathlib.Path(sys.argv[1]).resolve())
    models = sorted(path for folder in sys.argv[2:] for path in pathlib.Path(folder).resolve().rglob("*.json"))
    failures = 0
    for model in models:
        with tempfile.TemporaryDirectory() as folder:
            problem = problem_of(program, model, pathlib.Path(folder))
        if problem is not None:
            failures += 1
            print(f"{model}: {problem}")
    print(f"{len(models)} models, {failures} failures")
    return 1 if failures or not models else 0


if __name__ == "__main__":
    sys.exit(main())
