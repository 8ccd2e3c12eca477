#include "foundation/CSpecialChars.h"

#include "platform/text/HtmlEntities.h"

#include <charconv>
#include <cstdint>

namespace tovimar {
namespace {

/// Name without "&" and ";"; empty for another form.
std::string_view NameIn(std::string_view entity) {
    if (entity.size() < 4 || entity.front() != '&' || entity.back() != ';' || entity[1] == '#')
        return {};
    return entity.substr(1, entity.size() - 2);
}

/// Number in "&#160;", 0 for another form.
char32_t NumberIn(std::string_view code) {
    if (code.size() < 4 || !code.starts_with("&#") || code.back() != ';')
        return 0;
    std::uint32_t number = 0;
    const char* end = code.data() + code.size() - 1;
    const auto [stop, error] = std::from_chars(code.data() + 2, end, number);
    return error == std::errc() && stop == end ? number : 0;
}

} // namespace

std::string CSpecialChars::GetNumCode(std::string_view name) const {
    const char32_t codePoint = CharacterOf(name);
    return codePoint == 0 ? std::string()
                          : "&#" + std::to_string(static_cast<std::uint32_t>(codePoint)) + ";";
}

std::string CSpecialChars::GetCharCode(std::string_view code) const {
    const char32_t number = NumberIn(code);
    const std::string_view name = text::EntityOfCharacter(number);
    return name.empty() ? std::string() : "&" + std::string(name) + ";";
}

char32_t CSpecialChars::CharacterOf(std::string_view name) {
    const std::string_view bare = NameIn(name);
    return bare.empty() ? 0 : text::CharacterOfEntity(bare);
}

} // namespace tovimar
