"""Colour, detail and noise filters, straight from the formulas, pixel by pixel, without tables."""
import itertools
import math
import random

from reference import case, f, keep_hue, pixels

MEANS = (90.5, 128.0, 40.0)  # channel means that CClarity reads


def cells(y0, y1, x0, x1):
    return [(y, x) for y in range(y0, y1 + 1) for x in range(x0, x1 + 1)]


def bilinear(pos, pic, host, w, h):
    sigma = f(f(f(f(pos) * 4.5) / 1000) + 0.5)
    var = f(sigma * sigma)
    out = [row[:] for row in pic]
    for y, x in cells(1, h - 2, 1, w - 2):
        sums, total = [0.0] * 3, 0.0
        for v, u in cells(y - 1, y + 1, x - 1, x + 1):
            dist = sum((a - b) ** 2 for a, b in zip(pic[y][x], pic[v][u]))
            weight = f(f(math.exp(-dist / 1125)) * f(math.exp(-((v - y) ** 2 + (u - x) ** 2) / var)))
            sums = [s + weight * c for s, c in zip(sums, pic[v][u])]
            total += weight
        out[y][x] = tuple(int(f(s / total)) for s in sums)
    return out


def moire(pos, pic, host, w, h):
    sigma = f(pos * 1.5 / 1000 + 0.5)
    den = f(2 * f(f(sigma * sigma) ** 2))
    out = [row[:] for row in pic]
    for y, x in cells(0, h - 1, 0, w - 1):
        sums, total = [0.0] * 3, 0.0
        for v, u in cells(max(y - 2, 0), min(y + 2, h - 2), max(x - 2, 0), min(x + 2, w - 2)):
            weight = f(1 / math.exp(((v - y) ** 2 + (u - x) ** 2) / den))
            sums = [s + min(a, b) * weight for s, a, b in zip(sums, pic[y][x], pic[v][u])]
            total += weight
        if total and all(abs(int(f(f(s / total) - c))) > 15 for s, c in zip(sums, host[y][x])):
            out[y][x] = host[y][x]
    return out


def clarity(pos, pic, host, w, h):
    sigma = f(pos * 50 / 1000 + 2)
    sloper = f(511 if pos <= 600 else 1120 - pos * 102 / 100)

    def channel(c, mean):
        d = c - int(mean)
        t = f(math.exp(-abs(d) / (2 * f(sigma * sigma))) * d)
        return int(f((255 - c) * t / sloper + c if d >= 0 else c - (255 - c) * t / 511))
    return [[keep_hue([channel(c, m) for c, m in zip(p, MEANS)]) for p in row] for row in pic]


def means(pic, w, h, margin):
    px = [pic[y][x] for y in range(0, h - margin, 5) for x in range(0, w - margin, 5)]
    if not px:
        return 0.0, [0.0] * 3
    return f(sum(map(sum, px)) / 3 / len(px)), [f(sum(c) / len(px)) for c in zip(*px)]


def dominant(c, mean, order, k):
    low, middle, top = order
    if mean == top:
        return c
    d = f(top - middle) if mean == middle else f(top - low)
    pull = 1 / math.cosh((c - mean) / 11) * (math.tanh((top - c) / (mean * 0.025)) + 1) * d * k / 2
    return max(0, int(f(c - pull)))


def hsv(p, pos):
    top, delta = max(p), max(p) - min(p)
    v, sat = f(top / 255), f(delta / top) if top else 0.0
    r, g, b = p
    hue = 0.0
    if sat:
        third = 0 if r == top else 1 if g == top else 2
        hue = f(f((g - b, b - r, r - g)[third] * 60 / delta) + 120 * third)
        hue = f(hue + 360) if hue < 0 else hue
    if int(pos) < 501:
        new = f(sat - f(sat * f(1 - pos / 500)))
    else:
        boost = f((pos - 500) / 500 + 0.2) / math.cosh(f(f(255 - f(255 * sat)) / 120))
        new = f(min(1.0, sat + boost / f(f(2 - sat) ** 2)))
    if not new:
        return (int(f(255 * v)),) * 3
    i = int(f(hue / 60))
    frac = f(f(hue / 60) - i)
    lo, q, t = (f(v * f(1 - s)) for s in (new, f(frac * new), f(f(1 - frac) * new)))
    return tuple(int(f(255 * c)) for c in ((v, t, lo), (q, v, lo), (lo, v, t), (lo, q, v), (t, lo, v), (v, lo, q))[i])


