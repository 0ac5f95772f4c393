"""cimomd on the machine that the test runs on, as the test's user or as one without rights."""

import os
import pathlib
import shutil
import tempfile

from cim_client import Client
from cimomd_server import Server

# The user and the group "nobody" of Debian, who own nothing.
NOBODY = ["setpriv", "--reuid=65534", "--regid=65534", "--clear-groups", "--no-new-privs",
          "--inh-caps=-all", "--bounding-set=-all"]


class LiveServer:
    """Serves until end() is called."""

    def __init__(self, cimomd, as_nobody=False, root=None):
        self.place = pathlib.Path(tempfile.mkdtemp(prefix="cimomd-machine-"))
        own = self.place / "own"
        own.mkdir()
        command = [cimomd, "--http", "127.0.0.1:0", "--mof-dir", str(own)]
        if root is not None:
            command += ["--root", str(root)]
        if as_nobody:
            command = NOBODY + [self.copied(cimomd)] + command[1:]
        self.server = Server(self.place, *command)
        self.port = self.server.port()
        self.client = Client(self.port)

    def copied(self, cimomd):
        """The program and its schema in a directory that everybody may enter."""
        build = pathlib.Path(cimomd).resolve().parent.parent
        schema = pathlib.Path("share") / "cimomd" / "schema"
        shutil.copytree(build / schema, self.place / schema)
        (self.place / "bin").mkdir()
        shutil.copy(cimomd, self.place / "bin")
        for directory, _, files in os.walk(self.place):
            os.chmod(directory, 0o755)
            for name in files:
                os.chmod(os.path.join(directory, name), 0o755)
        return str(self.place / "bin" / pathlib.Path(cimomd).name)

    def end(self):
        status = self.server.end()
        shutil.rmtree(self.place)
        return status
