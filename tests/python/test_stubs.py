"""The stubs, by mypy."""

import os
import subprocess
import sys

import pytest

import qrx
from conftest import ROOT, example_scripts

pytest.importorskip("mypy", reason="scripts/install-dependencies.sh python gets mypy")
PACKAGE = os.path.dirname(os.path.dirname(qrx.__file__))


def mypy(*files, cwd):
    command = [sys.executable, "-m", "mypy", "--strict", "--cache-dir", str(cwd / "cache"), *map(str, files)]
    environment = {**os.environ, "MYPYPATH": PACKAGE}
    return subprocess.run(command, capture_output=True, text=True, cwd=cwd, env=environment, check=False).stdout


def test_Examples_AreRightByTheStubs(tmp_path):
    assert mypy(*example_scripts(), cwd=tmp_path).startswith("Success"), mypy(*example_scripts(), cwd=tmp_path)


WRONG = """\
import qrx
qrx.StaticStep("Load", nlgeon=True)
qrx.Elastic(type=1.5)
qrx.TrussSection(area="wide")
qrx.Pressure("A.B").at("Load", magnitud=1.0)
m = qrx.Model()
m.loads["A"] = qrx.Material()
qrx.StaticStep(5)
qrx.Mesh([[0.0]], {"C3D8": "x"})
reveal_type(qrx.Elastic().type)
reveal_type(qrx.Material().elastic)
reveal_type(m.materials["A"].copy())
"""


def test_WrongUses_AreToldByTheStubs(tmp_path):
    path = tmp_path / "wrong.py"
    path.write_text(WRONG)
    told = mypy(path, cwd=tmp_path)
    for line in (2, 3, 4, 5, 7, 8, 9):
        assert f"wrong.py:{line}: error" in told, (line, told)
    assert 'Revealed type is "qrx.ElasticType"' in told
    assert 'Revealed type is "Union[qrx.Elastic, None]"' in told
    assert 'Revealed type is "qrx.Material"' in told


def test_Stubs_HaveAllPublicNames():
    text = open(os.path.join(os.path.dirname(qrx.__file__), "__init__.pyi"), encoding="utf-8").read()
    for name in qrx.__dir__():
        assert any(f"{kind} {name}" in text for kind in ("class", "def")) or f"\n{name}:" in text, name
    assert (ROOT / "python" / "qrx" / "py.typed").exists()
