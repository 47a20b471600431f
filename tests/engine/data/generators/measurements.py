"""The histograms: which pixels they sample, what they make of the counts, and when they run."""
from reference import case, numbers, table

SAMPLED = {"CHistogram0": "", "CHistogram_III": "", "CHistogram_IV": "mAuto_Color_Enabled", "CHistogram_VII": "",
           "CHistogram_VIII": "DigitalFlashEnabled", "CHistogram_Luma_after_Orv": "OrvelaLevelEnabled"}
# width, height, step and the numbers of sampled columns and rows
GRIDS = [(699, 9, 1, 698, 8), (9, 699, 1, 8, 698), (700, 100, 5, 139, 19), (2000, 30, 10, 199, 2),
         (1001, 1001, 5, 200, 199), (1200, 60, 6, 199, 9), (1000, 20, 5, 199, 3), (30, 1403, 7, 4, 199), (2, 2, 1, 1, 1),
         (800, 4, 5, 159, 0)]


def grid(task, width, height, step, columns, rows):
    """Only what lies on the grid of the samples is bright; no sample falls beside it."""
    count = step * step * columns * rows
    means = {"m_OriginalLumaR0": 200 if rows else 0} if task == "CHistogram0" else {
        "m_OriginalLumaR": 200 * count // (width * height)}
    bins = {"pHisto_Luma[100]": count, "pHisto_Red[200]": count, "pHisto_Green[100]": count, "pHisto_Blue[0]": count,
            "pHisto_Luma[9]": 0, "pHisto_Blue[9]": 0}
    return case(task, SAMPLED[task], f"in {width}x{height} grid {step} 200,100,0 9",
                "stat " + numbers({**bins, **means}))


def highlights(task, counts, flag, level):
    """So many of 100 samples per channel at `level`, the others one below the highlights."""
    columns = [",".join(str(level if x < n else 219) for n in counts) for x in range(101)]
    return case(task, SAMPLED[task], f"in 101x2 {' '.join(columns)}", f"stat m_Histo_Light_Exception={flag}")


def cast(task, means, flag, before=""):
    """40000 of 40401 pixels are sampled, so a sample is one above its mean."""
    means = [int(mean) for mean in means.split(",")]
    sample = ",".join(str(m + 1 if m else 0) for m in means)
    expected = dict(zip(("m_OriginalLumaR", "m_OriginalLumaG", "m_OriginalLumaB"), means), Bicromic=int(flag))
    return case(task, f"{SAMPLED[task]} {before}", f"in 201x201 {sample}", "stat " + numbers(expected))


def cases():
    for size in GRIDS:
        for task in SAMPLED:
            yield grid(task, *size)

    for task, rest in table("greys.txt"):
        settings, row, expected = rest.split("|")
        yield case(task, settings, f"in {len(row.split()) + 1}x2{row}7", f"stat{expected}")

    # Highlights that lack a colour have one channel's share below half of both others'.
    for flag, a, b, c, level in ((1, 20, 20, 5, 220), (0, 20, 20, 10, 220), (0, 20, 9, 10, 220), (0, 0, 0, 30, 220),
                                 (0, 0, 0, 0, 220), (1, 20, 20, 5, 255), (0, 20, 20, 5, 219)):
        for task in ("CHistogram0", "CHistogram_VIII"):
            for counts in ((a, b, c), (c, a, b), (b, c, a)):
                yield highlights(task, counts, flag, level)

    for task, rest in table("casts.txt"):
        yield cast(task, *rest.split(" | "))

    for bits in range(16):
        names = ("OrvelaLevelEnabled", "OrvelaLevel2Enabled", "Normal_Picture", "Under_Exposed_Picture")
        settings = numbers({name: bits >> i & 1 for i, name in enumerate(names)})
        yield case("CHistogram_Luma_after_Orv", settings, "in 9x9 5", "same" if 5 <= bits <= 7 else "skipped | writes")
    for task in ("CHistogram_IV", "CHistogram_VIII"):
        yield case(task, "", "in 9x9 5", "skipped", "writes")
