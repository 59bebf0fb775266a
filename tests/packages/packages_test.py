#!/usr/bin/env python3
"""Builds the packages twice, looks at them, and installs them into a fresh Debian root.

usage: packages_test.py REPOSITORY [--built FOLDER [--again]] [--root FOLDER]

With --built the packages are taken from there, and built once more for the comparison with --again alone. With --root a
root is kept there for the next time. What isn't there for a part of it (lintian, debootstrap, root's rights) skips that
part, with a message.
"""

import argparse
import functools
import gzip
import json
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tarfile
import tempfile
import unittest

OPTIONS = None
# The licence is the owners' to choose.
LICENCE_TAGS = {"copyright-without-copyright-notice"}
SUITE = "bookworm"


def run(*command, **options):
    done = subprocess.run([str(word) for word in command], capture_output=True, text=True, **options)
    if done.returncode != 0:
        raise AssertionError(f"{' '.join(str(word) for word in command)} ended with {done.returncode}:\n"
                             f"{done.stdout[-3000:]}{done.stderr[-3000:]}")
    return done.stdout


@functools.cache
def commit():
    """The last one when the tests began: a later one has other sources."""
    return run("git", "-C", OPTIONS.repository, "rev-parse", "HEAD").strip()


def build(folder):
    """Builds the packages of the last commit from an archive of its sources, in a folder of this name."""
    folder.mkdir(parents=True)
    archive = folder / "sources.tar"
    run("git", "-C", OPTIONS.repository, "archive", "-o", archive, commit())
    with tarfile.open(archive) as sources:
        sources.extractall(folder / "sources", filter="tar")
    modules = OPTIONS.repository / "viewer" / "node_modules"
    if modules.exists():
        (folder / "sources" / "viewer" / "node_modules").symlink_to(modules.resolve())
    run(folder / "sources" / "scripts" / "build-packages.sh", folder / "packages")
    return folder / "packages"


@functools.cache
def packages():
    """The folder of the packages that all tests look at."""
    if OPTIONS.built:
        return OPTIONS.built.resolve()
    # In a place that stays the same, so that a compiler cache has what another run compiled.
    folder = OPTIONS.repository / "build/packages-test"
    shutil.rmtree(folder, ignore_errors=True)
    return build(folder)


