"""The smart analyzers: every field that they write; all others stay as they are."""
import itertools
import math

from reference import case as line, f as single, numbers, parsed, table

WIDTH, HEIGHT = 40, 450
N = WIDTH * HEIGHT
SUFFIXES, ENDS = ["RGB", "R", "G", "B"], ["", "_R", "_G", "_B"]
LEVELS = ["Dark", "Middle", "Light"]


def step(i, center, slope):
    return single((math.tanh((i - center) / slope) + 1) / 2)


def rising(bins, center, slope):
    return sum(step(i, center, slope) * bins[i] for i in range(256))


def falling(bins, center, slope):
    return sum(single(1 - step(i, center, slope)) * bins[i] for i in range(256))


def remap(bins, curve):
    moved = [0.0] * 256
    for i in range(256):
        j = math.trunc(single(curve(i)))
        if 0 <= j <= 255:
            moved[j] += bins[i]
    return moved


def over(numerator, mass, factor):
    return single(numerator / (mass / N) * factor) if mass else 0


def recount(plane):
    power, distance, modulus, *first = plane
    bins = [[0.0] * 256 for _ in range(4)]
    pieces = [(0, 112), (112, 225), (225, 337), (337, 450)]  # 450 rows, halved down to at most 200
    for y in (y for piece in pieces for y in range(*piece, 5)):
        for x in range(WIDTH):
            rgb = [value + distance * ((x + 3 * y) ** power % modulus) for value in first]
            for counts, value in zip(bins, (sum(rgb) // 3, *rgb)):
                counts[value] += 5
    left = min(next((i for i in range(254) if all(c[i:i + 3])), 0) for c in bins[1:])
    right = max(next((i for i in range(255, 1, -1) if c[i] and c[i - 1]), 255) for c in bins[1:])
    return bins, left, right


def chosen(on, pattern):
    return [k for k in range(4) if on[pattern % SUFFIXES[k]]]


def any_level(on, pattern, more=()):
    return any(on[pattern % level] for level in (*LEVELS, *more))


def perceptual_contrast_brightness(on, bins, _):
    contrast = on["Contrast2Enabled"] or on["mPerceptual_Contrast_Touch_Enabled"]
    if not (contrast or on["Brightness2Enabled"] or on["mPerceptual_Brightness_Touch_Enabled"]):
        return {}
    out = {f"C_H_F_{side}{end}": 0 for side in ("High", "Low") for end in ENDS}
    out["B_H_F_High"], out["B_H_F_Low"] = single(rising(bins[0], 170, 25)), single(falling(bins[0], 85, 25))
    high, low = over(0.05520644, out["B_H_F_High"], 70), over(0.44574037, out["B_H_F_Low"], 30)
    high = min(high, 127 - on["m_OriginalLuma"]) if on["m_OriginalLuma"] < 127 else high
    out.update(m_B_H_C_F_High=high, m_B_H_C_F_Low=low)
    if not contrast:
        return out
    touch = on["Final_Touch_Mode_Enabled"]
    up = on["mPerceptual_Brightness_Touch_Value" if touch else "Brightness2Value"] >= 500
    for k in range(4) if touch else [0]:
        tones = remap(bins[k], lambda i: min(255, i + high) if up else max(0, i - low))
        out["C_H_F_High" + ENDS[k]], out["C_H_F_Low" + ENDS[k]] = rising(tones, 200, 25), falling(tones, 55, 25)
    for side in ("High", "Low"):
        out["m_P_C_H_C_" + side] = min(60, over(0.10211310535669327, out["C_H_F_" + side], 50))
    return out


def perceptual_level_dark(on, _, plane):
    def share(counts, gain):
        return single(falling(remap(counts, lambda i: i - 200 * (1 - i / 255)), left + 100, 56) / N * gain)

    bins, left, _ = recount(plane)
    if on["Final_Touch_Mode_Enabled"]:
        flags = [] if chosen(on, "mDark_Touch_%s_Enabled") else chosen(on, "mPerceptual_Touch_Dark_%s_Enabled")
        return {"m_L_H_L_F_" + SUFFIXES[k]: share(bins[k], 200) for k in flags}
    main = on["PerceptualDarkEnabled"] and not on["mAbsolute_Dark_Enabled"]
    return {"m_L_H_L_F": share(bins[0], 100)} if main else {}


def perceptual_level_middle(on, bins, _):
    def masses(counts):
        dark = remap(counts, lambda i: 255 * single(i / 255) ** 1.5384615659713745)
        light = remap(counts, lambda i: 255 * single(i / 255) ** 0.20000000298023224)
        return falling(dark, 100, 30), rising(light, 100, 30)

    out = {}
    if on["Final_Touch_Mode_Enabled"]:
        for k in chosen(on, "mPerceptual_Touch_Middle_%s_Enabled"):
            low, high = (single(mass / N / 255) for mass in masses(bins[k]))
            out.update({"m_M_H_L_F" + ENDS[k]: low, "m_M_H_H_F" + ENDS[k]: high})
            out.update(m_M_L_C_F_Low=low, m_M_L_C_F_Hight=high)
    elif (any_level(on, "Perceptual%sEnabled", ["Gamma"]) and not on["GammaCorrectionEnabled"]
          and not any_level(on, "mAbsolute_%s_Enabled")):
        low, high = masses(bins[0])
        low, high = single(low / N * 0.6163860327556137), over(0.7267330288887024, high, 1)
        out = dict(m_M_L_C_F_Low=low, m_M_L_C_F_Hight=high, m_M_H_L_F=min(single(0.99), low), m_M_H_H_F=2 * high)
    return out


def perceptual_level_right(on, _, plane):
    def rest(counts):
        return 1 - rising(remap(counts, lambda i: min(255, i + 200 * i / 255)), right + 100, 56) / N

    (bins, _, right), out = recount(plane), {}
    if any_level(on, "Perceptual%sEnabled") and not any_level(on, "mAbsolute_%s_Enabled"):
        out["m_R_L_L_F"] = single(rest(bins[0]) * 150 + right)
    if not chosen(on, "mLight_Touch_%s_Enabled"):
        for k in chosen(on, "mPerceptual_Touch_Light_%s_Enabled"):
            out["m_R_L_L_F" + ENDS[k]] = single(rest(bins[k]) * (200 if k else 150))
    return out


def digital_flash(on, bins, _):
    def spread(x):
        return max(0, x - (mean - x) * 50 / 51) if x < mean + 1 else min(255, x + (x - mean) * 50 / 51)

    mean = on["m_OriginalLuma"]
    tones = remap(bins[0], lambda i: spread(i + 1))
    x = math.floor(over(0.20000000298023224, falling(tones, 30, 30), 30))
    y = math.floor(over(0.07699999958276749, rising(tones, 225, 30), 50))
    out = {"m_P_C_H_C_F_L": x if x <= 70 else 40, "m_P_C_H_C_F_H": y if y <= 70 else 60}
    return out if on["DigitalFlashEnabled"] else {}


def case(task, rest):
    settings, picture, *pattern = rest.split(" | ")
    on = parsed(settings)
    bins = [[float((i * 37 + 11 * k) % 101) if pattern else 0.0 for i in range(256)] for k in range(4)]
    bins[0] = [on.get(f"pHisto_Luma[{i}]", bins[0][i]) for i in range(256)]
    analyzer = globals()[task.removeprefix("CSmartAnalyzer_").lower()]
    writes = analyzer(on, bins, [int(number) for number in picture.split()[3:]])
    expected = numbers({name: float(value) for name, value in writes.items()})
    return line(task, settings, picture, *pattern, f"writes {expected}".strip())


def recounted(level, rows, split):
    """What the analyzer leaves in the histograms: the rows are cut at `split`, samples start anew in each piece."""
    counts = {y: 15 if (y if y < split else y - split) % 5 == 0 else 0 for y in range(rows)}
    bins = {f"pHisto_Red[{y}]": count for y, count in counts.items()}
    bins.update({f"pHisto_Green[{255 - y}]": count for y, count in counts.items()})
    bins.update({"pHisto_Blue[7]": sum(counts.values()), "pHisto_Luma[87]": sum(counts.values())})
    picture = " ".join(f"{y},{255 - y},7*3" for y in range(rows))
    return line("CSmartAnalyzer_Perceptual_Level_" + level, "PerceptualDarkEnabled", f"in 3x{rows} {picture}",
                "stat " + numbers(bins))


def cases():
    yield from itertools.starmap(case, table("analyzers.txt"))
    for level in ("Dark", "Right"):
        for rows, split in ((200, 200), (201, 100), (202, 101)):
            yield recounted(level, rows, split)
