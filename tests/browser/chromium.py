"""Drives headless Chromium by the WebDriver protocol, for the scripts that look at pages."""

import contextlib
import json
import os
import signal
import subprocess
import sys
import urllib.error
import urllib.request

OPTIONS = [
    "--headless",
    "--no-sandbox",  # root can't have one
    "--disable-gpu",
    "--disable-dev-shm-usage",
]


class Browser:
    """A session of the WebDriver protocol."""

    def __init__(self, port, size):
        self.base = f"http://127.0.0.1:{port}"
        chromium = {"args": OPTIONS + [f"--window-size={size}"]}
        answer = self.send("POST", "/session", {
            "capabilities": {"alwaysMatch": {"goog:chromeOptions": chromium,
                                             "goog:loggingPrefs": {"performance": "ALL"}}}})
        self.base += "/session/" + answer["sessionId"]

    def send(self, method, path, body=None):
        data = None if body is None else json.dumps(body).encode()
        request = urllib.request.Request(self.base + path, data, method=method,
                                         headers={"Content-Type": "application/json"})
        try:
            with urllib.request.urlopen(request, timeout=60) as answer:
                return json.load(answer)["value"]
        except urllib.error.HTTPError as error:
            sys.exit(f"chromium: {method} {path}: {json.load(error)['value']['message']}")

    def open(self, url):
        # The fragment of the place before must not turn this into a move within the document.
        self.send("POST", "/url", {"url": "about:blank"})
        self.send("POST", "/url", {"url": url})

    def run(self, script):
        return self.send("POST", "/execute/sync", {"script": script, "args": []})

    def take_requests(self):
        """Returns: the places that were read since this was asked before."""
        messages = [json.loads(entry["message"])["message"]
                    for entry in self.send("POST", "/se/log", {"type": "performance"})]
        return [message["params"]["request"]["url"] for message in messages
                if message["method"] == "Network.requestWillBeSent"]


def start_driver():
    driver = subprocess.Popen(["chromedriver", "--port=0"], stdout=subprocess.PIPE, text=True,
                              start_new_session=True)
    for line in driver.stdout:
        if "started successfully on port" in line:
            return driver, int(line.rsplit(" ", 1)[1].strip(".\n"))
    sys.exit("chromium: chromedriver does not start")


@contextlib.contextmanager
def open_browser(size):
    """Gives a browser with a window of "width,height" pixels, and ends it."""
    driver, port = start_driver()
    try:
        browser = Browser(port, size)
        try:
            yield browser
        finally:
            browser.send("DELETE", "")  # ends Chromium
    finally:
        os.killpg(driver.pid, signal.SIGTERM)
        driver.wait()
