#include "helpcompiler/Markup.h"
#include "helpcompiler/WordTable.h"
#include "platform/text/HtmlEntities.h"

#include <charconv>
#include <cstdint>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kLongestReference = 12; ///< "&thetasym;" and "&#x0010FFFF"

struct Reference {
    char32_t character = 0; ///< 0 for a "&" that begins none
    std::size_t length = 1;
};

Reference Numbered(std::string_view text) {
    const bool hexadecimal = text.size() > 2 && (text[2] == 'x' || text[2] == 'X');
    const char* start = text.data() + (hexadecimal ? 3 : 2);
    const char* end = text.data() + text.size();
    std::uint32_t number = 0;
    const auto [stop, error] = std::from_chars(start, end, number, hexadecimal ? 16 : 10);
    if (error != std::errc() || number == 0 || number > 0x10FFFF)
        return {};
    const auto length = static_cast<std::size_t>(stop - text.data());
    return {number, length + (stop < end && *stop == ';' ? 1 : 0)};
}

/// `text` begins with "&".
Reference ReadReference(std::string_view text) {
    text = text.substr(0, kLongestReference);
    if (text.size() > 2 && text[1] == '#')
        return Numbered(text);
    const std::size_t end = text.find(';');
    if (end == std::string_view::npos)
        return {};
    return {text::CharacterOfEntity(text.substr(1, end - 1)), end + 1};
}

/// Bytes 80 to 9F have no characters of their own numbers; whoever writes such a number means the byte.
bool IsBytePlace(char32_t character) {
    return character < 0x80 || (character >= 0x80 && character < 0xA0);
}

std::string BytesOf(char32_t character, std::string_view source, const text::CodePage& page, Unheld unheld) {
    const bool doubleByte = IsDoubleByte(page.Number());
    if (IsBytePlace(character) && (character < 0x80 || !doubleByte))
        return {static_cast<char>(character)};
    if (page.CanEncode(character))
        return page.Encode(text::FromCodePoint(character));
    if (unheld == Unheld::Keep)
        return std::string(source);
    return {character < 0x100 && !doubleByte ? static_cast<char>(character) : ' '};
}

} // namespace

std::string DecodeReferences(std::string_view text, const text::CodePage& page, Unheld unheld) {
    std::string out;
    std::size_t from = 0;
    for (std::size_t at = text.find('&'); at != std::string_view::npos; at = text.find('&', from)) {
        out.append(text.substr(from, at - from));
        const Reference reference = ReadReference(text.substr(at));
        const std::string_view source = text.substr(at, reference.length);
        if (reference.character == 0)
            out.append(source.substr(0, 1));
        else
            out.append(BytesOf(reference.character, source, page, unheld));
        from = at + (reference.character == 0 ? 1 : reference.length);
    }
    return out.append(text.substr(from));
}

} // namespace tovimar::helpcompiler
