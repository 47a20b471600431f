#include "metadata/JpegMetadata.h"

#include "metadata/ExtendedXmp.h"
#include "metadata/ImageResources.h"
#include "metadata/JpegSegments.h"

#include <algorithm>
#include <cctype>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr auto kJfif = "JFIF\0"sv;
constexpr auto kExif = "Exif\0\0"sv;
constexpr auto kXmp = "http://ns.adobe.com/xap/1.0/\0"sv;
constexpr auto kPhotoshop = "Photoshop 3.0\0"sv;
constexpr std::size_t kLongest = 65533;

enum Marker {
    App0 = 0xE0,
    App1,
    App2,
    App4 = 0xE4,
    App11 = 0xEB,
    App13 = 0xED,
    App14,
    App15,
    Comment = 0xFE
};

// "APP12 Ducky": the marker and the identifier that most segments begin with.
std::string nameOf(const JpegSegment& segment) {
    if (segment.marker == App1 && startsWith(segment.data, "http://ns.adobe.com/xmp/extension/"))
        return kExtendedXmp;
    if (segment.marker == App0 && asText(segment.data).substr(0, 14).ends_with("HEAPJPGM"))
        return "APP0 CIFF";
    std::string name = "APP" + std::to_string(segment.marker - App0);
    std::string identifier;
    for (const std::uint8_t byte : segment.data.first(std::min<std::size_t>(16, segment.data.size()))) {
        if (!std::isalnum(byte) && byte != '_' && byte != '-')
            break;
        identifier += static_cast<char>(byte);
    }
    return identifier.size() < 2 ? name : name + " " + identifier;
}

void takeJfif(ByteView data, Metadata& metadata) {
    if (data.size() < 14 || metadata.density)
        return;
    const auto edge = [&](std::size_t at) {
        return Rational{static_cast<std::uint32_t>(number(data, at, 2, ByteOrder::Big)), 1};
    };
    const Density density{edge(8), edge(10),
                          data[7] == 1   ? DensityUnit::Inch
                          : data[7] == 2 ? DensityUnit::Centimetre
                                         : DensityUnit::None};
    // Square pixels without a unit are what encoders write that know no density.
    const bool says = density.unit != DensityUnit::None || density.x != density.y;
    if (says && density.isMeant())
        metadata.density = density;
    if (data[12] > 0 && data[13] > 0)
        metadata.unheld.emplace_back("the JFIF thumbnail");
}

// A block of more than 64 KiB goes on in further segments, which have no byte order mark.
bool takeExif(ByteView data, Metadata& metadata) {
    const ByteView block = behind(data, kExif.size());
    const bool begins = startsWith(block, "II*\0"sv) || startsWith(block, "MM\0*"sv);
    if (begins && !metadata.exif.empty())
        return false;
    append(metadata.exif, block);
    return true;
}

void takeResources(ByteView list, Metadata& metadata) {
    if (startsWith(list, "8BIM") && imageResources(metadata.resources).rest.empty())
        padToEven(metadata.resources);
    append(metadata.resources, list);
}

// What refers to other places of the file or to its compressed data would lie in the result.
const char* unheldName(const JpegSegment& segment) {
    if (segment.marker == App0 && startsWith(segment.data, "JFXX\0"sv))
        return "the JFXX thumbnail";
    if (segment.marker == App2 && startsWith(segment.data, "MPF\0"sv))
        return "the further pictures (MPF)";
    if (segment.marker == App2 && startsWith(segment.data, "urn:iso:std:iso:ts:21496"))
        return "the gain map";
    if (segment.marker == App4 && startsWith(segment.data, "SCALADO"))
        return "the index of the compressed data (SCALADO)";
    if (segment.marker == App11)
        return "HDR or provenance data (APP11)";
    return nullptr;
}

bool isProfile(const JpegSegment& segment) {
    return segment.marker == App2 && startsWith(segment.data, "ICC_PROFILE\0"sv);
}

// Whether the encoder of the result writes it itself.
bool isEncoders(const JpegSegment& segment) {
    return segment.marker < App0 || segment.marker > Comment ||
           (segment.marker > App15 && segment.marker < Comment) || isProfile(segment) ||
           (segment.marker == App14 && startsWith(segment.data, "Adobe"));
}

void take(const JpegSegment& segment, Metadata& metadata) {
    const ByteView data = segment.data;
    if (isEncoders(segment))
        return;
    if (const char* name = unheldName(segment)) {
        nameOnce(metadata.unheld, name);
    } else if (segment.marker == App0 && startsWith(data, kJfif)) {
        takeJfif(data, metadata);
    } else if (segment.marker == App1 && startsWith(data, kExif)) {
        if (!takeExif(data, metadata))
            nameOnce(metadata.unheld, "a second Exif block");
    } else if (segment.marker == App1 && startsWith(data, kXmp) && metadata.xmp.empty()) {
        metadata.xmp = copyOf(behind(data, kXmp.size()));
    } else if (segment.marker == App13 && startsWith(data, kPhotoshop)) {
        takeResources(behind(data, kPhotoshop.size()), metadata);
    } else if (segment.marker == Comment) {
        metadata.texts.push_back({"Comment", std::string(asText(data))});
    } else {
        metadata.segments.push_back({nameOf(segment), copyOf(data), segment.marker});
    }
}

