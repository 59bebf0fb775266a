"""Builds the package with the project's CMake build; needs nothing from the network.

Wheels are the same to the last bit for the same sources and compiler: their entries stand in order, under one time
(SOURCE_DATE_EPOCH, else that of the oldest ZIP file), and no path of the build is in them.
"""

import base64
import hashlib
import io
import os
import pathlib
import re
import subprocess
import sys
import sysconfig
import tarfile
import tempfile
import time
import tomllib
import zipfile

ROOT = pathlib.Path(__file__).resolve().parents[2]
TREE = ["CMakeLists.txt", "README.md", "pyproject.toml", "cmake", "platform", "foundation", "store_interface", "keyword_layer",
        "QRXZptIfwOif.m", "deck_checks", "whole_file", "deck_reader", "mesh_file", "model_file", "view_page", "viewer",
        "study", "tools", "examples", "python", "scripts", "docs"]


def get_requires_for_build_wheel(config_settings=None):
    return []


def get_requires_for_build_sdist(config_settings=None):
    return []


def _project():
    return tomllib.loads((ROOT / "pyproject.toml").read_text(encoding="utf-8"))["project"]


def _version():
    text = (ROOT / "CMakeLists.txt").read_text(encoding="utf-8")
    return re.search(r"project\(\w+ VERSION ([\d.]+)", text)[1]


def _tag():
    tag = f"cp{sys.version_info.major}{sys.version_info.minor}"
    return f"{tag}-{tag}-{sysconfig.get_platform().replace('-', '_').replace('.', '_')}"


def _metadata():
    project = _project()
    lines = ["Metadata-Version: 2.1", f"Name: {project['name']}", f"Version: {_version()}",
             f"Summary: {project['description']}", f"Requires-Python: {project['requires-python']}"]
    for extra, needed in project["optional-dependencies"].items():
        lines.append(f"Provides-Extra: {extra}")
        lines += [f'Requires-Dist: {each}; extra == "{extra}"' for each in needed]
    lines += ["Description-Content-Type: text/markdown", ""]
    return "\n".join(lines) + "\n" + (ROOT / "README.md").read_text(encoding="utf-8")


def _wheel_text():
    return f"Wheel-Version: 1.0\nGenerator: qrx\nRoot-Is-Purelib: false\nTag: {_tag()}\n"


def _run(*command, **options):
    subprocess.run([str(word) for word in command], check=True, **options)


def _build(folder):
    """Builds the package's folder and gives it; QRX_BUILT_PACKAGE names one that is built already."""
    if "QRX_BUILT_PACKAGE" in os.environ:
        return pathlib.Path(os.environ["QRX_BUILT_PACKAGE"])
    given = os.environ.get("QRX_PACKAGE_BUILD_DIR")
    build = pathlib.Path(given) if given else pathlib.Path(folder) / "build"
    flags = f"-O2 -DNDEBUG -ffile-prefix-map={ROOT}=. -ffile-prefix-map={build}=build"
    options = [f"-DCMAKE_CXX_FLAGS_RELEASE={flags}", "-DCMAKE_BUILD_TYPE=Release", "-DQRX_BUILD_PYTHON=ON",
               "-DQRX_BUILD_TESTS=OFF", "-DQRX_UNITY_BUILD=ON", "-DCMAKE_SKIP_RPATH=ON",
               f"-DPython_EXECUTABLE={sys.executable}"]
    launcher = _which("ccache")
    if launcher:
        options.append(f"-DCMAKE_CXX_COMPILER_LAUNCHER={launcher}")
    generator = ["-G", "Ninja"] if _which("ninja") else []
    _run("cmake", "-S", ROOT, "-B", build, *generator, *options, stdout=sys.stderr)
    _run("cmake", "--build", build, "--target", "qrx_package", "--parallel", os.cpu_count() or 1, stdout=sys.stderr)
    return build / "python" / "package" / "qrx"


def _which(program):
    from shutil import which

    return which(program)


def _stripped(path):
    with tempfile.TemporaryDirectory() as folder:
        target = pathlib.Path(folder) / path.name
        strip = _which("strip")
        if strip is None:
            return path.read_bytes()
        _run(strip, "--strip-unneeded", "-o", target, path)
        return target.read_bytes()


