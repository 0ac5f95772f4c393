"""What the build makes of its variables: which CIM library each program gets, and that no packages
are made that nobody answers for."""

import os
import pathlib
import re
import shlex
import subprocess
import tempfile
import unittest

from places import Places, run_tests


def run(*command):
    return subprocess.run(command, capture_output=True, text=True, timeout=240, check=False)


class Tree:
    """A directory to configure the sources in."""

    def __init__(self, place):
        self.build = place / "build"
        self.pegasus = place / "pegasus"
        self.source = Places.source.parent

    def configure(self, *variables):
        return run("cmake", "-S", self.source, "-B", self.build, "-G", "Ninja",
                   *("-D" + variable for variable in variables))

    def install_pegasus(self):
        """Files of an installed client library as far as they are looked for."""
        for name in ("include/Pegasus/Client/CIMClient.h", "lib64/libpegclient.so",
                     "lib64/libpegcommon.so"):
            (self.pegasus / name).parent.mkdir(parents=True, exist_ok=True)
            (self.pegasus / name).touch()

    def command_with(self, target, end):
        """The command that makes the file of this end on the way to the target."""
        listed = run("ninja", "-C", self.build, "-t", "commands", target).stdout
        return next(words for words in map(shlex.split, listed.splitlines())
                    if any(word.endswith(end) for word in words))


class CimLibraryTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-configurations-")
        self.addCleanup(directory.cleanup)
        self.tree = Tree(pathlib.Path(directory.name))

    def assertLinks(self, program, library, other):
        words = " ".join(self.tree.command_with(program, f"bin/{program}"))
        self.assertRegex(words, library)
        self.assertNotRegex(words, other)

    def test_the_installed_one_is_taken_for_the_generator_alone(self):
        self.tree.install_pegasus()
        done = self.tree.configure("SENNET_CIM_LIBRARY=auto",
                                   f"OPENPEGASUS_ROOT={self.tree.pegasus}")
        self.assertEqual(done.returncode, 0, done.stderr)
        pegasus = re.escape(str(self.tree.pegasus / "lib64/libpegclient.so"))
        self.assertLinks("sennet", pegasus, "libcimclient")
        self.assertLinks("sennetctl", "libcimclient", pegasus)
        headers = str(self.tree.pegasus / "include")
        bundled = str(self.tree.source / "src/cimclient/model/../include")
        compiled = " ".join(self.tree.command_with("sennet", "ConverterFactory.cc.o"))
        self.assertIn(headers, compiled)
        self.assertNotIn(bundled, compiled)

    def test_the_bundled_one_is_taken_where_none_is_installed(self):
        done = self.tree.configure("SENNET_CIM_LIBRARY=auto",
                                   "CMAKE_DISABLE_FIND_PACKAGE_OpenPegasus=ON")
        self.assertEqual(done.returncode, 0, done.stderr)
        self.assertLinks("sennet", "libcimclient", "libpegclient")
        self.assertLinks("sennetctl", "libcimclient", "libpegclient")

    @unittest.skipIf(any(map(os.path.exists, ("/usr/include/Pegasus", "/usr/local/include/Pegasus"))),
                     "OpenPegasus is there")
    def test_one_that_is_wanted_and_not_there_is_told(self):
        done = self.tree.configure("SENNET_CIM_LIBRARY=openpegasus",
                                   f"OPENPEGASUS_ROOT={self.tree.pegasus}")
        self.assertNotEqual(done.returncode, 0)
        self.assertIn("Could NOT find OpenPegasus", done.stderr)


class ContactTest(unittest.TestCase):
    def setUp(self):
        directory = tempfile.TemporaryDirectory(prefix="sennet-contact-")
        self.addCleanup(directory.cleanup)
        self.tree = Tree(pathlib.Path(directory.name))

    def before_packing(self, *variables):
        self.assertEqual(self.tree.configure(*variables).returncode, 0)
        config = self.tree.build / "CPackConfig.cmake"
        return run("cmake", "-DCONFIG=" + str(config), "-P", self.probe())

    def probe(self):
        """What cpack does before it packs, without the packing."""
        path = self.tree.build / "probe.cmake"
        path.write_text('include("${CONFIG}")\ninclude("${CPACK_PROJECT_CONFIG_FILE}")\n')
        return path

    def test_packages_that_nobody_answers_for_are_refused(self):
        for contact in ("", "Ada Example"):
            done = self.before_packing("SENNET_PACKAGE_CONTACT=" + contact)
            self.assertNotEqual(done.returncode, 0, contact)
            self.assertIn("SENNET_PACKAGE_CONTACT", done.stderr)

    def test_a_name_with_an_address_is_taken(self):
        done = self.before_packing("SENNET_PACKAGE_CONTACT=Ada Example <ada@example.org>")
        self.assertEqual((done.returncode, done.stderr), (0, ""))


if __name__ == "__main__":
    run_tests()
