"""Runs of the generator for an inventory that its server answers rightly, and the files of an
earlier run in their way: each must be the old or the new one, whole."""

import contextlib
import pathlib

import rows
import wire
from generator import Generator
from hostile_server import HostileServer

# Which rules of `sennetctl mif check` a product's files keep.
PROFILES = {"SMS": "sms", "CA": "ca", "LD": "landesk", "QVE": "dmi"}
CLASSES = ("CIM_Disk", "CIM_Fan")


def earlier(path):
    """The octets of an earlier run's file."""
    return f"the earlier {path}\r\n".encode()


class InventoryRun:
    """To be used in a with statement. `instances` of each of two classes make the files as long as a
    case needs them; `value` is in each of them."""

    def __init__(self, trial, instances=3, value="new", outputs=None):
        self.trial = trial
        self.instances = instances
        self.value = value
        self._outputs = outputs
        self._new = {}
        self._stack = contextlib.ExitStack()

    def __enter__(self):
        place = pathlib.Path(self._stack.enter_context(rows.place()))
        self.generator = Generator(self.trial.bin, place, self._outputs)
        self.generator.add_script("a", "[CIM]\nG[0]=CIM_Disk\nA[0]=Name,Size\n"
                                       "G[1]=CIM_Fan\nA[1]=Name\n")
        self.generator.add_script("b", "[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n")
        self._stack.enter_context(HostileServer(self.generator.socket, self._answer))
        return self

    def __exit__(self, *error):
        return self._stack.__exit__(*error)

    def _answer(self, peer, request):
        name = request.class_name
        if request.method == "GetClass":
            size = '<PROPERTY NAME="Size" TYPE="uint64"/>' if name == "CIM_Disk" else ""
            content = wire.cim_class(name, size)
        else:
            content = "".join(
                wire.named(name, wire.string_property("Name", f"{self.value} {number}") +
                           f'<PROPERTY NAME="Size" TYPE="uint64"><VALUE>{number}</VALUE></PROPERTY>')
                for number in range(self.instances))
        peer.send(wire.in_chunks(wire.result(request, content), 50000))
        return True

    def new(self, product):
        """The files of an undisturbed run, by path; MIF files that the strict reader takes."""
        if product not in self._new:
            generator = self.generator
            generator.empty_outputs()
            finished = generator.run(product)
            expected = (0, generator.banner() + "Processing a...\nProcessing b...\n")
            rows.expect_equal((finished.status, finished.out), expected, "undisturbed run")
            self._check(product, sorted(generator.mif.glob("*.mif")))
            self._new[product] = generator.outputs()
        return self._new[product]

    def _check(self, product, files):
        largest = ["--max-kb", "5120"] if product == "SMS" else []
        checked = rows.run([self.generator.binaries / "sennetctl", "mif", "check", "--profile",
                            PROFILES[product], *largest, *files])
        # A product may leave out what the standard wants; that is a warning.
        rows.expect(files and ": 0 errors" in checked.out, f"/{product}: {checked}")

    def leave_earlier_files(self, product):
        self.generator.empty_outputs()
        for path in self.new(product):
            (self.generator.top / path).write_bytes(earlier(path))

    def is_untouched(self, product):
        """Whether no file of the earlier run has been replaced."""
        with contextlib.suppress(FileNotFoundError):
            return all((self.generator.top / path).stat().st_size == len(earlier(path))
                       for path in self.new_files(product))
        return False

    def expect_whole(self, product, what, hidden=False):
        """Each file is the old or the new one. Returns how many are new. `hidden`: the run was
        killed and may have left temporary files."""
        seen = self.generator.outputs()
        new = self.new_files(product)
        if hidden:
            seen = {path: octets for path, octets in seen.items()
                    if not pathlib.Path(path).name.startswith(".velm-")}
        rows.expect_equal(sorted(seen), sorted(new), f"/{product}, {what}: names")
        for path, octets in seen.items():
            rows.expect(octets in (earlier(path), new[path]),
                        f"/{product}, {what}: expected the old or the new {path}, "
                        f"seen {octets[:100]!r}... of {len(octets)} octets")
        return sum(seen[path] == new[path] for path in seen)

    def expect_whole_or_none(self, product, what):
        """As expect_whole, for a run to whose system a request may fail as well: what it takes for a
        class without instances is missing in a MIF file, or the file is."""
        seen = self.generator.outputs()
        new = self.new_files(product)
        others = []
        for path, octets in seen.items():
            rows.expect(path in new, f"/{product}, {what}: unexpected {path}")
            if octets not in (earlier(path), new[path]):
                rows.expect(path.endswith(".mif"),
                            f"/{product}, {what}: neither the old nor the new {path}: {octets!r}")
                others.append(self.generator.top / path)
        if others:
            self._check(product, others)
        return sum(octets != earlier(path) for path, octets in seen.items())

    def new_files(self, product):
        return self._new[product]

    def expect_new(self, product, what):
        count = self.expect_whole(product, what)
        rows.expect_equal(count, len(self.new_files(product)), f"/{product}, {what}: new files")
