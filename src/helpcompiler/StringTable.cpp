#include "helpcompiler/StringTable.h"

#include <algorithm>

namespace tovimar::helpcompiler {

std::uint32_t StringTable::Add(const std::string& text) {
    constexpr std::size_t kLongest = kTablePage - 1;
    const std::string shown = text.substr(0, std::min(text.find('\0'), kLongest));
    if (shown.empty())
        return 0;
    const auto [place, added] = offsets_.try_emplace(shown, 0);
    if (added) {
        StartPageFor(bytes_, shown.size() + 1);
        place->second = static_cast<std::uint32_t>(bytes_.size());
        bytes_.append(shown).push_back('\0');
    }
    return place->second;
}

} // namespace tovimar::helpcompiler
