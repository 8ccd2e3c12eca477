#include "project/SitemapRepair.h"

#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <string_view>
#include <utility>
#include <vector>

namespace tovimar {

namespace {

constexpr int kDeepestList = 400;

struct Fault {
    std::size_t offset;
    std::string reason;
};

bool IsBlank(char byte) {
    return byte == ' ' || byte == '\t' || byte == '\r' || byte == '\n';
}

void AppendValue(std::string& out, const std::string& value) {
    for (const char byte : DecodeHtmlEntities(value)) {
        if (byte == '&')
            out += "&amp;";
        else if (byte == '<')
            out += "&lt;";
        else if (byte == '"')
            out += "&quot;";
        else if (static_cast<unsigned char>(byte) >= 0x20)
            out += byte;
    }
}

class Repair {
public:
    explicit Repair(const std::string& text) : text_(text) {}

    std::string Run() {
        out_ = "<BODY>";
        for (at_ = text_.find('<'); at_ != std::string::npos; at_ = text_.find('<', at_))
            Markup();
        if (inObject_)
            throw Fault{object_, "An entry is not closed"};
        if (!hasEntry_)
            throw Fault{text_.size(), "There is no list of topics in the file"};
        for (; depth_ > 0; --depth_)
            out_ += "</UL>";
        return out_ + "</BODY>";
    }

private:
    void Markup() {
        if (text_.compare(at_, 4, "<!--") == 0)
            SkipPast("-->", "A comment is not closed");
        else if (at_ + 1 < text_.size() && (text_[at_ + 1] == '!' || text_[at_ + 1] == '?'))
            SkipPast(">", "A tag is not closed");
        else
            Tag();
    }

    void SkipPast(std::string_view what, const char* reason) {
        const auto end = text_.find(what, at_);
        if (end == std::string::npos)
            throw Fault{at_, reason};
        at_ = end + what.size();
    }

    std::string Word() {
        const auto start = at_;
        while (at_ < text_.size() && !IsBlank(text_[at_]) &&
               std::string_view("=><\"'").find(text_[at_]) == std::string_view::npos)
            ++at_;
        return text_.substr(start, at_ - start);
    }

    std::string Value() {
        const char quote = text_[at_];
        if (quote != '"' && quote != '\'')
            return Word();
        const auto end = text_.find(quote, at_ + 1);
        if (end == std::string::npos)
            throw Fault{at_, "A value is not closed"};
        const auto start = std::exchange(at_, end + 1) + 1;
        return text_.substr(start, end - start);
    }

    void SkipBlanks(std::size_t tag) {
        while (at_ < text_.size() && IsBlank(text_[at_]))
            ++at_;
        if (at_ >= text_.size())
            throw Fault{tag, "A tag is not closed"};
    }

    void Tag() {
        const auto tag = at_++;
        const auto name = text::ToUpper(Word());
        attributes_.clear();
        for (SkipBlanks(tag); text_[at_] != '>' && text_[at_] != '<'; SkipBlanks(tag)) {
            auto attribute = text::ToLower(Word());
            SkipBlanks(tag);
            std::string value;
            if (text_[at_] == '=') {
                ++at_;
                SkipBlanks(tag);
                value = Value();
            } else if (attribute.empty()) {
                ++at_; // a stray quote
            }
            attributes_.emplace_back(std::move(attribute), std::move(value));
        }
        if (text_[at_] == '>')
            ++at_;
        Act(name, tag);
    }

    std::string Attribute(std::string_view name) const {
        for (const auto& [known, value] : attributes_)
            if (known == name)
                return value;
        return {};
    }

    void Act(const std::string& name, std::size_t tag) {
        if (name == "UL")
            OpenList(tag);
        else if (name == "/UL")
            CloseList();
        else if (name == "OBJECT")
            OpenObject(tag);
        else if (name == "/OBJECT")
            CloseObject();
        else if (name == "PARAM" && inObject_ && !aside_)
            Parameter();
    }

    void OpenList(std::size_t tag) {
        CloseObject();
        if (++depth_ > kDeepestList)
            throw Fault{tag, "The lists are nested too deeply"};
        out_ += "<UL>";
    }

    void CloseList() {
        CloseObject();
        if (depth_ == 0)
            return;
        --depth_;
        out_ += "</UL>";
    }

    void OpenObject(std::size_t tag) {
        CloseObject();
        inObject_ = true;
        object_ = tag;
        aside_ = text::EqualsIgnoringCase(Attribute("type"), "text/site properties");
        if (aside_)
            return;
        hasEntry_ = true;
        out_ += "<OBJECT>";
    }

    void CloseObject() {
        if (std::exchange(inObject_, false) && !aside_)
            out_ += "</OBJECT>\r\n";
    }

    void Parameter() {
        out_ += "<param name=\"";
        AppendValue(out_, Attribute("name"));
        out_ += "\" value=\"";
        AppendValue(out_, Attribute("value"));
        out_ += "\"/>";
    }

    const std::string& text_;
    std::string out_;
    std::size_t at_ = 0;
    std::size_t object_ = 0;
    int depth_ = 0;
    bool inObject_ = false;
    bool aside_ = false; ///< the object at hand is no entry
    bool hasEntry_ = false;
    std::vector<std::pair<std::string, std::string>> attributes_;
};

} // namespace

RepairedSitemap RepairSitemap(const std::string& text) {
    try {
        return {Repair(text).Run(), {}, 0};
    } catch (const Fault& fault) {
        const auto end = text.begin() + static_cast<std::ptrdiff_t>(std::min(fault.offset, text.size()));
        return {{}, fault.reason, static_cast<std::int32_t>(1 + std::count(text.begin(), end, '\n'))};
    }
}

} // namespace tovimar
