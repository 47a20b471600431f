"""The level filters over twelve pixels; the host's pixels are 255 minus the input's."""
from math import cosh

from reference import case, f, keep_hue, parsed, table

PIXELS = [(0, 0, 0), (1, 2, 3), (20, 60, 10), (40, 40, 40), (90, 110, 100), (100, 100, 100), (101, 100, 100),
          (180, 30, 220), (250, 128, 5), (200, 210, 190), (255, 255, 200), (255, 255, 255)]


def bell(luma, p, width, shift=0.32, scale=0.6782):
    return f((1 / cosh((p["m_OriginalLuma"] - luma) / width) - shift) / scale)


def move(sign, x, k, level):
    return f(min(255, max(0, x - k * level * (1 - x / 255) if sign < 0 else x + k * level * x / 255)))


def group(p, tone):
    return any(p[tone % c] for c in ("RGB", "R", "G", "B"))


def values(p, name, scale):
    return [f(p[name % c] * s) for c, s in zip(("RGB", "R", "G", "B"), scale)]


def shifted(p, sign, weight, levels, replace=False):
    out = []
    for pixel in PIXELS:
        k, new = weight(sum(pixel) / 3), []
        for x, own in zip(pixel, levels[1:]):
            if replace:
                new.append(move(sign, x, k, own or levels[0]))
            else:
                new.append(move(sign, move(sign, x, k, levels[0]), k, own))
        out.append(new)
    return out


def transfer(n, g):
    return f(f((n / 255) ** (1 / g)) * 255) if n >= 1 and g > 0 else 0.0


def ratio(mean, g):
    return f(transfer(int(mean), g) / mean) if mean > 0 and g != 1 else 1.0


def factored(common, own):
    return [keep_hue([int(f(int(f(x * common)) * o)) for x, o in zip(pixel, own)]) for pixel in PIXELS]


def absolute_side(p, side, sign, weight):
    touch = group(p, f"m{side}_Touch_%s_Enabled")
    if p["mAuto_Color_Enabled"] or not (p[f"mAbsolute_{side}_Enabled"] or touch):
        return None
    value, levels = p[f"mAbsolute_{side}_Value"], [0] * 4
    if p["Final_Touch_Mode_Enabled"] and touch:
        levels = values(p, f"m{side}_Touch_Value_%s", [0.255] * 4)
        if sign > 0 and not any(levels):
            return None
    elif not p["Final_Touch_Mode_Enabled"] and p[f"mAbsolute_{side}_Enabled"]:
        levels[0] = f(value * 255 / 1000) if value > 0 else (255 if sign > 0 else 0)
    return shifted(p, sign, weight, levels, True)


def dark_left(p):
    m = p["m_OriginalLuma"]
    return absolute_side(p, "Dark", -1, lambda y: bell(y, p, 30, 0.028, 0.97) if y <= m else 1)


def light_right(p):
    return absolute_side(p, "Light", 1, lambda y: bell(y, p, 120))


def slider_gamma(v):
    return f((v - 500) * 9 / 500 + 1 if v >= 500 else v * 0.9 / 500 + 0.1)


def middle(p):
    touch = group(p, "mMiddle_Touch_%s_Enabled")
    if p["mAuto_Color_Enabled"] or not (p["mAbsolute_Middle_Enabled"] or touch):
        return None
    r = [1] * 4
    if p["Final_Touch_Mode_Enabled"] and touch:
        r = [ratio(p[f"m_OriginalLuma{c}"], slider_gamma(p["mMiddle_Touch_Value_" + (c or "RGB")]))
             for c in ("", "R", "G", "B")]
    elif not p["Final_Touch_Mode_Enabled"] and p["mAbsolute_Middle_Enabled"]:
        r[0] = ratio(p["m_OriginalLuma"], slider_gamma(p["mAbsolute_Middle_Value"]))
    return factored(r[0], r[1:])


def top(v):
    return f((v - 900) / 200 + 1) if v > 900 else 1.0


def dark_perceptual(p):
    touch, m, v = group(p, "mPerceptual_Touch_Dark_%s_Enabled"), p["m_OriginalLuma"], p["PerceptualDark"]
    if not (p["PerceptualDarkEnabled"] or touch) or p["mAbsolute_Dark_Enabled"] or group(p, "mDark_Touch_%s_Enabled"):
        return None
    if not p["Final_Touch_Mode_Enabled"]:
        on = p["PerceptualDarkEnabled"]
        weight = lambda y: bell(y, p, 70) if y <= m and v < 900 else top(v)
        return shifted(p, -1, weight, [f(p["m_L_H_L_F"] * v / 1000) if on else 0, 0, 0, 0])
    if not touch:
        return [list(x) for x in PIXELS]
    levels = [f(p[f"m_L_H_L_F_{c}"] * p[f"mPerceptual_Touch_Dark_Value_{c}"] / 1000 * s)
              for c, s in (("RGB", 1), ("R", 0.8), ("G", 0.6), ("B", 0.6))]
    new = shifted(p, -1, lambda y: bell(y, p, 70) if y <= m else 1, levels)
    return [[(w + 255 - x) * 0.5 for w, x in zip(n, pixel)] for n, pixel in zip(new, PIXELS)]


