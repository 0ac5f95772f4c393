"""cimomd as a child process, and the octets that go to it and come from it."""

import os
import pathlib
import re
import signal
import subprocess
import time

# Programs are slower under valgrind.
SLOWNESS = int(os.environ.get("SENNET_TEST_SLOWNESS", "1"))
PATIENCE_S = 10 * SLOWNESS
NAMESPACE = "root/cimv2"


def waited(condition):
    end = time.monotonic() + PATIENCE_S
    while time.monotonic() < end:
        if condition():
            return True
        time.sleep(0.02)
    return False


class Server:
    """cimomd as a child; its standard error goes to a file that tests read."""

    def __init__(self, place, *command, **options):
        self.log_path = place / "log"
        self.log_file = open(self.log_path, "ab")
        self.process = subprocess.Popen(command, stdout=subprocess.PIPE, stderr=self.log_file,
                                        **options)

    def log(self):
        return self.log_path.read_text()

    def port(self):
        line = self.process.stdout.readline().decode()
        return int(re.fullmatch(r"listening on http://127\.0\.0\.1:(\d+)\n", line).group(1))

    def descriptors(self):
        return len(os.listdir(f"/proc/{self.process.pid}/fd"))

    def resident_kib(self):
        status = pathlib.Path(f"/proc/{self.process.pid}/status").read_text()
        return int(re.search(r"VmRSS:\s+(\d+) kB", status).group(1))

    def end(self):
        self.process.send_signal(signal.SIGTERM)
        status = self.process.wait(PATIENCE_S)
        self.process.stdout.close()
        self.log_file.close()
        return status


def call(method, parameters="", namespace=NAMESPACE):
    parts = "".join(f'<NAMESPACE NAME="{part}"/>' for part in namespace.split("/"))
    return ('<?xml version="1.0" encoding="utf-8"?><CIM CIMVERSION="2.0" DTDVERSION="2.0">'
            '<MESSAGE ID="1" PROTOCOLVERSION="1.0"><SIMPLEREQ>'
            f'<IMETHODCALL NAME="{method}"><LOCALNAMESPACEPATH>{parts}</LOCALNAMESPACEPATH>'
            f'{parameters}</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>').encode()


def class_name(name):
    return f'<IPARAMVALUE NAME="ClassName"><CLASSNAME NAME="{name}"/></IPARAMVALUE>'


def post(body, headers=b"", host=b"localhost"):
    return (b"POST /cimom HTTP/1.1\r\nHost: " + host + b"\r\nContent-Type: application/xml\r\n"
            b"CIMOperation: MethodCall\r\nConnection: close\r\n" + headers +
            b"Content-Length: %d\r\n\r\n" % len(body) + body)


def exchange(connection, request, patience_s=PATIENCE_S):
    """What comes back until the server closes the connection."""
    connection.settimeout(patience_s)
    connection.sendall(request)
    answer = bytearray()
    while piece := connection.recv(65536):
        answer += piece
    return bytes(answer)


def body_of(answer):
    """The content of a chunked answer."""
    start = answer.index(b"\r\n\r\n") + 4
    body = bytearray()
    while True:
        end = answer.index(b"\r\n", start)
        size = int(answer[start:end], 16)
        if size == 0:
            return bytes(body)
        body += answer[end + 2:end + 2 + size]
        start = end + 2 + size + 2
