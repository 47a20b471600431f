"""What the generators of reference data share: single precision, pixels, tables and the form of a case."""
import collections
import itertools
import pathlib
import re
import string
import struct


def f(value):
    """Rounded to single precision."""
    return struct.unpack("f", struct.pack("f", value))[0]


def keep_hue(pixel):
    """A pixel above 255 brought down to 254 with its hue kept."""
    top = max(pixel)
    return [v * 254 // top for v in pixel] if top > 255 else list(pixel)


def pixels(rows):
    """Pixels as the reader takes them, hexadecimal."""
    return "#" + "".join("%02x%02x%02x" % tuple(p) for p in rows)


def numbers(values):
    """name=value name=value"""
    return " ".join(f"{name}={value!r}" for name, value in values.items())


def case(task, settings, *fields):
    """A case of a task: its line, and the task whose file it belongs to."""
    return task, " | ".join([f"{task} {' '.join(settings.split())}".strip(), *fields])


def each_suffix(setting):
    values = zip(("RGB", "R", "G", "B"), setting[3].split(","))
    return " ".join(f"{setting[1]}{suffix}{setting[2]}={value}" for suffix, value in values)


def table(file):
    """The cases of a table, each a task and the rest of its line.

    A line "NAME = TEXT" lets $NAME stand for the text in the lines below; each of {A;B} is a case of its own; and
    NAME_*=A,B,C,D are four settings, for RGB, R, G and B.
    """
    given = {}
    for line in pathlib.Path(__file__).with_name(file).read_text().splitlines():
        name, _, text = string.Template(line).substitute(given).partition(" ")
        text = re.sub(r"(\S*)\*(\S*)=(\S+)", each_suffix, text)
        if text.startswith("= "):
            given[name] = text[2:]
        elif name not in ("", "#"):
            for words in itertools.product(*(part.split(";") for part in re.split("[{}]", text))):
                yield name, "".join(words)


def parsed(settings):
    """Settings by name, 0 where there is none."""
    values = (setting.split("=") for setting in settings.split())
    return collections.defaultdict(float, {name: f(float(value)) for name, value in values})
