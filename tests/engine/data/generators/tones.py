"""The weighted tone filters over a picture of 16 x 16: red 17 x, green 17 (x + y) / 2, blue 17 y.

The host's pixels are the same with the channels turned.
"""
from math import cosh

from reference import case, f, keep_hue, pixels, table


def pivot(b, p, k):  # every operation rounded to single precision
    if b >= p + 1:
        return min(f(f(f(f(b - p) * k) / f(101 - k)) + b), 255.0)
    return max(f(b - f(f(f(p - b) * k) / f(101 - k))), 0.0)


def perceptual(rgb, _, mean, low, high, brightness):
    w = f(1 / cosh((mean - f(sum(rgb) / 3)) / 100))
    lit = [int(min(max(f(c + f(brightness)), 0.0), 255.0)) for c in rgb]
    return [int(pivot(b, mean, f(w * (low if b <= mean else high)))) for b in lit]


def flash(rgb, host, mean, low, high, position, fade):
    a = f((position / 1000 - 0.7) / 0.3) if position > 700 else 0
    share = min(f(fade / 1000 * (a / 5 + 1.1)), 1.0)
    d = mean - f(sum(rgb) / 3)
    w = f((1 / cosh(d / 40) - 0.85) / 0.915) if d > 0 else f(1 / cosh(d / 20))
    lit = [int(pivot(c, mean, f(w * f((low if c < mean else high) * position / 1000)))) for c in rgb]
    return [int(f(h * share + o * f(1 - share))) for h, o in zip(host, lit)]


def tint(rgb, _, channel, low, high):
    q = f((low + 1) / (high + 1))
    v = f(q / 20 * 0.15 if q <= 21 else 0.15)
    mixed = [int(f(c * f(1 - v) + v * (255 if i == channel else 0))) for i, c in enumerate(rgb)]
    mean = f(sum(mixed) / 3)
    return keep_hue([int(f(c * (f(sum(rgb) // 3 / mean) if mean > 0 else 1.0))) for c in mixed])


PIXELS = {"CContrast_Brightness_Perceptual": perceptual, "CDigital_Flash_Perceptual": flash,
          "CSpecial_Contrast_Perceptual": tint}
PICTURE = [(17 * x, 17 * (x + y) // 2, 17 * y) for y in range(16) for x in range(16)]
HOST = [rgb[1:] + rgb[:1] for rgb in PICTURE]


def cases():
    for name, rest in table("tones.txt"):
        settings, numbers = rest.split(" | ")
        numbers = [float(number) for number in numbers.split()]
        out = [PIXELS[name](rgb, host, *numbers) for rgb, host in zip(PICTURE, HOST)]
        yield case(name, settings, f"in 16x16 {pixels(PICTURE)}", f"host {pixels(HOST)}", f"out {pixels(out)}")
