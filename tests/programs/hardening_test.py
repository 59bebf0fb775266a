#!/usr/bin/env python3
"""Looks into the release build of a program for what guards it.

usage: hardening_test.py PROGRAM [unittest options]
"""

import platform
import re
import subprocess
import sys
import unittest


def shown(tool, *arguments):
    return subprocess.run([tool, *arguments, PROGRAM], check=True, capture_output=True, text=True).stdout


class Hardening(unittest.TestCase):
    def test_Addresses_DifferFromRunToRun(self):
        self.assertRegex(shown("readelf", "-hW"), r"Type:\s+DYN")
        self.assertRegex(shown("readelf", "-dW"), r"FLAGS_1.*\bPIE\b")

    def test_TablesOfAddresses_AreFilledAndLockedAtTheStart(self):
        self.assertIn("GNU_RELRO", shown("readelf", "-lW"))
        self.assertRegex(shown("readelf", "-dW"), r"FLAGS_1.*\bNOW\b")

    def test_Stack_HoldsNoCode(self):
        stack = re.search(r"GNU_STACK.*", shown("readelf", "-lW")).group()
        self.assertRegex(stack, r"\bRW\b")

    def test_Stacks_AreGuarded(self):
        self.assertIn("__stack_chk_fail", shown("readelf", "-sW"))

    def test_CallsOfTheLibrary_AreChecked(self):
        self.assertRegex(shown("readelf", "-sW"), r"__(mem|str|sn?printf|read)\w*_chk")

    @unittest.skipIf(platform.machine() != "x86_64", "the marks are of this processor")
    def test_TargetsOfJumps_AreMarked(self):
        main = shown("objdump", "-d", "--disassemble=main")
        self.assertRegex(main, r"<main>:\n[^\n]*endbr64")


if __name__ == "__main__":
    PROGRAM = sys.argv.pop(1)
    unittest.main()
