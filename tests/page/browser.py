"""A headless Chromium, driven over its debugging pipe: no port, no module beyond Python's own.

    with Browser() as browser:
        page = browser.open(path, width=360)
        page.run("document.title")
"""

import base64
import itertools
import json
import os
import shutil
import subprocess
import tempfile
from pathlib import Path

FLAGS = ["--headless", "--no-sandbox", "--disable-gpu", "--no-first-run", "--disable-background-networking",
         "--disable-component-update", "--disable-sync", "--disable-dev-shm-usage", "--remote-debugging-pipe"]


class Browser:
    def __init__(self) -> None:
        self.profile = tempfile.mkdtemp(prefix="zel-page-")
        from_browser, to_us = os.pipe()
        from_us, to_browser = os.pipe()

        def connect() -> None:
            # The browser reads commands from descriptor 3 and writes answers to 4.
            command, answer = os.dup(from_us), os.dup(to_us)
            os.dup2(command, 3)
            os.dup2(answer, 4)

        self.process = subprocess.Popen(
            ["chromium", *FLAGS, f"--user-data-dir={self.profile}", "about:blank"],
            stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
            preexec_fn=connect, close_fds=False)
        os.close(from_us)
        os.close(to_us)
        self.commands = os.fdopen(to_browser, "wb")
        self.answers = os.fdopen(from_browser, "rb")
        self.numbers = itertools.count(1)
        self.rest = b""
        self.events: list[dict] = []

    def __enter__(self) -> "Browser":
        return self

    def __exit__(self, *_: object) -> None:
        self.process.kill()
        self.process.wait()
        self.commands.close()
        self.answers.close()
        shutil.rmtree(self.profile, ignore_errors=True)

    def _read(self) -> dict:
        while b"\0" not in self.rest:
            piece = os.read(self.answers.fileno(), 1 << 16)
            if not piece:
                raise RuntimeError("the browser has gone")
            self.rest += piece
        message, self.rest = self.rest.split(b"\0", 1)
        return json.loads(message)

    def call(self, method: str, session: str | None = None, **parameters: object) -> dict:
        number = next(self.numbers)
        command = {"id": number, "method": method, "params": parameters}
        if session:
            command["sessionId"] = session
        self.commands.write(json.dumps(command).encode() + b"\0")
        self.commands.flush()
        while True:
            message = self._read()
            if message.get("id") != number:
                self.events.append(message)
                continue
            if "error" in message:
                raise RuntimeError(f"{method}: {message['error']}")
            return message["result"]

    def wait_for(self, method: str, session: str) -> dict:
        while True:
            for event in self.events:
                if event.get("method") == method and event.get("sessionId") == session:
                    return event
            self.events.append(self._read())

    def open(self, path: Path, width: int, height: int = 800, scheme: str = "light") -> "Page":
        return Page(self, path, width, height, scheme)


class Page:
    """A file in a tab of its own. `requests` are the addresses it asked for, `complaints` what the console says."""

    def __init__(self, browser: Browser, path: Path, width: int, height: int, scheme: str) -> None:
        self.browser = browser
        target = browser.call("Target.createTarget", url="about:blank")["targetId"]
        self.session = browser.call("Target.attachToTarget", targetId=target, flatten=True)["sessionId"]
        for domain in ("Page", "Runtime", "Log", "Network"):
            self.call(f"{domain}.enable")
        self.call("Emulation.setDeviceMetricsOverride", width=width, height=height, deviceScaleFactor=1, mobile=width < 600)
        self.call("Emulation.setEmulatedMedia", features=[{"name": "prefers-color-scheme", "value": scheme}])
        self.call("Page.navigate", url=Path(path).resolve().as_uri())
        browser.wait_for("Page.loadEventFired", self.session)

    def call(self, method: str, **parameters: object) -> dict:
        return self.browser.call(method, self.session, **parameters)

    def run(self, script: str) -> object:
        """The value of an expression in the page."""
        answer = self.call("Runtime.evaluate", expression=script, returnByValue=True)
        if "exceptionDetails" in answer:
            raise RuntimeError(f"{script}: {answer['exceptionDetails']}")
        return answer["result"].get("value")

    def type(self, text: str) -> None:
        self.call("Input.insertText", text=text)

    def press(self, key: str) -> None:
        for kind in ("keyDown", "keyUp"):
            self.call("Input.dispatchKeyEvent", type=kind, key=key, code=key, windowsVirtualKeyCode={"Tab": 9}[key])

    def screenshot(self, path: Path) -> None:
        image = self.call("Page.captureScreenshot", captureBeyondViewport=True)["data"]
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_bytes(base64.b64decode(image))

    def _events(self, method: str) -> list[dict]:
        return [event["params"] for event in self.browser.events
                if event.get("method") == method and event.get("sessionId") == self.session]

    @property
    def requests(self) -> list[str]:
        return [event["request"]["url"] for event in self._events("Network.requestWillBeSent")]

    @property
    def complaints(self) -> list[str]:
        return ([event["entry"]["text"] for event in self._events("Log.entryAdded")]
                + [str(event["args"]) for event in self._events("Runtime.consoleAPICalled")]
                + [str(event["exceptionDetails"]) for event in self._events("Runtime.exceptionThrown")])
