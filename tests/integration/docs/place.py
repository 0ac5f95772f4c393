"""A system as the documents tell of it, below a directory: the commands of the documents run there
unchanged but for that directory before its places."""

import contextlib
import os
import pathlib
import pwd
import re
import shutil
import signal
import subprocess
import sys
import tempfile

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
from installation import Cimomd, Programs

PATIENCE_S = 300
# Places of an installed system that are written to or hold what the packages bring.
PLACES = re.compile(r"(?<![\w.~/$-])(?=/(etc/(velmira|sennet|cimomd|systemd)|usr/share/sennet|"
                    r"usr/sbin/cimomd|var/lib/sennet|srv|run|tmp)\b)")
DIRECTORIES = ("etc/velmira", "etc/cimomd/mof.d", "usr/share/sennet", "usr/sbin", "var/lib", "srv",
               "run", "tmp", "bin", "work")
# What root alone may read of the recorded laptop.
FOR_ROOT_ONLY = ("sys/firmware/dmi/tables/DMI", "sys/class/dmi/id/product_serial",
                 "sys/class/dmi/id/product_uuid", "sys/class/dmi/id/board_serial",
                 "sys/class/dmi/id/chassis_serial")


class Sources:
    """The tree of sources and what was built of it."""

    def __init__(self, source, build):
        self.source = source
        self.build = build
        self.programs = Programs(build / "bin", build / "tests" / "mif-rows", source / "inventory",
                                 source / "src" / "cimomd" / "schema")
        self.machines = source / "tests" / "machines"


class Place:
    """To be used in a with statement, which removes everything at its end."""

    def __init__(self, sources):
        self.sources = sources
        self.stack = contextlib.ExitStack()
        self.root = pathlib.Path(
            self.stack.enter_context(tempfile.TemporaryDirectory(prefix="sennet-docs-")))
        self.root.chmod(0o755)
        for name in DIRECTORIES:
            (self.root / name).mkdir(parents=True)
        self.work = self.root / "work"
        self.other_socket = None
        shutil.copytree(sources.programs.inventory, self.root / "usr/share/sennet",
                        dirs_exist_ok=True)
        self._write_configuration()
        # What it does when everything is built; that alone is no matter of the documents.
        self._write_program("work/run", "exec sennet /SMS ./out")

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.stack.close()

    def _write_configuration(self):
        """The one of the packages, with the places of this system."""
        text = (self.sources.source / "packaging/velm.properties.in").read_text()
        text = text.replace("@CMAKE_INSTALL_FULL_LOCALSTATEDIR@", str(self.root / "var"))
        scripts = self.root / "usr/share/sennet"
        text += f"sennet.directory = {scripts}\nsennet.resources = {scripts}/sennet.properties\n"
        (self.root / "etc/velmira/velm.properties").write_text(text)

    def _write_program(self, name, text):
        path = self.root / name
        path.write_text("#!/bin/bash\n" + text + "\n")
        path.chmod(0o755)

    def write(self, name, text):
        (self.work / name).write_text(self.placed(text))

    def placed(self, text):
        """A text of the documents with the places of this system."""
        return PLACES.sub(str(self.root), text)

    def as_shown(self, text):
        """What was printed, as on a system whose root and administrator are the usual ones."""
        user = pwd.getpwuid(os.getuid()).pw_name
        text = re.sub(rf"(?m)^(\*?\s+/\S+\s+){user}\b", r"\1root", text)
        return text.replace(str(self.root), "")

    def run(self, command, machine="laptop", given=None):
        """Runs a command of the documents with bash."""
        environment = {
            "PATH": f"{self.root / 'bin'}:{self.sources.programs.sennet.parent}:{os.environ['PATH']}",
            "HOME": str(self.work), "LC_ALL": "C.UTF-8",
            "CIM_COMMAND": str(self.root / "usr/sbin/cimomd"),
            "VELM_CONFIG": str(self.root / "etc/velmira/velm.properties")}
        self.use_machine(self.sources.machines / machine)
        if given is not None:
            environment.update(SITUATIONS[given](self))
        with subprocess.Popen(["bash", "-eu"], stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                              stderr=subprocess.STDOUT, text=True, cwd=self.work, env=environment,
                              start_new_session=True) as process:
            try:
                printed = process.communicate(self.placed(command), PATIENCE_S)[0]
            except subprocess.TimeoutExpired:
                os.killpg(process.pid, signal.SIGKILL)
                raise
        return process.returncode, self.as_shown(printed)

    def use_machine(self, machine, before=""):
        """Has sennet and sennetctl start the object manager on a recorded machine."""
        self._write_program("usr/sbin/cimomd",
                            f"exec {before} '{self.sources.programs.cimomd}' --root '{machine}' "
                            f"--mof-dir '{self.root / 'etc/cimomd/mof.d'}' \"$@\"")

    # --- what may be wrong with a system ----------------------------------------------------------

    def no_server(self):
        return {"CIM_EMBEDDED": "never"}

    def other_server(self):
        """One that an administrator named, on another machine's record."""
        if self.other_socket is None:
            place = self.root / "other"
            place.mkdir()
            server = Cimomd(self.sources.programs, place, self.sources.machines / "virtual", place)
            self.other_socket = self.stack.enter_context(server).socket
        return {"CIM_LOCAL_SOCKET": str(self.other_socket)}

    def plain_user(self):
        """The object manager may not read what is root's."""
        copy = self.root / "machine"
        if not copy.exists():
            shutil.copytree(self.sources.machines / "laptop", copy, symlinks=True)
            for name in FOR_ROOT_ONLY:
                if (copy / name).exists():
                    (copy / name).chmod(0)
        drop = "setpriv --reuid=65534 --regid=65534 --clear-groups" if os.getuid() == 0 else ""
        self.use_machine(copy, drop)
        return {}


SITUATIONS = {"no-server": Place.no_server, "other-server": Place.other_server,
              "plain-user": Place.plain_user}
