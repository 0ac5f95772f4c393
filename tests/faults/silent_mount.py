"""A mounted file system whose program does not answer, like a disk of a server that has died. It
speaks the protocol of /dev/fuse just far enough to be mounted."""

import os
import pathlib
import select
import struct
import threading

import neighbours

_NODEV_NOSUID = 0x4 | 0x2
_CONTROL = pathlib.Path("/sys/fs/fuse/connections")
_REQUEST_BYTES = 1 << 20
_INIT = 26
_IN_HEADER = struct.Struct("=IIQ")
# struct fuse_out_header, then struct fuse_init_out of the protocol's version 7.
_INIT_ANSWER = struct.Struct("=IiQ" "IIII" "HHII" "HHI" "7I")


class SilentMount:
    """To be used in a with statement, in mounts of one's own."""

    def __init__(self, place, kind, takes_requests, owner=None):
        """`kind` is what the table of mounts says. When requests are taken and not answered, who
        asks cannot even be killed. An owner keeps it for himself, as is usual for FUSE; without one
        everybody may ask."""
        self.path = pathlib.Path(place)
        self.kind = kind
        self._takes_requests = takes_requests
        self._users = (f"user_id={owner or 0},group_id={owner or 0}" +
                       (",allow_other" if owner is None else ""))
        self._device = os.open("/dev/fuse", os.O_RDWR | os.O_CLOEXEC)
        self._stop, self._stopping = os.pipe()
        self._thread = threading.Thread(target=self._take)

    def __enter__(self):
        self.path.mkdir()
        try:
            neighbours.mount("user@server.example:/srv", self.path, self.kind, _NODEV_NOSUID,
                             f"fd={self._device},rootmode=40000,{self._users}")
        except OSError:
            self._close()
            raise
        self._thread.start()
        return self

    def __exit__(self, *_):
        self.abort()
        os.write(self._stopping, b"x")
        self._thread.join()
        neighbours.unmount(self.path)
        self._close()

    def _close(self):
        for descriptor in (self._device, self._stop, self._stopping):
            os.close(descriptor)

    def abort(self):
        """Ends the waiting of all who asked."""
        if not any(_CONTROL.iterdir()):
            neighbours.mount("fusectl", _CONTROL, "fusectl")
        [device] = [line.split()[2] for line in
                    pathlib.Path("/proc/self/mountinfo").read_text().splitlines()
                    if line.split()[4] == str(self.path)]
        (_CONTROL / device.split(":")[1] / "abort").write_text("1")

    def _take(self):
        while True:
            ready, _, _ = select.select([self._device, self._stop], [], [])
            if self._stop in ready:
                return
            try:
                request = os.read(self._device, _REQUEST_BYTES)
            except OSError:
                return
            _, operation, unique = _IN_HEADER.unpack_from(request)
            if operation == _INIT:
                major, minor = struct.unpack_from("=II", request, 40)
                os.write(self._device, _INIT_ANSWER.pack(
                    _INIT_ANSWER.size, 0, unique, major, min(minor, 31), 4096, 0, 12, 9, 4096, 1,
                    0, 0, 0, *[0] * 7))
                if not self._takes_requests:
                    os.read(self._stop, 1)
                    return
