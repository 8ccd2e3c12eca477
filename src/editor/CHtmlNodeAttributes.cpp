#include "editor/CHtmlNodeAttributes.h"

#include "platform/html/HtmlNode.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar {

namespace {

constexpr std::string_view kSpaces = " \t\r\n\f";

/// Steps through a start tag behind its name.
class StartTag {
public:
    explicit StartTag(std::string_view tag) : tag_(tag) {
        at_ = std::min(tag_.find_first_of(" \t\r\n\f/>", 1), tag_.size());
    }

    /// False at the tag's end.
    bool Next(std::string_view& name, std::string_view& value) {
        SkipAny(" \t\r\n\f/");
        if (at_ >= tag_.size() || tag_[at_] == '>')
            return false;
        // A name may begin with "=", as strange as that is.
        name = Take(tag_.find_first_of(" \t\r\n\f/>=", at_ + 1));
        value = {};
        SkipAny(kSpaces);
        if (at_ >= tag_.size() || tag_[at_] != '=')
            return true;
        ++at_;
        SkipAny(kSpaces);
        value = TakeValue();
        return true;
    }

private:
    void SkipAny(std::string_view characters) {
        at_ = std::min(tag_.find_first_not_of(characters, at_), tag_.size());
    }
    std::string_view Take(std::size_t end) {
        end = std::min(end, tag_.size());
        const std::string_view taken = tag_.substr(at_, end - at_);
        at_ = end;
        return taken;
    }
    std::string_view TakeValue() {
        if (at_ >= tag_.size() || (tag_[at_] != '"' && tag_[at_] != '\''))
            return Take(tag_.find_first_of(" \t\r\n\f>", at_));
        const char quote = tag_[at_++];
        const std::string_view value = Take(tag_.find(quote, at_));
        ++at_;
        return value;
    }

    std::string_view tag_;
    std::size_t at_ = 0;
};

} // namespace

std::vector<CHtmlAttribute> CHtmlNodeAttributes::GetNodeAttributes(const HtmlNode& node) const {
    std::vector<CHtmlAttribute> attributes;
    const std::string tag = node.startTag();
    StartTag scan(tag);
    std::string_view name;
    std::string_view value;
    while (scan.Next(name, value))
        attributes.push_back({std::string(name), ValueOf(name, value)});
    return attributes;
}

std::string CHtmlNodeAttributes::ValueOf(std::string_view name, std::string_view written) const {
    if (text::EqualsIgnoringCase(name, "href") || text::EqualsIgnoringCase(name, "src"))
        return Page.RelativeAsWritten(written);
    return std::string(written);
}

} // namespace tovimar
