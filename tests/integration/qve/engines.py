"""Database engines for the length of a test: private, on a Unix socket, without a TCP port."""

import os
import pathlib
import pwd
import shutil
import subprocess
import time

START_SECONDS = 30


class EngineError(Exception):
    """An engine that does not start, or a statement that fails where none may."""


def run(command, **options):
    return subprocess.run(command, capture_output=True, encoding="latin-1", **options)


def wait_until(ready, server, log):
    deadline = time.monotonic() + START_SECONDS
    while time.monotonic() < deadline:
        if server.poll() is not None:
            raise EngineError("the engine ended at once:\n" + log.read_text(errors="replace"))
        if ready():
            return
        time.sleep(0.1)
    raise EngineError("the engine is not ready after %d s" % START_SECONDS)


def stop(server):
    if server is not None and server.poll() is None:
        server.terminate()
        try:
            server.wait(timeout=20)
        except subprocess.TimeoutExpired:
            server.kill()
            server.wait()


class MariaDb:
    """MariaDB; a database per schema dialect. Texts are ISO 8859-1, as MIF files are."""

    name = "MariaDB"

    def __init__(self, directory):
        self.directory = pathlib.Path(directory)
        self.socket = self.directory / "socket"
        self.server = None

    def __enter__(self):
        data = self.directory / "data"
        user = pwd.getpwuid(os.getuid()).pw_name
        installed = run(["mariadb-install-db", "--no-defaults", "--skip-test-db",
                         "--auth-root-authentication-method=normal", "--user=" + user,
                         "--datadir=%s" % data])
        if installed.returncode != 0:
            raise EngineError(installed.stdout + installed.stderr)
        log = self.directory / "log"
        with open(log, "wb") as output:
            self.server = subprocess.Popen(
                [shutil.which("mariadbd") or "/usr/sbin/mariadbd", "--no-defaults",
                 "--datadir=%s" % data, "--socket=%s" % self.socket, "--skip-networking",
                 "--pid-file=%s" % (self.directory / "pid"), "--user=" + user,
                 "--character-set-server=latin1", "--innodb-buffer-pool-size=16M",
                 "--innodb-flush-log-at-trx-commit=0"],
                stdout=output, stderr=output)
        try:
            wait_until(lambda: self.execute("", "select 1").returncode == 0, self.server, log)
        except EngineError:
            stop(self.server)
            raise
        return self

    def __exit__(self, *_):
        stop(self.server)

    def create(self, database):
        self.must("", "create database %s character set latin1" % database)

    def client(self, database):
        """The command that runs the statements it is given."""
        return ["mariadb", "--no-defaults", "--socket=%s" % self.socket, "--user=root", "--batch",
                "--skip-column-names", "--default-character-set=latin1"
                ] + ([database] if database else [])

    def execute(self, database, sql):
        return run(self.client(database) + ["--force"], input=sql)

    def must(self, database, sql):
        result = self.execute(database, sql)
        if result.returncode != 0 or result.stderr:
            raise EngineError("%s\n%s" % (sql, result.stderr))
        return result.stdout

    def errors(self, database, sql):
        """The errors of a script's statements, in order, each without its place."""
        lines = self.execute(database, sql).stderr.splitlines()
        return [line.split(": ", 1)[1].replace("'%s." % database, "'")
                for line in lines if line.startswith("ERROR ")]

    def missing(self, table, view):
        """What the drops of a script meet in a schema that has neither."""
        return ["Unknown table '%s'" % table, "Unknown VIEW: '%s'" % view]

    def repeats(self, column):
        return "Duplicate column name '%s'" % column

    def columns(self, database, table):
        sql = ("select column_name, character_maximum_length from information_schema.columns"
               " where table_schema = '%s' and table_name = '%s' order by ordinal_position")
        rows = self.must(database, sql % (database, table)).splitlines()
        return [(row.split("\t")[0], int(row.split("\t")[1])) for row in rows]

    @staticmethod
    def quoted(identifier):
        return "`%s`" % identifier

    @staticmethod
    def literal(text):
        return "x'%s'" % text.encode("latin-1").hex() if text else "''"

    @staticmethod
    def hexadecimal(column):
        return "hex(%s)" % column


class PostgreSql:
    """PostgreSQL; a database per schema dialect. It refuses to run as root."""

    name = "PostgreSQL"

    def __init__(self, directory):
        self.directory = pathlib.Path(directory)
        self.server = None
        # setpriv, unlike su and runuser, becomes the program: signals reach the engine itself.
        self.account = ["setpriv", "--reuid=postgres", "--regid=postgres", "--init-groups"
                        ] if os.getuid() == 0 else []
        programs = sorted(pathlib.Path("/usr/lib/postgresql").glob("*/bin"))
        self.programs = programs[-1] if programs else pathlib.Path("/usr/bin")

    def __enter__(self):
        if self.account:
            shutil.chown(self.directory, "postgres")
        data = self.directory / "data"
        made = run(self.account + [str(self.programs / "initdb"), "-D", str(data), "-U", "qve",
                                   "-A", "trust", "-E", "LATIN1", "--locale=C", "--no-sync"],
                   cwd=self.directory)
        if made.returncode != 0:
            raise EngineError(made.stdout + made.stderr)
        log = self.directory / "log"
        with open(log, "wb") as output:
            self.server = subprocess.Popen(
                self.account + [str(self.programs / "postgres"), "-D", str(data),
                                "-k", str(self.directory), "-c", "listen_addresses=",
                                "-c", "fsync=off", "-c", "shared_buffers=16MB"],
                stdout=output, stderr=output, cwd=self.directory)
        try:
            wait_until(lambda: self.execute("postgres", "select 1").returncode == 0, self.server,
                       log)
        except EngineError:
            stop(self.server)
            raise
        return self

    def __exit__(self, *_):
        stop(self.server)

    def create(self, database):
        self.must("postgres", "create database %s" % database)

    def client(self, database):
        return [str(self.programs / "psql"), "-X", "-q", "-A", "-t", "-F", "\t", "-U", "qve",
                "-h", str(self.directory), "-d", database]

    def execute(self, database, sql):
        environment = dict(os.environ, PGCLIENTENCODING="LATIN1",
                           PGOPTIONS="-c client_min_messages=error")
        return run(self.client(database), input=sql, env=environment)

    def must(self, database, sql):
        result = self.execute(database, sql)
        if result.returncode != 0 or result.stderr:
            raise EngineError("%s\n%s" % (sql, result.stderr))
        return result.stdout

    def errors(self, database, sql):
        lines = self.execute(database, sql).stderr.splitlines()
        return [line.split("ERROR:  ", 1)[-1] for line in lines if line.startswith("ERROR")]

    def missing(self, table, view):
        return ['table "%s" does not exist' % table.lower(),
                'view "%s" does not exist' % view.lower()]

    def repeats(self, column):
        return 'column "%s" specified more than once' % column.lower()

    def columns(self, database, table):
        sql = ("select column_name, character_maximum_length from information_schema.columns"
               " where table_name = '%s' order by ordinal_position")
        rows = self.must(database, sql % table.lower()).splitlines()
        return [(row.split("\t")[0], int(row.split("\t")[1])) for row in rows]

    @staticmethod
    def quoted(identifier):
        return '"%s"' % identifier.lower()

    @staticmethod
    def literal(text):
        return "convert_from('\\x%s', 'LATIN1')" % text.encode("latin-1").hex()

    @staticmethod
    def hexadecimal(column):
        return "upper(encode(convert_to(%s, 'LATIN1'), 'hex'))" % column