def saturation(pos, pic, host, w, h):
    mean_in, mu = means(pic, w, h, 5)
    if 500 <= int(pos) <= 600:
        k = f((pos - 500) / 200)
        out = [[tuple(dominant(c, m, sorted(mu), k) for c, m in zip(p, mu)) if pos < 600 else p for p in row]
               for row in pic]
    else:
        out = [[hsv(p, pos) for p in row] for row in pic]
    mean_out = means(out, w, h, 6)[0]
    ratio = f(mean_in / mean_out) if mean_out else 1.0
    return [[keep_hue([int(f(c * ratio)) for c in p]) for p in row] for row in out]


MEAN_SETTINGS = " ".join(f"m_OriginalLuma{c}={m}" for c, m in zip("RGB", MEANS))
# formula, settings but for the position, positions, sizes
TASKS = {
    "CBilinear": (bilinear, "BilinearFilteringEnabled BilinearFilteringValue", (0, 500, 1000),
                  ((7, 5), (2, 4), (260, 3))),
    "CMoire": (moire, "Moire_Enabled mMoire_Value", (0, 500, 1000), ((9, 8), (1, 3), (2, 2))),
    "CClarity": (clarity, MEAN_SETTINGS + " ClarityFilterEnabled ClarityFilterValue", (0, 600, 601, 1000), ((9, 9),)),
    "Saturation": (saturation, "SaturationEnabled SaturationValue",
                   (0, 200, 499, 500, 501, 550, 599, 600, 600.5, 601, 800, 1000), ((12, 11),)),
}


def picture(rng, w, h, low=0, high=255):
    def pixel():
        base = rng.randint(low, high)
        return tuple(min(255, max(0, base + rng.randint(-spread, spread))) for spread in (40, 25, 60))
    return [[pixel() for _ in range(w)] for _ in range(h)]


def flat(pic):
    return pixels(p for row in pic for p in row)


def large_bilinear():
    """Above a side of 700 six tenths of the slider count; a pattern of 11 pixels fills the picture."""
    w, h, pattern = 720, 700, [(97 + 7 * i % 23, 101 + i * i % 19, 90 + 3 * i) for i in range(11)]
    corner = [[pattern[(y * w + x) % 11] for x in range(14)] for y in range(4)]
    smooth = bilinear(300, corner, None, 14, 4)
    at = [f"at {x},{y} " + ",".join(map(str, smooth[y][x])) for y in (1, 2) for x in range(1, 12, 2)]
    return case("CBilinear", "BilinearFilteringEnabled BilinearFilteringValue=500",
                f"in {w}x{h} {pixels(pattern)}", *at)


def smoothed_spot(dx, dy):
    """One pixel of 100 more in red among greys of 100: the centre is averaged; it is itself an edge."""
    weight = lambda d2: math.exp(-d2 / 6.25) / 0.72
    total = sum(weight(v * v + u * u) * 100 for v, u in cells(-2, 2, -2, 2)) + weight(dx * dx + dy * dy) * 100
    spot = ["100"] * 49
    spot[7 * (3 + dy) + 3 + dx] = "200,100,100"
    red, rest = int(total / 20), int((total - weight(dx * dx + dy * dy) * 100) / 20)
    return case("Super_ORV", "OrvelaLevel3Enabled OrvelaLevel3Value=1000", f"in 7x7 {' '.join(spot)}",
                f"at 3,3 {red},{rest},{rest}")


def median_of(values):
    """At position 1000 every bright pixel becomes the median: the third smallest of its window."""
    third = sorted(values)[2]
    rows = [values[2 * (y % 2) + x % 2] for y in range(3) for x in range(3)]
    return case("CMedian_Salt_Pepper", "SaltPepperEnabled SaltPepperValue=1000",
                f"in 3x3 {' '.join(map(str, rows))}", f"at 1,1 {third if values[3] > 100 else values[3]}")


def cases():
    rng = random.Random(55)
    for name, (task, settings, positions, sizes) in TASKS.items():
        for w, h in sizes:
            for pos in positions:
                pic = picture(rng, w, h, *((90, 130) if name == "CBilinear" else ()))
                host = [[tuple(min(255, max(0, c + s)) for c in p)
                         for p in row for s in [rng.choice((0, -12, -40, 18, 30))]] for row in pic]
                yield case(name, f"{settings}={pos}", f"in {w}x{h} {flat(pic)}", f"host {flat(host)}",
                           f"out {flat(task(float(pos), pic, host, w, h))}")
    yield large_bilinear()
    for dy, dx in cells(-2, 2, -2, 2):
        if dx or dy:
            yield smoothed_spot(dx, dy)
    for values in itertools.permutations((40, 90, 150, 200)):
        yield median_of(values)
