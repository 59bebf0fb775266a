"""What docs/python.md shows runs and gives what stands there."""

import doctest
import os
import re
import shutil

from conftest import ROOT

# A brick of one element with a face on either side.
PLATE = """$MeshFormat
2.2 0 8
$EndMeshFormat
$PhysicalNames
3
3 1 "BODY"
2 2 "LEFT"
2 3 "RIGHT"
$EndPhysicalNames
$Nodes
8
1 0 0 0
2 9 0 0
3 9 9 0
4 0 9 0
5 0 0 1
6 9 0 1
7 9 9 1
8 0 9 1
$EndNodes
$Elements
3
1 5 2 1 1 1 2 3 4 5 6 7 8
2 3 2 2 2 1 4 8 5
3 3 2 3 3 2 3 7 6
$EndElements
"""


def test_Docs_ShowWhatHappens(tmp_path, monkeypatch):
    shutil.copy(ROOT / "examples" / "bonded_blocks" / "blocks.msh", tmp_path / "blocks.msh")
    monkeypatch.chdir(tmp_path)
    failed, tried = doctest.testfile(
        os.fspath(ROOT / "docs" / "python.md"), module_relative=False,
        optionflags=doctest.NORMALIZE_WHITESPACE | doctest.ELLIPSIS, encoding="utf-8",
    )
    assert tried > 40
    assert failed == 0


def test_Readme_ShowsAModelThatIsWritten(tmp_path, monkeypatch, capsys):
    monkeypatch.chdir(tmp_path)
    (tmp_path / "plate.msh").write_text(PLATE)
    (code,) = re.findall(r"```python\n(.*?)```", (ROOT / "README.md").read_text(encoding="utf-8"), re.DOTALL)
    exec(code.replace('"ALL"', '"BODY"'), {})
    assert capsys.readouterr().out == "[]\n"
    deck = (tmp_path / "plate.inp").read_text()
    assert "*Dsload\nPLATE-1.RIGHT, P, -50.\n" in deck
    assert "PLATE-1.LEFT_NODES, 1, 1\n" in deck
