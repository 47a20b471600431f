#!/usr/bin/env python3
"""Enhances sound photographs with less and less memory (ulimit -v), and looks at how the program bears it.

    memory.py PROGRAM SAMPLES [--size WIDTHxHEIGHT] [--limits FROM:TO:STEP] [--names NAME,...]

Limits are in megabytes. Whatever the limit, each run must end by itself, either with the result that a run without a
limit gives, or with status 5 and one short line about the memory, and nothing left behind. What the system's loader has
no room for is not the program's.
"""
import argparse
import os
import resource
import subprocess
import sys
import tempfile
import time

from robustness import MAX_LINE, make_seeds

SECONDS = 60  # at the least, and ten times what a run without a limit takes
ONE_OF_EACH = ("rgb.jpg", "progressive.jpg", "cmyk.jpg", "rgb.png", "deep.png", "tiles.tif", "jpeg.tif", "pages.tif",
               "lossy.webp", "lossless.webp", "rgb.psd", "deep.psd", "photo.heic")


def enhance(options, folder, name, megabytes=None, seconds=None):
    """Status (None when it did not end), messages and result."""
    def limit():
        resource.setrlimit(resource.RLIMIT_CORE, (0, 0))
        if megabytes:
            resource.setrlimit(resource.RLIMIT_AS, (megabytes << 20, megabytes << 20))
    target = f"out/{name}.tif" if name.endswith(".psd") else f"out/{name}"
    command = [options.program, "enhance", name, "-o", target, "--quiet", "--mode", "SmartGamma", "--value", "1.2"]
    try:
        done = subprocess.run(command, cwd=folder, preexec_fn=limit, stdin=subprocess.DEVNULL, capture_output=True,
                              timeout=seconds, check=False)
    except subprocess.TimeoutExpired:
        return None, [], None
    result = None
    if os.path.exists(f"{folder}/{target}"):
        with open(f"{folder}/{target}", "rb") as file:
            result = file.read()
        os.remove(f"{folder}/{target}")
    return done.returncode, done.stderr.decode("utf-8", "replace").splitlines(), result


def fault(outcome, whole, left):
    """What is wrong with a limited run; nothing when all is well."""
    status, lines, result = outcome
    if status is None:
        return "did not end"
    if left:
        return f"left {left}"
    if status == 0:
        return None if result == whole else "a result that differs"
    if result is not None:
        return f"a result with status {status}"
    if status == 127 and "error while loading shared libraries" in lines[0]:
        return None
    if status != 5:
        return f"status {status}: {' / '.join(lines)[:300]}"
    if len(lines) != 1 or "memory" not in lines[0] or len(lines[0].encode()) > MAX_LINE:
        return f"told: {' / '.join(lines)[:300]}"
    return None


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("program", type=os.path.realpath)
    parser.add_argument("samples", type=os.path.realpath)
    parser.add_argument("--size", default="96x64")
    parser.add_argument("--limits", default="80:440:60")
    parser.add_argument("--names", default=",".join(ONE_OF_EACH))
    options = parser.parse_args()
    runs, faults = 0, 0
    with tempfile.TemporaryDirectory() as folder:
        os.mkdir(f"{folder}/out")
        for name in make_seeds(options.samples, folder, options.size, options.names.split(",")):
            started = time.monotonic()
            status, lines, whole = enhance(options, folder, name)
            seconds = max(SECONDS, 10 * (time.monotonic() - started))
            if status != 0:
                sys.exit(f"{name} fails without a limit: {lines}")
            done = []
            for megabytes in range(*map(int, options.limits.split(":"))):
                outcome = enhance(options, folder, name, megabytes, seconds)
                left = os.listdir(f"{folder}/out")
                wrong = fault(outcome, whole, left)
                runs += 1
                faults += wrong is not None
                if wrong:
                    print(f"FAILED: {name} with {megabytes} MB: {wrong}", flush=True)
                done += [megabytes] if outcome[0] == 0 else []
                for each in left:
                    os.remove(f"{folder}/out/{each}")
            print(f"{name}: done with {min(done, default='more')} MB", flush=True)
    print(f"{runs} runs, {faults} failures")
    return 1 if faults or not runs else 0


sys.exit(main())