def light_perceptual(p):
    touch, m, v = group(p, "mPerceptual_Touch_Light_%s_Enabled"), p["m_OriginalLuma"], p["PerceptualLight"]
    absolute = any(p[f"mAbsolute_{t}_Enabled"] for t in ("Dark", "Middle", "Light"))
    if not (p["PerceptualLightEnabled"] or touch):
        return None
    if not p["Final_Touch_Mode_Enabled"] and not touch and not absolute:
        weight = lambda y: bell(y, p, 70) if y >= m and v < 900 else top(v)
        return shifted(p, 1, weight, [f(p["m_R_L_L_F"] * v / 1000), 0, 0, 0])
    levels = [0] * 4
    if (p["Final_Touch_Mode_Enabled"] and touch and not p["PerceptualLightEnabled"]
            and not group(p, "mLight_Touch_%s_Enabled") and p["Normal_Picture"]):
        levels = [f(p["m_R_L_L_F" + s] * p["mPerceptual_Touch_Light_Value_" + (s[1:] or "RGB")] / 1000)
                  for s in ("", "_R", "_G", "_B")]
    return shifted(p, 1, lambda y: bell(y, p, 120), levels)


def middle_perceptual(p):
    touch, v = group(p, "mPerceptual_Touch_Middle_%s_Enabled"), p["PerceptualMiddle"]
    absolute = any(p[f"mAbsolute_{t}_Enabled"] for t in ("Dark", "Middle", "Light"))
    if not (p["PerceptualMiddleEnabled"] or touch):
        return None
    if not p["Final_Touch_Mode_Enabled"]:
        g, high, low = 1, p["m_M_H_H_F"], p["m_M_H_L_F"]
        if p["PerceptualMiddleEnabled"] and not p["PerceptualGammaEnabled"] and p["Normal_Picture"] and not absolute:
            high -= high > 1
            g = f((v - 500) / 500 * high * 9 + 1 if v >= 500 else v / 500 * (1 - low) + low)
        return [[int(transfer(x, g)) if g > 0 else x for x in pixel] for pixel in PIXELS]
    if not touch or group(p, "mMiddle_Touch_%s_Enabled") or not p["Normal_Picture"]:
        return [list(x) for x in PIXELS]
    means = [p["m_OriginalLuma" + c] for c in ("R", "G", "B")]
    factors = []
    for c, s, reach in (("RGB", "", 2.5), ("R", "_R", 1.5), ("G", "_G", 1.7), ("B", "_B", 2)):
        v, high, g = p["mPerceptual_Touch_Middle_Value_" + c], p["m_M_H_H_F" + s], 1
        if p[f"mPerceptual_Touch_Middle_{c}_Enabled"]:
            high -= high > 1
            g = f((v - 500) / 500 * high * reach + 1 if v >= 500 else (1 - v / 500) * p["m_M_H_L_F" + s])
        r = ratio(p["m_OriginalLuma" + s[1:]], g)
        if s and min(means) > 0:
            q = f(max(means) / min(means) * (1.5 if all(m > 100 for m in means) else 1))
            t = f(1.3 / q * (1.1 if all(m > 80 for m in means) else 1))
            r = min(r, q)
            r = max(r, t if t <= 1 else f(1 / q)) if v < 100 else r
        factors.append(r if r >= 1 else f(1 - r))
    return factored(factors[0], factors[1:])


MODELS = {"CLevel_Dark_Left": dark_left, "CLevel_Middle": middle, "CLevel_Light_Right": light_right,
          "CLevel_Dark_Left_Perceptual": dark_perceptual, "CLevel_Middle_Perceptual": middle_perceptual,
          "CLevel_Light_Right_Perceptual": light_perceptual}


def cases():
    text = lambda rows: " ".join(",".join(str(int(x)) for x in pixel) for pixel in rows)
    host = text([255 - x for x in pixel] for pixel in PIXELS)
    for name, setting in table("levels.txt"):
        p = parsed("Normal_Picture=1 " + setting)
        new = MODELS[name](p)
        # Two equal rows; one of the filters leaves the last one alone.
        last = PIXELS if name == "CLevel_Dark_Left_Perceptual" else []
        yield case(name, setting, f"in {len(PIXELS)}x2 {text(PIXELS)}", f"host {host}",
                   f"out {text([*new, *last])}" if new else "skipped")
