#!/usr/bin/env python3
"""Completions in the real shells, and manual pages in the real formatter; skipped where these are not there.

usage: completion_test.py PROGRAM
"""

import os
import pathlib
import pty
import re
import select
import shutil
import subprocess
import sys
import tempfile
import time
import unittest

PROGRAM = pathlib.Path(sys.argv[1]).resolve()


class Shell(unittest.TestCase):
    """The same questions to each shell: `complete(line)` gives what may stand at the end of the line."""

    name = ""

    @classmethod
    def setUpClass(cls):
        if not cls.name or shutil.which(cls.name) is None:
            raise unittest.SkipTest(f"there is no {cls.name or 'shell'} here: scripts/install-dependencies.sh test")
        cls.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrxdeck_completion_"))
        cls.addClassCleanup(shutil.rmtree, cls.folder)
        (cls.folder / "bin").mkdir()
        (cls.folder / "bin" / "qrxdeck").symlink_to(PROGRAM)
        (cls.folder / "work").mkdir()
        for name in ("bridge.json", "bridge two.json", "bridge.inp", "plate.msh", "notes.txt"):
            (cls.folder / "work" / name).touch()
        (cls.folder / "work" / "brook").mkdir()
        cls.environment = {"PATH": f"{cls.folder / 'bin'}:{os.environ['PATH']}", "HOME": str(cls.folder),
                           "XDG_CONFIG_HOME": str(cls.folder), "XDG_DATA_HOME": str(cls.folder), "TERM": "xterm",
                           "LC_ALL": "C.UTF-8"}
        cls.script = cls.folder / f"qrxdeck.{cls.name}"
        cls.script.write_bytes(subprocess.run([PROGRAM, "completion", cls.name], stdout=subprocess.PIPE, check=True).stdout)

    def run_shell(self, *words, **options):
        return subprocess.run([self.name, *words], cwd=self.folder / "work", env=self.environment,
                              capture_output=True, text=True, timeout=60, **options)

    def has(self, line, *wanted, without=()):
        found = self.complete(line)
        for word in wanted:
            self.assertIn(word, found, f"{line!r}: {found}")
        for word in without:
            self.assertNotIn(word, found, f"{line!r}: {found}")
        return found

    def check_all(self):
        self.has("qrxdeck ", "write", "check", "explain", "completion")
        self.assertEqual(self.complete("qrxdeck wri"), ["write"])
        self.has("qrxdeck write --", "--job", "--output-dir", "--strict", "--json", without=["--textconv"])
        self.assertEqual(self.complete("qrxdeck diff --text"), ["--textconv"])
        self.assertEqual(self.complete("qrxdeck variables --step-type StaticR"), ["StaticRiks"])
        self.assertEqual(self.complete("qrxdeck completion f"), ["fish"])
        self.assertEqual(self.complete("qrxdeck explain unused-"), ["unused-nodes"])
        self.assertEqual(self.complete("qrxdeck check --ignore unused-n"), ["unused-nodes"])
        self.assertEqual(self.complete("qrxdeck help exp"), ["explain"])
        self.assertEqual(self.complete("qrxdeck --color ne"), ["never"])
        self.assertEqual(self.complete("qrxdeck --color never wri"), ["write"])
        self.assertEqual(self.complete("qrxdeck study --emit sl"), ["slurm"])
        self.has("qrxdeck write br", "bridge.json", "bridge two.json", without=["bridge.inp", "notes.txt"])
        self.has("qrxdeck check br", "bridge.json", "bridge.inp")
        self.has("qrxdeck mesh ", "plate.msh", without=["bridge.json", "notes.txt"])
        self.has("qrxdeck format bridge.json -o no", "notes.txt")


class Bash(Shell):
    name = "bash"

    def complete(self, line):
        words = re.split(" +", line)
        if words[-1].startswith("--color="):
            words[-1:] = ["--color", "=", words[-1][8:]]
        script = (f"source {self.script}; COMP_WORDS=({' '.join(repr(word) for word in words)}); "
                  f"COMP_CWORD={len(words) - 1}; _qrxdeck; printf '%s\\n' \"${{COMPREPLY[@]}}\"")
        run = self.run_shell("--norc", "-c", script)
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        return [word for word in run.stdout.split("\n") if word]

    def test_Completions(self):
        self.check_all()
        self.assertEqual(self.complete("qrxdeck write x --color=al"), ["always"])
        self.has("qrxdeck write --output-dir ", "brook", without=["bridge.json"])

    def test_OnATerminal_TheTabulatorKeyCompletes(self):
        ours, theirs = pty.openpty()
        shell = subprocess.Popen(["bash", "--norc", "--noprofile", "-i"], cwd=self.folder / "work", stdin=theirs,
                                 stdout=theirs, stderr=theirs, start_new_session=True,
                                 env={**self.environment, "PS1": "ready> ", "INPUTRC": "/dev/null"})
        os.close(theirs)
        self.addCleanup(os.close, ours)
        self.addCleanup(shell.wait)
        self.addCleanup(shell.kill)
        self.answer(ours, b"", b"ready> ")
        self.answer(ours, f"source {self.script}\n".encode(), b"ready> ")
        self.answer(ours, b"qrxdeck exp\t", b"qrxdeck explain ")
        self.answer(ours, b"unused-\t", b"unused-nodes ")

    def answer(self, terminal, keys, wanted):
        os.write(terminal, keys)
        seen, end = b"", time.monotonic() + 20
        while wanted not in seen and time.monotonic() < end:
            if select.select([terminal], [], [], 0.5)[0]:
                seen += os.read(terminal, 4096)
        self.assertIn(wanted, seen)

    def test_InstalledScript_IsLoadedByTheShellsOwnLoader(self):
        loader = pathlib.Path("/usr/share/bash-completion/bash_completion")
        if not loader.exists():
            self.skipTest("there is no bash-completion here: scripts/install-dependencies.sh test")
        place = self.folder / "bash-completion" / "completions"
        place.mkdir(parents=True, exist_ok=True)
        shutil.copy(self.script, place / "qrxdeck")
        run = self.run_shell("--norc", "-ic", f"source {loader}; _completion_loader qrxdeck; complete -p qrxdeck")
        self.assertEqual(run.stdout, "complete -F _qrxdeck qrxdeck\n")