def _notices():
    """The terms of what is compiled in but not ours."""
    for package in ("nlohmann-json3-dev", "libcli11-dev", "pybind11-dev"):
        path = pathlib.Path("/usr/share/doc") / package / "copyright"
        if path.is_file():
            yield package, path.read_bytes()


class _Wheel:
    """A wheel that is written entry by entry."""

    def __init__(self, path):
        stamp = int(os.environ.get("SOURCE_DATE_EPOCH", 315532800))
        self._time = max(time.gmtime(stamp)[:6], (1980, 1, 1, 0, 0, 0))
        self._zip = zipfile.ZipFile(path, "w", zipfile.ZIP_DEFLATED, compresslevel=9)
        self._records = []

    def add(self, name, content, mode=0o644):
        entry = zipfile.ZipInfo(name, self._time)
        entry.compress_type = zipfile.ZIP_DEFLATED
        entry.create_system = 3
        entry.external_attr = (0o100000 | mode) << 16
        self._zip.writestr(entry, content, compresslevel=9)
        digest = base64.urlsafe_b64encode(hashlib.sha256(content).digest()).rstrip(b"=").decode()
        self._records.append(f"{name},sha256={digest},{len(content)}")

    def close(self, info):
        self._records.append(f"{info}/RECORD,,")
        self.add_last(f"{info}/RECORD", "\n".join(self._records) + "\n")
        self._zip.close()

    def add_last(self, name, text):
        entry = zipfile.ZipInfo(name, self._time)
        entry.compress_type = zipfile.ZIP_DEFLATED
        entry.create_system = 3
        entry.external_attr = 0o100644 << 16
        self._zip.writestr(entry, text, compresslevel=9)


def _write_wheel(folder, files):
    name = f"qrx-{_version()}-{_tag()}.whl"
    info = f"qrx-{_version()}.dist-info"
    wheel = _Wheel(pathlib.Path(folder) / name)
    for path, content, mode in files:
        wheel.add(path, content, mode)
    wheel.add(f"{info}/METADATA", _metadata().encode())
    wheel.add(f"{info}/WHEEL", _wheel_text().encode())
    for package, text in _notices():
        wheel.add(f"{info}/notices/{package}", text)
    wheel.close(info)
    return name


def prepare_metadata_for_build_wheel(metadata_directory, config_settings=None):
    """What the wheel will say of itself, without building it."""
    info = pathlib.Path(metadata_directory) / f"qrx-{_version()}.dist-info"
    info.mkdir()
    (info / "METADATA").write_text(_metadata(), encoding="utf-8")
    (info / "WHEEL").write_text(_wheel_text(), encoding="utf-8")
    return info.name


def build_wheel(wheel_directory, config_settings=None, metadata_directory=None):
    with tempfile.TemporaryDirectory() as folder:
        package = _build(folder)
        suffix = sysconfig.get_config_var("EXT_SUFFIX")
        files = []
        for path in sorted(package.iterdir()):
            if path.suffix in (".py", ".pyi", ".typed") or path.name == "py.typed":
                files.append((f"qrx/{path.name}", path.read_bytes(), 0o644))
            elif path.name == f"_qrx{suffix}":
                files.append((f"qrx/{path.name}", _stripped(path), 0o755))
        return _write_wheel(wheel_directory, files)


def build_sdist(sdist_directory, config_settings=None):
    name = f"qrx-{_version()}"
    stamp = int(os.environ.get("SOURCE_DATE_EPOCH", 315532800))
    path = pathlib.Path(sdist_directory) / f"{name}.tar.gz"

    def clean(entry):
        if "node_modules" in entry.name or "__pycache__" in entry.name:
            return None
        entry.mtime = stamp
        entry.uid = entry.gid = 0
        entry.uname = entry.gname = ""
        return entry

    with tarfile.open(path, "w:gz", format=tarfile.PAX_FORMAT) as archive:
        for each in TREE:
            archive.add(ROOT / each, f"{name}/{each}", filter=clean)
        text = _metadata().encode()
        entry = tarfile.TarInfo(f"{name}/PKG-INFO")
        entry.size = len(text)
        entry.mtime = stamp
        archive.addfile(entry, io.BytesIO(text))
    return path.name
