#!/usr/bin/env python3
"""The layer check itself, on small trees."""

import pathlib
import subprocess
import sys
import tempfile
import unittest

import check_layers

DECK = check_layers.DECK_WRITER


class LayerCheckTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.root = pathlib.Path(folder.name)
        for header in ("foundation/a.h", "store_interface/model/s.h", "keyword_layer/k.h",
                       DECK + "/deck/d.h", DECK + "/mesh/m.h", "model_file/f.h", "tools/t.h"):
            self.write(header, "")

    def write(self, path, text):
        file = self.root / path
        file.parent.mkdir(parents=True, exist_ok=True)
        file.write_text(text, encoding="utf-8")

    def found(self, path, *lines):
        self.write(path, "\n".join(lines) + "\n")
        return check_layers.findings(self.root)[0]

    def test_tree_in_order_has_no_findings(self):
        self.write("foundation/x.cpp", '#include "foundation/a.h"\n#include <vector>\n#include <unistd.h>\n')
        self.write("store_interface/model/x.cpp", '#include "foundation/a.h"\n#include "store_interface/model/s.h"\n')
        self.write("keyword_layer/x.cpp", '#include "store_interface/model/s.h"\n#include "keyword_layer/k.h"\n')
        self.write(DECK + "/deck/x.cpp", '#include "mesh/m.h"\n#include "deck/d.h"\n#include "keyword_layer/k.h"\n')
        self.write("model_file/x.cpp", '#include <nlohmann/json.hpp>\n#include "store_interface/model/s.h"\n')
        self.write("tools/x.cpp", '#include <CLI/CLI.hpp>\n#include "deck/d.h"\n#include "model_file/f.h"\n')
        self.assertEqual(check_layers.findings(self.root), ([], 13))

    def test_lower_layer_that_includes_a_higher_one_is_found(self):
        self.assertEqual(
            self.found("foundation/x.cpp", "", '#include "store_interface/model/s.h"', '#  include  "deck/d.h"'),
            ['foundation/x.cpp:2: foundation may not include store_interface ("store_interface/model/s.h")',
             f'foundation/x.cpp:3: foundation may not include {DECK} ("deck/d.h")'])

    def test_sideways_include_is_found(self):
        self.assertEqual(self.found("model_file/x.cpp", '#include "deck/d.h"', '#include "keyword_layer/k.h"'),
                         [f'model_file/x.cpp:1: model_file may not include {DECK} ("deck/d.h")',
                          'model_file/x.cpp:2: model_file may not include keyword_layer ("keyword_layer/k.h")'])
        self.assertEqual(len(self.found(DECK + "/deck/x.cpp", '#include "model_file/f.h"')), 3)

    def test_include_of_a_higher_room_is_found(self):
        self.write("store_interface/records/r.h", "")
        self.assertEqual(
            self.found("store_interface/records/x.cpp", '#include "store_interface/model/s.h"'),
            ['store_interface/records/x.cpp:1: records may not include model ("model/s.h")'])
        self.assertEqual(self.found("store_interface/model/x.cpp", '#include "store_interface/records/r.h"'), [
            'store_interface/records/x.cpp:1: records may not include model ("model/s.h")'])

    def test_include_of_a_room_beside_is_found(self):
        self.write(DECK + "/materials/y.h", "")
        self.assertEqual(self.found(DECK + "/mesh/x.cpp", '#include "materials/y.h"'),
                         [f'{DECK}/mesh/x.cpp:1: mesh may not include materials ("materials/y.h")'])

    def test_file_outside_the_rooms_is_found(self):
        self.assertEqual(self.found(DECK + "/attic/x.cpp", '#include "mesh/m.h"'),
                         [f"{DECK}/attic/x.cpp:1: {DECK} has no room for attic/x.cpp"])

    def test_third_party_header_in_the_core_is_found(self):
        self.assertEqual(self.found(DECK + "/deck/x.cpp", "#include <nlohmann/json.hpp>", "#include <fmt/core.h>"),
                         [f"{DECK}/deck/x.cpp:1: {DECK} may not include <nlohmann/json.hpp>",
                          f"{DECK}/deck/x.cpp:2: {DECK} may not include <fmt/core.h>"])

    def test_system_header_outside_the_device_is_found(self):
        self.assertEqual(self.found("store_interface/model/x.cpp", "#include <unistd.h>"),
                         ["store_interface/model/x.cpp:1: store_interface may not include <unistd.h>"])

    def test_header_not_named_by_its_path_is_found(self):
        self.assertEqual(
            self.found("foundation/x.cpp", '#include "a.h"', '#include "../keyword_layer/k.h"', "#include NAME"),
            ['foundation/x.cpp:1: "a.h" names no header by its path',
             'foundation/x.cpp:2: "../keyword_layer/k.h" names no header by its path',
             "foundation/x.cpp:3: the name of an included file must be written out"])

    def test_program_fails_on_findings_and_on_an_empty_tree(self):
        script = pathlib.Path(check_layers.__file__)

        def run(root):
            return subprocess.run([sys.executable, script, root], stdout=subprocess.DEVNULL).returncode

        self.assertEqual(run(self.root), 0)
        self.write("foundation/x.cpp", '#include "keyword_layer/k.h"\n')
        self.assertEqual(run(self.root), 1)
        with tempfile.TemporaryDirectory() as empty:
            self.assertEqual(run(empty), 1)


if __name__ == "__main__":
    unittest.main()
