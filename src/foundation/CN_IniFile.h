#pragma once

#include "foundation/CN_IniFileSection.h"

#include <memory>
#include <string>
#include <vector>

namespace tovimar {

/// An ini file as sections of items. Each section is read as a whole when the file gets its name, changed in
/// memory, and written as a whole by `Save`; what this class doesn't know of, such as comments before the
/// first section, stays in the file. Section and item names ignore case.
class CN_IniFile {
public:
    using SectionList = KeyedList<std::unique_ptr<CN_IniFileSection>>;

    /// Windows path of the file.
    const std::string& Name() const { return name_; }
    /// A path with no folder, or with one that doesn't exist, means a file in the program's own folder. Reads
    /// the file; one that is missing has no sections.
    void SetName(const std::string& vstrName);

    /// The section of that name, made when there is none.
    CN_IniFileSection& Add(const std::string& vstrSection);
    /// Null when there is none.
    CN_IniFileSection* Item(const std::string& vstrSection);
    std::int32_t Count() const { return static_cast<std::int32_t>(sections_.Count()); }
    /// In the file too, at once.
    void DeleteSection(const std::string& vstrSection);
    /// Writes every section. Raises as `CN_IniFileSection::Save`.
    void Save();
    const SectionList& Sections() const { return sections_; }
    bool SectionExists(const std::string& vstrSection) const { return sections_.Contains(vstrSection); }

    bool ValueExists(const std::string& vstrSection, const std::string& vstrItem);
    /// Empty when the item isn't there.
    std::string Value(const std::string& vstrSection, const std::string& vstrItem);
    /// Makes section and item where they are missing.
    void SetValue(const std::string& vstrSection, const std::string& vstrItem, const std::string& vstrValue);
    /// Empty without that section.
    std::string SectionContent(const std::string& vstrSection);
    /// The default when the item isn't there.
    std::string ValueEx(const std::string& vstrSection, const std::string& vstrItem,
                        const std::string& vstrDefault);
    void RemoveValue(const std::string& vstrSection, const std::string& vstrItem);

    /// The parts of a value between separators, trimmed; none of an empty value.
    static std::vector<std::string> Split(const std::string& vstrValue,
                                          const std::string& vstrSeparator = ",");
    /// Adds a line "name=value" to a section, which is made when it is missing. Of an item that is there
    /// already the value changes.
    void AddLine(const std::string& vstrSection, const std::string& vstrLine);

private:
    std::string name_;
    SectionList sections_;
};

} // namespace tovimar
