"""A headless Chromium, driven with the DevTools protocol over a pair of pipes."""

import json
import os
import select
import shutil
import subprocess
import tempfile
import time

PATIENCE_S = 120


def program():
    """The path of the program; None where it is not installed."""
    return shutil.which("chromium")


class Chromium:
    """One window; to be used in a with statement."""

    def __init__(self):
        self.profile = tempfile.TemporaryDirectory(prefix="sennet-chromium-",
                                                   ignore_cleanup_errors=True)
        commands, self.to_browser = os.pipe()
        self.from_browser, answers = os.pipe()
        # The program reads its commands from 3 and writes to 4. Its sandbox does not run as root.
        self.process = subprocess.Popen(
            ["bash", "-c", f'exec "$@" 3<&{commands} 4>&{answers}', "bash", program(),
             "--headless", "--no-sandbox", "--disable-gpu", "--disable-dev-shm-usage",
             "--no-first-run", "--disable-background-networking", "--remote-debugging-pipe",
             f"--user-data-dir={self.profile.name}", "about:blank"],
            pass_fds=(commands, answers), stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
            stderr=subprocess.DEVNULL,
            env={**os.environ, "HOME": self.profile.name, "TMPDIR": self.profile.name})
        os.close(commands)
        os.close(answers)
        self.bytes = b""
        self.last_id = 0
        self.session = None
        self.events = []

    def __enter__(self):
        try:
            target = self.command("Target.createTarget", url="about:blank")["targetId"]
            self.session = self.command("Target.attachToTarget", targetId=target,
                                        flatten=True)["sessionId"]
            for domain in ("Page", "Runtime", "Log", "Network"):
                self.command(domain + ".enable")
        except BaseException:
            self.end()
            raise
        return self

    def __exit__(self, *_):
        self.end()

    def end(self):
        self.process.kill()
        self.process.wait()
        os.close(self.to_browser)
        os.close(self.from_browser)
        self.profile.cleanup()

    def command(self, method, **parameters):
        """The result of a command. Raises RuntimeError when the browser refuses it."""
        self.last_id += 1
        message = {"id": self.last_id, "method": method, "params": parameters}
        if self.session:
            message["sessionId"] = self.session
        data = json.dumps(message).encode() + b"\0"
        while data:
            data = data[os.write(self.to_browser, data):]
        while True:
            answer = self.next_message()
            if answer.get("id") == self.last_id:
                break
            self.events.append(answer)
        if "error" in answer:
            raise RuntimeError(f"{method}: {answer['error']['message']}")
        return answer["result"]

    def next_message(self):
        deadline = time.monotonic() + PATIENCE_S
        while b"\0" not in self.bytes:
            ready, _, _ = select.select([self.from_browser], [], [],
                                        max(0, deadline - time.monotonic()))
            piece = os.read(self.from_browser, 1 << 16) if ready else b""
            if not piece:
                raise RuntimeError("the browser hangs" if not ready else "the browser ended")
            self.bytes += piece
        message, _, self.bytes = self.bytes.partition(b"\0")
        return json.loads(message)

    def open(self, url):
        """Loads a page, and forgets what happened before."""
        self.events.clear()
        self.command("Page.navigate", url=url)
        while not any(event.get("method") == "Page.loadEventFired" for event in self.events):
            self.events.append(self.next_message())

    def value(self, expression):
        """The value of an expression of JavaScript in the page, awaited if it is a promise."""
        answer = self.command("Runtime.evaluate", expression=expression, returnByValue=True,
                              awaitPromise=True)
        if "exceptionDetails" in answer:
            raise RuntimeError(json.dumps(answer["exceptionDetails"]))
        return answer["result"].get("value")

    def press(self, key, text=""):
        for kind in ("keyDown", "keyUp"):
            self.command("Input.dispatchKeyEvent", type=kind, key=key, text=text,
                         windowsVirtualKeyCode=13 if key == "Enter" else 0)

    def type(self, text):
        self.command("Input.insertText", text=text)

    def happened(self, *methods):
        """What the browser told of these events since the page was opened."""
        self.value("0")  # all that came before is read now
        return [event["params"] for event in self.events if event.get("method") in methods]
