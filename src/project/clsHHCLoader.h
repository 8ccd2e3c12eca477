#pragma once

#include "platform/Error.h"
#include "platform/KeyedList.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace tovimar {

class XmlNode;

/// A `param` of a contents entry.
struct clsHHCObjectEntryParam {
    std::string Name;
    std::string Value;
};

/// A "name=value" part of an entry's comment.
struct clsHHCObjectEntryComment {
    std::string Name;
    std::string Value;
};

/// One entry of a contents file that was made elsewhere.
class clsHHCObjectEntry {
public:
    /// 1 for the root.
    std::int32_t Level = 1;
    std::vector<std::unique_ptr<clsHHCObjectEntry>> Children;

    std::string Name() const { return Parameter("Name"); }
    std::string Local_() const { return Parameter("Local"); }
    std::string Comment() const { return Parameter("Comment"); }
    std::string URL() const { return Parameter("URL"); }
    std::string ImageNumber() const { return Parameter("ImageNumber"); }
    std::string SourceApp() const { return CommentValue("SourceApp"); }
    std::string SourceObjectType() const { return CommentValue("SourceObjectType"); }
    std::string Skipped() const { return CommentValue("Skipped"); }
    std::string ExtraValue() const { return CommentValue("ExtraValue"); }
    std::string IndexesStr() const { return CommentValue("Indexes"); }
    std::int32_t TovimarVersionMajor() const;

    /// Takes level, parameters and comment values from the child elements of an OBJECT.
    void ProcessHHCXmlStrTree(std::int32_t level, const std::vector<XmlNode>& nodes);
    /// The entry as project XML.
    std::string XMLSTr(std::int32_t& rlngPref, const std::string& icon, bool hidden,
                       const std::string& sourceObjectType, std::int32_t version) const;
    /// The entry as contents file text.
    std::string HHCStr() const;
    /// The one place for a character conversion of foreign names; none is needed.
    static std::string DecEncode(const std::string& text) { return text; }

private:
    struct Element;
    /// What an entry takes over from the one above it.
    struct Surroundings {
        std::string icon;
        bool hidden = false;
        std::string type;
        std::int32_t version = 1;
    };

    std::string Parameter(const std::string& name) const;
    std::string CommentValue(const std::string& name) const;
    void ReadComment();
    void AppendXml(std::string& out, std::int32_t& pref, const Surroundings& around) const;
    void AppendSitemap(std::string& out) const;
    std::string ObjectTag(const std::string& tag, const std::string& type) const;
    Element DescribeElement(std::int32_t pref, const std::string& type) const;
    std::string OpenTag(const Element& element, const std::string& type, bool hidden, bool underIcon) const;

    KeyedList<clsHHCObjectEntryParam> parameters_;
    KeyedList<clsHHCObjectEntryComment> comments_;
};

/// Reads a contents file of another tool and gives it as project XML. The text is UTF-8 or UTF-16 with a byte
/// order mark, else in the ANSI code page. Markup that is no XML is repaired where that can be done:
/// unbalanced lists, tags of any case anywhere in a line, values in any quotes, bare "&".
///
/// The first entry becomes the project; a later one that stands beside it, not below it, has no place in a
/// project and is counted as dropped.
class clsHHCLoader {
public:
    /// 0 also for a file that can't be read as entries; `ErrorCode` then tells.
    ResultCode Load(const std::string& vstrHHCFileFullPath);
    /// The same for the bytes of a file.
    void LoadBytes(const std::string& bytes);
    ResultCode SaveXml(const std::string& path) const;
    /// The header alone when nothing was loaded.
    std::string GetXMLStr() const;
    /// A file's entries as project text. False with a message that names path and line when there is nothing
    /// to be had; a file that can't be read raises its failure.
    static bool Convert(const std::string& path, std::string& projectText, std::string& message);

    ResultCode ErrorCode() const { return errorCode_; }
    const std::string& ErrorReason() const { return errorReason_; }
    /// From 1; 0 when no line is to blame.
    std::int32_t ErrorLine() const { return errorLine_; }
    std::size_t DroppedEntries() const { return dropped_; }
    const clsHHCObjectEntry* Root() const { return root_.get(); }

private:
    static std::string WellFormed(const std::string& text);
    void ReadFile(const std::string& path);
    void ReadText(const std::string& text);
    void Walk(std::int32_t level, const std::vector<XmlNode>& nodes);
    void Place(std::unique_ptr<clsHHCObjectEntry> entry);

    std::unique_ptr<clsHHCObjectEntry> root_;
    std::vector<clsHHCObjectEntry*> flat_;
    ResultCode errorCode_ = kSuccess;
    std::string errorReason_;
    std::int32_t errorLine_ = 0;
    std::size_t dropped_ = 0;
};

} // namespace tovimar
