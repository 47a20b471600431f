#!/usr/bin/env python3
"""Feeds damaged photographs to `orvela enhance` and interrupts it, and looks at what is left behind.

    robustness.py PROGRAM SAMPLES [--mutants N] [--cuts N] [--kills N] [--seed N] [--keep FOLDER]

Every file of seeds.txt is changed at random places (mutants), cut short (cuts), and enhanced by runs that are ended by
a signal at a random moment (kills). One mutant of six goes into a file of another format, each of them by turns.
Whatever happens, the program must
  - end by itself, with a status that it documents, and never by a signal of its own making,
  - tell each failure in one short line that names the file,
  - leave every source as it was, every result whole or not there at all, and no other file.
Prints the damaged file of each failure and exits 1; with --keep it is kept.
"""
import argparse
import itertools
import os
import random
import shutil
import signal
import subprocess
import sys
import tempfile
import time

HERE = os.path.dirname(os.path.realpath(__file__))
STATUSES = {0, 1, 5}  # done, a photograph failed, not enough memory
SECONDS = 60          # for a batch of pictures of a few thousand pixels
MAX_LINE = 400        # bytes of a message
TARGETS = (".jpg", ".png", ".webp", ".heic", ".tif")


def make_seeds(samples, folder, size="96x64", wanted=None):
    """The files of seeds.txt by name, or those that are wanted of them."""
    subprocess.run(
        f"convert '{samples}/coffee.png' -resize {size}! p8.png && vips cast p8.png s.v ushort && "
        "vips linear s.v l.v 257 1 && vips cast l.v c.v ushort && vips copy c.v p16.png --interpretation rgb16",
        shell=True, cwd=folder, check=True)
    seeds = {}
    with open(f"{HERE}/seeds.txt", encoding="utf-8") as rows:
        for row in rows:
            if row.startswith("#"):
                continue
            name, command = row.rstrip("\n").split(" | ")
            if wanted and name not in wanted:
                continue
            subprocess.run(command, shell=True, cwd=folder, check=True)
            with open(f"{folder}/{name}", "rb") as file:
                seeds[name] = file.read()
    return seeds


def mutant(data, rng):
    """The data with one to eight changes; most of them near the start, where the structure is."""
    data = bytearray(data)
    for _ in range(rng.choice((1, 1, 2, 4, 8))):
        at = int(len(data) * rng.random() ** rng.choice((1, 3)))
        kind = rng.randrange(6)
        if kind == 0:
            data[at:at + 1] = bytes([rng.randrange(256)])
        elif kind == 1 and at < len(data):
            data[at] ^= 1 << rng.randrange(8)
        elif kind == 2:
            data[at:at + 4] = rng.choice((b"\0\0\0\0", b"\xff\xff\xff\xff", b"\x7f\xff\xff\xff", b"\0\0\0\x01"))
        elif kind == 3:
            del data[at:at + rng.choice((1, 2, 4, 16, 200))]
        elif kind == 4:
            start = rng.randrange(max(1, len(data)))
            data[at:at] = data[start:start + rng.choice((1, 2, 4, 16, 200))]
        else:
            start = rng.randrange(max(1, len(data)))
            count = rng.choice((2, 4, 12, 64))
            data[at:at + count] = data[start:start + count]
    return bytes(data) or b"x"


def cut(data, rng):
    return data[:rng.randrange(1, len(data))]


