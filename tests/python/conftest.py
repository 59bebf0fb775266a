"""What the tests of the package share. QRX_PROGRAM names the built command line."""

import importlib.util
import os
import pathlib
import subprocess

import pytest

ROOT = pathlib.Path(__file__).resolve().parents[2]


@pytest.fixture(scope="session")
def root():
    return ROOT


@pytest.fixture(scope="session")
def program():
    return os.environ["QRX_PROGRAM"]


def run(*words):
    """Runs a program, without what a sanitized extension has the interpreter preload."""
    environment = {name: value for name, value in os.environ.items() if name != "LD_PRELOAD"}
    command = [str(word) for word in words]
    return subprocess.run(command, capture_output=True, text=True, check=False, env=environment)


def model_files():
    """The models of the deck tests and of the examples."""
    found = sorted((ROOT / "tests" / "decks").glob("*.json")) + sorted((ROOT / "examples").glob("*/*.json"))
    assert len(found) > 100
    return found


def example_scripts():
    return [path for path in sorted((ROOT / "examples").glob("*/*.py")) if not path.name.startswith("make_")]


def module_of(path):
    spec = importlib.util.spec_from_file_location(path.stem, path)
    module = importlib.util.module_from_spec(spec)
    spec.loader.exec_module(module)
    return module
