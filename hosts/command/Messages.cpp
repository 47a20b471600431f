#include "command/Messages.h"

#include <QList>
#include <QString>
#include <QUtf8StringView>

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdio>
#include <iostream>

namespace orvela {

namespace Messages {

namespace {

// The beginning names the photograph, the end says what to do.
constexpr std::size_t kBeginning = 110;
constexpr std::size_t kEnd = 180;

// Number of bytes of the character that `text` begins with; 0 when it begins with none.
std::size_t characterSize(std::string_view text) {
    for (std::size_t size = 1; size <= std::min<std::size_t>(4, text.size()); ++size)
        if (QUtf8StringView(text.data(), static_cast<qsizetype>(size)).isValidUtf8())
            return size;
    return 0;
}

// Also what parts lines or turns the direction of writing; joiners belong to the words of many languages.
bool isControl(std::string_view character) {
    const char32_t code =
        QString::fromUtf8(character.data(), static_cast<qsizetype>(character.size())).toUcs4()[0];
    switch (QChar::category(code)) {
    case QChar::Other_Control:
    case QChar::Separator_Line:
    case QChar::Separator_Paragraph:
        return true;
    case QChar::Other_Format:
        return code != U'\u200C' && code != U'\u200D';
    default:
        return false;
    }
}

std::string escaped(std::string_view bytes) {
    if (bytes == "\n")
        return "\\n";
    if (bytes == "\t")
        return "\\t";
    std::string text;
    for (const char byte : bytes) {
        std::array<char, 5> code{};
        std::snprintf(code.data(), code.size(), "\\x%02x", static_cast<std::uint8_t>(byte));
        text += code.data();
    }
    return text;
}

// Where a character begins, at `at` or before.
std::size_t characterStart(const std::string& text, std::size_t at) {
    while (at > 0 && static_cast<std::uint8_t>(text[at]) >> 6 == 2)
        --at;
    return at;
}

std::string withoutMiddle(const std::string& text) {
    if (text.size() <= kBeginning + kEnd)
        return text;
    return text.substr(0, characterStart(text, kBeginning)) + " ... " +
           text.substr(characterStart(text, text.size() - kEnd));
}

} // namespace

std::string shown(std::string_view text) {
    std::string line;
    while (!text.empty()) {
        const std::size_t size = characterSize(text);
        const std::string_view taken = text.substr(0, size == 0 ? 1 : size);
        line += size == 0 || isControl(taken) ? escaped(taken) : std::string(taken);
        text.remove_prefix(taken.size());
    }
    return line;
}

void tell(std::string_view text) {
    std::cerr << "orvela: " << withoutMiddle(shown(text)) << std::endl;
}

} // namespace Messages

} // namespace orvela