class Zsh(Shell):
    name = "zsh"
    # A shell within a terminal of its own is asked what it would list. Its echo of the question has no marker whole.
    ASK = r"""
zmodload zsh/zpty
zpty shell zsh -f -i
zpty -w shell "PROMPT=; stty -echo; autoload -Uz compinit; fpath=($FUNCTIONS \$fpath); compinit -u -D"
zpty -w shell "zstyle ':completion:*' list-separator ''; zstyle ':completion:*' verbose no"
zpty -w shell "compadd() { local -a hits; builtin compadd -A hits \"\$@\"; (( \$#hits )) && print -rl -- '<h''it>'\${^hits}'</h''it>'; builtin compadd \"\$@\"; }"
zpty -w shell "LISTMAX=1000; ask() { zle complete-word; print -r '<en''d>'; }; zle -N ask; zle -C complete-word complete-word _main_complete; bindkey '^X' ask"
zpty -w shell "cd $WORK; print -r '<rea''dy>'"
zpty -r -m shell seen '*<ready>*' || exit 3
zpty -n -w shell "$LINE"$'\x18'
zpty -r -m shell seen '*<end>*' || exit 4
print -r -- "$seen"
"""

    def complete(self, line):
        functions = self.folder / "functions"
        functions.mkdir(exist_ok=True)
        shutil.copy(self.script, functions / "_qrxdeck")
        environment = {**self.environment, "FUNCTIONS": str(functions), "WORK": str(self.folder / "work"), "LINE": line}
        run = subprocess.run(["zsh", "-f", "-c", self.ASK], cwd=self.folder / "work", env=environment,
                             capture_output=True, text=True, timeout=60)
        self.assertEqual(run.returncode, 0, run.stdout + run.stderr)
        return list(dict.fromkeys(hit.replace("\\", "") for hit in re.findall(r"<hit>(.*?)</hit>", run.stdout)))

    def test_Script_IsGoodZsh(self):
        self.assertEqual(self.run_shell("-n", self.script).stderr, "")

    def test_Completions(self):
        self.check_all()
        self.assertEqual(self.complete("qrxdeck write x --color=al"), ["always"])


class Fish(Shell):
    name = "fish"

    def complete(self, line):
        run = self.run_shell("--no-config", "-c", f"source {self.script}; complete -C {line!r}")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        return [word.split("\t")[0] for word in run.stdout.splitlines()]

    def test_Completions(self):
        self.check_all()
        self.has("qrxdeck write --output-dir ", "brook/", without=["bridge.json"])


class Manuals(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrxdeck_manuals_"))
        self.addCleanup(shutil.rmtree, self.folder)
        subprocess.run([PROGRAM, "man", "--into", self.folder], check=True)

    def test_PagesOfAllCommands_AreWhatTheFormatterTakes(self):
        if shutil.which("groff") is None:
            self.skipTest("there is no groff here: scripts/install-dependencies.sh test")
        pages = sorted(self.folder.iterdir())
        self.assertGreater(len(pages), 12)
        for page in pages:
            with self.subTest(page=page.name):
                run = subprocess.run(["groff", "-man", "-ww", "-Tascii", "-P-c", page], capture_output=True, text=True)
                self.assertEqual((run.returncode, run.stderr), (0, ""))
                plain = re.sub(".\b", "", run.stdout)
                for section in ("NAME", "SYNOPSIS", "DESCRIPTION", "OPTIONS", "EXIT STATUS", "EXAMPLES", "SEE ALSO"):
                    self.assertRegex(plain, rf"(?m)^{section}$")
                self.assertNotIn("\\", plain)

    def test_PageOfACommand_HasAllItsOptions(self):
        page = subprocess.run([PROGRAM, "man", "write"], capture_output=True, text=True).stdout
        helped = subprocess.run([PROGRAM, "help", "write"], capture_output=True, text=True).stdout
        self.assertEqual(page, (self.folder / "qrxdeck-write.1").read_text())
        options = re.findall(r"(?m)^ +(?:-\w, )?(--[a-z-]+)", helped)
        self.assertGreater(len(options), 8)
        for option in options:
            self.assertIn("\\fB" + option.replace("-", "\\-") + "\\fR", page)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