class Packages(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.scratch = pathlib.Path(cls.enterClassContext(tempfile.TemporaryDirectory()))
        cls.folder = packages()
        cls.debs = sorted(cls.folder.glob("*.deb"))

    def deb(self, name):
        found = [deb for deb in self.debs if deb.name.startswith(name + "_")]
        self.assertEqual(len(found), 1, name)
        return found[0]

    def unpacked(self, name):
        folder = self.scratch / "unpacked" / name
        if not folder.exists():
            folder.mkdir(parents=True)
            run("dpkg-deb", "-x", self.deb(name), folder)
        return folder

    def test_SameSourcesInAnotherFolder_MakeTheSameBytes(self):
        if OPTIONS.built and not OPTIONS.again:
            self.skipTest("the packages were given, and not --again")
        # Nothing of the first build may serve the second.
        os.environ["CCACHE_DISABLE"] = "1"
        again = build(self.scratch / "another folder, with a longer name")
        del os.environ["CCACHE_DISABLE"]
        # That of the sources is git's own.
        names = sorted(path.name for path in self.folder.iterdir() if not path.name.endswith("-sources.tar.gz"))
        self.assertGreaterEqual(len(names), 3)
        self.assertEqual(names, sorted(path.name for path in again.iterdir()))
        for name in names:
            self.assertEqual((self.folder / name).read_bytes(), (again / name).read_bytes(), name)

    def test_Lintian_FindsNothingButTheLicence(self):
        if shutil.which("lintian") is None:
            self.skipTest("no lintian; scripts/install-dependencies.sh packages")
        for deb in self.debs:
            found = subprocess.run(["lintian", "--allow-root", "--tag-display-limit", "0", deb], capture_output=True,
                                   text=True).stdout
            tags = [line for line in found.splitlines() if re.match(r"[EW]: ", line)
                    and line.split(": ", 2)[2].split()[0] not in LICENCE_TAGS]
            self.assertEqual(tags, [], deb.name)

    def test_Contents_AreDescribed(self):
        for name, parts in (("qrxdeck", {"nlohmann-json", "CLI11"}), ("libqrxptinputfilewriter-dev", {"libstdc++"})):
            docs = self.unpacked(name) / "usr/share/doc" / name
            self.assertIn("not yet chosen", (docs / "copyright").read_text())
            self.assertIn(f"{name} (", gzip.decompress((docs / "changelog.gz").read_bytes()).decode())
            described = json.loads((docs / f"{name}.spdx.json").read_text())
            self.assertEqual(described["spdxVersion"], "SPDX-2.3")
            ids = [package["SPDXID"] for package in described["packages"]]
            self.assertEqual(len(ids), len(set(ids)))
            self.assertLessEqual(parts, {package["name"] for package in described["packages"]})
            for relation in described["relationships"]:
                self.assertIn(relation["relatedSpdxElement"], ids)
            for package in described["packages"]:
                self.assertLessEqual({"name", "versionInfo", "downloadLocation", "licenseDeclared"}, set(package))
        notices = {path.name for path in (self.unpacked("qrxdeck") / "usr/share/doc/qrxdeck/notices").iterdir()}
        self.assertLessEqual({"nlohmann-json3-dev", "libcli11-dev"}, notices)

    def test_EveryLibraryThatTheProgramLoads_IsInItsDescription(self):
        packages = json.loads(next(self.unpacked("qrxdeck").rglob("qrxdeck.spdx.json")).read_text())["packages"]
        names = {package["name"].lower() for package in packages}
        needed = re.findall(r"\(NEEDED\).*\[lib([^.]+?)(?:_serial)?\.so", run(
            "readelf", "-d", self.unpacked("qrxdeck") / "usr/bin/qrxdeck"))
        # The C library and the compiler's are every program's.
        for library in set(needed) - {"c", "m", "gcc_s"}:
            known = {"z": "zlib", "crypto": "openssl", "stdc++": "libstdc++"}.get(library, library)
            self.assertIn(known, names)

    def test_SharedLibrary_ShowsItsOwnNamesAndNoOthers(self):
        folder = self.unpacked("libqrxptinputfilewriter-dev")
        shared = next(path for path in folder.rglob("*.so.*") if not path.is_symlink())
        self.assertRegex(run("readelf", "-d", shared), r"soname: \[libQRXZptInputFileWriter\.so\.\d+\.\d+\]")
        shown = {line.split()[-1].split("@")[0]
                 for line in run("nm", "-D", "--defined-only", shared).splitlines() if " A " not in line}
        self.assertGreater(len(shown), 1000)
        of_others = [name for name in shown if re.match(r"_Z(T[VTISC])?N?K?(St|S[absiod])|_ZN9__gnu_cxx", name)]
        self.assertEqual(of_others, [])
        # All that is compiled of this library, and not within one source alone, can be linked to.
        own = set()
        for line in run("nm", "--defined-only", next(folder.rglob("*.a"))).splitlines():
            words = line.split()
            if len(words) == 3 and words[1] in "TDBR":
                own.add(words[2])
        self.assertGreater(len(own), 1000)
        self.assertEqual(sorted(own - shown)[:10], [])

    def test_Files_DoNotTellWhereTheyWereBuilt(self):
        places = [os.fsencode(place) for place in (OPTIONS.repository, self.folder.parent)]
        for deb in self.debs:
            for path in self.unpacked(deb.name.split("_")[0]).rglob("*"):
                if path.is_file() and not path.is_symlink():
                    content = path.read_bytes()
                    self.assertFalse([place for place in places if place in content], path)

    def test_Archive_HasProgramAndLibrary(self):
        archive = next(path for path in self.folder.glob("*.tar.gz") if "sources" not in path.name)
        with tarfile.open(archive) as content:
            names = [re.sub(r"^[^/]+/", "", name) for name in content.getnames()]
            times = {member.mtime for member in content.getmembers()}
        self.assertIn("bin/qrxdeck", names)
        self.assertTrue(any(name.endswith("QRXZptInputFileWriterConfig.cmake") for name in names))
        self.assertEqual(len(times), 1)


class InAFreshRoot(unittest.TestCase):
    """What a user does who has nothing but the packages."""

    @classmethod
    def setUpClass(cls):
        if os.geteuid() != 0 or shutil.which("debootstrap") is None:
            raise unittest.SkipTest("a fresh root takes root's rights and debootstrap")
        cls.root = OPTIONS.root or pathlib.Path(cls.enterClassContext(tempfile.TemporaryDirectory()))
        if not (cls.root / "usr/bin/apt-get").exists():
            run("debootstrap", "--variant=minbase", SUITE, cls.root)
        for folder in ("tmp/packages", "tmp/consumer"):
            shutil.rmtree(cls.root / folder, ignore_errors=True)
        shutil.copytree(packages(), cls.root / "tmp/packages")
        shutil.copytree(OPTIONS.repository / "tests/consumer/project", cls.root / "tmp/consumer")
        cls.there("rm -rf /tmp/work && mkdir /tmp/work && apt-get -q update")
        cls.there("apt-get -q install -y --no-install-recommends /tmp/packages/*.deb g++ cmake make pkg-config "
                  "man-db bash-completion")

    @classmethod
    def there(cls, script):
        environment = {"PATH": "/usr/sbin:/usr/bin:/sbin:/bin", "HOME": "/root", "LC_ALL": "C.UTF-8",
                       "DEBIAN_FRONTEND": "noninteractive"}
        # Its own /proc goes with the command.
        return run("unshare", "--mount", "sh", "-ec", 'mount -t proc proc "$0/proc"; exec chroot "$0" sh -ec "$1"', cls.root,
                   "cd /tmp/work 2>/dev/null || cd /tmp\n" + script, env=environment)

    def test_CommandsOfTheReadme_DoWhatItSays(self):
        readme = (OPTIONS.repository / "README.md").read_text(encoding="utf-8")
        blocks = re.findall(r"^<!-- files: (\S+) -->\n```sh\n(.*?)^```$", readme, re.MULTILINE | re.DOTALL)
        self.assertGreater(len(blocks), 0)
        for file, commands in blocks:
            self.there(f"cp /usr/share/doc/qrxdeck/{file} .\n{commands}")
        self.assertTrue((self.root / "tmp/work/part.inp").read_text(encoding="utf-8").startswith("*Heading\n"))
        # And the lines that it shows of a deck.
        self.there("cp /usr/share/doc/qrxdeck/examples/bracket/* . && qrxdeck write bracket.json && qrxdeck check bracket.inp")
        shown = re.findall(r"^```inp\n(.*?)^```$", readme, re.MULTILINE | re.DOTALL)
        self.assertGreater(len(shown), 0)
        for lines in shown:
            self.assertIn(lines, (self.root / "tmp/work/bracket.inp").read_text(encoding="utf-8"))

    def test_ExamplesOfThePackages_WriteTheirDecks(self):
        written = self.there("""cd /usr/share/doc/qrxdeck/examples
            for model in */*.json; do
                qrxdeck write -o /tmp/work/example.inp "$model" >/dev/null
                expected=${model%.json}.inp
                [ ! -e "$expected" ] || cmp "$expected" /tmp/work/example.inp
                echo "$model"
            done""").split()
        models = {path.relative_to(OPTIONS.repository / "examples").as_posix()
                  for path in OPTIONS.repository.glob("examples/*/*.json")}
        self.assertEqual(set(written), models)
        self.there("g++ /usr/share/doc/libqrxptinputfilewriter-dev/examples/two_instances.cpp -o two_instances "
                   "$(pkg-config --cflags --libs QRXZptInputFileWriter) && ./two_instances")

    def test_Version_TellsTheCommit(self):
        self.assertRegex(self.there("qrxdeck --version"), r"^qrxdeck \d+\.\d+\.\d+ \([0-9a-f]{12}\+?\)\n$")

    def test_ManualPages_AreFound(self):
        self.assertIn("qrxdeck - ", self.there("man qrxdeck"))
        verbs = re.search(r"'(write [^']+)'", self.there("qrxdeck completion bash"))[1].split()
        self.assertGreater(len(verbs), 10)
        for verb in verbs:
            self.assertIn(f"qrxdeck {verb}", self.there(f"MANWIDTH=80 man qrxdeck-{verb}"))
        self.assertIn("qrxdeck-write", self.there("mandb -q && apropos deck"))

    def test_TabulatorInBash_CompletesVerbsAndFiles(self):
        (self.root / "tmp/work/completed.json").write_text("{}")
        for words, completed in (("qrxdeck wri", "write"), ("qrxdeck write compl", "completed.json")):
            shown = self.there(f"""bash -ic '. /usr/share/bash-completion/bash_completion
                _completion_loader qrxdeck
                COMP_LINE="{words}" COMP_POINT=${{#COMP_LINE}} COMP_WORDS=({words}) COMP_CWORD=$((${{#COMP_WORDS[@]}} - 1))
                _qrxdeck && echo "${{COMPREPLY[@]}}"' 2>/dev/null""")
            self.assertEqual(shown.strip(), completed)

    def test_Python_WritesTheSameDeck(self):
        if not any(path.name.startswith("python3-qrx_") for path in (self.root / "tmp/packages").iterdir()):
            self.skipTest("no package for Python was built")
        self.there("cp /usr/share/doc/qrxdeck/examples/assembly/assembly.json . && "
                   "qrxdeck write assembly.json --job program && python3 -c \"import qrx; "
                   "qrx.load('assembly.json').write('python.inp')\" && cmp program.inp python.inp")

    def test_ProgramThatUsesTheLibrary_IsBuiltBothWays(self):
        expected = (r"^/models/Default Model/parts/ROD: 1 element has no section \[no-section\]\n"
                    r"consumer\.inp: 278 bytes\n$")
        version = re.search(r" VERSION ([\d.]+)", (OPTIONS.repository / "CMakeLists.txt").read_text())[1]
        self.there(f"cmake -S ../consumer -B built -D EXPECTED_VERSION={version} && cmake --build built")
        self.assertRegex(self.there("built/qrx_consumer"), expected)
        self.there("g++ ../consumer/main.cpp -o dynamic $(pkg-config --cflags --libs QRXZptInputFileWriter)")
        self.assertIn("libQRXZptInputFileWriter.so", self.there("ldd ./dynamic"))
        self.assertRegex(self.there("./dynamic"), expected)

    @classmethod
    def tearDownClass(cls):
        cls.there("apt-get -q purge -y qrxdeck libqrxptinputfilewriter-dev python3-qrx || true")
        left = [path for path in (cls.root / "usr").rglob("*qrx*")]
        if left:
            raise AssertionError(f"left behind: {left[:5]}")


def main():
    global OPTIONS
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("repository", type=pathlib.Path)
    parser.add_argument("--built", type=pathlib.Path)
    parser.add_argument("--again", action="store_true")
    parser.add_argument("--root", type=pathlib.Path)
    OPTIONS, rest = parser.parse_known_args()
    OPTIONS.repository = OPTIONS.repository.resolve()
    unittest.main(argv=[sys.argv[0], *rest], verbosity=2)


if __name__ == "__main__":
    main()
