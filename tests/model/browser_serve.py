#!/usr/bin/env python3
"""Drives the `robotcfg serve` page in headless Chromium through its DevTools protocol.

Usage: browser_serve.py ROBOTCFG SOURCE_DIR OUT_DIR. Opens the page on a copy of an
example, changes a motor's type with its drop-down, waits for the block to change,
saves, checks the file on disk, and saves a screenshot of each tab in OUT_DIR.
Exits 77 (skipped) when no browser is installed.
"""
import base64
import json
import os
import pathlib
import shutil
import signal
import socket
import subprocess
import sys
import tempfile
import time
import urllib.request

browser = shutil.which("chromium") or shutil.which("chromium-browser")
if not browser:
    print("SKIPPED: no chromium browser installed (Debian: chromium)")
    sys.exit(77)


class DevTools:
    """A minimal WebSocket client (RFC 6455 text frames) speaking the DevTools protocol."""

    def __init__(self, url):
        rest = url.split("://", 1)[1]
        hostport, path = rest.split("/", 1)
        host, port = hostport.split(":")
        self.sock = socket.create_connection((host, int(port)), timeout=30)
        key = base64.b64encode(os.urandom(16)).decode()
        self.sock.sendall((f"GET /{path} HTTP/1.1\r\nHost: {hostport}\r\nUpgrade: websocket\r\nConnection: Upgrade\r\n"
                           f"Sec-WebSocket-Key: {key}\r\nSec-WebSocket-Version: 13\r\n\r\n").encode())
        reply = b""
        while b"\r\n\r\n" not in reply:
            reply += self.sock.recv(1)
        if b" 101 " not in reply.split(b"\r\n")[0]:
            raise RuntimeError("no WebSocket: " + reply.decode(errors="replace"))
        self.next_id = 0

    def _read(self, count):
        data = b""
        while len(data) < count:
            chunk = self.sock.recv(count - len(data))
            if not chunk:
                raise RuntimeError("DevTools closed the connection")
            data += chunk
        return data

    def _send(self, text):
        payload = text.encode()
        header = bytes([0x81])
        if len(payload) < 126:
            header += bytes([0x80 | len(payload)])
        elif len(payload) < 65536:
            header += bytes([0x80 | 126]) + len(payload).to_bytes(2, "big")
        else:
            header += bytes([0x80 | 127]) + len(payload).to_bytes(8, "big")
        mask = os.urandom(4)
        self.sock.sendall(header + mask + bytes(b ^ mask[i % 4] for i, b in enumerate(payload)))

    def _receive(self):
        message = b""
        while True:
            first, second = self._read(2)
            length = second & 0x7F
            if length == 126:
                length = int.from_bytes(self._read(2), "big")
            elif length == 127:
                length = int.from_bytes(self._read(8), "big")
            message += self._read(length)
            if first & 0x80:
                return json.loads(message)

    def call(self, method, **params):
        self.next_id += 1
        self._send(json.dumps({"id": self.next_id, "method": method, "params": params}))
        while True:
            reply = self._receive()
            if reply.get("id") == self.next_id:
                if "error" in reply:
                    raise RuntimeError(f"{method}: {reply['error']}")
                return reply.get("result", {})

    def evaluate(self, expression):
        result = self.call("Runtime.evaluate", expression=expression, awaitPromise=True, returnByValue=True)
        return result.get("result", {}).get("value")

    def wait_for(self, expression, what, seconds=30):
        deadline = time.time() + seconds
        while time.time() < deadline:
            if self.evaluate(expression):
                return
            time.sleep(0.2)
        raise RuntimeError("timed out waiting for " + what)


def free_port():
    with socket.socket() as s:
        s.bind(("127.0.0.1", 0))
        return s.getsockname()[1]


def main():
    robotcfg, source, out = sys.argv[1], pathlib.Path(sys.argv[2]), pathlib.Path(sys.argv[3]).resolve()
    out.mkdir(parents=True, exist_ok=True)
    work = pathlib.Path(tempfile.mkdtemp())
    program = work / "robot.c"
    shutil.copy(source / "examples" / "vex-i2c" / "program.c", program)
    server = subprocess.Popen([robotcfg, "serve", "--platform", "vexi2c", str(program)], stdout=subprocess.PIPE, text=True)
    chrome = None
    try:
        url = server.stdout.readline().split(" at ", 1)[1].strip()
        port = free_port()
        chrome = subprocess.Popen([browser, "--headless", "--no-sandbox", "--disable-gpu", "--disable-background-networking",
                                   "--disable-component-update", "--disable-sync", "--no-first-run",
                                   f"--user-data-dir={work / 'profile'}", f"--remote-debugging-port={port}",
                                   "--window-size=1400,1000", url],
                                  stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        targets = []
        for _ in range(150):
            try:
                targets = json.load(urllib.request.urlopen(f"http://127.0.0.1:{port}/json"))
                if any(t.get("type") == "page" for t in targets):
                    break
            except OSError:
                pass
            time.sleep(0.2)
        page = next(t for t in targets if t.get("type") == "page")
        tools = DevTools(page["webSocketDebuggerUrl"])
        motor = 'document.querySelector(\'select[aria-label="Type of motor port3"]\')'
        tools.wait_for(motor, "the motor table")
        tools.evaluate(f'{motor}.value = "tmotorVex393HighSpeed_MC29"; {motor}.dispatchEvent(new Event("change")); true')
        tools.wait_for('document.getElementById("block").textContent.includes("tmotorVex393HighSpeed_MC29")',
                       "the block to change")
        tools.evaluate('document.getElementById("save").click(); true')
        deadline = time.time() + 30
        while "tmotorVex393HighSpeed_MC29" not in program.read_text() and time.time() < deadline:
            time.sleep(0.2)
        if "port3,           rightMotor,    tmotorVex393HighSpeed_MC29" not in program.read_text():
            print("the saved file lacks the new motor type:\n" + program.read_text())
            return 1
        # After saving, the page loads the file again and shows no difference from it.
        tools.wait_for('document.querySelectorAll("#block .add, #block .del").length === 0', "the reloaded block")
        tabs = tools.evaluate('[...document.querySelectorAll("[role=tab]")].map((t) => t.dataset.tab)')
        for index, name in enumerate(tabs):
            tools.evaluate(f'document.getElementById("tab-{index}").click(); true')
            shot = tools.call("Page.captureScreenshot", format="png")["data"]
            file = out / ("serve-" + name.lower().replace(" ", "-").replace("/", "-") + ".png")
            file.write_bytes(base64.b64decode(shot))
            print(f"{name}: {file}")
        return 0
    finally:
        if chrome:
            chrome.terminate()
            chrome.wait(timeout=30)
        server.send_signal(signal.SIGINT)
        server.wait(timeout=30)
        shutil.rmtree(work, ignore_errors=True)


sys.exit(main())
