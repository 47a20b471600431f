#pragma once

#include "support/TestPlanes.h"

#include <QStringList>

#include <filesystem>
#include <fstream>
#include <map>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// Reference data: what tasks make of pictures, one case per line of a text file.
///
///     cases 2
///     # how the numbers were found
///     CColor mColor_Effect_Intensity_Enabled | in 5x5 100,20,3 | out 100,20,3
///     CColor mColor_Effect_Intensity_Value=9 | in 5x5 100,20,3 | skipped
///
/// First come the task and its settings (see setFields), then fields with a keyword each.
///
///     in WxH PIXELS     the picture; PIXELS are repeated until it is full
///     host PIXELS       the host's unprocessed picture, else the same as `in`
///     counted, pattern  the histograms count the picture; or bin i of luma, red, green and blue holds
///                       (37 i + 0, 11, 22, 33) % 101; else 0
///     out PIXELS        the task applies and gives this
///     at X,Y PIXEL      the task applies and this is one of its pixels
///     same, skipped     the task applies and changes nothing; or does not apply
///     stops SOURCE      a stop request ends the task, on the record as from this source
///     stat NAME=VALUE   statistics and bins afterwards
///     writes NAME=VALUE the only statistics that are written, to twelve digits
///     log, silent TEXT  a line that is logged, or is not
///
/// PIXELS are words, each a grey "9" or a colour "200,100,0" with an optional count "9*12", or hexadecimal
/// RGB bytes "#c86400"; or `grid STEP A B`: A where column and row are multiples of STEP, B elsewhere; or
/// `wave POWER STEP MODULUS R G B`: R + v, G + v, B + v with v = STEP * ((x + 3 y)^POWER % MODULUS).
struct ReferenceCase {
    std::string place; ///< file and line
    std::string task;
    std::string settings;
    std::multimap<std::string, QString> fields;

    bool has(const std::string& keyword) const { return fields.count(keyword) > 0; }
    /// The text of a field.
    /// @throws std::invalid_argument when it is missing
    QString text(const std::string& keyword) const {
        const auto found = fields.find(keyword);
        if (found == fields.end())
            throw std::invalid_argument("the field " + keyword + " is missing");
        return found->second;
    }
};

namespace referencecases {

inline int number(const QString& text) {
    bool isNumber = false;
    const int value = text.toInt(&isNumber);
    if (!isNumber)
        throw std::invalid_argument("no number: " + text.toStdString());
    return value;
}

inline testplanes::Pixel pixel(const QString& word) {
    const QStringList samples = word.split(',');
    if (samples.size() != 1 && samples.size() != 3)
        throw std::invalid_argument("no pixel: " + word.toStdString());
    testplanes::Pixel p;
    for (std::size_t c = 0; c < 3; ++c)
        p[c] = static_cast<std::uint8_t>(number(samples.at(samples.size() == 3 ? static_cast<int>(c) : 0)));
    return p;
}

inline void append(std::vector<testplanes::Pixel>& pixels, const QString& word) {
    if (!word.startsWith('#')) {
        const int count = word.contains('*') ? number(word.section('*', 1)) : 1;
        pixels.insert(pixels.end(), static_cast<std::size_t>(count), pixel(word.section('*', 0, 0)));
        return;
    }
    const QByteArray bytes = QByteArray::fromHex(word.mid(1).toLatin1());
    const auto sample = [&bytes](qsizetype i) { return static_cast<std::uint8_t>(bytes.at(i)); };
    for (qsizetype i = 0; i + 2 < bytes.size(); i += 3)
        pixels.push_back({sample(i), sample(i + 1), sample(i + 2)});
}

/// A picture from its description.
inline std::unique_ptr<CARGBPlane> picture(int width, int height, const QString& description) {
    const QStringList words = description.split(' ', Qt::SkipEmptyParts);
    if (words.value(0) == "grid") {
        const int step = number(words.value(1));
        const testplanes::Pixel on = pixel(words.value(2));
        const testplanes::Pixel off = pixel(words.value(3));
        return testplanes::make(width, height,
                                [=](int x, int y) { return x % step == 0 && y % step == 0 ? on : off; });
    }
    if (words.value(0) == "wave") {
        std::array<int, 6> n = {};
        for (int i = 0; i < 6; ++i)
            n.at(static_cast<std::size_t>(i)) = number(words.value(i + 1));
        return testplanes::make(width, height, [n](int x, int y) {
            const int k = x + 3 * y;
            const int value = n[1] * ((n[0] == 2 ? k * k : k) % n[2]);
            const auto sample = [value](int first) { return static_cast<std::uint8_t>(first + value); };
            return testplanes::Pixel{sample(n[3]), sample(n[4]), sample(n[5])};
        });
    }
    std::vector<testplanes::Pixel> pixels;
    for (const QString& word : words)
        append(pixels, word);
    if (pixels.empty())
        throw std::invalid_argument("no pixels");
    return testplanes::make(width, height, [&pixels, i = std::size_t{0}](int, int) mutable {
        return pixels[i++ % pixels.size()];
    });
}

inline ReferenceCase parse(const std::string& place, const QString& line) {
    static const QStringList known = {"in",    "host",    "counted", "pattern", "out", "at",    "same",
                                      "stops", "skipped", "stat",    "writes",  "log", "silent"};
    static const QStringList given = {"in", "host", "counted", "pattern"};
    const QStringList parts = line.split(QStringLiteral(" | "));
    ReferenceCase read{
        place, parts[0].section(' ', 0, 0).toStdString(), parts[0].section(' ', 1).toStdString(), {}};
    bool expects = false;
    for (const QString& part : parts.mid(1)) {
        const QString keyword = part.section(' ', 0, 0);
        if (!known.contains(keyword))
            throw std::invalid_argument("unknown field " + keyword.toStdString());
        expects = expects || !given.contains(keyword);
        read.fields.emplace(keyword.toStdString(), part.section(' ', 1));
    }
    if (!expects)
        throw std::invalid_argument("the case expects nothing");
    return read;
}

/// The cases of a file.
/// @throws std::runtime_error naming file and line, when one cannot be read, there is none, or there are
///         not as many as the first line states
inline std::vector<ReferenceCase> read(const std::filesystem::path& file) {
    std::ifstream stream(file);
    std::vector<ReferenceCase> cases;
    std::string line;
    int number = 0;
    unsigned long stated = 0;
    const auto place = [&] { return file.filename().string() + ":" + std::to_string(number); };
    try {
        while (std::getline(stream, line)) {
            ++number;
            if (number == 1)
                stated = line.starts_with("cases ") ? std::stoul(line.substr(6)) : 0;
            else if (!line.empty() && line[0] != '#')
                cases.push_back(parse(place(), QString::fromStdString(line)));
        }
    } catch (const std::logic_error& failure) {
        throw std::runtime_error(place() + ": " + failure.what());
    }
    if (cases.empty() || cases.size() != stated)
        throw std::runtime_error(place() + ": " + std::to_string(cases.size()) + " cases, stated are " +
                                 std::to_string(stated));
    return cases;
}

} // namespace referencecases

} // namespace orvela
