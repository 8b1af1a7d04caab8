"""A headless browser, driven through its own driver with nothing but the standard library."""

import base64
import json
import re
import subprocess
import tempfile
import time
import urllib.error
import urllib.request

ELEMENT = "element-6066-11e4-a52e-4f735466cecf"
KEYS = {"Enter": "\ue007", "Escape": "\ue00c", "Down": "\ue015", "Up": "\ue013", "End": "\ue010",
        "Home": "\ue011", "Right": "\ue014", "Left": "\ue012", "Control": "\ue009"}


class Browser:
    """One window of Chromium with an empty profile of its own."""

    def __init__(self):
        self.profile = tempfile.TemporaryDirectory()
        self.driver = subprocess.Popen(["chromedriver", "--port=0"], text=True,
                                       stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
        for line in self.driver.stdout:
            started = re.search(r"started successfully on port (\d+)", line)
            if started:
                break
        self.base = f"http://127.0.0.1:{started[1]}/session"
        options = {"args": [
            "--headless", "--no-sandbox", "--disable-gpu", "--no-first-run",
            "--disable-background-networking", "--disable-component-update", "--disable-sync",
            f"--user-data-dir={self.profile.name}", "--window-size=1280,800"]}
        wanted = {"alwaysMatch": {"browserName": "chrome", "goog:chromeOptions": options,
                                  "goog:loggingPrefs": {"browser": "ALL"}}}
        self.base += "/" + self.call("", {"capabilities": wanted})["sessionId"]

    def call(self, path, body=None, method=None):
        data = None if body is None else json.dumps(body).encode()
        request = urllib.request.Request(self.base + path, data, method=method,
                                         headers={"Content-Type": "application/json"})
        try:
            with urllib.request.urlopen(request, timeout=120) as answer:
                return json.load(answer)["value"]
        except urllib.error.HTTPError as failure:
            raise AssertionError(json.load(failure)["value"]["message"]) from None

    def close(self):
        try:
            self.call("", method="DELETE")
        finally:
            self.driver.terminate()
            self.driver.wait()
            self.profile.cleanup()

    def open(self, address):
        self.call("/url", {"url": address})

    def run(self, script, *arguments):
        return self.call("/execute/sync", {"script": script, "args": list(arguments)})

    def wait(self, what, script, *arguments, seconds=60):
        """Waits until `script` returns something true, and returns it."""
        end = time.monotonic() + seconds
        while time.monotonic() < end:
            value = self.run(script, *arguments)
            if value:
                return value
            time.sleep(0.1)
        raise AssertionError(f"waited in vain for {what}")

    def click(self, selector):
        element = self.call("/element", {"using": "css selector", "value": selector})
        self.call(f"/element/{element[ELEMENT]}/click", {})

    def type(self, selector, text):
        element = self.call("/element", {"using": "css selector", "value": selector})
        self.call(f"/element/{element[ELEMENT]}/clear", {})
        self.call(f"/element/{element[ELEMENT]}/value", {"text": text})

    def press(self, *keys):
        """Presses keys one after another, wherever the focus is."""
        actions = []
        for key in keys:
            value = KEYS.get(key, key)
            actions += [{"type": "keyDown", "value": value}, {"type": "keyUp", "value": value}]
        self.call("/actions", {"actions": [{"type": "key", "id": "keys", "actions": actions}]})

    def look(self, scheme, width, height):
        self.devtools("Emulation.setEmulatedMedia",
                      features=[{"name": "prefers-color-scheme", "value": scheme}])
        self.devtools("Emulation.setDeviceMetricsOverride", width=width, height=height,
                      deviceScaleFactor=1, mobile=False)

    def devtools(self, command, **parameters):
        return self.call("/goog/cdp/execute", {"cmd": command, "params": parameters})

    def complaints(self):
        """What the browser wrote on its console: a breach of the content policy stands there."""
        return [each["message"] for each in self.call("/se/log", {"type": "browser"})
                if "favicon.ico" not in each["message"]]

    def screenshot(self, file):
        with open(file, "wb") as out:
            out.write(base64.b64decode(self.call("/screenshot")))
