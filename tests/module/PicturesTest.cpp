#include "common/ImageHost.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "module/ForeignHost.h"

#include <cstring>

using namespace orvela;

namespace {

constexpr int kWidth = 97;
constexpr int kHeight = 64;

int valueOf(const Photograph& photograph, std::size_t sample) {
    if (photograph.depth == 8)
        return photograph.samples[sample];
    std::uint16_t value = 0;
    std::memcpy(&value, photograph.samples.data() + 2 * sample, sizeof value);
    return value;
}

// A part of the bundled photograph with these channels, of which one that is no colour gets values of its
// own.
Photograph part(ColorModel model, int depth) {
    const Photograph whole = readPhotograph(ORVELA_SAMPLES "/coffee.png");
    const int channels = samplesPerPixel(model);
    Photograph cut;
    cut.width = kWidth;
    cut.height = kHeight;
    cut.depth = depth;
    cut.model = model;
    for (int y = 0; y < kHeight; ++y)
        for (int x = 0; x < kWidth; ++x)
            for (int c = 0; c < channels; ++c) {
                const bool colour = c < (channels < 3 ? 1 : 3);
                const int eight =
                    colour
                        ? whole.samples[static_cast<std::size_t>(((y + 120) * whole.width + x + 200) * 3 + c)]
                        : (7 * x + 3 * y) % 256;
                const auto sample =
                    static_cast<std::uint16_t>(depth == 8 ? eight : eight * 256 + (x * 31 + y) % 256);
                cut.samples.push_back(static_cast<std::uint8_t>(sample));
                if (depth == 16)
                    cut.samples.push_back(static_cast<std::uint8_t>(sample >> 8));
            }
    return cut;
}

struct Kind {
    const char* name;
    ColorModel model;
    int depth;
    int imageMode;
};

constexpr Kind kKinds[] = {
    {"grey", ColorModel::Grey, 8, 1},           {"grey16", ColorModel::Grey, 16, 10},
    {"duotone", ColorModel::Grey, 8, 8},        {"alpha", ColorModel::GreyAlpha, 8, 1},
    {"alpha16", ColorModel::GreyAlpha, 16, 10}, {"rgb", ColorModel::Rgb, 8, 3},
    {"rgb16", ColorModel::Rgb, 16, 11},         {"lab", ColorModel::Rgb, 8, 9},
    {"lab16", ColorModel::Rgb, 16, 12},         {"hsl", ColorModel::Rgb, 8, 5},
    {"rgba", ColorModel::RgbAlpha, 8, 3},       {"rgba16", ColorModel::RgbAlpha, 16, 11},
    {"cmyk", ColorModel::Cmyk, 8, 4},           {"cmyk16", ColorModel::Cmyk, 16, 13},
    {"channels", ColorModel::Rgb, 8, 7},
};

class PicturesTest : public ForeignHostTest {
protected:
    // The samples as a host has them, from or to its file.
    void give(const Photograph& photograph, const QString& name) {
        QByteArray samples(reinterpret_cast<const char*>(photograph.samples.data()),
                           static_cast<qsizetype>(photograph.samples.size()));
        for (std::size_t i = 0; photograph.depth == 16 && i < photograph.samples.size() / 2; ++i) {
            const std::uint16_t deep = toHostSample(static_cast<std::uint16_t>(valueOf(photograph, i)));
            std::memcpy(samples.data() + 2 * i, &deep, sizeof deep);
        }
        store((name + ".raw").toUtf8(), samples);
    }
    Photograph taken(const Photograph& like, const QString& name) const {
        Photograph result = like;
        const QByteArray samples = bytes((name + ".out").toUtf8());
        result.samples.assign(samples.begin(), samples.end());
        EXPECT_EQ(result.samples.size(), like.samples.size());
        result.samples.resize(like.samples.size());
        return result;
    }

    // What the command makes of it.
    Photograph enhanced(const Photograph& photograph, const QString& arguments = "--mode Automatic") {
        WriteOptions options;
        options.overwrite = true;
        writePhotograph(photograph, path("in.tif").toStdString(), options);
        const Answer answer = orvela(("enhance in.tif --force -o out.tif " + arguments).toUtf8().constData());
        EXPECT_EQ(answer.status, 0) << answer.err;
        return readPhotograph(path("out.tif").toStdString());
    }

    static QStringList opening(const Kind& kind) {
        return {QString("image %1 %2 %3 %4 %5 1")
                    .arg(kWidth)
                    .arg(kHeight)
                    .arg(samplesPerPixel(kind.model))
                    .arg(kind.depth)
                    .arg(kind.imageMode),
                QString("read %1.raw").arg(kind.name)};
    }

    // The host's samples are those of the command, and channels without colour those that went in.
    void expectSame(const Kind& kind, const Photograph& before) {
        SCOPED_TRACE(kind.name);
        const Photograph out = taken(before, kind.name);
        const Photograph expected = enhanced(before);
        const auto channels = static_cast<std::size_t>(samplesPerPixel(kind.model));
        int wrong = 0;
        int changed = 0;
        for (std::size_t i = 0; i < std::size_t{kWidth} * kHeight * channels; ++i) {
            const bool deep = kind.depth == 16;
            const auto host = static_cast<std::uint16_t>(valueOf(out, i));
            const auto went = static_cast<std::uint16_t>(valueOf(before, i));
            if (channels % 2 == 0 && i % channels == channels - 1) {
                const int untouched = deep ? toHostSample(went) : went;
                const int opaque = deep ? 32768 : 255;
                wrong += host != (channels == 2 ? opaque : untouched);
            } else {
                wrong += (deep ? toFileSample(host) : host) != valueOf(expected, i);
                changed += host != (deep ? toHostSample(went) : went);
            }
        }
        EXPECT_EQ(wrong, 0);
        EXPECT_GT(changed, kWidth * kHeight / 4) << "nothing was enhanced";
    }
};

} // namespace

