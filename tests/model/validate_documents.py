#!/usr/bin/env python3
"""Validates `robotcfg show --json` of every example against docs/configuration.schema.json,
and checks that `show --svg` is XML naming every configured device.

Usage: validate_documents.py ROBOTCFG SOURCE_DIR. Exits 77 (skipped) when the
jsonschema module is missing.
"""
import json
import pathlib
import xml.etree.ElementTree as ElementTree
import subprocess
import sys

try:
    import jsonschema
except ImportError:
    print("SKIPPED: the Python module jsonschema is not installed (Debian: python3-jsonschema)")
    sys.exit(77)

robotcfg, source = sys.argv[1], pathlib.Path(sys.argv[2])
schema = json.loads((source / "docs" / "configuration.schema.json").read_text())
jsonschema.Draft202012Validator.check_schema(schema)
validator = jsonschema.Draft202012Validator(schema)

failures = 0
documents = 0
for example in sorted((source / "examples").iterdir()):
    options = (example / "options").read_text().split()
    for extra in ([], ["--all", "--choices"]):
        run = subprocess.run([robotcfg, "show", "--json", *extra, *options, str(example / "program.c")],
                             capture_output=True, text=True)
        if run.returncode not in (0, 1) or not run.stdout:
            print(f"{example.name}: show --json failed: {run.stderr}")
            failures += 1
            continue
        documents += 1
        document = json.loads(run.stdout)
        for error in validator.iter_errors(document):
            print(f"{example.name} {' '.join(extra)}: {'/'.join(map(str, error.absolute_path))}: {error.message}")
            failures += 1
        if extra:
            continue
        picture = subprocess.run([robotcfg, "show", "--svg", *options, str(example / "program.c")],
                                 capture_output=True, text=True).stdout
        drawn = "".join(ElementTree.fromstring(picture.encode()).itertext())
        for kind in ("motors", "sensors", "servos"):
            for device in document[kind]:
                if device["type"] is not None and device["name"] and device["name"] not in drawn:
                    print(f"{example.name}: the picture lacks {device['name']}")
                    failures += 1
print(f"{documents} documents checked, {failures} problems")
sys.exit(1 if failures else 0)
