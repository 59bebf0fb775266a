"""The wheel: the same to the last bit, and installed where there is nothing else and no network."""

import os
import pathlib
import subprocess
import sys
import zipfile

import pytest

import qrx
import rod
from conftest import ROOT

PACKAGE = pathlib.Path(qrx.__file__).parent


def wheel(folder):
    """Packs what is built already."""
    folder.mkdir()
    environment = {**os.environ, "QRX_BUILT_PACKAGE": str(PACKAGE)}
    code = (
        f"import sys; sys.path.insert(0, {str(ROOT / 'python' / 'build')!r}); sys.dont_write_bytecode = True; "
        f"import backend; print(backend.build_wheel({str(folder)!r}))"
    )
    made = subprocess.run([sys.executable, "-c", code], capture_output=True, text=True, check=True, env=environment)
    return folder / made.stdout.split()[-1]


def test_Wheel_IsTheSameToTheLastBit(tmp_path):
    first = wheel(tmp_path / "first")
    second = wheel(tmp_path / "second")
    assert first.name == second.name
    assert first.read_bytes() == second.read_bytes()
    assert first.stat().st_size < 6_000_000


def test_Wheel_InAnEmptyEnvironmentWithoutNetwork_Works(tmp_path):
    made = wheel(tmp_path / "wheel")
    place = tmp_path / "venv"
    try:
        subprocess.run([sys.executable, "-m", "venv", place], check=True, capture_output=True)
    except subprocess.CalledProcessError as error:
        pytest.skip(f"no environments here: {error.stdout}")
    python = place / "bin" / "python"
    environment = {name: value for name, value in os.environ.items() if not name.startswith("PYTHON")}

    def run(*words):
        return subprocess.run([python, *words], capture_output=True, text=True, check=True, cwd=tmp_path,
                              env=environment).stdout

    run("-m", "pip", "install", "--no-index", "--disable-pip-version-check", made)
    assert run("-c", "import qrx; print(qrx.__file__)").startswith(str(place))
    assert run("-m", "qrx", "--version").split()[:2] == ["qrxdeck", qrx.__version__]
    rod.model().save(tmp_path / "rod.json")
    code = "import qrx; m = qrx.load('rod.json'); m.materials['Steel'].density = 7.85e-9; m.write('rod.inp')"
    run("-c", code)
    assert (tmp_path / "rod.inp").read_text() == rod.DECK.replace(
        "*Material, name=Steel\n", "*Material, name=Steel\n*Density\n 7.85e-09,\n"
    )
    listed = run("-m", "pip", "show", "-f", "qrx")
    assert "qrx/py.typed" in listed and "qrx/__init__.pyi" in listed


def test_MetadataAhead_IsThatOfTheWheel(tmp_path):
    code = (
        f"import sys; sys.path.insert(0, {str(ROOT / 'python' / 'build')!r}); sys.dont_write_bytecode = True; "
        f"import backend; print(backend.prepare_metadata_for_build_wheel({str(tmp_path)!r}))"
    )
    made = subprocess.run([sys.executable, "-c", code], capture_output=True, text=True, check=True)
    info = made.stdout.strip()
    with zipfile.ZipFile(wheel(tmp_path / "wheel")) as packed:
        for name in ("METADATA", "WHEEL"):
            assert packed.read(f"{info}/{name}") == (tmp_path / info / name).read_bytes()


def test_SourceArchive_HasAllThatTheBuildTakes(tmp_path):
    import re
    import tarfile

    code = (
        f"import sys; sys.path.insert(0, {str(ROOT / 'python' / 'build')!r}); sys.dont_write_bytecode = True; "
        f"import backend; print(backend.build_sdist({str(tmp_path)!r}))"
    )
    made = subprocess.run([sys.executable, "-c", code], capture_output=True, text=True, check=True)
    with tarfile.open(tmp_path / made.stdout.strip()) as archive:
        names = archive.getnames()
    top = {name.split("/")[1] for name in names if "/" in name}
    lists = re.findall(r"add_subdirectory\((.+)\)", (ROOT / "CMakeLists.txt").read_text(encoding="utf-8"))
    assert set(lists) - top == {"tests", "benchmarks", "fuzz"}
    assert not [name for name in names if "node_modules" in name or "__pycache__" in name]
