"""Files, threads, signals and the command line."""

import errno
import io
import os
import pathlib
import signal
import stat
import subprocess
import sys
import threading
import time

import numpy as np
import pytest

import qrx
import rod


def large(count):
    """A model of many nodes."""
    points = np.arange(3 * count, dtype=np.float32).reshape(count, 3)
    rows = np.arange(count - 1, dtype=np.int32)
    model = qrx.Model(heading="Large")
    model.add_part("ROD", qrx.Mesh(points, {"T3D2": np.column_stack([rows, rows + 1])}))
    model.add_instance("ROD-1", "ROD")
    return model


def test_Path_IsReplacedAsAWhole(tmp_path):
    path = tmp_path / "rod.inp"
    path.write_text("old")
    path.chmod(0o640)
    rod.model().write(path)
    assert path.read_text() == rod.DECK
    assert stat.S_IMODE(path.stat().st_mode) == 0o640
    assert os.listdir(tmp_path) == ["rod.inp"]
    rod.model().write(str(path))
    assert path.read_text() == rod.DECK


def test_FailedWrite_LeavesTheOldDeck(tmp_path):
    path = tmp_path / "rod.inp"
    path.write_text("old")
    model = rod.model()
    model.loads["Force"].region = "NOWHERE"
    with pytest.raises(qrx.ModelError):
        model.write(path)
    assert path.read_text() == "old"
    assert os.listdir(tmp_path) == ["rod.inp"]


def test_BinaryFile_GetsTheDeck(tmp_path):
    target = io.BytesIO()
    rod.model().write(target)
    assert target.getvalue().decode() == rod.DECK
    with open(tmp_path / "rod.inp", "wb", buffering=0) as file:
        rod.model().write(file)
    assert (tmp_path / "rod.inp").read_text() == rod.DECK


def test_FileThatTakesLittle_GetsAll():
    class Slow:
        def __init__(self):
            self.text = b""

        def write(self, text):
            self.text += text[:100]
            return min(len(text), 100)

    target = Slow()
    rod.model().write(target)
    assert target.text.decode() == rod.DECK


def test_WhatAFileRaises_ComesThrough():
    class Full:
        def write(self, text):
            raise OSError(errno.ENOSPC, "full")

    with pytest.raises(OSError) as raised:
        rod.model().write(Full())
    assert raised.value.errno == errno.ENOSPC


def test_Refusals_HaveTheirNumbers(tmp_path):
    with pytest.raises(FileNotFoundError) as raised:
        rod.model().write(tmp_path / "none" / "rod.inp")
    assert raised.value.errno == errno.ENOENT
    assert raised.value.filename == str(tmp_path / "none" / "rod.inp")
    with pytest.raises(IsADirectoryError):
        rod.model().write(tmp_path)
    with pytest.raises(FileNotFoundError):
        rod.model().save(tmp_path / "none" / "rod.json")
    with pytest.raises(FileNotFoundError):
        qrx.load(tmp_path / "none.json")
    with pytest.raises(IsADirectoryError):
        qrx.load(tmp_path)


def test_MissingMeshFile_IsNotFound(tmp_path):
    (tmp_path / "m.json").write_text(
        '{"format": "qrx-model/1", "models": {"Default Model": {"parts": {"P": {"mesh": {"file": "none.msh"}}}}}}'
    )
    with pytest.raises(FileNotFoundError) as raised:
        qrx.load(tmp_path / "m.json")
    assert "none.msh" in str(raised.value)


def test_WrongModelFile_IsAModelError(tmp_path):
    (tmp_path / "m.json").write_text('{"format": "qrx-model/1", "models": {"Default Model": {"lods": {}}}}')
    with pytest.raises(qrx.ModelError, match="did you mean 'loads'"):
        qrx.load(tmp_path / "m.json")
    (tmp_path / "m.json").write_text("{")
    with pytest.raises(qrx.ModelError):
        qrx.load(tmp_path / "m.json")


