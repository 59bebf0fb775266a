#!/usr/bin/env python3
"""Runs what the docs show: commands and their output, models, pieces of models, deck lines, C++ and Python.

usage: snippets_test.py QRXDECK ROOT [--compiler CXX] [--package FOLDER] [PAGE ...]
"""

import argparse
import contextlib
import doctest
import io
import json
import os
import pathlib
import re
import shlex
import shutil
import subprocess
import sys
import tempfile

import snippets

# Pages whose Python is tried by the tests of the package, which bring what it works on.
PYTHON_ELSEWHERE = {"README.md", "docs/python.md"}
# What a page of the docs may hold that is neither command nor code.
PLAIN = {"text", "csv", "{toctree}", "{include}"}


class Wrong(Exception):
    pass


class Page:
    def __init__(self, path, arguments):
        self.path = path
        self.root = arguments.root
        self.name = path.relative_to(self.root).as_posix()
        self.arguments = arguments
        self.model = None
        self.tried = 0

    def run(self, folder):
        self.folder = folder
        if self.path.parent.name == "recipes":
            shutil.copytree(self.path.parent, folder, dirs_exist_ok=True)
            model = self.path.with_suffix(".json")
            self.model = folder / model.name if model.exists() else None
        failures = []
        for block in snippets.blocks_of(self.path.read_text(encoding="utf-8")):
            try:
                self.take_files(block)
                self.try_block(block)
            except (Wrong, ValueError, OSError, subprocess.SubprocessError) as failure:
                failures.append(f"{self.name}:{block.line}: {failure}")
        return failures

    def take_files(self, block):
        for name in block.words.get("files", "").split():
            source, target = self.root / name, self.folder / pathlib.Path(name).name
            if source.is_dir():
                shutil.copytree(source, self.folder if name.endswith("/") else target, dirs_exist_ok=True)
            else:
                shutil.copy(source, target)
        if "model" in block.words:
            name = block.words["model"]
            kept = self.folder / name
            self.model = kept if ".." not in name and kept.exists() else (self.path.parent / name).resolve()

    def try_block(self, block):
        language = re.split(r"[\s]", block.language)[0]
        if "before" in block.words:
            self.program("bash", "-euo", "pipefail", "-c", block.words["before"])
        if "save" in block.words:
            (self.folder / block.words["save"]).write_text(block.text, encoding="utf-8")
        # Tables and drawings say nothing that could be run; what Doxygen knows, the site's build knows.
        if language in PLAIN or language.startswith("{doxygen"):
            return
        taker = {"json": self.try_json, "jsonl": self.try_lines, "sh": self.try_commands, "console": self.try_console,
                 "inp": self.try_deck, "cpp": self.try_cpp, "cmake": self.try_cmake, "python": self.try_python,
                 "{literalinclude}": self.try_include}.get(language)
        if taker is None:
            raise Wrong(f"nobody knows how to try a block of '{block.language}'")
        taker(block)
        self.tried += 1

    def program(self, *arguments, check=True):
        environment = os.environ | {"PATH": f"{self.arguments.qrxdeck.parent}:{os.environ['PATH']}", "NO_COLOR": "1"}
        result = subprocess.run(arguments, cwd=self.folder, capture_output=True, text=True, env=environment, timeout=120)
        if check and result.returncode != 0:
            raise Wrong(f"{shlex.join(map(str, arguments))} ends with {result.returncode}: "
                        f"{(result.stdout + result.stderr)[:1000]}")
        return result

    # -- JSON

    def try_json(self, block):
        value = snippets.json_of(block.text)
        if isinstance(value, dict) and {"format", "models"} <= value.keys():
            file = self.folder / block.words.get("save", "shown.json")
            file.write_text(block.text, encoding="utf-8")
            self.program("qrxdeck", "check", file.name)
            self.model = file
        elif "schema" in block.words:
            self.try_schema(block.words["schema"], value)
        elif "merge" in block.words:
            model = json.loads(snippets.without_comments((self.folder / block.words["merge"]).read_text("utf-8")))
            (self.folder / "merged.json").write_text(json.dumps(laid_over(model, value)), encoding="utf-8")
            self.program("qrxdeck", "check", "merged.json")
        elif self.model is None:
            raise Wrong("a piece of JSON, and no model that it could be of")
        elif not snippets.is_somewhere(value, json.loads(snippets.without_comments(self.model_text()))):
            raise Wrong(f"not a part of {self.model.name}")

    def model_text(self):
        return self.model.read_text(encoding="utf-8")

    def try_schema(self, definition, value):
        import jsonschema
        schema = json.loads(self.program("qrxdeck", "schema").stdout)
        schema = {"$schema": schema["$schema"], "$defs": schema["$defs"], "$ref": f"#/$defs/{definition}"}
        errors = sorted(jsonschema.Draft202012Validator(schema).iter_errors(value), key=str)
        if errors:
            raise Wrong(f"no {definition}: {errors[0].message[:500]}")

    def try_lines(self, block):
        """Lines of JSON have the members of those of a file that the page has made."""
        known = {frozenset(json.loads(line)) for line in (self.folder / block.words["like"]).read_text().splitlines()}
        for line in block.text.splitlines():
            if frozenset(json.loads(line)) not in known:
                raise Wrong(f"{block.words['like']} has no line with the members of {line}")

    # -- Commands

    def try_commands(self, block):
        if "not run" in block.words:
            for line in block.text.splitlines():
                self.look_at(line)
            return
        self.program("bash", "-euo", "pipefail", "-c", block.text)

    def look_at(self, line):
        """Scripts of the repository exist; verbs and options of the program are known."""
        words = shlex.split(line.split("#")[0].replace("&&", ";").replace("|", ";").replace(";", " ; "))
        while words:
            end = words.index(";") if ";" in words else len(words)
            command, words = words[:end], words[end + 1:]
            if not command:
                continue
            name = command[0].removeprefix("./")
            if re.match(r"(scripts/)?[a-z-]+\.(sh|py)$", name) and not (self.root / name).exists():
                raise Wrong(f"no {name}")
            if pathlib.Path(name).name == "qrxdeck" and len(command) > 1:
                self.look_at_call(command[1:])

    def look_at_call(self, words):
        verb = [] if words[0].startswith("-") else [words[0]]
        known = self.program("qrxdeck", *verb, "--help").stdout
        for word in words:
            if re.match(r"--?[a-z]", word) and not re.search(rf"(?<![\w-]){re.escape(word.split('=')[0])}(?![\w-])", known):
                raise Wrong(f"qrxdeck {' '.join(verb)} has no option {word}")

    def try_console(self, block):
        calls = re.split(r"^\$ ", block.text, flags=re.MULTILINE)
        if calls[0].strip():
            raise Wrong("a console block begins with '$ '")
        for number, call in enumerate(calls[1:]):
            command, _, expected = call.partition("\n")
            while command.endswith("\\"):
                more, _, expected = expected.partition("\n")
                command = command[:-1] + more.removeprefix("> ")
            result = self.program("bash", "-c", command + " 2>&1", check=False)
            # Only the last call of a block may fail.
            wanted = int(block.words.get("exit", 0)) if number == len(calls) - 2 else 0
            if result.returncode != wanted:
                raise Wrong(f"{command} ends with {result.returncode}:\n{result.stdout[:1000]}")
            lines = expected.rstrip("\n").split("\n") if expected.strip() else []
            if not snippets.shows(lines, self.steady(result.stdout)):
                raise Wrong(f"{command} says\n{result.stdout[:1000]}")

    @staticmethod
    def steady(text):
        """Times differ from run to run."""
        return [re.sub(r"\b\d+\.\d\d\b(?= s\b|,|$)", "0.00", line) if " s: reading" in line else line
                for line in text.rstrip("\n").split("\n")] if text.strip() else []

    # -- Decks and code

    def try_deck(self, block):
        if "deck" in block.words:
            deck = self.folder / block.words["deck"]
        elif self.model is None:
            raise Wrong("deck lines, and no model that they could be of")
        else:
            deck = self.folder / self.model.with_suffix(".inp").name
            self.program("qrxdeck", "write", self.model, "--job", deck.with_suffix("").name)
        if not snippets.holds(block.text.rstrip("\n").split("\n"), deck.read_text(encoding="utf-8").split("\n")):
            raise Wrong(f"not lines of {deck.name}")

    def try_cpp(self, block):
        if not self.arguments.compiler:
            return
        source = self.folder / "shown.cpp"
        headers = "".join(f'#include "{name}"\n' for name in block.words.get("include", "").split())
        source.write_text(headers + block.text, encoding="utf-8")
        self.program(self.arguments.compiler, "-std=c++20", "-Wall", "-Wextra", "-Werror", "-fsyntax-only",
                     f"-I{self.root}", f"-I{self.root}/QRXZptIfwOif.m/src", source.name)

    def try_cmake(self, block):
        """A program of the tests finds the library so."""
        consumer = (self.root / "tests/consumer/project/CMakeLists.txt").read_text(encoding="utf-8")
        for name in re.findall(r"QRX[\w:]+", block.text):
            if name not in consumer:
                raise Wrong(f"no program of the tests takes {name}")

    def try_python(self, block):
        if self.name in PYTHON_ELSEWHERE or "not run" in block.words or not self.arguments.package:
            return
        code = block.text
        out = io.StringIO()
        with contextlib.chdir(self.folder), contextlib.redirect_stdout(out):
            exec(block.words.get("setup", ""), self.globals())
            if ">>>" in code:
                options = doctest.NORMALIZE_WHITESPACE | doctest.ELLIPSIS
                runner = doctest.DocTestRunner(optionflags=options, verbose=False)
                test = doctest.DocTestParser().get_doctest(code, self.globals(), self.name, None, block.line)
                failed = runner.run(test, out=out.write, clear_globs=False).failed
            else:
                failed = 0
                exec(compile(code, f"{self.name}:{block.line}", "exec"), self.globals())
        if failed:
            raise Wrong(out.getvalue()[:1000])

    def globals(self):
        if not hasattr(self, "names"):
            self.names = {"__name__": "shown"}
        return self.names

    def try_include(self, block):
        name = block.language.split()[1]
        if not (self.path.parent / name).exists():
            raise Wrong(f"no {name}")
        if name.endswith(".json"):
            self.program("qrxdeck", "check", (self.path.parent / name).resolve())


