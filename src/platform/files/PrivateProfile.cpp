#include "platform/files/PrivateProfile.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <optional>

namespace tovimar::platform {
namespace {

using Lines = std::vector<std::string>;

constexpr std::string_view kUtf8Header = "\xEF\xBB\xBF";
constexpr std::string_view kLineEnds("\r\n\0", 3);

struct Profile {
    Lines lines;
    bool utf8 = false;
};

/// Where a section stands: its heading, and behind its last line.
struct Place {
    std::size_t heading, end;
};

/// A zero character or a single CR ends a line too: no item may hold one.
Lines LinesOf(const std::string& text) {
    Lines lines;
    for (std::size_t begin = 0; begin < text.size();) {
        const std::size_t end = std::min(text.find_first_of(kLineEnds, begin), text.size());
        lines.push_back(text.substr(begin, end - begin));
        begin = end + (text.compare(end, 2, "\r\n") == 0 ? 2 : 1);
    }
    return lines;
}

/// Raises what reading a file that stands raises.
Profile Read(const std::string& path) {
    Profile profile;
    auto& files = *Env().files;
    if (!files.FileExists(path))
        return profile;
    std::string bytes = files.ReadFile(path);
    profile.utf8 = bytes.starts_with(kUtf8Header);
    const std::string text = profile.utf8 ? text::MakeValidUtf8(bytes.substr(kUtf8Header.size()))
                                          : text::AnsiCodePage().Decode(bytes);
    profile.lines = LinesOf(text);
    return profile;
}

void Write(const std::string& path, const Profile& profile) {
    std::string text;
    for (const std::string& line : profile.lines)
        text += line + "\r\n";
    Env().files->WriteFile(path, profile.utf8 ? std::string(kUtf8Header) + text
                                              : text::AnsiCodePage().Encode(text));
}

/// The name in "[name]"; none for another line.
std::optional<std::string> HeadingIn(const std::string& line) {
    const std::string trimmed = text::TrimWhitespace(line);
    const auto end = trimmed.find(']');
    if (!trimmed.starts_with('[') || end == std::string::npos)
        return std::nullopt;
    return text::TrimWhitespace(trimmed.substr(1, end - 1));
}

std::optional<Place> Find(const Lines& lines, const std::string& section) {
    std::optional<Place> place;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const auto heading = HeadingIn(lines[i]);
        if (!heading)
            continue;
        if (place)
            return Place{place->heading, i};
        if (text::EqualsIgnoringCase(*heading, section))
            place = Place{i, lines.size()};
    }
    return place;
}

bool IsItem(const std::string& trimmed) {
    return !trimmed.empty() && trimmed.front() != ';';
}

/// A line end would begin another item, or another section.
std::string OneLine(const std::string& text) {
    return text.substr(0, text.find_first_of(kLineEnds));
}

/// Position of the item's line in the section; the place's end when it isn't there.
std::size_t FindItem(const Lines& lines, const Place& place, const std::string& name) {
    for (std::size_t i = place.heading + 1; i < place.end; ++i) {
        const std::string trimmed = text::TrimWhitespace(lines[i]);
        const std::string here = text::TrimWhitespace(trimmed.substr(0, trimmed.find('=')));
        if (IsItem(trimmed) && text::EqualsIgnoringCase(here, name))
            return i;
    }
    return place.end;
}

/// Behind the last line that isn't empty, so that blank lines go on dividing sections.
std::size_t EndOfText(const Lines& lines, const Place& place) {
    std::size_t end = place.end;
    while (end > place.heading + 1 && text::TrimWhitespace(lines[end - 1]).empty())
        --end;
    return end;
}

auto At(Lines& lines, std::size_t position) {
    return lines.begin() + static_cast<std::ptrdiff_t>(position);
}

Profile ReadOrNothing(const std::string& path) {
    try {
        return Read(path);
    } catch (const RaisedError&) {
        return {};
    }
}

} // namespace

Lines PrivateProfileSectionNames(const std::string& path) {
    Lines names;
    for (const std::string& line : ReadOrNothing(path).lines)
        if (const auto heading = HeadingIn(line))
            names.push_back(*heading);
    return names;
}

Lines PrivateProfileSection(const std::string& path, const std::string& section) {
    const Lines lines = ReadOrNothing(path).lines;
    Lines items;
    if (const auto place = Find(lines, section))
        for (std::size_t i = place->heading + 1; i < place->end; ++i)
            if (std::string line = text::TrimWhitespace(lines[i]); IsItem(line))
                items.push_back(std::move(line));
    return items;
}

void WritePrivateProfileSection(const std::string& path, const std::string& section, const Lines& lines) {
    Profile profile = Read(path);
    auto place = Find(profile.lines, section);
    if (!place) {
        profile.lines.push_back("[" + OneLine(section) + "]");
        place = Place{profile.lines.size() - 1, profile.lines.size()};
    }
    const std::size_t first = place->heading + 1;
    profile.lines.erase(At(profile.lines, first), At(profile.lines, EndOfText(profile.lines, *place)));
    Lines clean;
    std::transform(lines.begin(), lines.end(), std::back_inserter(clean), OneLine);
    profile.lines.insert(At(profile.lines, first), clean.begin(), clean.end());
    Write(path, profile);
}

void DeletePrivateProfileSection(const std::string& path, const std::string& section) {
    Profile profile = Read(path);
    const auto place = Find(profile.lines, section);
    if (!place)
        return;
    profile.lines.erase(At(profile.lines, place->heading), At(profile.lines, place->end));
    Write(path, profile);
}

void WritePrivateProfileString(const std::string& path, const std::string& section, const std::string& name,
                               const std::string& value) {
    const std::string line = OneLine(name) + "=" + OneLine(value);
    Profile profile = Read(path);
    const auto place = Find(profile.lines, section);
    if (!place) {
        profile.lines.insert(profile.lines.end(), {"[" + OneLine(section) + "]", line});
    } else if (const std::size_t at = FindItem(profile.lines, *place, name); at < place->end) {
        profile.lines[at] = line;
    } else {
        profile.lines.insert(At(profile.lines, EndOfText(profile.lines, *place)), line);
    }
    Write(path, profile);
}

} // namespace tovimar::platform