def test_Threads_WriteModelsAtOnce(tmp_path):
    models = [large(20000 + i) for i in range(4)]
    expected = [model.deck() for model in models]
    failures = []

    def write(number):
        try:
            models[number % 4].write(tmp_path / f"{number}.inp")
        except BaseException as error:
            failures.append(error)

    threads = [threading.Thread(target=write, args=(number,)) for number in range(8)]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    assert failures == []
    for number in range(8):
        assert (tmp_path / f"{number}.inp").read_text() == expected[number % 4]


def test_DeckOfAnyNumberOfThreads_IsTheSame(tmp_path):
    model = large(100000)
    expected = model.deck()
    for threads in (1, 2, 5):
        model.write(tmp_path / "large.inp", threads=threads)
        assert (tmp_path / "large.inp").read_text() == expected


def test_OtherThreads_GoOnWhileADeckIsWritten():
    model = large(300000)
    counted = []
    done = threading.Event()

    def count():
        while not done.is_set():
            counted.append(time.perf_counter())
            time.sleep(0.001)

    thread = threading.Thread(target=count)
    thread.start()
    begin = time.perf_counter()
    model.deck()
    end = time.perf_counter()
    done.set()
    thread.join()
    inside = [moment for moment in counted if begin < moment < end]
    # With the lock held all the time there would be one or two.
    assert len(inside) > 0.02 * (end - begin) / 0.001


LONG = """
import numpy as np, os, pathlib, sys, qrx, time
sys.path.insert(0, {tests!r})
from test_files import large
model = large(2000000)
model.save("large.json")
print("ready", flush=True)
try:
    while True:
        {run}
except KeyboardInterrupt:
    print("interrupted", flush=True)
"""


@pytest.mark.parametrize("run", ["model.write('large.inp')", "model.deck()", "model.check()", "qrx.load('large.json')"])
def test_Interrupt_EndsALongRunAndLeavesNothing(tmp_path, run):
    tests = str(pathlib.Path(__file__).parent)
    process = subprocess.Popen(
        [sys.executable, "-c", LONG.format(tests=tests, run=run)], cwd=tmp_path, stdout=subprocess.PIPE, text=True
    )
    assert process.stdout.readline() == "ready\n"
    time.sleep(0.3)
    process.send_signal(signal.SIGINT)
    begin = time.monotonic()
    assert process.communicate(timeout=60)[0] == "interrupted\n"
    assert time.monotonic() - begin < 20
    assert process.returncode == 0
    assert [name for name in os.listdir(tmp_path) if name not in ("large.inp", "large.json")] == []


def test_CommandLine_IsTheProgram(tmp_path, program):
    rod.model().save(tmp_path / "rod.json")

    def run(*words):
        return subprocess.run(words, capture_output=True, text=True, cwd=tmp_path, check=False)

    for words in (["--version"], ["check", "rod.json"], ["info", "--history", "rod.json"], ["write"], ["nothing"]):
        mine = run(sys.executable, "-m", "qrx", *words)
        other = run(program, *words)
        assert (mine.returncode, mine.stdout, mine.stderr) == (other.returncode, other.stdout, other.stderr)
    assert run(sys.executable, "-m", "qrx", "write", "rod.json").returncode == 0
    assert (tmp_path / "rod.inp").read_text() == rod.DECK


def test_Import_IsFastAndTakesNoNumpy():
    code = (
        "import time; begin = time.perf_counter(); import qrx; took = time.perf_counter() - begin; import sys; "
        "assert 'numpy' not in sys.modules; qrx.Material(elastic=[[1, 2]]); assert 'numpy' not in sys.modules; "
        "print(took)"
    )
    times = [float(subprocess.run([sys.executable, "-c", code], capture_output=True, text=True, check=True).stdout)
             for _ in range(5)]
    assert min(times) < 0.1