void put(Bytes& file, int marker, std::string_view head, ByteView data) {
    append(file, 0xFF00U | static_cast<unsigned>(marker), 2, ByteOrder::Big);
    append(file, 2 + head.size() + data.size(), 2, ByteOrder::Big);
    append(file, head);
    append(file, data);
}

void putInPieces(Bytes& file, int marker, std::string_view head, ByteView data) {
    while (!data.empty()) {
        const std::size_t size = std::min(data.size(), kLongest - head.size());
        put(file, marker, head, data.first(size));
        data = behind(data, size);
    }
}

// Whole numbers per inch or centimetre, whichever is nearer.
Density forJfif(const Density& density) {
    const double length = density.millimetres();
    const auto rounded = [](double value) {
        return Rational{static_cast<std::uint32_t>(std::clamp(value + 0.5, 1.0, 65535.0)), 1};
    };
    if (length == 0)
        return {rounded(density.x.value()), rounded(density.y.value()), DensityUnit::None};
    const auto in = [&](double unit) {
        return std::pair(density.x.value() / length * unit, density.y.value() / length * unit);
    };
    const auto error = [&](double value) {
        const double off = rounded(value).value() - value;
        return off * off / (value * value);
    };
    const auto [inchX, inchY] = in(25.4);
    const auto [metricX, metricY] = in(10);
    if (error(metricX) + error(metricY) < error(inchX) + error(inchY))
        return {rounded(metricX), rounded(metricY), DensityUnit::Centimetre};
    return {rounded(inchX), rounded(inchY), DensityUnit::Inch};
}

// Without a density, Exif's counts, which a JFIF head would contradict. Of three colours a head says what
// they are, so that it must not stand where the encoder says by Adobe's marker that they are others.
void putJfif(Bytes& file, const Metadata& metadata, const std::vector<JpegSegment>& encoders) {
    const auto has = [&](auto condition) { return std::any_of(encoders.begin(), encoders.end(), condition); };
    const bool written =
        has([](const JpegSegment& one) { return one.marker == App0 && startsWith(one.data, kJfif); });
    const bool adobe = has([](const JpegSegment& one) { return one.marker == App14; });
    const bool threeColours = has([](const JpegSegment& one) {
        return isJpegFrame(one.marker) && one.data.size() > 5 && one.data[5] == 3;
    });
    const bool allowed = written || !adobe || !threeColours;
    if (!allowed || (!metadata.density && !metadata.exif.empty()))
        return;
    const Density density = forJfif(metadata.density.value_or(Density{{1, 1}, {1, 1}}));
    Bytes data = copyOf(asBytes("\1\1"sv));
    data.push_back(density.unit == DensityUnit::Inch ? 1 : density.unit == DensityUnit::Centimetre ? 2 : 0);
    append(data, density.x.numerator, 2, ByteOrder::Big);
    append(data, density.y.numerator, 2, ByteOrder::Big);
    append(data, 0, 2, ByteOrder::Big);
    put(file, App0, kJfif, data);
}

void putSegments(Bytes& file, const Metadata& metadata, bool first) {
    for (const Chunk& segment : metadata.segments)
        if ((segment.marker == App0) == first)
            put(file, segment.marker, "", segment.data);
}

} // namespace

Metadata readJpegMetadata(ByteView file) {
    Metadata metadata;
    metadata.format = FileFormat::Jpeg;
    for (const JpegSegment& segment : jpegSegments(file))
        take(segment, metadata);
    for (const JpegSegment& segment : laterJpegSegments(file))
        if (isProfile(segment))
            nameOnce(metadata.unheld, "an ICC profile behind the beginning of the picture");
        else
            take(segment, metadata);
    // As they are written.
    std::stable_partition(metadata.segments.begin(), metadata.segments.end(),
                          [](const Chunk& segment) { return segment.marker == App0; });
    const bool further = std::any_of(metadata.unheld.begin(), metadata.unheld.end(),
                                     [](const std::string& name) { return name.ends_with("(MPF)"); });
    const ByteView rest = behindJpeg(file);
    if (!further || holdsFilm(rest))
        nameRest(rest, metadata);
    return metadata;
}

void embedIntoJpeg(const Metadata& metadata, Bytes& encoded) {
    const std::vector<JpegSegment> encoders = jpegSegments(encoded);
    Bytes file = copyOf(asBytes("\xFF\xD8"sv));
    file.reserve(encoded.size() + metadata.exif.size() + metadata.xmp.size() + metadata.resources.size() +
                 65536);
    putJfif(file, metadata, encoders);
    putSegments(file, metadata, true);
    putInPieces(file, App1, kExif, metadata.exif);
    putInPieces(file, App1, kXmp, metadata.xmp);
    putSegments(file, metadata, false);
    putInPieces(file, App13, kPhotoshop, metadata.resources);
    for (const Text& text : metadata.texts)
        put(file, Comment, text.text, {});
    for (const JpegSegment& segment : encoders)
        if (isEncoders(segment))
            put(file, segment.marker, "", segment.data);
    append(file, jpegScans(encoded));
    encoded = std::move(file);
}

} // namespace orvela
