#!/usr/bin/env python3
"""What reads the pages would say when a page were wrong."""

import unittest

import snippets


class Blocks(unittest.TestCase):
    def test_WordsAheadOfABlock_BelongToItAlone(self):
        first, second = snippets.blocks_of("<!-- exit: 1 -->\n<!-- not run: big -->\n```sh\na\n```\n\n```inp\n*Node\n```\n")
        self.assertEqual((first.language, first.text, first.line), ("sh", "a\n", 3))
        self.assertEqual(first.words, {"exit": "1", "not run": "big"})
        self.assertEqual((second.text, second.words), ("*Node\n", {}))

    def test_ABlockInAList_LosesItsIndent(self):
        (block,) = snippets.blocks_of("- so:\n  ```sh\n  a\n    b\n  ```\n")
        self.assertEqual(block.text, "a\n  b\n")

    def test_ABlockWithoutAnEnd_IsRefused(self):
        with self.assertRaises(ValueError):
            snippets.blocks_of("```sh\na\n")


class Pieces(unittest.TestCase):
    MODEL = {"loads": {"A": {"class": "kloC_Pressure", "states": {"S": {"magnitude": 1.0}}, "list": [1, 2, {"x": 3}]}}}

    def test_APieceAnywhere_IsFound(self):
        for text in ('"A": { "class": "Pressure" }', '{ "magnitude": 1 }', '"list": [1, {"x": 3}] // two left out'):
            self.assertTrue(snippets.is_somewhere(snippets.json_of(text), self.MODEL), text)

    def test_AnotherValueNameOrOrder_IsNoPiece(self):
        for text in ('"A": { "class": "Gravity" }', '{ "magnitude": 2 }', '"list": [2, 1]', '"B": {}',
                     '{ "magnitude": true }'):
            self.assertFalse(snippets.is_somewhere(snippets.json_of(text), self.MODEL), text)

    def test_CommentsInTexts_AreNone(self):
        self.assertEqual(snippets.json_of('{"a": "http://b" /* c */}'), {"a": "http://b"})


class Lines(unittest.TestCase):
    def test_ThreePoints_StandForAnyLines(self):
        lines = ["a", "b", "c", "d"]
        for expected in (["a", "b", "c", "d"], ["a", "...", "d"], ["...", "b", "c", "..."], ["a", "b", "..."], ["..."]):
            self.assertTrue(snippets.shows(expected, lines), expected)
        for expected in (["a", "b"], ["b", "..."], ["a", "...", "c"], ["a", "c", "..."], ["...", "c", "b", "..."]):
            self.assertFalse(snippets.shows(expected, lines), expected)

    def test_ThreePointsInALine_StandForAnyText(self):
        self.assertTrue(snippets.shows(["a ... s"], ["a 0.5 s"]))
        self.assertFalse(snippets.shows(["a ... s"], ["a 0.5 ms."]))

    def test_DeckLines_StandTogether(self):
        deck = ["*Step", "*Static", "1., 1.", "*End Step"]
        self.assertTrue(snippets.holds(["*Static", "1., 1."], deck))
        self.assertTrue(snippets.holds(["*Step", "...", "*End Step"], deck))
        self.assertFalse(snippets.holds(["*Static", "*End Step"], deck))


if __name__ == "__main__":
    unittest.main()
