#include "platform/painting/FieldName.h"

#include "platform/text/Text.h"

namespace tovimar::platform::painting {

std::string FieldName(std::string_view source) {
    auto name = text::Trim(source);
    const auto point = name.rfind('.');
    if (point != std::string::npos && point + 1 < name.size())
        name = name.substr(point + 1);
    std::erase_if(name, [](char letter) { return letter == '[' || letter == ']'; });
    return name;
}

std::string SpacedName(std::string_view name) {
    std::string spaced;
    for (const char letter : name) {
        const bool capital = letter >= 'A' && letter <= 'Z';
        if (capital && !spaced.empty() && spaced.back() >= 'a' && spaced.back() <= 'z')
            spaced += ' ';
        spaced += letter == '_' ? ' ' : letter;
    }
    return spaced;
}

} // namespace tovimar::platform::painting
