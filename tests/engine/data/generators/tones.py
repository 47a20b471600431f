"""The weighted tone filters over a picture of 16 x 16: red 17 x, green 17 (x + y) / 2, blue 17 y.

The host's pixels are the same with the channels turned.
"""
from math import cosh

from reference import case, f, keep_hue, pixels

CASES = [
    # settings; pivot, contrast below, above, brightness
    ("Contrast2Enabled Contrast2Value=600 Brightness2Enabled Brightness2Value=100 m_OriginalLuma=121 "
     "m_P_C_H_C_Low=40 m_P_C_H_C_High=70 m_B_H_C_F_Low=11", (121, 24, 42, -8.8)),
    ("Contrast2Enabled Contrast2Value=600 Brightness2Enabled Brightness2Value=800 m_OriginalLuma=90 "
     "m_P_C_H_C_Low=100 m_P_C_H_C_High=70 m_B_H_C_F_High=20 pHisto_Luma[255]=1.5", (90, 60, 0, 12)),
    ("Contrast2Enabled Contrast2Value=600 m_OriginalLuma=90 m_P_C_H_C_Low=100 m_P_C_H_C_High=70 "
     "pHisto_Luma[0]=0.5 pHisto_Luma[255]=1", (90, 0, 42, 0)),
    ("mPerceptual_Contrast_Touch_Enabled mPerceptual_Contrast_Touch_Value=600 Final_Touch_Mode_Enabled "
     "mPerceptual_Brightness_Touch_Enabled mPerceptual_Brightness_Touch_Value=100 m_OriginalLuma=121 "
     "m_P_C_H_C_Low=40 m_P_C_H_C_High=70 m_B_H_C_F_Low=11 pHisto_Luma[0]=9 pHisto_Luma[255]=9",
     (121, 24, 42, -8.8)),
    # flash; pivot, factor below, above, flash, fade
    ("mDigital_Flash_Value=1000 m_OriginalLuma=127 m_P_C_H_C_F_L=70 m_P_C_H_C_F_H=60", (127, 70, 60, 1000, 0)),
    ("mDigital_Flash_Value=700 mFade_Value=300 m_OriginalLuma=80 m_P_C_H_C_F_L=31.5 m_P_C_H_C_F_H=70",
     (80, 31.5, 70, 700, 300)),
    ("mDigital_Flash_Value=850 mFade_Value=600 m_OriginalLuma=150 m_P_C_H_C_F_L=70 m_P_C_H_C_F_H=70",
     (150, 70, 70, 850, 600)),
    # cast; missing channel, its shadows and highlights
    ("C_H_F_High_R=90 C_H_F_High_G=90 C_H_F_High_B=10 C_H_F_Low_B=300", (2, 300, 10)),
    ("C_H_F_High_R=90 C_H_F_High_G=4 C_H_F_High_B=90 C_H_F_Low_G=99", (1, 99, 4)),
    ("C_H_F_High_R=1 C_H_F_High_G=90 C_H_F_High_B=90 C_H_F_Low_R=20.5", (0, 20.5, 1)),
]


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


KINDS = {4: ("CContrast_Brightness_Perceptual", "", perceptual),
         5: ("CDigital_Flash_Perceptual", "DigitalFlashEnabled ", flash),
         3: ("CSpecial_Contrast_Perceptual", "Contrast2Enabled ", tint)}
PICTURE = [(17 * x, 17 * (x + y) // 2, 17 * y) for y in range(16) for x in range(16)]
HOST = [rgb[1:] + rgb[:1] for rgb in PICTURE]


def cases():
    for settings, numbers in CASES:
        name, switch, pixel = KINDS[len(numbers)]
        out = [pixel(rgb, host, *numbers) for rgb, host in zip(PICTURE, HOST)]
        yield case(name, switch + settings, f"in 16x16 {pixels(PICTURE)}", f"host {pixels(HOST)}",
                   f"out {pixels(out)}")
