#include "foundation/CN_IniFileSection.h"

#include "platform/files/PrivateProfile.h"
#include "platform/text/Text.h"

namespace tovimar {

std::pair<std::string, std::string> IniNameAndValue(const std::string& line) {
    const auto equals = line.find('=');
    if (equals == std::string::npos)
        return {text::TrimWhitespace(line), {}};
    return {text::TrimWhitespace(line.substr(0, equals)), text::TrimWhitespace(line.substr(equals + 1))};
}

CN_IniFileItem::CN_IniFileItem(std::string file, std::string section, std::string name, std::string value)
    : Name(std::move(name)), Value(std::move(value)), file_(std::move(file)), section_(std::move(section)) {}

void CN_IniFileItem::Save() const {
    platform::WritePrivateProfileString(file_, section_, Name, Value);
}

void CN_IniFileSection::Initialize(const std::string& vstrFileFullPath, const std::string& vstrName) {
    file_ = vstrFileFullPath;
    name_ = vstrName;
    items_.Clear();
    for (const std::string& line : platform::PrivateProfileSection(file_, name_)) {
        const auto [name, value] = IniNameAndValue(line);
        if (!items_.Contains(name))
            items_.Add({file_, name_, name, value}, name);
    }
}

std::string CN_IniFileSection::SectionContent() const {
    std::string content;
    for (const CN_IniFileItem& item : items_)
        content += item.Name + "=" + item.Value + "\r\n";
    return content;
}

void CN_IniFileSection::Delete() {
    platform::DeletePrivateProfileSection(file_, name_);
}

void CN_IniFileSection::Remove(const std::string& vstrName) {
    items_.Take(vstrName);
}

CN_IniFileItem& CN_IniFileSection::Add(const std::string& vstrName, const std::string& vstrValue) {
    if (CN_IniFileItem* item = items_.Find(vstrName)) {
        item->Value = vstrValue;
        return *item;
    }
    items_.Add({file_, name_, vstrName, vstrValue}, vstrName);
    return items_.At(items_.Count());
}

void CN_IniFileSection::Save() {
    std::vector<std::string> lines;
    for (const CN_IniFileItem& item : items_)
        lines.push_back(item.Name + "=" + item.Value);
    try {
        platform::WritePrivateProfileSection(file_, name_, lines);
    } catch (const RaisedError& error) {
        throw RaisedError(error.Number(), "Unable to save INI file section '" + name_ + "'",
                          "CN_IniFileSection.Save");
    }
}

} // namespace tovimar
