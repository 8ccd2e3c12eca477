#include "foundation/CN_IniFile.h"

#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/files/PrivateProfile.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

std::string PlaceOf(const std::string& path) {
    const auto& environment = platform::Env();
    const std::string folder = platform::FolderOf(path);
    if (!folder.empty() && folder != "\\" && environment.files->FolderExists(folder))
        return path;
    // A drive has no place below a folder.
    return platform::Join(environment.folders.program,
                          platform::HasDrive(path) ? platform::FileNameOf(path) : path);
}

} // namespace

void CN_IniFile::SetName(const std::string& vstrName) {
    name_ = PlaceOf(vstrName);
    sections_.Clear();
    for (const std::string& section : platform::PrivateProfileSectionNames(name_))
        Add(section);
}

CN_IniFileSection& CN_IniFile::Add(const std::string& vstrSection) {
    if (CN_IniFileSection* section = Item(vstrSection))
        return *section;
    auto section = std::make_unique<CN_IniFileSection>();
    section->Initialize(name_, vstrSection);
    sections_.Add(std::move(section), vstrSection);
    return *sections_.At(sections_.Count());
}

CN_IniFileSection* CN_IniFile::Item(const std::string& vstrSection) {
    auto* section = sections_.Find(vstrSection);
    return section == nullptr ? nullptr : section->get();
}

void CN_IniFile::DeleteSection(const std::string& vstrSection) {
    if (const auto section = sections_.Take(vstrSection))
        (*section)->Delete();
}

void CN_IniFile::Save() {
    for (const auto& section : sections_)
        section->Save();
}

bool CN_IniFile::ValueExists(const std::string& vstrSection, const std::string& vstrItem) {
    CN_IniFileSection* section = Item(vstrSection);
    return section != nullptr && section->Item(vstrItem) != nullptr;
}

std::string CN_IniFile::Value(const std::string& vstrSection, const std::string& vstrItem) {
    return ValueEx(vstrSection, vstrItem, {});
}

void CN_IniFile::SetValue(const std::string& vstrSection, const std::string& vstrItem,
                          const std::string& vstrValue) {
    Add(vstrSection).Add(vstrItem, vstrValue);
}

std::string CN_IniFile::SectionContent(const std::string& vstrSection) {
    const CN_IniFileSection* section = Item(vstrSection);
    return section == nullptr ? std::string() : section->SectionContent();
}

std::string CN_IniFile::ValueEx(const std::string& vstrSection, const std::string& vstrItem,
                                const std::string& vstrDefault) {
    CN_IniFileSection* section = Item(vstrSection);
    const CN_IniFileItem* item = section == nullptr ? nullptr : section->Item(vstrItem);
    return item == nullptr ? vstrDefault : item->Value;
}

void CN_IniFile::RemoveValue(const std::string& vstrSection, const std::string& vstrItem) {
    if (CN_IniFileSection* section = Item(vstrSection))
        section->Remove(vstrItem);
}

std::vector<std::string> CN_IniFile::Split(const std::string& vstrValue, const std::string& vstrSeparator) {
    std::vector<std::string> parts;
    if (vstrValue.empty())
        return parts;
    for (const std::string& part : text::Split(vstrValue, vstrSeparator))
        parts.push_back(text::TrimWhitespace(part));
    return parts;
}

void CN_IniFile::AddLine(const std::string& vstrSection, const std::string& vstrLine) {
    const auto [name, value] = IniNameAndValue(vstrLine);
    Add(vstrSection).Add(name, value);
}

} // namespace tovimar