def laid_over(value, other):
    """The first value with what the second one says."""
    if isinstance(value, dict) and isinstance(other, dict):
        return value | {name: laid_over(value.get(name), each) for name, each in other.items()}
    return other


def pages_of(root):
    pages = [path for path in root.glob("*.md")]
    pages += sorted((root / "docs").rglob("*.md"))
    pages += sorted((root / "examples").rglob("*.md"))
    return pages


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("qrxdeck", type=lambda name: pathlib.Path(name).resolve())
    parser.add_argument("root", type=lambda name: pathlib.Path(name).resolve())
    parser.add_argument("--compiler")
    parser.add_argument("--package", help="where the package for Python was built")
    parser.add_argument("pages", nargs="*", help="only these, relative to the root")
    arguments = parser.parse_intermixed_args()
    if arguments.package:
        sys.path.insert(0, arguments.package)
    pages = [arguments.root / name for name in arguments.pages] or pages_of(arguments.root)
    failures, tried = [], 0
    for path in pages:
        page = Page(path, arguments)
        with tempfile.TemporaryDirectory() as folder:
            failures += page.run(pathlib.Path(folder).resolve())
        tried += page.tried
    print("\n".join(failures))
    print(f"{tried} blocks of {len(pages)} pages tried, {len(failures)} wrong")
    # A reader of pages that finds nothing would find nothing wrong either.
    if not arguments.pages and tried < 100:
        print("too few blocks: are pages read at all?", file=sys.stderr)
        return 1
    return 1 if failures else 0


if __name__ == "__main__":
    sys.exit(main())
