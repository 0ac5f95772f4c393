"""sennetctl on a terminal, in a pipe, and with a server that listens and says nothing."""

import argparse
import fcntl
import json
import os
import pathlib
import pty
import resource
import socket
import struct
import subprocess
import sys
import tempfile
import termios
import unittest

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
LITTLE_MEMORY = 64 << 20
TEXT = "a text of more characters than a narrow terminal has in one of its lines"
MIF = f"""Start Component Name = "Machine"
Start Group Name = "Fan" Class = "Own|Fan|001" Id = 1
Start Attribute Name = "Text" Id = 1 Type = String(99) Value = "{TEXT}" End Attribute
End Group
End Component
"""


class SurroundingsTest(unittest.TestCase):
    def setUp(self):
        self.place = pathlib.Path(self.enterContext(
            tempfile.TemporaryDirectory(prefix="sennet-surroundings-")))
        self.mif = self.place / "fan.mif"
        self.mif.write_text(MIF)
        (self.place / "velm.properties").touch()

    def command(self, *words):
        return [ARGUMENTS.programs.resolve() / "sennetctl", *words]

    def environment(self):
        return {"PATH": os.environ["PATH"], "TERM": "xterm", "NO_COLOR": "1",
                "CIM_LOCAL_SOCKET": str(self.place / "silent.socket"),
                "VELM_CONFIG": str(self.place / "velm.properties")}

    def silent_server(self):
        """A socket that takes connections and never answers."""
        listener = self.enterContext(socket.socket(socket.AF_UNIX))
        listener.bind(str(self.place / "silent.socket"))
        listener.listen()

    def on_a_terminal(self, columns, *words):
        ours, theirs = pty.openpty()
        try:
            fcntl.ioctl(theirs, termios.TIOCSWINSZ, struct.pack("HHHH", 24, columns, 0, 0))
            subprocess.run(self.command(*words), stdout=theirs, timeout=60, check=True,
                           env=self.environment())
            return os.read(ours, 65536).decode().replace("\r\n", "\n")
        finally:
            os.close(theirs)
            os.close(ours)

    def test_cells_are_cut_to_the_width_of_a_terminal(self):
        shown = self.on_a_terminal(40, "mif", "show", self.mif)
        self.assertIn("\n" + TEXT[:39] + "…\n", shown)
        self.assertIn("\n" + TEXT + "\n", self.on_a_terminal(72, "mif", "show", self.mif))

    def test_cells_are_whole_in_a_pipe(self):
        shown = subprocess.run(self.command("mif", "show", self.mif), capture_output=True,
                               text=True, timeout=60, check=True, env=self.environment())
        self.assertIn("\n" + TEXT + "\n", shown.stdout)

    def with_little_memory(self, *words):
        return subprocess.run(
            self.command(*words), capture_output=True, text=True, timeout=60, check=False,
            env=self.environment(), preexec_fn=lambda: resource.setrlimit(
                resource.RLIMIT_AS, (LITTLE_MEMORY, LITTLE_MEMORY)))

    def test_lack_of_memory_is_told_as_such(self):
        if self.with_little_memory("mif", "show", self.mif).returncode != 0:
            self.skipTest("the sanitizers need more address space to begin with")
        self.mif.write_text(MIF.replace(
            "End Group\n", "".join(f'Start Attribute Name = "A{number}" Id = {number} Type = '
                                   f'String(99) Value = "{TEXT}" End Attribute\n'
                                   for number in range(2, 60000)) + "End Group\n"))
        result = self.with_little_memory("mif", "json", self.mif)
        self.assertEqual(result.returncode, 2)
        self.assertEqual(result.stderr, "sennetctl: not enough memory\n")
        self.assertEqual(json.loads(result.stdout), {"error": {"message": "not enough memory"}})

    def test_the_places_are_told_before_the_server_answers(self):
        self.silent_server()
        with subprocess.Popen(self.command("server", "--timeout", "600"), stdout=subprocess.PIPE,
                              env=self.environment()) as program:
            try:
                told = b""
                while b"connected" not in told:
                    piece = os.read(program.stdout.fileno(), 4096)
                    self.assertTrue(piece, told)
                    told += piece
                self.assertIn(str(self.place / "silent.socket").encode(), told)
                self.assertIsNone(program.poll())
            finally:
                program.kill()

    def test_a_silent_server_leaves_the_findings_in_the_scripts(self):
        self.silent_server()
        script = self.place / "own.script.inv"
        script.write_text("[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nnonsense\n")
        result = subprocess.run(self.command("check", "--timeout", "1", "--json", script),
                                capture_output=True, text=True, timeout=60, check=False,
                                env=self.environment())
        self.assertEqual(result.returncode, 1)
        self.assertIn("is connected, but does not answer within 1 s\n", result.stderr)
        document = json.loads(result.stdout)
        self.assertEqual(document["server"], "not reached")
        self.assertIn("does not answer within 1 s", document["serverReason"])
        self.assertIn((str(script), 4), [(each["file"], each["line"])
                                         for each in document["findings"]])


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    ARGUMENTS, rest = parser.parse_known_args()
    unittest.main(argv=[sys.argv[0], *rest])
