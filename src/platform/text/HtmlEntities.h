#pragma once

#include <string_view>

/// The 252 character entities of HTML 4, by bare names: "nbsp".
namespace tovimar::text {

/// A name is looked up as it is written and, failing that, without regard to case; 0 when it isn't known.
char32_t CharacterOfEntity(std::string_view name);
/// Empty for a character without a name.
std::string_view EntityOfCharacter(char32_t character);

} // namespace tovimar::text
