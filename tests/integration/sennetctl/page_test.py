"""The page that `sennetctl mif html` writes, as a browser shows it."""

import argparse
import pathlib
import re
import subprocess
import sys
import tempfile
import unittest

import chromium

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE.parent / "inventory"))
import installation

ARGUMENTS = None
EVIL = """\\"'><script>document.title='owned'</script><img src=x onerror=\\"document.title='owned'\\">"""
HOSTILE = f"""Start Component Name = "</title>{EVIL}"
Start Group Name = "javascript:alert(1)" Class = "{EVIL}" Id = 1 Key = 1
Description = "</script>{EVIL}"
Start Attribute Name = "{EVIL}" Id = 1 Type = String(999) Value = "</table>{EVIL}" End Attribute
End Group
End Component
"""


def fan_file():
    """Five fans; the third has no speed."""
    fans = [("fan10", "900"), ("fan9", "1200"), ("fan1", ""), ("Fan2", "-5"), ("fan2", "80")]
    rows = "\n".join(f'{{ {number}, "{name}", {speed} }}'
                     for number, (name, speed) in enumerate(fans, 1))
    return f"""Start Component Name = "Machine"
Start Group Name = "Fan" Class = "Own|Fan|001" Key = 1
Start Attribute Name = "Index" Id = 1 Type = Integer Value = 1 End Attribute
Start Attribute Name = "Device" Id = 2 Type = String(8) Value = "" End Attribute
Start Attribute Name = "Speed" Id = 3 Type = String(8) Value = "" End Attribute
End Group
Start Table Name = "Fan" Class = "Own|Fan|001" Id = 2
{rows}
End Table
Start Group Name = "System" Class = "Own|System|001" Id = 1
Start Attribute Name = "Model" Id = 1 Type = String(8) Value = "Tower" End Attribute
Start Attribute Name = "Vendor" Id = 2 Type = String(8) Value = "Own" End Attribute
End Group
End Component
"""


class PageTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        if chromium.program() is None:
            raise unittest.SkipTest("chromium is not installed")
        cls.place = pathlib.Path(cls.enterClassContext(
            tempfile.TemporaryDirectory(prefix="sennet-page-")))
        cls.fans = cls.page("fans", cls.file("fans.mif", fan_file()))
        cls.fleet = cls.page("fleet", cls.file("anna/fans.mif", fan_file()),
                             cls.file("bert/fans.mif", fan_file().replace("Tower", "Rack")),
                             cls.place / "bert/none.mif", status=2)
        cls.hostile = cls.page("hostile", cls.file("hostile.mif", HOSTILE))
        cls.laptop = cls.page("laptop", *cls.inventory())
        cls.browser = cls.enterClassContext(chromium.Chromium())

    @classmethod
    def file(cls, name, text):
        (cls.place / name).parent.mkdir(exist_ok=True)
        (cls.place / name).write_text(text)
        return cls.place / name

    @classmethod
    def page(cls, name, *files, status=0):
        run = subprocess.run(
            [ARGUMENTS.programs / "sennetctl", "mif", "html", "-o", cls.place / name, *files],
            timeout=60, capture_output=True, text=True)
        if run.returncode != status:
            raise AssertionError(f"status {run.returncode}: {run.stderr}")
        return cls.place / name / "inventory.html"

    @classmethod
    def inventory(cls):
        programs = installation.programs_of(ARGUMENTS)
        (cls.place / "mof.d").mkdir()
        root = ARGUMENTS.machines.resolve() / "laptop"
        with installation.Cimomd(programs, cls.place, root, cls.place / "mof.d") as server:
            return installation.Run(programs, "SMS", cls.place, server.socket).files()

    def setUp(self):
        self.browser.command("Emulation.clearDeviceMetricsOverride")
        self.browser.command("Emulation.setEmulatedMedia", features=[])

    def open(self, page):
        self.browser.open(page.as_uri())

    def column(self, number):
        """What is seen of a column of the first table."""
        return self.browser.value(f"""[...document.querySelector("table").tBodies[0].rows]
            .filter((row) => !row.hidden).map((row) => row.cells[{number}].textContent)""")

    def seen(self, selector):
        return self.browser.value(f"""[...document.querySelectorAll({selector!r})]
            .filter((element) => element.checkVisibility()).map((element) => element.innerText)""")

    def search(self, text):
        self.browser.value("document.getElementById('search').select()")
        self.browser.value("document.getElementById('search').focus()")
        self.browser.type(text)

    def sort(self, number):
        """With the keyboard; tells what the header says afterwards."""
        self.browser.value(f"document.querySelectorAll('th button')[{number}].focus()")
        self.browser.press("Enter", "\r")
        return self.browser.value(
            f"document.querySelectorAll('thead th')[{number}].getAttribute('aria-sort')")

    def assert_nothing_went_wrong(self, page):
        self.assertEqual(self.browser.happened("Runtime.exceptionThrown", "Log.entryAdded",
                                               "Runtime.consoleAPICalled"), [])
        requests = self.browser.happened("Network.requestWillBeSent")
        self.assertEqual({request["request"]["url"] for request in requests}, {page.as_uri()})

    def test_a_page_loads_nothing_else_and_has_no_errors(self):
        for page in (self.fans, self.laptop):
            self.open(page)
            self.assertTrue(self.seen("table"))
            self.assert_nothing_went_wrong(page)

    def test_sorting_by_a_column_of_names(self):
        self.open(self.fans)
        self.assertEqual(self.sort(0), "ascending")
        self.assertEqual(self.column(0), ["fan1", "Fan2", "fan2", "fan9", "fan10"])
        self.assertEqual(self.sort(0), "descending")
        self.assertEqual(self.column(0), ["fan10", "fan9", "Fan2", "fan2", "fan1"])
        self.assertEqual(self.sort(0), "none")
        self.assertEqual(self.column(0), ["fan10", "fan9", "fan1", "Fan2", "fan2"])

    def test_sorting_by_a_column_of_numbers(self):
        self.open(self.fans)
        self.assertEqual(self.sort(1), "ascending")
        self.assertEqual(self.column(1), ["-5", "80", "900", "1200", ""])
        self.assertEqual(self.sort(1), "descending")
        self.assertEqual(self.column(1), ["1200", "900", "80", "-5", ""])
        self.assertEqual(self.sort(0), "ascending")
        self.assertEqual(self.browser.value("document.querySelectorAll('[aria-sort=none]').length"),
                         1)

    def test_searching(self):
        self.open(self.fans)
        self.assertEqual(self.seen("#found"), [""])
        self.search("FAN2 80")
        self.assertEqual(self.column(0), ["fan2"])
        self.assertEqual(self.seen("section.table h3"), ["Fan"])
        self.assertEqual(self.seen("nav ul ul a"), ["Fan 5"])
        self.assertEqual(self.seen("#found"), ["1 row in 1 table"])
        self.search("tower")
        self.assertEqual(self.seen("section.table h3"), ["System"])
        self.assertEqual(self.seen("th[scope=row]"), ["Model", "Vendor"])
        self.search("fan")
        self.assertEqual(self.seen("#found"), ["5 rows in 1 table"])
        self.search("none such")
        self.assertEqual(self.seen("section"), [])
        self.assertEqual(self.seen("nav a"), [])
        self.assertEqual(self.seen("#found"), ["Nothing found"])
        self.browser.value("document.getElementById('search').select()")
        self.browser.press("Backspace")
        self.browser.command("Input.dispatchKeyEvent", type="keyDown", key="Delete",
                             windowsVirtualKeyCode=46)
        self.assertEqual(self.seen("main h2, main h3"), ["fans.mif", "Fan", "System"])
        self.assertEqual(len(self.seen("nav a")), 3)
        self.assert_nothing_went_wrong(self.fans)

    def test_searching_the_files_of_several_machines(self):
        self.open(self.fleet)
        anna, bert = (str(self.place / machine) for machine in ("anna", "bert"))
        self.assertEqual(self.seen("main h2"), ["Not shown", anna, bert])
        self.search("rack")
        self.assertEqual(self.seen("main h2"), ["Not shown", bert])
        self.assertEqual(self.seen("section.table h4"), ["System"])
        self.assertEqual(self.seen("nav a"), [bert, "fans.mif 2 tables", "System 1"])
        self.assertEqual(self.seen("#found"), ["1 row in 1 table"])
        self.assert_nothing_went_wrong(self.fleet)

    def test_without_script_everything_is_there_to_be_read(self):
        self.browser.command("Emulation.setScriptExecutionDisabled", value=True)
        try:
            self.open(self.fans)
            snapshot = self.browser.command("DOMSnapshot.captureSnapshot", computedStyles=[])
        finally:
            self.browser.command("Emulation.setScriptExecutionDisabled", value=False)
        strings = snapshot["strings"]
        texts = [strings[i] for i in snapshot["documents"][0]["layout"]["text"] if i >= 0]
        for text in ("Fan", "Device", "fan10", "1200", "System", "Tower"):
            self.assertIn(text, texts)
        self.assertNotIn("Search all tables", texts)

    def test_texts_of_a_file_stay_texts(self):
        self.open(self.hostile)
        self.assertEqual(self.browser.value("document.title"), "Inventory")
        self.assertEqual(self.browser.value("document.scripts.length"), 1)
        self.assertEqual(self.browser.value("document.images.length"), 0)
        self.assertEqual(self.seen("h2"), ["javascript:alert(1)"])
        evil = EVIL.replace("\\", "")
        self.assertEqual(self.seen("td"), ["</table>" + evil])
        self.assertEqual(self.seen("th"), [evil])
        links = self.browser.value("[...document.links].map((link) => link.getAttribute('href'))")
        self.assertEqual([link for link in links if not link.startswith("#")], [])
        self.assert_nothing_went_wrong(self.hostile)

    # Were there a hole in the escaping, the policy of the page would still stand.
    def test_the_policy_stops_foreign_script_and_style(self):
        text = self.fans.read_text()
        broken = self.place / "broken.html"
        broken.write_text(text.replace(
            "<main", "<script>document.title = 'owned'</script><style>h1{color:red}</style>"
            "<img src=x onerror=\"document.title = 'owned'\"><main"))
        self.open(broken)
        self.assertEqual(self.browser.value("document.title"), "Inventory")
        told = [entry["entry"]["text"] for entry in self.browser.happened("Log.entryAdded")]
        for policy in ("script-src", "style-src", "img-src"):
            self.assertTrue(any(policy in line for line in told), (policy, told))

    def test_no_page_is_wider_than_a_phone(self):
        self.browser.command("Emulation.setDeviceMetricsOverride", width=360, height=740,
                             deviceScaleFactor=2, mobile=True)
        for page in (self.fans, self.fleet, self.hostile, self.laptop):
            self.open(page)
            self.assertEqual(self.browser.value("document.documentElement.scrollWidth"), 360)

    def test_nothing_bars_anybody(self):
        if not ARGUMENTS.axe.exists():
            self.skipTest(f"axe-core is not at {ARGUMENTS.axe}")
        for page in (self.fans, self.fleet, self.hostile, self.laptop):
            for scheme in ("light", "dark"):
                self.browser.command("Emulation.setEmulatedMedia", features=[
                    {"name": "prefers-color-scheme", "value": scheme}])
                self.open(page)
                self.browser.value(ARGUMENTS.axe.read_text() + "; 0")
                found = self.browser.value("""axe.run().then((result) => result.violations.map(
                    (rule) => rule.id + ": " + rule.nodes[0].html))""")
                self.assertEqual(found, [], (page, scheme))


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    installation.add_arguments(parser)
    parser.add_argument("--axe", type=pathlib.Path, required=True)
    ARGUMENTS, rest = parser.parse_known_args()
    ARGUMENTS.programs = ARGUMENTS.programs.resolve()
    unittest.main(argv=[sys.argv[0], *rest])
