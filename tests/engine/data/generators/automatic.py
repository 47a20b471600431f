"""The automatic contrast and colour filters over small pictures whose histograms are counted beforehand."""
import math

from reference import case, f as f32, keep_hue, pixels


def first(bins, h, otherwise, t=0):
    return next((i for i in bins if t < h[i]), otherwise)


def histogram(picture, value, step=1):
    h = [0] * 256
    for y in range(0, len(picture), step):
        for x in range(0, len(picture[0]), step):
            h[value(picture[y][x])] += step * step
    return h


def histograms(picture, step=1):
    return [histogram(picture, lambda p, c=c: p[c], step) for c in range(3)]


def soft(v, black, white, between):
    c1 = between(f32(max(v - (1 - v / 255) * black, 0)))
    return int(min(f32(c1 + (1 - (255 - c1) / 255) * (255 - white)), 255))


def auto_contrast(picture, luma):
    hs = histograms(picture)
    limits = [(0, 255)] * 3

    def scan(t):
        for c, (l, r) in enumerate(limits):
            limits[c] = (first(range(255 if c else 256), hs[c], l, t), first(range(255, 1, -1), hs[c], r, t))
        return min(l for l, _ in limits), max(r for _, r in limits)

    black, white = scan(0)
    hazy = white < 215 and black > 40
    root = math.sqrt(len(picture) * len(picture[0]))
    black, white = scan(int(2 * root) if luma < 128 and not hazy else int(root))
    if not hazy:
        return lambda c, v: soft(v, black, white, lambda c1: c1)
    if black == white:
        return lambda c, v: 255
    return lambda c, v: min(255 * max(v - black, 0) // (white - black), 255)


def auto_color(picture, position):
    s = f32(position / 1000)
    t = (s * 6.67 - 3.67) * math.sqrt(len(picture) * len(picture[0]))
    limits = []
    for c, h in enumerate(histograms(picture)):
        i = first(range(255 if c else 256), h, 0, t)
        j = next((j for j in range(255, 1, -1) if min(h[j - 2:j + 1]) > t), 255)
        if 0.5 < s <= 0.75:
            limits.append((f32(i / 2 + i / 2 * s / math.cosh(i / 140)),
                           f32(255 - (255 - j) / 2 * (1 / math.cosh(j / 140) + 1) * s)))
        else:
            limits.append((min(f32(i * s), 120 if s <= 0.5 else 255), f32(255 - (255 - j) * s)))
    return lambda c, v: soft(v, *limits[c], int)


def hazy_by_luma(picture, step):
    h = histogram(picture, lambda p: sum(p) // 3, step)
    black, white = first(range(256), h, 0), first(range(255, 0, -1), h, 255)
    if black <= 40 or white >= 215:
        return None
    return lambda c, v: v if black == white else min(255 * max(v - black, 0) // (white - black), 255)


def test_one(picture, _):
    hs = histograms(picture, 3)
    black = min(first(range(254), h, 0) for h in hs)
    white = max(first(range(255, 1, -1), h, 255) for h in hs)
    k = f32(255 / (white - black)) if white > black else 1
    return hazy_by_luma(picture, 3) or (lambda c, v: None if v < black else int(f32((v - black) * k)))


def test_two(picture, _):
    limits = [(first(range(256), h, 0) // 2, (255 + first(range(255, -1, -1), h, 255)) // 2)
              for h in histograms(picture)]
    curve = lambda v, l, r: 255 * v // r if v < l else int(f32((v - l) * f32(255 / (r - l))))
    return hazy_by_luma(picture, 1) or (lambda c, v: curve(v, *limits[c]))


def mapped(pixel, curve):
    new = [curve(c, v) for c, v in enumerate(pixel)]
    return pixel if None in new else keep_hue(new)


SHAPES = [(12, 6, (10, 25, 5), (17, 13, 19), (231, 220, 243)), (12, 6, (30, 90, 0), (1, 1, 1), (9, 4, 3)),
          (12, 6, (200, 120, 60), (1, 2, 1), (5, 6, 7)), (12, 6, (60, 75, 90), (11, 7, 9), (100, 90, 70)),
          (4, 3, (100, 100, 100), (1, 1, 1), (1, 1, 1)), (4, 3, (20, 20, 20), (1, 1, 1), (1, 1, 1)),
          (1, 1, (30, 40, 250), (1, 1, 1), (1, 1, 1))]
FILTERS = [("Auto_Contrast", auto_contrast, "AutoContrast_Enabled m_OriginalLuma={}", (127, 128)),
           ("CAuto_Contrast_TEST", test_one, "ContrastEnabled", (0,)),
           ("CAuto_Color", auto_color, "mAuto_Color_Enabled mAuto_Color_Value={}", (0, 400, 500, 600, 750, 760, 1000)),
           ("CAuto_Contrast_TEST_II", test_two, "mAuto_Color_Enabled", (0,))]


def cases():
    for name, make_curve, settings, values in FILTERS:
        for width, height, low, step, span in SHAPES:
            picture = [[[low[c] + (x * step[c] + y * 7) % span[c] for c in range(3)] for x in range(width)]
                       for y in range(height)]
            flat = [p for row in picture for p in row]
            for value in values:
                curve = make_curve(picture, value)
                yield case(name, settings.format(value), "counted", f"in {width}x{height} {pixels(flat)}",
                           f"out {pixels(mapped(p, curve) for p in flat)}")
