#pragma once

#include "platform/KeyedList.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// One line of a section.
class CN_IniFileItem {
public:
    CN_IniFileItem(std::string file, std::string section, std::string name, std::string value);

    std::string Name;
    std::string Value;
    /// Writes this item alone. Raises as the file system does.
    void Save() const;

private:
    std::string file_;
    std::string section_;
};

/// A section of an ini file, its items in file order.
class CN_IniFileSection {
public:
    using ItemList = KeyedList<CN_IniFileItem>;

    /// Lines "name=value", CRLF behind each, as they stand in memory.
    std::string SectionContent() const;
    std::int32_t Count() const { return static_cast<std::int32_t>(items_.Count()); }
    /// Takes the section out of the file; the items stay in memory.
    void Delete();
    /// Null when there is none.
    CN_IniFileItem* Item(const std::string& vstrName) { return items_.Find(vstrName); }
    void Remove(const std::string& vstrName);
    /// Adds an item; of one that is there already the value changes.
    CN_IniFileItem& Add(const std::string& vstrName, const std::string& vstrValue);
    /// Puts the items in place of what the file has under the section's name. Raises
    /// "Unable to save INI file section '<name>'".
    void Save();
    /// Reads the section of that name; of items with one name the first counts.
    void Initialize(const std::string& vstrFileFullPath, const std::string& vstrName);
    const ItemList& Items() const { return items_; }
    const std::string& Name() const { return name_; }

private:
    std::string file_;
    std::string name_;
    ItemList items_;
};

/// A line's name and value: split at the first "=", both trimmed; no "=" means an empty value.
std::pair<std::string, std::string> IniNameAndValue(const std::string& line);

} // namespace tovimar
