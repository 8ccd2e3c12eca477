#pragma once

#include <string>
#include <vector>

namespace tovimar {

class CXmlForm;

/// A keyword of the index and the topic that it leads to. Everything is plain text.
struct IndexLink {
    std::string caption;
    std::string keyword;
    std::string bookmark; ///< anchor within the topic; empty for the topic as a whole
};

/// What contents, web help and index take from an object's definition. All three of one run are made from it,
/// so that a definition, which is hundreds of times as large, is read once for them.
struct ObjectContents {
    struct Entry {
        std::string controlName;
        std::string anchor;
        std::string caption; ///< or the name where the project identifies by name; not encoded
    };
    /// Documented menus, then documented controls.
    std::vector<Entry> entries;
    std::vector<IndexLink> links;
    std::string topicFile; ///< file name of the topic that the links lead to
};

ObjectContents ContentsOf(const CXmlForm& form);
/// The keywords of an object, its documented controls and menus.
std::vector<IndexLink> IndexLinksOf(const CXmlForm& form);

} // namespace tovimar
