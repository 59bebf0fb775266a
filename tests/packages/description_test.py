#!/usr/bin/env python3
"""Looks at what a build says of its contents: description_test.py FOLDER QRXDECK VERSION"""

import gzip
import json
import pathlib
import re
import subprocess
import sys
import unittest

FOLDER, PROGRAM, VERSION = pathlib.Path(sys.argv[1]), sys.argv[2], sys.argv[3]


class Description(unittest.TestCase):
    def described(self, package):
        return json.loads((FOLDER / package / f"{package}.spdx.json").read_text())

    def test_OfEachPackage_IsWhole(self):
        for package in ("qrxdeck", "libqrxptinputfilewriter-dev"):
            described = self.described(package)
            self.assertEqual((described["spdxVersion"], described["SPDXID"]), ("SPDX-2.3", "SPDXRef-DOCUMENT"))
            self.assertRegex(described["creationInfo"]["created"], r"^\d{4}-\d\d-\d\dT\d\d:\d\d:\d\dZ$")
            ids = [part["SPDXID"] for part in described["packages"]]
            self.assertEqual(len(ids), len(set(ids)))
            self.assertEqual(described["packages"][0]["name"], package)
            self.assertTrue(described["packages"][0]["versionInfo"].startswith(VERSION))
            for part in described["packages"]:
                self.assertNotIn("", (part["name"], part["versionInfo"], part["downloadLocation"], part["licenseDeclared"]))
            # Each part is told how it belongs to the package.
            self.assertEqual(sorted(each["relatedSpdxElement"] for each in described["relationships"]), sorted(ids))

    def test_OfTheProgram_NamesWhatItIsLinkedTo(self):
        names = {part["name"].lower() for part in self.described("qrxdeck")["packages"]}
        self.assertLessEqual({"nlohmann-json", "cli11"}, names)
        dynamic = subprocess.run(["readelf", "-d", PROGRAM], capture_output=True, text=True, check=True).stdout
        needed = set(re.findall(r"\(NEEDED\).*\[lib([^.]+?)(?:_serial)?\.so", dynamic))
        # The C library and the compiler's are every program's.
        for library in needed - {"c", "m", "gcc_s"}:
            self.assertIn({"z": "zlib", "crypto": "openssl", "stdc++": "libstdc++"}.get(library, library), names)

    def test_History_TellsTheVersion(self):
        for package in ("qrxdeck", "libqrxptinputfilewriter-dev"):
            text = gzip.decompress((FOLDER / package / "changelog.gz").read_bytes()).decode()
            self.assertTrue(text.startswith(f"{package} ({VERSION}) "), text)
            self.assertIn("not yet chosen", (FOLDER / package / "copyright").read_text())


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
