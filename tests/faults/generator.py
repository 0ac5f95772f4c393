"""The generator as an administrator would run it, in a place of its own and against a server of the
test."""

import contextlib
import os
import pathlib
import shutil
import stat

import rows

# What the generator may take while a server does its worst, the answer to one class aside.
MEMORY_LIMIT = 96 * rows.MIB
PRODUCTS = ("SMS", "CA", "LD", "QVE")
START = "Corvane CIM to MIF Generator, version 5.20\n\nCreating MIF files in {}\n"
# The generator's three minutes pass in less than a second.
QUICK = 250


def environment_of_faults(binaries, faults):
    """What makes the library of wrong answers of the system do `faults`; nothing without any."""
    if not faults:
        return {}
    return {"LD_PRELOAD": str(binaries.parent / "faults" / "libsystemfaults.so"),
            "ASAN_OPTIONS": "verify_asan_link_order=0",
            **{"FAULTS_" + name: str(value) for name, value in faults.items()}}


class Generator:
    """Scripts, output directories and configuration of `sennet` below `place`."""

    def __init__(self, binaries, place, top=None):
        """The output directories are below `top`, else below `place`."""
        place = pathlib.Path(place)
        self.top = pathlib.Path(top or place)
        self.binaries = binaries
        self.program = binaries / "sennet"
        self.place = place
        self.scripts = place / "scripts"
        self.mif = self.top / "mif"
        self.sql = self.top / "sql"
        self.socket = place / "cim.socket"
        self.configuration = place / "velm.properties"
        # Another user may run the generator, too.
        place.chmod(0o755)
        self.scripts.mkdir()
        (place / "sennet.properties").write_bytes(b"")
        self._configure()

    def _configure(self):
        self.configuration.write_text(
            f"sennet.directory={self.scripts}\n"
            f"sennet.resources={self.place / 'sennet.properties'}\n"
            f"mif.directory={self.mif}\nsql.directory={self.sql}\n")

    def use_outputs_of(self, other):
        """Writes into the other one's directories from now on."""
        self.top, self.mif, self.sql = other.top, other.mif, other.sql
        self._configure()

    def add_script(self, name, text):
        (self.scripts / f"{name}.script.inv").write_text(text)

    def environment(self, **faults):
        """`faults` are what the library of wrong answers of the system shall do."""
        return {"VELM_CONFIG": str(self.configuration), "CIM_LOCAL_SOCKET": str(self.socket),
                "CIM_EMBEDDED": "never", **environment_of_faults(self.binaries, faults)}

    def start(self, product, faults=None, limits=(), before=(), **options):
        """`before` is a command that runs the program that follows it."""
        return rows.Program([*before, self.program, "/" + product], self.environment(**(faults or {})),
                            limits, **options)

    def run(self, product, faults=None, limits=(), patience_s=rows.PATIENCE_S, **options):
        return self.start(product, faults, limits, **options).wait(patience_s)

    def banner(self):
        return START.format(self.mif)

    def remove_outputs(self):
        for directory in (self.mif, self.sql):
            with contextlib.suppress(FileNotFoundError):
                shutil.rmtree(directory)

    def empty_outputs(self):
        self.remove_outputs()
        for directory in (self.mif, self.sql):
            directory.mkdir()

    def outputs(self):
        """Bytes of every regular file of both output directories, hidden ones included, by path."""
        files = [pathlib.Path(directory, name) for top in (self.mif, self.sql)
                 for directory, _, names in os.walk(top) for name in names]
        return {str(file.relative_to(self.top)): file.read_bytes()
                for file in files if stat.S_ISREG(file.lstat().st_mode)}
