"""The examples as scripts: their decks are those of the model files, byte for byte."""

import os
import subprocess

import pytest

from conftest import ROOT, example_scripts, module_of, run


def test_EveryExample_HasAScript():
    # A study's template is a model file by its nature: what varies is what it names.
    folders = {path.parent.name for path in (ROOT / "examples").glob("*/*.json")} | {"in_memory"}
    folders -= {"plate_study"}
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
