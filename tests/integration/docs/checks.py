"""A look at commands that are not run where the tests run: each function raises ValueError with what
is wrong with the command."""

import itertools
import json
import re
import shlex
import subprocess

# Units of the packages, and what may be asked of systemd about them.
UNIT_VERBS = {"enable", "disable", "start", "stop", "restart", "reload", "status", "is-active",
              "list-timers"}
JOURNAL_OPTIONS = {"-u", "-t", "-b", "-n", "--no-pager", "--since"}


def _refuse(condition, reason):
    if condition:
        raise ValueError(reason)


def first_word(command):
    return command.split()[0] if command.split() else ""


class Checks:
    def __init__(self, sources):
        self.source = sources.source
        self.build = sources.build
        self.programs = sources.programs
        self.presets = json.loads((self.source / "CMakePresets.json").read_text())

        # These build and test: a test that runs them would run itself.
        self.builders = {"./run": self.check_script, "./test": self.check_script,
                         ".ci/run": self.check_script, "bench/compare": self.check_script,
                         "packaging/test-packages": self.check_script,
                         "scripts/fuzz": self.check_script,
                         "tests/valgrind": self.check_script, "cmake": self.check_cmake,
                         "cpack": self.check_cmake, "ctest": self.check_ctest,
                         "build/release/bin/inner-parts": self.check_benchmark}
        self.others = {"systemctl": self.check_systemctl, "journalctl": self.check_journalctl,
                       "apt": self.check_apt, "sennetctl": self.check_sennetctl,
                       "sennet": self.check_sennet, "cimomd": self.check_cimomd}

    def builds(self, command):
        return first_word(command) in self.builders

    def knows(self, command):
        return first_word(command) in {*self.builders, *self.others}

    def check(self, command):
        """Commands of programs that nothing is known of here pass."""
        words = shlex.split(command, comments=True)
        {**self.builders, **self.others}.get(words[0], lambda words: None)(words)

    # --- what builds and tests ---------------------------------------------------------------------

    def check_script(self, words):
        path = self.source / words[0]
        _refuse(not path.is_file() or not path.stat().st_mode & 0o100, "there is no such script")
        text = path.read_text()
        if words[0] == "bench/compare":
            text += (self.source / "bench/driver/compare.py").read_text()
        for word in words[1:]:
            _refuse(word.startswith("--") and word not in text, f"it has no option {word}")

    def check_cmake(self, words):
        kinds = {"cmake": "configurePresets", "cpack": "packagePresets"}
        kind = "buildPresets" if "--build" in words else kinds[words[0]]
        for option, value in zip(words, words[1:]):
            names = [preset["name"] for preset in self.presets[kind]]
            _refuse(option == "--preset" and value not in names, f"there is no preset {value}")
        for word in words:
            if match := re.match(r"-D(SENNET_\w+)=", word):
                declared = subprocess.run(["grep", "-rqE", rf"(set|option)\({match[1]}\b",
                                           self.source / "CMakeLists.txt", self.source / "src",
                                           self.source / "packaging"], check=False)
                _refuse(declared.returncode != 0, f"there is no variable {match[1]}")

    def check_ctest(self, words):
        pattern = words[words.index("-R") + 1]
        declared = subprocess.run(["grep", "-rqE", rf"add_test\((NAME )?\w*{pattern}",
                                   self.source / "tests", "--include=CMakeLists.txt"], check=False)
        _refuse(declared.returncode != 0, f"no test matches {pattern}")

    def check_benchmark(self, words):
        name = words[0].rpartition("/")[2]
        text = (self.source / "bench/CMakeLists.txt").read_text()
        _refuse(f"add_executable({name} " not in text, "there is no such program")

    # --- what an installed system has --------------------------------------------------------------

    def check_systemctl(self, words):
        verb, *rest = [word for word in words[1:] if not word.startswith("--")]
        if verb == "daemon-reload":
            return
        _refuse(verb not in UNIT_VERBS, f"the documents have no use for {verb} so far")
        for unit in rest:
            text = self._unit(unit if "." in unit or "*" in unit else unit + ".service")
            _refuse(verb == "enable" and "[Install]" not in text, f"{unit} cannot be enabled")
            _refuse(verb == "reload" and "ExecReload=" not in text, f"{unit} cannot be reloaded")

    def _unit(self, unit):
        instance = re.fullmatch(r"sennet@(SMS|CA|LD|QVE|\*)?(\.\w+)?", unit)
        name = "sennet@" + (instance[2] or ".timer") if instance else unit
        path = self.build / "packaging" / "systemd" / name
        _refuse(not path.is_file(), f"the packages have no unit {unit}")
        return path.read_text()

    def check_journalctl(self, words):
        for word, value in zip(words[1:], [*words[2:], ""]):
            _refuse(word.startswith("-") and word not in JOURNAL_OPTIONS, f"unknown option {word}")
            if word == "-u":
                self._unit(value if "." in value else value + ".service")
            _refuse(word == "-t" and value not in ("sennet", "cimomd"), f"nobody logs as {value}")

    def check_apt(self, words):
        _refuse(words[1] not in ("install", "remove", "purge"), f"no use for {words[1]} so far")
        for word in words[2:]:
            name = re.match(r"(?:\./)?([a-z-]+)", word)[1]
            _refuse(name not in ("sennet", "cimomd", "libvelmclient", "libvelmclient-dev"),
                    f"no package {name}")

    # --- our programs, where a sentence names an option --------------------------------------------

    def check_sennetctl(self, words):
        subcommands = list(itertools.takewhile(re.compile("[a-z]+$").match, words[1:]))
        told = subprocess.run([self.programs.sennet.parent / "sennetctl", *subcommands, "--help"],
                              capture_output=True, text=True, check=False, timeout=60)
        # An unknown command gets the help of the one above.
        _refuse(f"Usage: {' '.join(['sennetctl', *subcommands])} " not in told.stdout,
                f"there is no command {' '.join(subcommands)}")
        self._check_options(words[1:], told.stdout)

    def check_cimomd(self, words):
        told = subprocess.run([self.programs.cimomd, "--help"], capture_output=True, text=True,
                              check=True, timeout=60)
        self._check_options(words[1:], told.stdout)

    def check_sennet(self, words):
        _refuse(words[1] not in ("/SMS", "/CA", "/LD", "/QVE", "OPTION"), f"no product {words[1]}")

    @staticmethod
    def _check_options(words, told):
        for word in words:
            _refuse(word.startswith("-") and not re.search(rf"(?<![\w-]){re.escape(word)}\b", told),
                    f"it has no option {word}")
