# SPDX-License-Identifier: Apache-2.0
"""Recipe for Conan 2. Untested. The sources are the tree that it lies in."""
import os
import re

from conan import ConanFile
from conan.tools.cmake import CMake, CMakeDeps, CMakeToolchain, cmake_layout
from conan.tools.files import copy, load


class Zelvo(ConanFile):
    name = "zelvo"
    description = "Logging toolkit for server programs and agents"
    license = "Apache-2.0"
    package_type = "shared-library"
    settings = "os", "compiler", "build_type", "arch"
    requires = "icu/[>=70]"

    def _tree(self):
        return os.path.join(self.recipe_folder, "..", "..")

    def set_version(self):
        text = load(self, os.path.join(self._tree(), "CMakeLists.txt"))
        self.version = re.search(r"project\(zelvo VERSION ([0-9.]+)", text).group(1)

    def export_sources(self):
        for pattern in ("CMakeLists.txt", "*.md", "LICENSE", "cmake/*", "docs/*", "examples/*",
                        "include/*", "src/*"):
            copy(self, pattern, src=self._tree(), dst=self.export_sources_folder)

    def layout(self):
        cmake_layout(self)

    def generate(self):
        CMakeDeps(self).generate()
        toolchain = CMakeToolchain(self)
        for option in ("ZELVO_TESTS", "ZELVO_EXAMPLES"):
            toolchain.cache_variables[option] = "OFF"
        toolchain.generate()

    def build(self):
        cmake = CMake(self)
        cmake.configure()
        cmake.build()

    def package(self):
        CMake(self).install()

    def package_info(self):
        self.cpp_info.libs = ["zelvo"]
        self.cpp_info.includedirs = ["include/zelvo"]
        self.cpp_info.requires = ["icu::icu-uc", "icu::icu-i18n", "icu::icu-io"]
        self.cpp_info.set_property("cmake_target_name", "zelvo::zelvo")
        self.cpp_info.set_property("pkg_config_name", "zelvo")
