"""Many clients of cimomd at once: most ask as they should, the others do what they can to disturb
them."""

import collections
import multiprocessing
import random
import re
import socket
import threading
import time

from cimomd_server import post

PATIENCE_S = 60
PROCESSES = 8
# How long an unhurried client takes for a request that it never ends.
_DRIP_S = 0.02
_STATUS_LINE = re.compile(rb"^HTTP/1\.1 (\d{3}) ", re.MULTILINE)


class WrongAnswer(Exception):
    pass


def is_refusal(answer):
    """Whether it begins with a head, and every head says that the request was wrong."""
    statuses = _STATUS_LINE.findall(answer)
    return answer.startswith(b"HTTP/1.1 ") and bool(statuses) and min(statuses) >= b"400"


class Answers:
    """Requests, and what may come back: a set of bodies, or nothing for any body that is XML."""

    def __init__(self):
        self.allowed = {}

    def add(self, body, *allowed):
        self.allowed[body] = frozenset(allowed)

    def requests(self):
        return list(self.allowed)


class Stream:
    """Reads answers from a connection."""

    def __init__(self, connection):
        self._connection = connection
        self._octets = bytearray()

    def _more(self):
        piece = self._connection.recv(65536)
        if not piece:
            raise WrongAnswer(f"the connection ends after {bytes(self._octets[-200:])!r}")
        self._octets += piece

    def _until(self, mark):
        while (end := self._octets.find(mark)) < 0:
            self._more()
        taken = bytes(self._octets[:end])
        del self._octets[:end + len(mark)]
        return taken

    def _exactly(self, count):
        while len(self._octets) < count:
            self._more()
        taken = bytes(self._octets[:count])
        del self._octets[:count]
        return taken

    def answer(self):
        """The body of a good answer."""
        head = self._until(b"\r\n\r\n").lower()
        if not head.startswith(b"http/1.1 200 ") or b"transfer-encoding: chunked" not in head:
            raise WrongAnswer(f"head {head!r}")
        body = bytearray()
        while size := int(self._until(b"\r\n"), 16):
            body += self._exactly(size)
            self._exactly(2)
        while self._until(b"\r\n"):
            pass
        return bytes(body)


