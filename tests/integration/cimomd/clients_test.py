"""cimomd as clients that are not this project's see it: wbemcli over HTTP on the loopback, xmllint
for the form of its answers, a service manager that hands over a socket, and clients that behave
badly."""

import argparse
import os
import pathlib
import re
import shutil
import signal
import socket
import subprocess
import sys
import tempfile
import time
import unittest

from cimomd_server import (NAMESPACE, PATIENCE_S, SLOWNESS, Server, body_of, call, class_name,
                           exchange, post, waited)

CIMOMD = None
SANITIZED = False

OWN_MOF = """
class Test_Place { [Key] string Name; uint32 Floor; };
class Test_Room : Test_Place { [Description("how many people it holds")] uint16 Seats; };
"""


def machine(root):
    """A small recorded machine."""
    files = {
        "proc/sys/kernel/hostname": "node7\n",
        "proc/sys/kernel/ostype": "Linux\n",
        "proc/sys/kernel/arch": "x86_64\n",
        "etc/os-release": "ID=debian\nNAME=Debian\nVERSION_ID=12\n",
    }
    for name, text in files.items():
        path = root / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(text)
    return root


class CimomdTest(unittest.TestCase):
    def setUp(self):
        self.place = pathlib.Path(tempfile.mkdtemp(prefix="cimomd-clients-"))
        self.addCleanup(shutil.rmtree, self.place)

    def started(self, *arguments, **options):
        own = self.place / "own"
        own.mkdir(exist_ok=True)
        (own / "places.mof").write_text(OWN_MOF)
        server = Server(self.place, CIMOMD, *arguments, "--root", machine(self.place / "machine"),
                        "--mof-dir", own, **options)
        self.addCleanup(lambda: server.process.poll() is not None or server.end())
        return server


class HttpTest(CimomdTest):
    def setUp(self):
        super().setUp()
        self.server = self.started("--http", "127.0.0.1:0", "--idle-timeout", "2",
                                   "--max-connections", "8")
        self.port = self.server.port()

    def wbemcli(self, operation, name, *more):
        result = subprocess.run(
            ["wbemcli", "-nl", operation, f"http://localhost:{self.port}/{NAMESPACE}{name}", *more],
            capture_output=True, text=True, timeout=PATIENCE_S, check=False)
        return result.stdout.replace(f"localhost:{self.port}/{NAMESPACE}:", "")

    def connect(self):
        return socket.create_connection(("127.0.0.1", self.port), PATIENCE_S)

    def answer(self, body, headers=b"", host=b"localhost"):
        with self.connect() as connection:
            return exchange(connection, post(body, headers, host))

    def test_wbemcli_enumerates_instances(self):
        lines = self.wbemcli("ei", ":CIM_OperatingSystem").splitlines()
        self.assertTrue(lines[0].startswith("Velmira_OperatingSystem."))
        self.assertIn('-CSName="node7"', lines)
        self.assertIn('-CreationClassName="Velmira_OperatingSystem"', lines)

    def test_wbemcli_names_and_gets_an_instance(self):
        names = self.wbemcli("ein", ":CIM_OperatingSystem").splitlines()
        self.assertEqual(len(names), 1)
        self.assertIn('CSName="node7"', names[0])
        lines = self.wbemcli("gi", ":" + names[0]).splitlines()
        self.assertIn('-CSName="node7"', lines)
        self.assertEqual(self.wbemcli("gi", ":" + names[0].replace("node7", "node8")), "")

    def test_wbemcli_gets_a_class(self):
        lines = self.wbemcli("gc", ":Test_Room").splitlines()
        self.assertEqual(lines[:4], ["Test_Room", "-Name=", "-Floor=", "-Seats="])

    def test_wbemcli_enumerates_classes(self):
        self.assertEqual(self.wbemcli("ecn", ":Test_Place"), "Test_Room\n")
        lines = self.wbemcli("ec", ":Test_Place").splitlines()
        self.assertEqual(lines[0], "Test_Room : Test_Place")
        self.assertIn("-Seats=", lines)
        self.assertIn("Test_Place", self.wbemcli("ecn", "").splitlines())

    def test_every_answer_is_well_formed(self):
        name = ('<IPARAMVALUE NAME="InstanceName"><INSTANCENAME CLASSNAME="Test_Room"><KEYBINDING '
                'NAME="Name"><KEYVALUE>x</KEYVALUE></KEYBINDING></INSTANCENAME></IPARAMVALUE>')
        all_classes = '<IPARAMVALUE NAME="DeepInheritance"><VALUE>TRUE</VALUE></IPARAMVALUE>'
        calls = {
            "GetClass": class_name("CIM_OperatingSystem"),
            "EnumerateClasses": all_classes,
            "EnumerateClassNames": all_classes,
            "GetInstance": name,
            "EnumerateInstances": class_name("CIM_ManagedElement"),
            "EnumerateInstanceNames": class_name("CIM_ManagedElement"),
            "DeleteClass": class_name("Test_Room"),
        }
        for method, parameters in calls.items():
            for headers in (b"", b"TE: trailers\r\n"):
                body = body_of(self.answer(call(method, parameters), headers))
                self.assertIn(f'<IMETHODRESPONSE NAME="{method}">'.encode(), body)
                subprocess.run(["xmllint", "--noout", "-"], input=body, check=True)

    def test_a_foreign_name_is_refused(self):
        body = call("EnumerateClassNames")
        self.assertTrue(self.answer(body).startswith(b"HTTP/1.1 200 "))
        self.assertTrue(self.answer(body, host=b"evil.example").startswith(b"HTTP/1.1 403 "))

    def test_a_request_that_a_web_page_could_send_is_refused(self):
        body = call("EnumerateClassNames")
        plain = post(body).replace(b"CIMOperation: MethodCall\r\n", b"")
        with self.connect() as connection:
            self.assertTrue(exchange(connection, plain).startswith(b"HTTP/1.1 400 "))

    def test_a_client_that_does_not_read_is_given_up(self):
        without = self.server.descriptors()
        with self.connect() as connection:
            self.assertTrue(waited(lambda: self.server.descriptors() > without))
            connection.setsockopt(socket.SOL_SOCKET, socket.SO_RCVBUF, 4096)
            # More answers than all buffers hold.
            request = post(call("EnumerateClasses", '<IPARAMVALUE NAME="DeepInheritance"><VALUE>'
                                'TRUE</VALUE></IPARAMVALUE>')).replace(b"Connection: close\r\n", b"")
            connection.settimeout(1)
            try:
                for _ in range(1000):
                    connection.sendall(request)
            except OSError:
                pass
            self.assertTrue(waited(lambda: self.server.descriptors() <= without))

    def test_silent_clients_do_not_keep_others_out(self):
        silent = [self.connect() for _ in range(8)]
        self.assertTrue(self.answer(call("EnumerateClassNames")).startswith(b"HTTP/1.1 200 "))
        for connection in silent:
            connection.close()

    def test_no_descriptor_is_lost(self):
        body = call("EnumerateClassNames")
        self.answer(body)
        before = self.server.descriptors()
        for _ in range(50):
            self.answer(body)
            with self.connect() as connection:
                connection.sendall(b"POST /cimom")
        self.assertTrue(waited(lambda: self.server.descriptors() <= before))


