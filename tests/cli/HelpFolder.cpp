#include "cli/HelpFolder.h"

#include "cli/Program.h"
#include "platform/text/Text.h"

#include <sstream>

namespace tovimar::test {
namespace {

/// The file name or anchor that a link means.
std::string Meant(const std::string& link) {
    const std::string plain = text::ReplaceAll(link, "\\", "/");
    std::string meant;
    for (std::size_t i = 0; i < plain.size(); ++i)
        if (plain[i] == '%' && i + 2 < plain.size()) {
            meant += static_cast<char>(std::stoi(plain.substr(i + 1, 2), nullptr, 16));
            i += 2;
        } else
            meant += plain[i];
    return meant;
}

int Byte(const std::string& bytes, std::size_t at) {
    return static_cast<unsigned char>(bytes[at]);
}
int Word(const std::string& bytes, std::size_t at) {
    return Byte(bytes, at) * 256 + Byte(bytes, at + 1);
}

} // namespace

std::pair<int, int> SizeOfJpeg(const std::string& bytes) {
    if (!bytes.starts_with("\xff\xd8"))
        return {0, 0};
    for (std::size_t at = 2; at + 9 < bytes.size() && Byte(bytes, at) == 0xff;) {
        const int marker = Byte(bytes, at + 1);
        if (marker >= 0xc0 && marker <= 0xcf && marker != 0xc4 && marker != 0xc8 && marker != 0xcc)
            return {Word(bytes, at + 7), Word(bytes, at + 5)};
        at += 2 + static_cast<std::size_t>(Word(bytes, at + 2));
    }
    return {0, 0};
}

std::vector<std::string> HelpFolder::FilesWith(const std::string& extension) const {
    std::vector<std::string> found;
    for (const std::string& file : FilesBelow(folder_))
        if (file.ends_with(extension) && file.find('/') == std::string::npos)
            found.push_back(file);
    return found;
}

const std::set<std::string>& HelpFolder::AnchorsOf(const std::string& page) {
    const auto [entry, isNew] = anchors_.try_emplace(page);
    if (isNew)
        for (const Tag& tag : TagsOf(ReadWhole(folder_ / page)))
            for (const char* attribute : {"id", "name"})
                entry->second.insert(tag.Attribute(attribute));
    return entry->second;
}

void HelpFolder::CheckLink(const std::string& from, const std::string& link) {
    if (link.empty() || link.starts_with("main.htm?") || link.find(':') != std::string::npos)
        return;
    ++links;
    const auto sign = link.find('#');
    const std::string page = sign == 0 ? from : Meant(link.substr(0, sign));
    if (!fs::is_regular_file(folder_ / page))
        faults_.push_back(from + ": no page for " + link);
    else if (sign != std::string::npos && !AnchorsOf(page).contains(Meant(link.substr(sign + 1))))
        faults_.push_back(from + ": no anchor for " + link);
}

void HelpFolder::CheckArea(const std::string& page, const Tag& area, std::pair<int, int> size) {
    ++areas;
    std::istringstream numbers(text::ReplaceAll(area.Attribute("coords"), ",", " "));
    int left = -1;
    int top = -1;
    int right = -1;
    int bottom = -1;
    numbers >> left >> top >> right >> bottom;
    if (left < 0 || top < 0 || right <= left || bottom <= top || right > size.first || bottom > size.second)
        faults_.push_back(page + ": area " + area.Attribute("coords") + " in a picture of " +
                          std::to_string(size.first) + " by " + std::to_string(size.second));
}

void HelpFolder::CheckPictures(const std::string& page, const std::vector<Tag>& tags) {
    std::map<std::string, std::pair<int, int>> sizeByMap;
    for (const Tag& tag : tags)
        if (tag.name == "img") {
            const std::string picture = Meant(tag.Attribute("src"));
            const auto size = SizeOfJpeg(ReadWhole(folder_ / picture));
            if (size.first == 0)
                faults_.push_back(page + ": no picture " + picture);
            if (tag.Attribute("usemap").starts_with("#"))
                sizeByMap[tag.Attribute("usemap").substr(1)] = size;
        }
    std::string map;
    for (const Tag& tag : tags)
        if (tag.name == "map")
            map = tag.Attribute("name");
        else if (tag.name == "area")
            CheckArea(page, tag, sizeByMap[map]);
}

void HelpFolder::CheckNames(const std::string& page, const std::string& html, const std::vector<Tag>& tags) {
    for (const Tag& tag : tags) {
        if ((tag.name == "img" || tag.name == "area") && tag.Attribute("alt").empty())
            faults_.push_back(page + ": no name for " + tag.Attribute("src") + tag.Attribute("href"));
        if (tag.name == "html" && tag.Attribute("lang").empty())
            faults_.push_back(page + ": no language");
    }
    if (html.find("<title></title>") != std::string::npos || html.find("{{") != std::string::npos)
        faults_.push_back(page + ": not filled in");
}

std::vector<std::string> HelpFolder::Faults() {
    faults_.clear();
    for (const char* extension : {".hhc", ".hhk"})
        for (const std::string& list : FilesWith(extension))
            for (const Tag& tag : TagsOf(ReadWhole(folder_ / list)))
                if (tag.name == "param" && text::EqualsIgnoringCase(tag.Attribute("name"), "Local"))
                    CheckLink(list, tag.Attribute("value"));
    for (const std::string& page : FilesWith(".htm")) {
        const std::string html = ReadWhole(folder_ / page);
        const auto tags = TagsOf(html);
        CheckNames(page, html, tags);
        CheckPictures(page, tags);
        for (const Tag& tag : tags)
            CheckLink(page, tag.Attribute("href"));
    }
    return faults_;
}

std::vector<std::string> HelpFolder::ListedFiles() const {
    std::vector<std::string> listed;
    for (const std::string& project : FilesWith(".hhp")) {
        bool within = false;
        for (const std::string& line : text::Split(ReadWhole(folder_ / project), "\r\n")) {
            if (line.starts_with("["))
                within = line == "[FILES]" || line == "[Files]";
            else if (within && !line.empty())
                listed.push_back(line);
        }
    }
    return listed;
}

} // namespace tovimar::test
