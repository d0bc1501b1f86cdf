#!/usr/bin/env python3
"""Runs each Python example of a document in a fresh folder, with the programs of a build.

    examples.py DOCUMENT PROGRAM_FOLDER...
"""
import os
import re
import subprocess
import sys
import tempfile

document, folders = sys.argv[1], [os.path.abspath(folder) for folder in sys.argv[2:]]
environment = dict(os.environ, PATH=os.pathsep.join([*folders, os.environ["PATH"]]))
text = open(document, encoding="utf-8").read()
examples = re.findall(r"^## ([^\n]*)\n(.*?)(?=^## |\Z)", text, re.M | re.S)
verbs = subprocess.run(["zelctl", "--help"], check=True, capture_output=True, text=True,
                       env=environment).stdout.split("Subcommands:")[1]
named = " ".join(heading for heading, _ in examples)
failed = [f"no section on {verb}" for verb in re.findall(r"^  ([a-z]+)", verbs, re.M)
          if not re.search(rf"\b{verb}\b", named)]
count = 0
for heading, body in examples:
    blocks = re.findall(r"```python\n(.*?)```", body, re.S)
    if not blocks:
        failed.append(f"{heading}: no example")
    for block in blocks:
        count += 1
        with tempfile.TemporaryDirectory() as folder:
            run = subprocess.run([sys.executable, "-c", block], cwd=folder, capture_output=True,
                                 text=True, timeout=60,
                                 env=dict(environment, ZELREMOTE_HOME=folder + "/own"))
        if run.returncode:
            failed.append(f"{heading}: {run.stdout}{run.stderr}")
if count < 8:
    failed.append(f"only {count} examples were found")
print(f"{count} examples", *failed, sep="\n")
sys.exit(bool(failed))
