#include "TopicText.h"

#include "PageCharset.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <cctype>

namespace tovimar::search {

namespace {

constexpr std::size_t kLongestReference = 10;
constexpr auto kNone = std::string_view::npos;

/// Text that gets a blank where a block or a run of blanks parts it.
class Words {
public:
    void Add(std::string_view piece) { text_ += piece; }
    void Part() {
        if (!text_.empty() && text_.back() != ' ')
            text_ += ' ';
    }
    std::string Take() {
        auto whole = text::Trim(text_);
        text_.clear();
        return whole;
    }

private:
    std::string text_;
};

std::string Plain(std::string_view value) {
    std::string out;
    for (std::size_t at = 0; at < value.size(); ++at) {
        const auto end = value[at] == '&' ? value.substr(at, kLongestReference).find(';') : kNone;
        const auto character = end == kNone ? std::string() : CharacterOf(value.substr(at + 1, end - 1));
        out += character.empty() ? std::string(1, value[at]) : character;
        if (!character.empty())
            at += end;
    }
    return out;
}

bool HasControlCharacters(std::string_view value) {
    return std::any_of(value.begin(), value.end(), [](char c) { return static_cast<unsigned char>(c) < 32; });
}

bool IsBlank(char c) {
    return static_cast<unsigned char>(c) <= ' ';
}

/// Value of an attribute in the tag's text behind its name; the name in lower case.
std::string Attribute(std::string_view tag, std::string_view name) {
    for (auto at = FindAscii(tag, name, 0); at != kNone; at = FindAscii(tag, name, at + 1)) {
        auto value = at + name.size();
        if (at == 0 || !IsBlank(tag[at - 1]) || value >= tag.size() || tag[value] != '=')
            continue;
        ++value;
        const char quote = value < tag.size() ? tag[value] : ' ';
        const bool quoted = quote == '"' || quote == '\'';
        const auto start = quoted ? value + 1 : value;
        const auto end =
            quoted ? tag.find(quote, start) : std::min(tag.find_first_of(" \t\r\n", start), tag.size());
        return end == kNone ? std::string() : Plain(tag.substr(start, end - start));
    }
    return {};
}

/// One pass over the page.
class Reader {
public:
    explicit Reader(std::string_view page) : page_(page) {}

    TopicText Read() {
        while (at_ < page_.size())
            if (page_[at_] == '<')
                ReadTag();
            else
                ReadCharacter();
        FinishHeading();
        topic_.body = body_.Take();
        topic_.title = text::Left(topic_.title, kLongestCaption);
        return std::move(topic_);
    }

private:
    void Add(std::string_view piece) {
        body_.Add(piece);
        if (heading_ != 0)
            caption_.Add(piece);
        else
            anchor_.clear();
    }
    void Part() {
        body_.Part();
        caption_.Part();
    }

    void ReadCharacter() {
        const auto start = at_++;
        const char c = page_[start];
        if (IsBlank(c) || c == '\x7f')
            return Part();
        if (c == '&') {
            const auto end = page_.substr(start, kLongestReference).find(';');
            const auto character =
                end == kNone ? std::string() : CharacterOf(page_.substr(start + 1, end - 1));
            if (character == " ")
                Part();
            else
                Add(character.empty() ? "&" : std::string_view(character));
            if (!character.empty())
                at_ = start + end + 1;
            return;
        }
        while (at_ < page_.size() && page_[at_] != '<' && page_[at_] != '&' && !IsBlank(page_[at_]))
            ++at_;
        Add(page_.substr(start, at_ - start));
    }

    std::size_t Behind(std::string_view text) const {
        const auto found = FindAscii(page_, text, at_);
        return found == kNone ? page_.size() : found + text.size();
    }

    void ReadTag() {
        if (page_.substr(at_, 4) == "<!--") {
            at_ = Behind("-->");
            return Part();
        }
        const auto end = std::min(page_.find('>', at_), page_.size());
        const auto tag = page_.substr(at_ + 1, end - at_ - 1);
        std::string name;
        for (const char c : tag.substr(0, 12)) {
            if (IsBlank(c) || (c == '/' && !name.empty()))
                break;
            name += static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
        }
        at_ = std::min(end + 1, page_.size());
        if (name == "script" || name == "style")
            at_ = Behind("</" + name + ">");
        else if (name == "title")
            ReadTitle();
        else
            NoteTag(name, tag);
        // Bold letters inside a word don't part it.
        if (name != "b" && name != "/b" && name != "i" && name != "/i" && name != "em" && name != "/em" &&
            name != "u" && name != "/u")
            Part();
    }

    void ReadTitle() {
        const auto start = at_;
        at_ = Behind("</title>");
        const auto length = at_ - start;
        // One that is never closed swallows the page, as in a browser.
        if (length < 8 || page_.substr(at_ - 1, 1) != ">" || !topic_.title.empty())
            return;
        Reader title(page_.substr(start, length - 8));
        title.inTitle_ = true;
        topic_.title = title.Read().body;
    }

    void NoteTag(std::string_view name, std::string_view tag) {
        const bool opens = name.size() == 2 && name[0] == 'h' && name[1] >= '1' && name[1] <= '6';
        const bool closes = name.size() == 3 && name[0] == '/' && name[1] == 'h' && name[2] >= '1';
        if (inTitle_)
            return;
        if (opens || closes)
            FinishHeading();
        if (opens)
            heading_ = name[1] - '0';
        if (!opens && name != "a")
            return;
        for (const char* attribute : {"name", "id"})
            if (auto anchor = Attribute(tag, attribute); !anchor.empty())
                anchor_ = std::move(anchor);
    }

    void FinishHeading() {
        auto caption = caption_.Take();
        const int level = heading_;
        heading_ = 0;
        if (level == 0)
            return;
        if (level == 1 && topic_.title.empty())
            topic_.title = caption;
        if (level > 1 && !caption.empty())
            topic_.sections.push_back(
                {HasControlCharacters(anchor_) ? "" : anchor_, text::Left(caption, kLongestCaption)});
        anchor_.clear();
    }

    std::string_view page_;
    std::size_t at_ = 0;
    bool inTitle_ = false;
    int heading_ = 0; ///< level of the open heading
    std::string anchor_;
    Words body_;
    Words caption_;
    TopicText topic_;
};

} // namespace

TopicText ReadTopic(std::string_view bytes) {
    const auto page = DecodePage(bytes);
    return Reader(page).Read();
}

} // namespace tovimar::search
