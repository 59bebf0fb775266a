#!/usr/bin/env python3
"""Asks qrxdeck what classes there are, as a user at a terminal does.

usage: classes_test.py PROGRAM [unittest options]
"""

import fcntl
import json
import os
import pty
import struct
import subprocess
import sys
import termios
import unittest


def on_terminal(columns, *arguments, **environment):
    """What the program shows on a terminal of that width."""
    master, slave = pty.openpty()
    fcntl.ioctl(slave, termios.TIOCSWINSZ, struct.pack("HHHH", 50, columns, 0, 0))
    variables = {name: value for name, value in os.environ.items() if name != "NO_COLOR"}
    run = subprocess.Popen([PROGRAM, *arguments], stdout=slave, env={**variables, "TERM": "xterm", **environment})
    os.close(slave)
    shown = b""
    while True:
        try:
            block = os.read(master, 65536)
        except OSError:
            break
        if not block:
            break
        shown += block
    os.close(master)
    return run.wait(), shown.decode().replace("\r\n", "\n")


class ClassesTest(unittest.TestCase):
    def run_program(self, *arguments):
        return subprocess.run([PROGRAM, *arguments], capture_output=True, text=True)

    def test_Classes_AreListedByFamilyWithALineEach(self):
        run = self.run_program("classes")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        for line in ["steps: steps", "loads: loads", "materials: options of a material, by the member that holds each",
                     "controls: solution controls of the step"]:
            self.assertIn(line, run.stdout.splitlines())
        self.assertRegex(run.stdout, r"(?m)^  StaticStep +General static analysis\.$")
        self.assertRegex(run.stdout, r"(?m)^  elastic +linear elasticity$")
        self.assertNotIn("odiK_", run.stdout)

    def test_OneFamily_StandsAlone(self):
        run = self.run_program("classes", "LOADS")
        self.assertTrue(run.stdout.startswith("loads: loads\n  BoltLoad "))
        self.assertNotIn("StaticStep", run.stdout)
        told = json.loads(self.run_program("classes", "loads", "--json").stdout)
        self.assertEqual(list(told["classes"]), ["loads"])
        self.assertEqual(told["classes"]["loads"]["Pressure"], "pressure on a surface: stress")

    def test_UnknownFamilyOrClass_IsCodeTwoWithTheNearest(self):
        for arguments, nearest in [(["classes", "loafs"], "loads"), (["schema", "Presure"], "Pressure"),
                                   (["schema", "kprC_StaticStp"], "StaticStep")]:
            run = self.run_program(*arguments)
            self.assertEqual((run.returncode, run.stdout), (2, ""))
            self.assertIn(f"did you mean '{nearest}'?", run.stderr)

    def test_Class_IsATableOfItsMembersWithAnExample(self):
        for name in ["StaticStep", "static", "kprC_StaticStep"]:
            run = self.run_program("schema", name)
            self.assertEqual((run.returncode, run.stderr), (0, ""))
            self.assertTrue(run.stdout.startswith("StaticStep (also kprC_StaticStep, Static)\nGeneral static analysis.\n"))
            self.assertRegex(run.stdout, r"(?m)^  timePeriod +number +1\.0 +time period of the step")
            self.assertRegex(run.stdout, r"(?m)^  class +word +\(needed\) +")
            self.assertIn('"class": "StaticStep"', run.stdout)
        self.assertIn("In each of the states", self.run_program("schema", "Pressure").stdout)

    def test_PartsOfTheFrame_AreTablesToo(self):
        for name in ["model", "INSTANCE", "mesh"]:
            run = self.run_program("schema", name)
            self.assertEqual(run.returncode, 0, run.stderr)
            self.assertIn("meaning", run.stdout)

    def test_WordOfTwoClasses_ShowsBoth(self):
        run = self.run_program("schema", "Damping")
        self.assertIn("Damping (also kmaC_Damping)", run.stdout)
        self.assertIn("Damping (also kinC_Damping)", run.stdout)

    def test_ClassesThatAreListed_HaveTheirTables(self):
        families = json.loads(self.run_program("classes", "--json").stdout)["classes"]
        names = {name for family, classes in families.items() if family != "materials" for name in classes}
        self.assertGreater(len(names), 150)
        for name in sorted(names)[::12]:
            run = self.run_program("schema", name)
            self.assertEqual((run.returncode, run.stderr), (0, ""), name)

    def test_ATerminal_GetsLinesOfItsWidth(self):
        for columns in [40, 60, 100]:
            for arguments in [["classes", "steps"], ["schema", "Pressure"]]:
                code, text = on_terminal(columns, *arguments, NO_COLOR="1")
                self.assertEqual(code, 0)
                self.assertNotIn("\033", text)
                # What no line break can help is longer.
                long = [line for line in text.splitlines() if len(line) > columns and " " in line.strip()]
                self.assertEqual(long, [], f"{columns} {arguments}")
        self.assertLess(len(on_terminal(100, "classes")[1].splitlines()), len(on_terminal(60, "classes")[1].splitlines()))

    def test_Colours_AreForTerminalsThatWantThem(self):
        self.assertIn("\033[1mloads\033[0m", on_terminal(80, "classes", "loads")[1])
        self.assertNotIn("\033", on_terminal(80, "classes", "loads", NO_COLOR="1")[1])
        self.assertNotIn("\033", on_terminal(80, "classes", "loads", TERM="dumb")[1])
        self.assertNotIn("\033", self.run_program("classes", "loads").stdout)


if __name__ == "__main__":
    PROGRAM = os.path.abspath(sys.argv.pop(1))
    unittest.main()
