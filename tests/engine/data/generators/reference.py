"""What the generators of reference data share: single precision, pixels, and the form of a case."""
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
