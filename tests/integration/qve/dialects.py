"""The four schema dialects as the product's installer runs them."""

import re


class Dialect:
    def __init__(self, name, mif, queries, computer_table, keys):
        self.name = name
        self.mif = mif
        self.queries = queries
        self.computer_table = computer_table
        self.keys = keys

    def tables(self):
        """The product's own tables that a schema script counts on."""
        return ("create table %s (%s varchar(64), QVE_OBJECT_ID varchar(32),"
                " QVE_OBJECT_LABEL varchar(64));\n"
                "create table QUERY_VIEWS (VIEW_NAME varchar(64));\n"
                "insert into %s values ('%s', '1', '%s');\n"
                % (self.computer_table, self.keys[0], self.computer_table, SYSTEM, LABEL))

    def statements(self, text):
        """The script as an engine of the family takes it."""
        return text


class TransactSql(Dialect):
    """Batches end at a line that reads "go"."""

    def statements(self, text):
        return re.sub(r"(?m)^go\r$", ";", text)


class Oracle(Dialect):
    """MariaDB's Oracle mode knows all of it but the word after cascade."""

    def statements(self, text):
        return "set sql_mode = ORACLE;\n" + text.replace(" cascade constraints ;", " cascade ;")


SYSTEM = "system-1"
LABEL = "first machine"
KEYS = ("HARDWARE_SYSTEM_ID", "CONFIG_CHANGE_TYPE", "CONFIG_CHANGE_TIME")
LUMO_KEYS = ("HWARE_SYS_ID", "CFG_CHG_TYPE", "CFG_CHG_TIME")
KEY_LENGTHS = (64, 12, 32)

LUMO = Dialect("lumo", "kwinvlumo.mif", "queries_lumo.sh", "COMPUTER_SYS", LUMO_KEYS)
SYBASE = TransactSql("sybase", "kwvinv.mif", "queries.sh", "COMPUTER_SYSTEM", KEYS)
MS = TransactSql("ms", "kwvinv.mif", "queries.sh", "COMPUTER_SYSTEM", KEYS)
ORACLE = Oracle("oracle", "kwvinv.mif", "queries.sh", "COMPUTER_SYSTEM", KEYS)
