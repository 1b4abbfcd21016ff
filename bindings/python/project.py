"""Builds the package against the libraries of Zandor that pkg-config finds."""

import os
import shutil
import subprocess
import sys
from glob import glob

import PyQt6
from pyqtbuild import PyQtProject
from sipbuild import Installable, UserException

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
import headers

MODULES = ["zandor-widgets", "zandor-reader", "zandor-files"]


def pkg_config(*arguments):
    try:
        return subprocess.run(
            ["pkg-config", *arguments, *MODULES], check=True, capture_output=True, text=True
        ).stdout.strip()
    except FileNotFoundError:
        raise UserException("pkg-config is not installed; install the package pkg-config")
    except subprocess.CalledProcessError:
        raise UserException(
            "pkg-config does not find " + ", ".join(MODULES) + "; install Zandor, and name the"
            " folder of its .pc files in PKG_CONFIG_PATH when it is not one of the system's"
        )


class Zandor(PyQtProject):
    def apply_user_defaults(self, tool):
        # Debian's qmake of Qt 6 goes by this name.
        if self.builder.qmake is None:
            self.builder.qmake = shutil.which("qmake6")
        super().apply_user_defaults(tool)

    def get_metadata_overrides(self):
        # The version is that of the libraries.
        return {"version": pkg_config("--modversion").split()[0]}

    def get_bindings_dir(self):
        return os.path.join("zandor", "bindings")

    def update(self, tool):
        super().update(tool)
        folders = [flag[2:] for flag in pkg_config("--cflags-only-I").split()]
        generated = os.path.join(self.build_dir, "generated")
        os.makedirs(generated, exist_ok=True)
        headers.fill(glob(os.path.join(self.root_dir, "sip", "*.sip.in")), folders, generated)
        self.sip_include_dirs += [generated, os.path.join(PyQt6.__path__[0], "bindings")]

        bindings = self.bindings["_zandor"]
        bindings.include_dirs.append(os.path.join(self.root_dir, "src"))
        bindings.sources += glob(os.path.join(self.root_dir, "src", "*.cpp"))
        bindings.headers += glob(os.path.join(self.root_dir, "src", "*.h"))
        bindings.builder_settings += [
            "QT += widgets sql",
            "CONFIG += c++20 no_keywords link_pkgconfig",
            "PKGCONFIG += " + " ".join(MODULES),
        ]

        package = Installable("package", target_subdir="zandor")
        package.files = sorted(
            glob(os.path.join(self.root_dir, "zandor", "*.py"))
            + glob(os.path.join(self.root_dir, "zandor", "*.pyi"))
            + [os.path.join(self.root_dir, "zandor", "py.typed")]
        )
        self.installables.append(package)
