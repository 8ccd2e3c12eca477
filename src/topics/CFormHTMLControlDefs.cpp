#include "topics/CFormHTMLControlDefs.h"

#include "foundation/CUTF8FileReader.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/Value.h"
#include "platform/text/Text.h"
#include "topics/TopicText.h"

#include <unordered_set>

namespace tovimar {

namespace {

constexpr std::size_t kNone = std::string_view::npos;

/// Bookmarks that a topic keeps out of the help's contents, folded.
class ExcludeList {
public:
    explicit ExcludeList(const std::string& list) {
        for (const std::string& name : text::Split(list, "|"))
            names_.insert(text::FoldCase(name));
    }
    bool Holds(const std::string& bookmark) const { return names_.contains(text::FoldCase(bookmark)); }

private:
    std::unordered_set<std::string> names_;
};

std::string MetaOf(std::string_view html, const std::string& shortName) {
    const std::string value = CFormHTMLControlDefs::MetaValue(html, "HTML-" + shortName);
    return value.empty() ? CFormHTMLControlDefs::MetaValue(html, shortName) : value;
}

std::string Cleaned(std::string_view value) {
    std::string cleaned = text::TrimWhitespace(value);
    if (!cleaned.empty() && cleaned.back() == '/')
        cleaned.pop_back();
    cleaned = text::TrimWhitespace(cleaned);
    if (!cleaned.empty() && IsQuote(cleaned.front()))
        cleaned.erase(0, 1);
    if (!cleaned.empty() && IsQuote(cleaned.back()))
        cleaned.pop_back();
    return cleaned;
}

} // namespace

std::string CFormHTMLControlDefs::MetaValue(std::string_view html, std::string_view name) {
    const std::size_t found = FindAscii(html, name);
    if (found == kNone)
        return {};
    const std::size_t begin = html.rfind('<', found);
    if (begin == kNone)
        return {};
    std::string_view element = html.substr(begin);
    const std::size_t end = element.find('>');
    element = element.substr(0, end);
    const std::size_t nameAt = found - begin;
    if (nameAt >= element.size())
        return {};
    const std::size_t content = FindAscii(element, "content");
    const std::size_t equals = content == kNone ? kNone : element.find('=', content);
    if (equals == kNone)
        return {};
    // `content="value" name="NAME"` ends its value before the name, the other order at the element's end.
    std::size_t valueEnd = element.size();
    if (content < nameAt)
        valueEnd = FindAscii(element, " name", equals);
    return valueEnd == kNone ? std::string() : Cleaned(element.substr(equals + 1, valueEnd - equals - 1));
}

ResultCode CFormHTMLControlDefs::Parse(const std::string& vstrFullPath) {
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped("CFormHTMLControlDefs", "Parse", [&] {
        CUTF8FileReader reader;
        result = reader.LoadFile(vstrFullPath);
        if (result == kSuccess)
            result = ParseText(reader.Text());
    });
    return failure != kSuccess ? failure : result;
}

ResultCode CFormHTMLControlDefs::ParseText(std::string_view html) {
    return Trapped("CFormHTMLControlDefs", "Parse", [&] {
        Menus.Clear();
        Controls.Clear();
        ReadMetadata(html);
        const auto& [first, second, third, fourth] = versionNumbers_;
        if (version_.empty() || (first == 2 && second == 0)) {
            ReadByMarkers(html);
            return;
        }
        const bool anchorsOnly = first == 2 && second == 1 && third == 0 && fourth < 49;
        if (!anchorsOnly)
            Parse2(html, formName_, excludeList_);
        if (anchorsOnly || Controls.Empty())
            Parse1(html, formName_, excludeList_);
    });
}

void CFormHTMLControlDefs::ReadMetadata(std::string_view html) {
    formName_ = MetaOf(html, "TOVIMAR-FORM-NAME");
    excludeList_ = MetaOf(html, "TOVIMAR-TOC-EXCLUDE-LIST");
    version_ = MetaOf(html, "TOVIMAR-VERSION");
    ReadVersion();
}

void CFormHTMLControlDefs::ReadVersion() {
    versionNumbers_ = {2, 0, 1, 1};
    const std::size_t blank = version_.find(' ');
    if (blank == std::string::npos) {
        version_ = text::Left(version_, 3);
        return;
    }
    version_.erase(blank);
    const auto parts = text::Split(version_, ".");
    for (std::size_t i = 0; i < parts.size() && i < versionNumbers_.size(); ++i)
        PassOver([&] { versionNumbers_[i] = Value(parts[i]).AsInteger(); });
}

void CFormHTMLControlDefs::ReadByMarkers(std::string_view html) {
    ReadMarkedSections(html, "CONTROL ", false);
    ReadMarkedSections(html, "MENU ", true);
}

void CFormHTMLControlDefs::ReadMarkedSections(std::string_view html, std::string_view kind, bool isMenu) {
    const std::string opening = "<!-- + " + std::string(kind);
    const std::string closing = "<!-- - " + std::string(kind);
    std::size_t begin = html.find(opening);
    while (begin != kNone) {
        const std::size_t next = html.find(opening, begin + opening.size());
        const std::size_t closingAt = html.find(closing, begin);
        const std::size_t end = closingAt == kNone ? kNone : html.find("-->", closingAt);
        if (end == kNone)
            return;
        if (next > closingAt) {
            auto def = std::make_unique<CFormHTMLControlDef>();
            def->ParseHTML(html, begin, end + 3);
            def->IsMenu = isMenu;
            if (def->IsValid())
                (isMenu ? Menus : Controls).Add(std::move(def));
        }
        begin = next;
    }
}

void CFormHTMLControlDefs::Parse1(std::string_view vstrBuf, const std::string& vstrFormName,
                                  const std::string& vstrExcludeList) {
    constexpr std::string_view kAnchorEnd = "</a>";
    const ExcludeList excluded(vstrExcludeList);
    std::size_t begin = FindAscii(vstrBuf, "<a name=");
    while (begin != kNone) {
        std::size_t end = FindAscii(vstrBuf, kAnchorEnd, begin);
        if (end == kNone)
            return;
        end += kAnchorEnd.size();
        auto def = std::make_unique<CFormHTMLControlDef>();
        def->ParseHTML1(vstrBuf.substr(begin, end - begin), vstrFormName);
        if (def->IsValid() && !excluded.Holds(def->BookmarkName))
            Controls.Add(std::move(def));
        begin = FindAscii(vstrBuf, "<a name=", end);
    }
}

void CFormHTMLControlDefs::Parse2(std::string_view vstrBuf, const std::string& vstrFormName,
                                  const std::string& vstrExcludeList) {
    const CTovimarParameters* parameters = Session::Parameters();
    std::string tags = parameters == nullptr ? std::string() : parameters->ListOfTagsToParseContentsFrom;
    if (tags.empty())
        tags = "H2";
    for (const std::string& tag : text::Split(tags, ";"))
        if (!tag.empty())
            ReadHeadings(vstrBuf, tag, vstrFormName, vstrExcludeList);
}

void CFormHTMLControlDefs::ReadHeadings(std::string_view buffer, const std::string& tag,
                                        const std::string& formName, const std::string& excludeList) {
    const ExcludeList excluded(excludeList);
    const std::string opening = "<" + tag + ">";
    const std::string closing = "</" + tag + ">";
    std::size_t begin = FindAscii(buffer, opening);
    while (begin != kNone) {
        std::size_t end = FindAscii(buffer, closing, begin);
        if (end == kNone)
            return;
        end += closing.size();
        auto def = std::make_unique<CFormHTMLControlDef>();
        def->ParseHTML2(buffer.substr(begin, end - begin), formName);
        if (def->IsValid() && !excluded.Holds(def->BookmarkName))
            Controls.Add(std::move(def));
        begin = FindAscii(buffer, opening, end);
    }
}

} // namespace tovimar
