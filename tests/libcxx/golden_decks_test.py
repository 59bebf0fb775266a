#!/usr/bin/env python3
"""Compares every golden deck, to the byte, with what a program writes: golden_decks_test.py REPOSITORY QRXDECK EXAMPLE"""

import pathlib
import subprocess
import sys
import tempfile
import unittest

REPOSITORY, PROGRAM, EXAMPLE = (pathlib.Path(word).resolve() for word in sys.argv[1:4])
sys.path.insert(0, str(REPOSITORY / "tests/programs"))
import two_instances_test  # noqa: E402


class GoldenDecks(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))

    def test_GoldenDecks_AreTheSameToTheByte(self):
        pairs = sorted(model for folder in ("tests/decks", "examples") for model in (REPOSITORY / folder).rglob("*.json")
                       if model.with_suffix(".inp").exists())
        self.assertGreater(len(pairs), 120)
        different = []
        for model in pairs:
            deck = self.folder / "deck.inp"
            deck.unlink(missing_ok=True)
            done = subprocess.run([PROGRAM, "write", model, "--job", "deck"], cwd=self.folder, capture_output=True)
            if done.returncode != 0 or deck.read_bytes() != model.with_suffix(".inp").read_bytes():
                different.append((model.name, done.stderr[-300:]))
        self.assertEqual(different, [])
        print(f"{len(pairs)} decks are the same", file=sys.stderr)

    def test_CanonicalForms_ReadBackTheSame(self):
        for model in sorted((REPOSITORY / "tests/decks").glob("*.json")):
            formatted = self.folder / "formatted.json"
            subprocess.run([PROGRAM, "format", model, "-o", formatted], check=True, capture_output=True)
            subprocess.run([PROGRAM, "format", formatted, "--check"], check=True, capture_output=True)

    def test_ExampleInMemory_WritesItsDeck(self):
        subprocess.run([EXAMPLE], cwd=self.folder, check=True, capture_output=True)
        decks = list(self.folder.glob("*.inp"))
        self.assertEqual([deck.read_bytes() for deck in decks], [two_instances_test.DECK.encode()])


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