class Judge:
    """Runs the program over folders of photographs and counts what it must not do."""

    def __init__(self, options):
        self.options = options
        self.failures = 0
        self.files = 0

    def fail(self, text, path=None):
        self.failures += 1
        print(f"FAILED: {text}")
        if path and self.options.keep:
            os.makedirs(self.options.keep, exist_ok=True)
            shutil.copy(path, f"{self.options.keep}/{self.failures}-{os.path.basename(path)}")

    def run(self, folder, names, extension):
        """Status and messages of one batch; None for a status when it did not end."""
        os.makedirs(f"{folder}/out", exist_ok=True)
        target = ["-o", f"out/{os.path.splitext(names[0])[0]}{extension}"] if extension else ["-d", "out"]
        command = [self.options.program, "enhance", *target, "--quiet", *names]
        try:
            done = subprocess.run(command, cwd=folder, stdin=subprocess.DEVNULL, capture_output=True, timeout=SECONDS)
            return done.returncode, done.stderr.decode("utf-8", "replace").splitlines()
        except subprocess.TimeoutExpired:
            return None, []

    def judge(self, files, what, extension=None):
        """Enhances the files, given as name to content, in one batch; apart when that goes wrong. With an extension
        there is one file, and that is the format that it goes into."""
        self.files += len(files)
        with tempfile.TemporaryDirectory() as folder:
            for name, data in files.items():
                with open(f"{folder}/{name}", "wb") as file:
                    file.write(data)
            status, lines = self.run(folder, list(files), extension)
            if status not in STATUSES:
                if len(files) > 1:
                    self.files -= len(files)
                    for name, data in files.items():
                        self.judge({name: data}, what)
                    return
                ending = "did not end" if status is None else f"ended with {status}"
                self.fail(f"{what} of {next(iter(files))}: {ending}", f"{folder}/{next(iter(files))}")
                return
            self.look(folder, files, status, lines, what)

    def look(self, folder, files, status, lines, what):
        results = set(os.listdir(f"{folder}/out")) if os.path.isdir(f"{folder}/out") else set()
        for line in lines:
            if len(line.encode()) > MAX_LINE or not any(os.path.splitext(name)[0] in line for name in files):
                self.fail(f"{what}: a message is long or names no file: {line[:600]}")
        for name, data in files.items():
            path = f"{folder}/{name}"
            with open(path, "rb") as file:
                if file.read() != data:
                    self.fail(f"{what}: {name} was changed", path)
            base = os.path.splitext(name)[0]
            made = [each for each in results if os.path.splitext(each)[0] == base]
            told = any(f"{base}." in line for line in lines) # itself or its result
            if not made and not told:
                self.fail(f"{what}: {name} failed without a message", path)
            if len(made) > 1:
                self.fail(f"{what}: {name} left {made}", path)
            results -= set(made)
        if results:
            self.fail(f"{what}: {sorted(results)} were left behind")
        if set(os.listdir(folder)) - set(files) - {"out"}:
            self.fail(f"{what}: files were left beside the sources")

    def kill(self, name, data, rng):
        """Ends a run at a random moment, looks, and runs again."""
        self.files += 1
        number = rng.choice((signal.SIGKILL, signal.SIGTERM, signal.SIGINT, signal.SIGHUP))
        with tempfile.TemporaryDirectory() as folder:
            path, target = f"{folder}/{name}", f"{folder}/out/{name}"
            with open(path, "wb") as file:
                file.write(data)
            process = subprocess.Popen([self.options.program, "enhance", "-d", "out", "--quiet", name], cwd=folder,
                                       stderr=subprocess.DEVNULL)
            time.sleep(rng.random() * self.options.seconds)
            process.send_signal(number)
            status = process.wait(SECONDS)
            with open(path, "rb") as file:
                if file.read() != data:
                    self.fail(f"signal {number}: {name} was changed")
            if os.path.exists(target) and status < 0 and number != signal.SIGKILL:
                self.fail(f"signal {number}: the program did not end by itself ({status})")
            if os.path.exists(target):
                self.compare(name, target, folder)
            again = subprocess.run([self.options.program, "enhance", "-d", "out", "--quiet", "--force", name],
                                   cwd=folder, stderr=subprocess.DEVNULL, check=False)
            left = sorted(os.listdir(f"{folder}/out")) if os.path.isdir(f"{folder}/out") else []
            if again.returncode != 0 or left != [name]:
                self.fail(f"signal {number}: the next run ended with {again.returncode} and left {left}")

    def compare(self, name, target, folder):
        subprocess.run([self.options.program, "enhance", "-d", "whole", "--quiet", name], cwd=folder, check=True)
        with open(target, "rb") as one, open(f"{folder}/whole/{name}", "rb") as other:
            if one.read() != other.read():
                self.fail(f"{name}: an interrupted run left a result that is not whole")


def batches(data, name, count, change, rng, size=20):
    """Changed forms of one seed, so many at a time, as name to content."""
    base, extension = os.path.splitext(name)
    for start in range(0, count, size):
        numbers = range(start, min(start + size, count))
        yield {f"{base}-{number}{extension}": change(data, rng) for number in numbers}


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("program", type=os.path.realpath)
    parser.add_argument("samples", type=os.path.realpath)
    parser.add_argument("--mutants", type=int, default=5, help="of each seed")
    parser.add_argument("--cuts", type=int, default=3, help="of each seed")
    parser.add_argument("--kills", type=int, default=6, help="in all")
    parser.add_argument("--seed", type=int, default=1, help="of the random numbers")
    parser.add_argument("--keep", help="folder for the damaged files of failures")
    options = parser.parse_args()
    judge = Judge(options)
    rng = random.Random(options.seed)
    with tempfile.TemporaryDirectory() as folder:
        seeds = make_seeds(options.samples, folder)
        targets = itertools.cycle(TARGETS)
        for name, data in seeds.items():
            judge.judge({name: data}, "the whole file")
            for files in batches(data, name, (options.mutants + 5) // 6, mutant, rng, 1):
                target = next(targets)
                judge.judge(files, "a mutant", next(targets) if name.endswith(target) else target)
            for files in batches(data, name, options.mutants, mutant, rng):
                judge.judge(files, "a mutant")
            for files in batches(data, name, options.cuts, cut, rng):
                judge.judge(files, "a cut")
        subprocess.run(f"convert '{options.samples}/coffee.png' -resize 300% large.tif", shell=True, cwd=folder, check=True)
        with open(f"{folder}/large.tif", "rb") as file:
            large = file.read()
        options.seconds = measured(options, folder)
        for _ in range(options.kills):
            judge.kill("large.tif", large, rng)
    print(f"{judge.files} files of {len(seeds)} seeds, {judge.failures} failures")
    return 1 if judge.failures or not judge.files else 0


def measured(options, folder):
    """How long a run over large.tif takes, in seconds."""
    started = time.monotonic()
    subprocess.run([options.program, "enhance", "-o", "measured.tif", "--quiet", "large.tif"], cwd=folder, check=True)
    return time.monotonic() - started


if __name__ == "__main__":
    sys.exit(main())