class Client:
    """One of the many; `counts` tells how often it did what."""

    def __init__(self, places, answers, seed):
        self.places = places
        self.answers = answers
        self.random = random.Random(seed)
        self.counts = collections.Counter()
        # Good requests most of the time.
        self.acts = [self.ask, self.ask, self.ask_several, self.drop_request, self.drop_answer,
                     self.send_damaged, self.send_garbage, self.send_oversized, self.drip]

    def run(self, end_s):
        while time.monotonic() < end_s:
            self.random.choice(self.acts)()

    def connected(self):
        place = self.random.choice(self.places)
        connection = socket.socket(socket.AF_UNIX if isinstance(place, str) else socket.AF_INET)
        connection.settimeout(PATIENCE_S)
        connection.connect(place)
        return connection

    def request(self):
        return self.random.choice(self.answers.requests())

    def check(self, request, body):
        allowed = self.answers.allowed[request]
        if allowed and body not in allowed:
            raise WrongAnswer(f"to {request.decode()}: {body[:2000].decode(errors='replace')}")
        if not body.endswith(b"</CIM>") and not body.endswith(b"</CIM>\n"):
            raise WrongAnswer(f"to {request.decode()}: ends with {body[-200:]!r}")
        self.counts["right"] += 1

    def ask(self):
        request = self.request()
        with self.connected() as connection:
            connection.sendall(post(request))
            self.check(request, Stream(connection).answer())

    def ask_several(self):
        with self.connected() as connection:
            stream = Stream(connection)
            for _ in range(self.random.randrange(2, 6)):
                request = self.request()
                connection.sendall(post(request).replace(b"Connection: close\r\n", b""))
                self.check(request, stream.answer())

    def drop_request(self):
        octets = post(self.request())
        with self.connected() as connection:
            connection.sendall(octets[:self.random.randrange(len(octets))])
            self.let_go(connection)
        self.counts["dropped"] += 1

    def drop_answer(self):
        with self.connected() as connection:
            connection.sendall(post(self.request()))
            for _ in range(self.random.randrange(3)):
                connection.recv(self.random.choice((1, 100, 5000)))
            self.let_go(connection)
        self.counts["dropped"] += 1

    def let_go(self, connection):
        """By a reset every other time, where the connection knows such."""
        if self.random.random() < 0.5:
            connection.setsockopt(socket.SOL_SOCKET, socket.SO_LINGER, b"\1\0\0\0\0\0\0\0")

    def send_damaged(self):
        octets = bytearray(post(self.request()))
        for _ in range(self.random.randrange(1, 5)):
            place = self.random.randrange(len(octets))
            act = self.random.randrange(3)
            if act == 0:
                octets[place] = self.random.randrange(256)
            elif act == 1:
                del octets[place:place + self.random.randrange(1, 30)]
            else:
                octets[place:place] = self.random.choice(
                    (b"<", b"&", b"\0", b"\xff", b"]]>", b"<!DOCTYPE a>", b"\r\n\r\n", b"<x>" * 50))
        self.send_and_leave(bytes(octets), "malformed")

    def send_garbage(self):
        self.send_refused(self.random.choice((
            self.random.randbytes(self.random.randrange(1, 3000)),
            b"GET / HTTP/1.1\r\n\r\n",
            b"\r\n" * 3000,
            post(b"<CIM" + b" a='1'" * 5000 + b">"),
            post(b"<CIM>" + b"<VALUE>" * 20000),
            post(b"<!DOCTYPE CIM [<!ENTITY a 'aaaa'>]><CIM>&a;</CIM>"),
            post(b"x").replace(b"Content-Length: 1", b"Content-Length: -1"),
            post(b"x").replace(b"Content-Length: 1", b"Content-Length: 99999999999999999999"),
            post(b"").replace(b"Content-Length: 0", b"Transfer-Encoding: chunked") + b"ffffffffff\r\n",
            post(b"").replace(b"Content-Length: 0", b"Transfer-Encoding: chunked") + b"zz\r\n\r\n",
        )), "malformed")

    def send_oversized(self):
        self.send_refused(self.random.choice((
            post(b"<CIM>" + b" " * (2 << 20)),
            post(b"x", b"X-Long: " + b"y" * 200000 + b"\r\n"),
            post(b"x", b"X-One-Of-Many: y\r\n" * 20000),
            b"POST /" + b"a" * 200000 + b" HTTP/1.1\r\n\r\n",
        )), "oversized")

    def send_and_leave(self, octets, kind):
        """Whatever the server says to it, that must have an end; it may come before the server has
        read all. Returns what arrived."""
        answer = bytearray()
        with self.connected() as connection:
            try:
                connection.sendall(octets)
                connection.shutdown(socket.SHUT_WR)
                while piece := connection.recv(65536):
                    answer += piece
            except TimeoutError as error:
                raise WrongAnswer(f"no end after {octets[:200]!r}") from error
            except OSError:
                # A reset: the server has closed with octets left unread.
                pass
        self.counts[kind] += 1
        return bytes(answer)

    def send_refused(self, octets, kind):
        """What cannot be right: the server must refuse it, or close without a word."""
        answer = self.send_and_leave(octets, kind)
        if answer and not is_refusal(answer):
            raise WrongAnswer(f"to {octets[:200]!r}: {answer[:200]!r}")

    def drip(self):
        octets = post(self.request())
        with self.connected() as connection:
            try:
                for place in range(self.random.randrange(1, 40)):
                    connection.sendall(octets[place:place + 1])
                    time.sleep(_DRIP_S)
            except ConnectionError:
                pass
        self.counts["slow"] += 1


def _run_some(clients, end_s, results):
    failures = []

    def run(client):
        try:
            client.run(end_s)
        except Exception as error:  # pylint: disable=broad-except; told by the parent
            failures.append(f"{type(error).__name__}: {error}")

    threads = [threading.Thread(target=run, args=(client,)) for client in clients]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    results.put((sum((client.counts for client in clients), collections.Counter()), failures))


class Storm:
    """Starts the clients, which go on for so many seconds."""

    def __init__(self, places, answers, count, seconds, seed):
        context = multiprocessing.get_context("fork")
        self._results = context.Queue()
        self.end_s = time.monotonic() + seconds
        clients = [Client(places, answers, f"{seed}-{i}") for i in range(count)]
        self._processes = [
            context.Process(target=_run_some, args=(clients[i::PROCESSES], self.end_s,
                                                    self._results), daemon=True)
            for i in range(PROCESSES)]
        for process in self._processes:
            process.start()

    def is_under_way(self):
        return time.monotonic() < self.end_s

    def wait(self):
        """How often the clients did what, and what was wrong."""
        counts, failures = collections.Counter(), []
        for _ in self._processes:
            some_counts, some_failures = self._results.get(timeout=3 * PATIENCE_S)
            counts += some_counts
            failures += some_failures
        for process in self._processes:
            process.join()
        return counts, failures
