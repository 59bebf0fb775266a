"""The examples as scripts: their decks are those of the model files, byte for byte."""

import os
import shutil
import subprocess
import sys

import pytest

from conftest import ROOT, example_scripts, module_of, run


def test_EveryExample_HasAScript():
    folders = {path.parent.name for path in (ROOT / "examples").glob("*/*.json")} | {"in_memory"}
    assert {path.parent.name for path in example_scripts()} == folders


@pytest.mark.parametrize("path", example_scripts(), ids=lambda path: path.stem)
def test_Script_WritesTheDeckOfTheModelFile(path, program, tmp_path):
    module_of(path).model().write(tmp_path / "python.inp")
    file = path.with_suffix(".json")
    if file.exists():
        run(program, "write", file, "--job", tmp_path / "program")
    else:
        two_instances = os.environ.get("QRX_TWO_INSTANCES")
        if path.stem != "two_instances" or not two_instances:
            pytest.skip("has no other deck to compare with")
        subprocess.run([two_instances, tmp_path / "program"], check=True, capture_output=True)
    assert (tmp_path / "python.inp").read_bytes() == (tmp_path / "program.inp").read_bytes()


@pytest.mark.parametrize("path", example_scripts(), ids=lambda path: path.stem)
def test_ModelOfAScript_HasNoErrors(path):
    assert [finding for finding in module_of(path).model().check() if finding.is_error] == []


def test_StudyScript_WritesTheDecksOfTheStudy(program, tmp_path):
    for name in ("make_study.py", "plate_study.json", "plate_study.py"):
        shutil.copy(ROOT / "examples" / "plate_study" / name, tmp_path)
    for name in ("make_study.py", "plate_study.py"):
        subprocess.run([sys.executable, tmp_path / name], cwd=tmp_path, check=True, capture_output=True)
    run(program, "study", tmp_path / "plate_study.json", tmp_path / "plates.csv", "--out", tmp_path / "program")
    decks = sorted(path.name for path in (tmp_path / "plates").iterdir())
    assert len(decks) == 200
    for name in decks:
        assert (tmp_path / "plates" / name).read_bytes() == (tmp_path / "program" / name).read_bytes()