class UnixSocketTest(CimomdTest):
    def test_the_log_tells_who_connects(self):
        path = str(self.place / "s")
        server = self.started("--socket", path, "--socket-mode", "0660")
        # The socket is private until it has the mode that was asked for.
        self.assertTrue(waited(lambda: os.path.exists(path) and
                               os.stat(path).st_mode & 0o777 == 0o660))
        with socket.socket(socket.AF_UNIX) as connection:
            connection.connect(path)
            exchange(connection, post(call("EnumerateClassNames")))
        line = f"connection from pid {os.getpid()} uid {os.getuid()} gid {os.getgid()}\n"
        # The answer may be faster than the log.
        self.assertTrue(waited(lambda: line in server.log()))
        self.assertEqual(server.end(), 0)
        self.assertFalse(os.path.exists(path))

    def test_many_connections_do_not_fill_the_log(self):
        path = str(self.place / "s")
        server = self.started("--socket", path)
        self.assertTrue(waited(lambda: os.path.exists(path)))
        start = time.monotonic()
        for _ in range(400):
            with socket.socket(socket.AF_UNIX) as connection:
                connection.connect(path)
        with socket.socket(socket.AF_UNIX) as connection:
            connection.connect(path)
            exchange(connection, post(call("EnumerateClassNames")))
        seconds = time.monotonic() - start
        told = "connections within a second that are not listed: "
        self.assertTrue(waited(lambda: told in server.log()))
        self.assertLessEqual(server.log().count("connection from pid "), 10 * (seconds + 1))

    def test_both_kinds_of_sockets_give_the_same(self):
        path = str(self.place / "s")
        server = self.started("--socket", path, "--http", "127.0.0.1:0")
        port = server.port()
        request = post(call("EnumerateInstances", class_name("CIM_OperatingSystem")))
        with socket.socket(socket.AF_UNIX) as connection:
            connection.connect(path)
            local = body_of(exchange(connection, request))
        with socket.create_connection(("127.0.0.1", port), PATIENCE_S) as connection:
            over_http = body_of(exchange(connection, request))
        self.assertIn(b"<VALUE>node7</VALUE>", local)
        changing = rb"(<PROPERTY NAME=\"(LocalDateTime|NumberOfProcesses)\".*?</PROPERTY>)"
        self.assertEqual(re.sub(changing, b"", local), re.sub(changing, b"", over_http))

    def test_a_wrong_reload_is_told_with_its_place(self):
        path = str(self.place / "s")
        server = self.started("--socket", path)
        self.assertTrue(waited(lambda: os.path.exists(path)))
        wrong = self.place / "own" / "places.mof"
        wrong.write_text("class Test_Place {\n  uint8 ;\n};\n")
        server.process.send_signal(signal.SIGHUP)
        self.assertTrue(waited(lambda: f"the old classes stay: {wrong}:2:9: " in server.log()))
        wrong.write_text("class Test_Place { uint8 Floor; };\n")
        server.process.send_signal(signal.SIGHUP)
        self.assertTrue(waited(lambda: "the classes have been loaded again\n" in server.log()))

    def test_memory_of_classes_that_are_gone_is_given_back(self):
        if SANITIZED or SLOWNESS > 1:
            self.skipTest("sanitizers and valgrind keep freed memory for a while")
        path = str(self.place / "s")
        server = self.started("--socket", path)
        self.assertTrue(waited(lambda: os.path.exists(path)))
        before = server.resident_kib()
        large = self.place / "own" / "large.mof"
        defaults = "".join(f'string Q{i} = "x";' for i in range(100))
        large.write_text(f"class Test_Large {{ [Key] string Name; {defaults} }};\n" +
                         "".join(f'instance of Test_Large {{ Name = "{i}"; }};\n'
                                 for i in range(1500)))
        server.process.send_signal(signal.SIGHUP)
        loaded = "the classes have been loaded again\n"
        self.assertTrue(waited(lambda: server.log().count(loaded) == 1))
        most = server.resident_kib()
        large.unlink()
        server.process.send_signal(signal.SIGHUP)
        self.assertTrue(waited(lambda: server.log().count(loaded) == 2))
        self.assertTrue(waited(lambda: server.resident_kib() < (before + most) / 2),
                        (before, most, server.resident_kib()))


