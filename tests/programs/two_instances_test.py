#!/usr/bin/env python3
"""Runs the example that builds its model in memory, and compares its deck.

usage: two_instances_test.py PROGRAM
"""

import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

MESH = """\
*Node
      1,           0.,           0.,           0.
      2,          20.,           0.,           0.
      3,          20.,          20.,           0.
      4,           0.,          20.,           0.
      5,           0.,           0.,         10.5
      6,          20.,           0.,         10.5
      7,          20.,          20.,         10.5
      8,           0.,          20.,         10.5
*Element, type=C3D8
1, 1, 2, 3, 4, 5, 6, 7, 8
*Nset, nset=BASE, generate
1, 4, 1
*Elset, elset=ALL
1,\x20
*Elset, elset=_TOP_S2, internal
1,\x20
*Surface, type=ELEMENT, name=TOP
_TOP_S2, S2
"""

DECK = f"""\
*Heading
Two stacked blocks
**
** PARTS
**
*Part, name=BLOCK
*End Part
**
** ASSEMBLY
**
*Assembly, name=Assembly
*Instance, name=lower, part=BLOCK
{MESH}*End Instance
*Instance, name=upper, part=BLOCK
          0.,           0.,         10.5
          0.,           0.,         10.5,           0.,           0.,         11.5, 57.2957795130823
{MESH}*End Instance
*Nset, nset=TIPS, instance=lower
5,6
*Nset, nset=TIPS, instance=upper
7,8
*Elset, elset=_JOINT_S2, instance=lower, internal
1,\x20
*Elset, elset=_JOINT_S1, instance=upper, internal
1,\x20
*Surface, type=ELEMENT, name=JOINT
_JOINT_S2, S2
_JOINT_S1, S1
*End Assembly
"""


class TwoInstances(unittest.TestCase):
    maxDiff = None

    def test_Example_WritesTheDeckOfItsModel(self):
        with tempfile.TemporaryDirectory() as folder:
            run = subprocess.run([PROGRAM], cwd=folder, capture_output=True, text=True)
            self.assertEqual((run.returncode, run.stderr), (0, ""))
            deck = pathlib.Path(folder, "two_instances.inp").read_bytes()
            self.assertEqual(deck.decode(), DECK)
            self.assertEqual(run.stdout, f"two_instances.inp: {len(deck)} bytes\n")

    def test_FolderThatIsNotThere_IsTold(self):
        with tempfile.TemporaryDirectory() as folder:
            run = subprocess.run([PROGRAM, "none/job"], cwd=folder, capture_output=True, text=True)
            self.assertEqual((run.returncode, run.stdout), (3, ""))
            self.assertEqual(run.stderr, "none/job.inp: No such file or directory\n")


if __name__ == "__main__":
    PROGRAM = os.path.abspath(sys.argv.pop(1))
    unittest.main()
