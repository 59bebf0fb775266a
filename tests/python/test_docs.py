"""What docs/python.md shows runs and gives what stands there."""

import doctest
import os
import shutil

from conftest import ROOT


def test_Docs_ShowWhatHappens(tmp_path, monkeypatch):
    shutil.copy(ROOT / "examples" / "bonded_blocks" / "blocks.msh", tmp_path / "blocks.msh")
    monkeypatch.chdir(tmp_path)
    failed, tried = doctest.testfile(
        os.fspath(ROOT / "docs" / "python.md"), module_relative=False,
        optionflags=doctest.NORMALIZE_WHITESPACE | doctest.ELLIPSIS, encoding="utf-8",
    )
    assert tried > 40
    assert failed == 0