TEST_F(PicturesTest, EveryKindComesBackAsTheCommandMakesIt) {
    QStringList commands;
    QStringList answers;
    for (const Kind& kind : kKinds) {
        const int channels = samplesPerPixel(kind.model);
        give(part(kind.model, kind.depth), kind.name);
        commands += opening(kind) +
                    QStringList({"click press btnAutomatic", "run", QString("write %1.out").arg(kind.name)});
        answers += QString("run 1:0 2:0 3:0 5:0, stored %1, advanced %2")
                       .arg(std::min(channels, 3))
                       .arg(1 + (channels < 3 ? channels : 3) + std::min(channels, 3) + 1 + 1);
    }
    EXPECT_EQ(host(commands), answers);
    for (const Kind& kind : kKinds)
        expectSame(kind, part(kind.model, kind.depth));
}

TEST_F(PicturesTest, ASelectedRectangleAloneIsWorkedOn) {
    const Kind kind = {"rgb", ColorModel::Rgb, 8, 3};
    const Photograph whole = part(kind.model, kind.depth);
    constexpr int kTop = 5, kLeft = 11, kBottom = 53, kRight = 90;
    give(whole, kind.name);
    EXPECT_EQ(host(opening(kind) +
                   QStringList({"rect 5 11 53 90", "click press btnAutomatic", "run", "write rgb.out"})),
              QStringList({"run 1:0 2:0 3:0 5:0, stored 3, advanced 9"}));
    Photograph cut = whole;
    cut.width = kRight - kLeft;
    cut.height = kBottom - kTop;
    cut.samples.clear();
    for (int y = kTop; y < kBottom; ++y)
        for (int i = kLeft * 3; i < kRight * 3; ++i)
            cut.samples.push_back(whole.samples[static_cast<std::size_t>(y * kWidth * 3 + i)]);
    const Photograph inside = enhanced(cut);
    EXPECT_NE(inside.samples, cut.samples);
    Photograph expected = whole;
    auto next = inside.samples.begin();
    for (int y = kTop; y < kBottom; ++y)
        for (int i = kLeft * 3; i < kRight * 3; ++i)
            expected.samples[static_cast<std::size_t>(y * kWidth * 3 + i)] = *next++;
    EXPECT_TRUE(taken(whole, kind.name).samples == expected.samples);
}

TEST_F(PicturesTest, ADialogueOfTheUserIsWrittenAndACancelledOneIsNot) {
    const Kind kind = {"rgb", ColorModel::Rgb, 8, 3};
    const Photograph whole = part(kind.model, kind.depth);
    give(whole, kind.name);
    const QString cancelled = "run 1:0 2:0 3:-128, stored 0, advanced 4";
    EXPECT_EQ(host(opening(kind) +
                   QStringList({"click close", "run", "click key Esc", "run", "click press btnAdvanced",
                                "click press btnCancel", "click press btnAddIllumination", "click close",
                                "click close", "run", "write cancelled.out", "click watch",
                                "click press btnAddIllumination", "click enter txtValue 6.5",
                                "click press btnOK", "run", "write rgb.out"})),
              QStringList({cancelled, cancelled, cancelled, "shown: CDlgMain", "shown: CDlgSettings",
                           "shown: CDlgDualPreview", "run 1:0 2:0 3:0 5:0, stored 3, advanced 9"}));
    EXPECT_EQ(bytes("cancelled.out"), bytes("rgb.raw"));
    EXPECT_NE(bytes("rgb.out"), bytes("rgb.raw"));
    EXPECT_TRUE(taken(whole, kind.name).samples ==
                enhanced(whole, "--mode \"Add Illumination\" --value 6.5").samples);
    EXPECT_EQ(log().filter("Now outputting the result").size(), 1);
}

TEST_F(PicturesTest, BatchModeReplaysWithoutTheMainWindow) {
    const Kind kind = {"rgb", ColorModel::Rgb, 8, 3};
    const QString done = "run 1:0 2:0 3:0 5:0, stored 3, advanced 9";
    const Photograph whole = part(kind.model, kind.depth);
    give(whole, kind.name);
    const QStringList said = host(opening(kind) +
                                  QStringList({"click press btnToggleBatchMode", "click box OK",
                                               "click press btnAutoContrast", "run"}) +
                                  opening(kind) +
                                  QStringList({"click watch", "run", "click watch", "run", "write rgb.out",
                                               "unload", "load " + mModule}) +
                                  opening(kind) + QStringList({"click watch", "run", "write other.out"}));
    EXPECT_TRUE(said.value(0).startsWith("box: Batch Mode Enabled|")) << said.value(0).toStdString();
    EXPECT_EQ(said.mid(1), QStringList({done, "shown: CDlgSettings", done, "shown: CDlgSettings", done,
                                        "unloaded", "shown: CDlgSettings", done}));
    const QString contrast = "--mode \"Auto Contrast\"";
    EXPECT_TRUE(taken(whole, "other").samples == enhanced(whole, contrast).samples);
    EXPECT_TRUE(taken(whole, kind.name).samples == enhanced(enhanced(whole, contrast), contrast).samples);
}