class ServiceManagerTest(CimomdTest):
    def test_it_takes_a_socket_and_tells_its_state(self):
        path = str(self.place / "activated")
        listener = socket.socket(socket.AF_UNIX)
        listener.bind(path)
        listener.listen()
        states = socket.socket(socket.AF_UNIX, socket.SOCK_DGRAM)
        states.bind(str(self.place / "notify"))
        states.settimeout(PATIENCE_S)

        environment = dict(os.environ, LISTEN_FDS="1", NOTIFY_SOCKET=str(self.place / "notify"))
        command = ["sh", "-c", 'LISTEN_PID=$$ exec "$0" "$@"', CIMOMD]
        process = subprocess.Popen(
            [*command, "--root", machine(self.place / "machine")], env=environment,
            preexec_fn=lambda: os.dup2(listener.fileno(), 3), pass_fds=(3,),
            stderr=subprocess.DEVNULL)
        try:
            self.assertEqual(states.recv(100), b"READY=1")
            with socket.socket(socket.AF_UNIX) as connection:
                connection.connect(path)
                answer = exchange(connection, post(call("EnumerateClassNames")))
            self.assertTrue(answer.startswith(b"HTTP/1.1 200 "))
            process.send_signal(signal.SIGHUP)
            self.assertRegex(states.recv(100), rb"^RELOADING=1\nMONOTONIC_USEC=\d+$")
            self.assertEqual(states.recv(100), b"READY=1")
            process.send_signal(signal.SIGTERM)
            self.assertEqual(states.recv(100), b"STOPPING=1")
            self.assertEqual(process.wait(PATIENCE_S), 0)
            self.assertTrue(os.path.exists(path))
        finally:
            process.kill()
            process.wait()
            listener.close()
            states.close()

    def test_it_refuses_a_socket_that_others_reach(self):
        listener = socket.socket(socket.AF_INET)
        listener.bind(("0.0.0.0", 0))
        listener.listen()
        result = subprocess.run(
            ["sh", "-c", 'LISTEN_PID=$$ exec "$0" "$@"', CIMOMD, "--root",
             machine(self.place / "machine")],
            env=dict(os.environ, LISTEN_FDS="1"), pass_fds=(3,), capture_output=True, text=True,
            preexec_fn=lambda: os.dup2(listener.fileno(), 3), timeout=PATIENCE_S, check=False)
        listener.close()
        self.assertEqual(result.returncode, 1)
        self.assertIn("can be reached from other machines", result.stderr)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--cimomd", required=True)
    parser.add_argument("--sanitized", action="store_true")
    known, rest = parser.parse_known_args()
    CIMOMD = known.cimomd
    SANITIZED = known.sanitized
    unittest.main(argv=[sys.argv[0], *rest])
