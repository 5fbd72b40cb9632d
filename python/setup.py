"""Builds the extension with the project's own CMake build (Release, with the
Python module on) and puts it into the package together with the two shared
libraries it loads from beside itself."""

import os
import pathlib
import shutil
import subprocess
import sys

from setuptools import Extension, setup
from setuptools.command.build_ext import build_ext

PROJECT = pathlib.Path(__file__).resolve().parent.parent


class CMakeBuild(build_ext):
    """Configures and builds the redavudeva_python target of the CMake project."""

    def build_extension(self, ext):
        build = pathlib.Path(self.build_temp).resolve() / "cmake"
        subprocess.run(["cmake", "-S", str(PROJECT), "-B", str(build), "-G", "Ninja",
                        "-DCMAKE_BUILD_TYPE=Release", "-DREDAVUDEVA_PYTHON=ON",
                        "-DREDAVUDEVA_BUILD_TESTS=OFF", "-DREDAVUDEVA_BUILD_EXAMPLES=OFF",
                        f"-DPython_EXECUTABLE={sys.executable}",
                        # Built with $ORIGIN as search path: the libraries lie beside the module.
                        "-DCMAKE_BUILD_WITH_INSTALL_RPATH=ON"], check=True)
        subprocess.run(["cmake", "--build", str(build), "--target", "redavudeva_python",
                        "-j", str(os.cpu_count() or 1)], check=True)
        module = pathlib.Path(self.get_ext_fullpath(ext.name))
        module.parent.mkdir(parents=True, exist_ok=True)
        built = (build / "python" / "package_files.txt").read_text().split()
        shutil.copyfile(built[0], module)
        for library in built[1:]:  # soname links: copy what they point to
            shutil.copyfile(library, module.parent / pathlib.Path(library).name)


setup(
    packages=["redavudeva"],
    package_data={"redavudeva": ["py.typed", "*.pyi"]},
    ext_modules=[Extension("redavudeva._redavudeva", sources=[])],
    cmdclass={"build_ext": CMakeBuild},
)
