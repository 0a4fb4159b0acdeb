#!/usr/bin/env python3
"""Renders the wiring pictures of example programs in headless Chromium.

Usage: browser_pictures.py ROBOTCFG SOURCE_DIR OUT_DIR. Saves OUT_DIR/<example>.png,
checks from the browser's DOM that every configured device's name is drawn, and
exits 77 (skipped) when no browser is installed.
"""
import json
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile

EXAMPLES = ["nxt-hubs", "vex-i2c", "arduino-motor-pins", "vex-drive-train"]

browser = shutil.which("chromium") or shutil.which("chromium-browser") or (
    "/usr/bin/chromium" if os.path.exists("/usr/bin/chromium") else None)
if not browser:
    print("SKIPPED: no chromium browser installed (Debian: chromium)")
    sys.exit(77)

robotcfg, source, out = sys.argv[1], pathlib.Path(sys.argv[2]), pathlib.Path(sys.argv[3]).resolve()
out.mkdir(parents=True, exist_ok=True)
failures = 0
with tempfile.TemporaryDirectory() as profile:
    flags = ["--headless", "--no-sandbox", "--disable-gpu", "--disable-background-networking",
             "--disable-component-update", "--disable-sync", "--no-first-run", f"--user-data-dir={profile}"]
    for name in EXAMPLES:
        example = source / "examples" / name
        options = (example / "options").read_text().split()
        program = str(example / "program.c")
        document = json.loads(subprocess.run([robotcfg, "show", "--json", *options, program],
                                             capture_output=True, text=True).stdout)
        picture = subprocess.run([robotcfg, "show", "--svg", *options, program], capture_output=True, text=True).stdout
        svg = out / f"{name}.svg"
        svg.write_text(picture)
        width, height = picture.split('width="')[1].split('"')[0], picture.split('height="')[1].split('"')[0]
        png = out / f"{name}.png"
        subprocess.run([browser, *flags, f"--screenshot={png}", f"--window-size={width},{height}", svg.as_uri()],
                       capture_output=True, timeout=120)
        dom = subprocess.run([browser, *flags, "--dump-dom", svg.as_uri()], capture_output=True, text=True,
                             timeout=120).stdout
        if not png.exists() or png.stat().st_size == 0:
            print(f"{name}: no screenshot")
            failures += 1
        names = [d["name"] for kind in ("motors", "sensors", "servos") for d in document[kind]
                 if d["type"] is not None and d["name"]]
        for device in names:
            if f">{device}<" not in dom:
                print(f"{name}: the browser's DOM lacks {device}")
                failures += 1
        print(f"{name}: {png} ({len(names)} devices)")
sys.exit(1 if failures else 0)
