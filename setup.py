# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Builds the Python package and, by CMake, the library that it loads.

OLVANE_NATIVE_LIBRARY may name a library that is already built. The same sources give the same bytes: SOURCE_DATE_EPOCH is
the time of what is packed, and 1980 where it is not set.
"""

import gzip
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tarfile
import tempfile

from setuptools import setup
from setuptools.command.build_py import build_py
from setuptools.command.sdist import sdist
from setuptools.dist import Distribution
from wheel.bdist_wheel import bdist_wheel

ROOT = pathlib.Path(__file__).resolve().parent
PACKAGE = ROOT / "bindings" / "python" / "olvane"
LIBRARY_PARTS = ["boost", "unicode-data", "utf8proc"]
os.environ.setdefault("SOURCE_DATE_EPOCH", "315532800")
os.umask(0o022)


def first_match(pattern: str, file: pathlib.Path) -> str:
    found = re.search(pattern, file.read_text(encoding="utf-8"), re.MULTILINE)
    assert found, f"{file}: nothing fits {pattern}"
    return found.group(1)


VERSION = first_match(r"^set\(OLVANE_VERSION ([0-9.]+)\)", ROOT / "cmake" / "OlvaneVersion.cmake")
# The name by which the package looks for the library beside itself.
SONAME = first_match(r'^_SONAME = "(.*)"', PACKAGE / "_native.py")


def make_readable(folder: str) -> None:
    """Whatever the sources' own permissions are, everybody may read what is packed."""
    for path in pathlib.Path(folder).rglob("*"):
        path.chmod(0o755 if path.is_dir() else 0o644)


def built_library(folder: pathlib.Path) -> pathlib.Path:
    """The C interface alone; nothing in it says where it was built."""
    flags = f"-ffile-prefix-map={ROOT}=. -ffile-prefix-map={folder}=build"
    options = {
        "CMAKE_BUILD_TYPE": "Release",
        "CMAKE_C_FLAGS": flags,
        "CMAKE_CXX_FLAGS": flags,
        "CMAKE_SHARED_LINKER_FLAGS": "-Wl,--build-id=none -Wl,-z,relro",
        "OLVANE_BUILD_LIBRARIES": "OFF",
        "OLVANE_BUILD_COMMAND": "OFF",
        "OLVANE_BUILD_FOUNDATION": "OFF",
        "OLVANE_BUILD_C": "ON",
        "OLVANE_BUILD_PAGE": "OFF",
        "OLVANE_STATIC_UTF8PROC": "ON",
        "OLVANE_GEDCOM_ZIP": "OFF",  # libzip needs a dozen libraries more; the package unpacks archives itself
    }
    generator = ["-G", "Ninja"] if shutil.which("ninja") else []
    given = [f"-D{name}={value}" for name, value in options.items()]
    subprocess.run(["cmake", "-S", ROOT, "-B", folder, *generator, *given], check=True)
    subprocess.run(["cmake", "--build", folder, "--target", "olvane_c", "--parallel", str(os.cpu_count())], check=True)
    return folder / "bindings" / "c" / SONAME


class BuildWithLibrary(build_py):
    def run(self) -> None:
        shutil.rmtree(self.build_lib, ignore_errors=True)  # of another version of the sources
        super().run()
        target = pathlib.Path(self.build_lib) / "olvane"
        with tempfile.TemporaryDirectory() as folder:
            given = os.environ.get("OLVANE_NATIVE_LIBRARY")
            shutil.copyfile(given or built_library(pathlib.Path(folder)), target / SONAME)
        subprocess.run(["strip", "--strip-unneeded", target / SONAME], check=True)
        contents = [ROOT / "scripts" / "write-contents", target / "contents.spdx.json", "olvane", VERSION]
        subprocess.run([sys.executable, *contents, *LIBRARY_PARTS], check=True)
        make_readable(self.build_lib)


class WheelOfAnyPython(bdist_wheel):
    """One wheel for every Python 3 of a platform: the library knows nothing of Python."""

    def get_tag(self) -> tuple[str, str, str]:
        return ("py3", "none", super().get_tag()[2])

    def egg2dist(self, egginfo_path: str, distinfo_path: str) -> None:
        super().egg2dist(egginfo_path, distinfo_path)
        make_readable(distinfo_path)


class SameBytesTwice(sdist):
    """An archive in which nothing depends on when, where and by whom it is made."""

    def make_archive(self, base_name: str, format: str, root_dir=None, base_dir=None, **_: object) -> str:
        time = int(os.environ["SOURCE_DATE_EPOCH"])

        def plain(entry: tarfile.TarInfo) -> tarfile.TarInfo:
            entry.uid = entry.gid = 0
            entry.uname = entry.gname = ""
            entry.mtime = time
            entry.mode = 0o755 if entry.isdir() or entry.mode & 0o100 else 0o644
            return entry

        name = f"{base_name}.tar.gz"
        with open(name, "wb") as file, gzip.GzipFile("", "wb", 9, file, mtime=time) as packed:
            with tarfile.open(fileobj=packed, mode="w", format=tarfile.PAX_FORMAT) as archive:
                for path in [pathlib.Path(base_dir), *sorted(pathlib.Path(base_dir).rglob("*"))]:
                    archive.add(path, recursive=False, filter=plain)
        return name


class WithLibrary(Distribution):
    def has_ext_modules(self) -> bool:
        return True


setup(
    version=VERSION,
    packages=["olvane"],
    package_dir={"olvane": str(PACKAGE.relative_to(ROOT))},
    package_data={"olvane": ["py.typed"]},
    cmdclass={"build_py": BuildWithLibrary, "bdist_wheel": WheelOfAnyPython, "sdist": SameBytesTwice},
    distclass=WithLibrary,
    options={"build": {"build_base": "build/python"}},
    zip_safe=False,
)
