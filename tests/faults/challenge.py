"""A CIM server of this user that answers each request with one challenge for local authentication
and keeps what it is sent."""

import socket
import threading


class ChallengingServer:
    """To be used in a with statement."""

    def __init__(self, path, challenged):
        """`challenged` is the file that the challenge names."""
        self.heard = b""
        self._answer = (b"HTTP/1.1 401 Unauthorized\r\nWWW-Authenticate: Local \"" +
                        challenged.encode() + b"\"\r\nContent-Length: 0\r\n\r\n")
        self._listener = socket.socket(socket.AF_UNIX)
        self._listener.bind(str(path))
        path.chmod(0o777)
        self._listener.listen()
        self._thread = threading.Thread(target=self._serve)

    def __enter__(self):
        self._thread.start()
        return self

    def __exit__(self, *_):
        self._listener.shutdown(socket.SHUT_RDWR)
        self._thread.join()
        self._listener.close()

    def requests(self):
        return self.heard.count(b"POST /cimom HTTP/1.1\r\n")

    def _serve(self):
        while True:
            try:
                connection, _ = self._listener.accept()
            except OSError:
                return
            with connection:
                while self._refuse_one(connection):
                    pass

    def _refuse_one(self, connection):
        end = b"</CIM>"
        begin = len(self.heard)
        while end not in self.heard[begin:]:
            piece = connection.recv(65536)
            if not piece:
                return False
            self.heard += piece
        connection.sendall(self._answer)
        return True
