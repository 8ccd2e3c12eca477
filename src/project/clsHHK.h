#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace tovimar {

class CXmlForm;
struct IndexLink;

/// One `param` line of an index entry.
class clsHHKObjectParameter {
public:
    clsHHKObjectParameter(std::string name, std::string value)
        : Name(std::move(name)), value_(std::move(value)) {}

    std::string Name;
    /// Of a "Local" parameter the file name part only, so that no folder reaches the file.
    std::string Value() const;
    void SetValue(const std::string& value) { value_ = value; }

private:
    std::string value_;
};

/// A keyword group or a link in the index. Making one counts as an index entry of the run.
class clsHHKObject {
public:
    clsHHKObject();

    std::string Key;
    std::string ObjectType = "text/sitemap";
    std::vector<clsHHKObjectParameter> Parameters;
    bool IsRoot = false;

    /// The key when none was set.
    std::string IndexGroupDisplayValue() const;
    void SetIndexGroupDisplayValue(const std::string& value) { displayValue_ = value; }

    /// The child that shows this text; null when there is none.
    clsHHKObject* GetObject(const std::string& vstrKey) const;
    bool ObjectExists(const std::string& vstrKey) const { return GetObject(vstrKey) != nullptr; }
    /// In the place of its display name; dropped when a child of that name, in any case, is there.
    void Add(std::unique_ptr<clsHHKObject> robj);
    std::string GenerateHHK(std::int32_t vlngLevel = 0) const;
    /// The same behind a text that is long already.
    void AppendHHK(std::string& out, std::int32_t level) const;
    void Terminate();
    std::size_t Count() const { return children_.size(); }

private:
    std::string DisplayName(const std::string& parentKey) const;
    void AppendGroup(std::string& out, std::int32_t level) const;

    std::string displayValue_;
    /// By folded display name, which is the order of the file.
    std::map<std::string, std::unique_ptr<clsHHKObject>> children_;
    /// The same when they are many, else null; the names stand in `children_`.
    std::unique_ptr<std::unordered_map<std::string_view, clsHHKObject*>> byName_;
};

/// The keyword index of a help project: links under keywords, both sorted without regard to case.
class clsHHK {
public:
    clsHHK();
    ~clsHHK();

    void AddCustomLink(const std::string& vstrIndexCaption, const std::string& vstrIndexKey,
                       const std::string& vstrGeneratedFileName, const std::string& vstrBookmarkName);
    /// The keywords of an object, its documented controls and menus. The file is that of the definition.
    void AddXmlFormLinks(const CXmlForm& rxmlForm, const std::string& vstrGeneratedHtmlFile);
    /// Links that were taken from a definition; the file is its topic's.
    void AddLinks(const std::vector<IndexLink>& links, const std::string& file);
    /// The text of the index file; with `FillIndexFromAppObjectsAndControls` off an empty list.
    std::string HHKContents() const;
    void Terminate();
    /// Empty again, as at its making.
    void Reset();

    /// Several words of more than 32 characters together are cut to 32 and "..."; a single word never is.
    static std::string TruncateCaption(const std::string& text);

private:
    std::unique_ptr<clsHHKObject> root_;
};

} // namespace tovimar
