#include "platform/html/HtmlBounds.h"

#include "platform/Error.h"
#include "platform/html/HtmlNode.h"
#include "platform/text/CodePoints.h"

#include <algorithm>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <utility>
#include <vector>

namespace tovimar {

namespace {

constexpr std::size_t kNone = std::string_view::npos;
constexpr std::size_t kMostBytes = 64U * 1024 * 1024;
constexpr std::size_t kMostLevels = 2000;
constexpr std::size_t kMostAttributes = 1000;

using Names = std::unordered_set<std::string_view>;

/// They close each other, or stand in a table, which is counted.
bool ClosesItself(std::string_view name) {
    static const Names kNames{"p",   "tr",       "td",      "th",   "tbody", "thead", "tfoot",
                              "col", "colgroup", "caption", "html", "head",  "body"};
    return kNames.contains(name);
}

/// Parts of lists, whose end tags old pages leave out by the thousand: one ends the one before it if that is
/// of its family, and the end of the list ends them all.
enum class Family { None, Item, Definition, Option, Group, Ruby };

Family FamilyOf(std::string_view name) {
    static const std::unordered_map<std::string_view, Family> kFamilies{
        {"li", Family::Item},       {"dd", Family::Definition},  {"dt", Family::Definition},
        {"option", Family::Option}, {"optgroup", Family::Group}, {"rb", Family::Ruby},
        {"rt", Family::Ruby},       {"rp", Family::Ruby},        {"rtc", Family::Ruby}};
    const auto family = kFamilies.find(name);
    return family == kFamilies.end() ? Family::None : family->second;
}

bool IsList(std::string_view name) {
    static const Names kNames{"ul", "ol", "dl", "menu", "dir", "select", "ruby"};
    return kNames.contains(name);
}

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f';
}

bool IsLetter(char c) {
    c = text::LowerAscii(c);
    return c >= 'a' && c <= 'z';
}

class Scan {
public:
    explicit Scan(std::string_view html) : html_(html) {}
    void Run();

private:
    void Comment();
    void Tag();
    std::string Name();
    void Attributes();
    void SkipRawText(const std::string& name);
    void Open(const std::string& name);
    void Close(const std::string& name);
    void OpenItem(Family family);
    void CloseItem();
    void CloseList(const std::string& name);
    void CheckLevels() const;
    [[noreturn]] static void Refuse(const std::string& reason) {
        throw RaisedError(kFailure1, "The page can't be read: " + reason, "HtmlDocument");
    }

    std::string_view html_;
    std::size_t at_ = 0;
    std::unordered_map<std::string, std::size_t> open_;
    std::size_t levels_ = 0;
    struct List {
        std::string name;
        std::size_t items;
        Family last;
    };
    std::vector<List> lists_; ///< the open ones, with what was counted before them
    std::size_t items_ = 0;   ///< levels of list items
    Family last_ = Family::None;
};

void Scan::Run() {
    if (html_.size() > kMostBytes)
        Refuse("it is longer than 64 MiB");
    for (at_ = html_.find('<'); at_ != kNone; at_ = html_.find('<', at_)) {
        if (html_.substr(at_).starts_with("<!--"))
            Comment();
        else
            Tag();
        if (at_ == kNone)
            return;
    }
}

void Scan::Comment() {
    at_ += 4;
    // An empty comment may lack its own dashes: "<!-->".
    const std::size_t shortEnd = html_.substr(at_).starts_with(">") ? at_ : html_.find("--", at_ - 2);
    at_ = html_.find('>', shortEnd == kNone ? html_.size() : shortEnd);
}

void Scan::Tag() {
    ++at_;
    const bool closing = at_ < html_.size() && html_[at_] == '/';
    if (closing)
        ++at_;
    if (at_ >= html_.size() || !IsLetter(html_[at_]))
        return;
    const std::string name = Name();
    Attributes();
    if (closing)
        Close(name);
    else if (IsRawTextElement(name) || name == "textarea" || name == "title")
        SkipRawText(name);
    else if (!IsVoidElement(name) && !ClosesItself(name))
        Open(name);
}

std::string Scan::Name() {
    std::string name;
    for (; at_ < html_.size() && !IsSpace(html_[at_]) && html_[at_] != '>' && html_[at_] != '/'; ++at_)
        name += text::LowerAscii(html_[at_]);
    return name;
}

/// Through the tag's end, past quoted values.
void Scan::Attributes() {
    std::size_t count = 0;
    char before = ' ';
    for (; at_ < html_.size() && html_[at_] != '>'; ++at_) {
        const char c = html_[at_];
        const bool startsName = (IsSpace(before) || before == '/' || before == '"') && !IsSpace(c);
        if (startsName && ++count > kMostAttributes)
            Refuse("a tag has more than 1,000 attributes");
        if ((c == '"' || c == '\'') && before == '=')
            at_ = std::min(html_.find(c, at_ + 1), html_.size() - 1);
        if (!IsSpace(c) || before != '=')
            before = c == '\'' ? '"' : c;
    }
}

void Scan::SkipRawText(const std::string& name) {
    const std::string ending = "</" + name;
    for (std::size_t end = html_.find("</", at_ == kNone ? html_.size() : at_); end != kNone;
         end = html_.find("</", end + 2)) {
        const std::string_view candidate = html_.substr(end, ending.size());
        if (std::equal(candidate.begin(), candidate.end(), ending.begin(), ending.end(),
                       [](char left, char right) { return text::LowerAscii(left) == right; })) {
            at_ = end + ending.size();
            return;
        }
    }
    at_ = kNone;
}

void Scan::CheckLevels() const {
    if (levels_ + items_ > kMostLevels)
        Refuse("it nests more than 2,000 levels");
}

void Scan::Open(const std::string& name) {
    if (const Family family = FamilyOf(name); family != Family::None) {
        OpenItem(family);
        return;
    }
    ++open_[name];
    ++levels_;
    if (IsList(name))
        lists_.push_back({name, items_, std::exchange(last_, Family::None)});
    CheckLevels();
}

void Scan::OpenItem(Family family) {
    // Outside of their lists these two nest.
    const bool nests =
        (family == Family::Ruby && open_["ruby"] == 0) || (family == Family::Group && open_["select"] == 0);
    if (std::exchange(last_, family) == family && !nests)
        return;
    ++items_;
    CheckLevels();
}

void Scan::Close(const std::string& name) {
    if (FamilyOf(name) != Family::None) {
        CloseItem();
        return;
    }
    const auto found = open_.find(name);
    if (found == open_.end() || found->second == 0)
        return;
    --found->second;
    --levels_;
    if (IsList(name))
        CloseList(name);
}

void Scan::CloseItem() {
    last_ = Family::None;
    if (items_ > (lists_.empty() ? 0 : lists_.back().items))
        --items_;
}

/// Lists inside it that were left open end with it.
void Scan::CloseList(const std::string& name) {
    while (!lists_.empty()) {
        const List list = std::move(lists_.back());
        lists_.pop_back();
        items_ = list.items;
        last_ = list.last;
        if (list.name == name)
            return;
        --open_[list.name];
        --levels_;
    }
}

} // namespace

void CheckHtmlBounds(std::string_view html) {
    Scan(html).Run();
}

} // namespace tovimar
