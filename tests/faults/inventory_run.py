"""Runs of the generator for an inventory that its server answers rightly, and the files of an
earlier run in their way: each must be the old or the new one, whole."""

import contextlib
import itertools
import pathlib

import rows
import wire
from generator import Generator
from hostile_server import HostileServer

# Which rules of `sennetctl mif check` a product's files keep.
PROFILES = {"SMS": "sms", "CA": "ca", "LD": "landesk", "QVE": "dmi"}
# What script a and script b may miss: the instances of classes, or all, for their classes cannot be
# asked for.
ABANDONED = ("all",)
LOSSES = ((), ("CIM_Disk",), ("CIM_Fan",), ("CIM_Disk", "CIM_Fan"), ABANDONED), \
         ((), ("CIM_Fan",), ABANDONED)


def earlier(path):
    """The octets of an earlier run's file."""
    return f"the earlier {path}\r\n".encode()


def expect_readable(generator, product):
    """The strict reader takes the MIF files of a run."""
    files = sorted(generator.mif.glob("*.mif"))
    largest = ["--max-kb", "5120"] if product == "SMS" else []
    checked = rows.run([generator.binaries / "sennetctl", "mif", "check", "--profile",
                        PROFILES[product], *largest, *files])
    # A product may leave out what the standard wants; that is a warning.
    rows.expect(files and ": 0 errors" in checked.out, f"/{product}: {checked}")


class InventoryRun:
    """To be used in a with statement. `instances` of each of two classes make the files as long as a
    case needs them; `value` is in each of them."""

    def __init__(self, trial, instances=3, value="new", outputs=None):
        self.trial = trial
        self.instances = instances
        self.value = value
        self._outputs = outputs
        self._new = {}
        self._without = {}
        self._losses = ((), ())
        # How often the last class of a script was asked for.
        self._last_classes = 0
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
        loss = self._loss_of(request)
        if request.method == "GetClass":
            if loss == ABANDONED:
                return False
            size = '<PROPERTY NAME="Size" TYPE="uint64"/>' if name == "CIM_Disk" else ""
            answer = wire.result(request, wire.cim_class(name, size))
        elif name in loss:
            answer = wire.document(request, '<ERROR CODE="1" DESCRIPTION="no"/>')
        else:
            answer = wire.result(request, "".join(
                wire.named(name, wire.string_property("Name", f"{self.value} {number}") +
                           f'<PROPERTY NAME="Size" TYPE="uint64"><VALUE>{number}</VALUE></PROPERTY>')
                for number in range(self.instances)))
        peer.send(wire.in_chunks(answer, 50000))
        return True

    def _loss_of(self, request):
        """Both scripts ask for CIM_Fan, the first one only after CIM_Disk was given to it."""
        of_a, of_b = self._losses
        self._last_classes += (request.method, request.class_name) == ("GetClass", "CIM_Fan")
        return of_b if self._last_classes > (of_a != ABANDONED) else of_a

    def new(self, product):
        """The files of an undisturbed run, by path; MIF files that the strict reader takes."""
        if product not in self._new:
            finished = self._into_empty_directories(product)
            expected = (0, self.generator.banner() + "Processing a...\nProcessing b...\n")
            rows.expect_equal((finished.status, finished.out), expected, "undisturbed run")
            expect_readable(self.generator, product)
            self._new[product] = self.generator.outputs()
        return self._new[product]

    def _into_empty_directories(self, product):
        self._last_classes = 0
        self.generator.empty_outputs()
        return self.generator.run(product)

    def learn_losses(self, product):
        """Makes known what the files are when some of the requests fail."""
        self.new(product)
        self._without[product] = []
        for self._losses in itertools.product(*LOSSES):
            finished = self._into_empty_directories(product)
            rows.expect_equal(finished.status, 0, f"/{product} without {self._losses}: status")
            self._without[product].append(self.generator.outputs())
        self._losses = ((), ())
        rows.expect_equal(self._without[product][0], self._new[product], "files without losses")

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

    def expect_whole_or_less(self, product, what):
        """As expect_whole, for a run of which requests may fail as well: files that miss something
        are what learn_losses has seen."""
        seen = self.generator.outputs()
        for path in {*seen, *self.new_files(product)}:
            allowed = {earlier(path), *(files.get(path) for files in self._without[product])}
            rows.expect(seen.get(path) in allowed, f"/{product}, {what}: {path} is neither the old nor "
                        f"the new one, nor one without instances: {seen.get(path)!r}")
        return sum(octets != earlier(path) for path, octets in seen.items())

    def new_files(self, product):
        return self._new[product]

    def expect_new(self, product, what):
        count = self.expect_whole(product, what)
        rows.expect_equal(count, len(self.new_files(product)), f"/{product}, {what}: new files")
