#include "platform/xml/XmlCheck.h"

#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <vector>

namespace tovimar {
namespace {

bool IsSpace(char byte) {
    return byte == ' ' || byte == '\t' || byte == '\r' || byte == '\n';
}

/// Letters beyond ASCII all count as name characters; the bytes are known to be good UTF-8 by then.
constexpr bool IsNameStart(char byte) {
    return (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z') || byte == '_' || byte == ':' ||
           static_cast<unsigned char>(byte) >= 0x80;
}

constexpr bool IsNamePart(char byte) {
    return IsNameStart(byte) || (byte >= '0' && byte <= '9') || byte == '-' || byte == '.';
}

constexpr auto kNamePart = [] {
    std::array<bool, 256> table{};
    for (std::size_t i = 0; i < table.size(); ++i)
        table[i] = IsNamePart(static_cast<char>(i));
    return table;
}();

/// Eight bytes that hold no end of a value and need no look of their own: no quote, "&" or "<", no control
/// character and nothing beyond ASCII. Values and texts are long runs of such.
bool IsPlainBlock(const char* bytes) {
    constexpr std::uint64_t kOnes = 0x0101010101010101U;
    constexpr std::uint64_t kTops = 0x8080808080808080U;
    std::uint64_t block = 0;
    std::memcpy(&block, bytes, sizeof block);
    const auto hits = [&](char byte) {
        const std::uint64_t changed = block ^ (kOnes * static_cast<unsigned char>(byte));
        return (changed - kOnes) & ~changed;
    };
    const std::uint64_t below = (block - kOnes * 0x20U) & ~block;
    return ((block | below | hits('"') | hits('\'') | hits('&') | hits('<')) & kTops) == 0;
}

bool IsPredefinedEntity(std::string_view name) {
    return name == "amp" || name == "lt" || name == "gt" || name == "quot" || name == "apos";
}

/// Content of `&#...;` without "&" and ";".
bool IsNumericReference(std::string_view body) {
    const bool hex = body.starts_with("#x");
    const std::string_view digits = body.substr(hex ? 2 : 1);
    if (digits.empty())
        return false;
    std::uint32_t value = 0;
    for (const char digit : digits) {
        const char lower = text::LowerAscii(digit);
        if (digit >= '0' && digit <= '9')
            value = value * (hex ? 16 : 10) + static_cast<std::uint32_t>(digit - '0');
        else if (hex && lower >= 'a' && lower <= 'f')
            value = value * 16 + static_cast<std::uint32_t>(lower - 'a' + 10);
        else
            return false;
        if (value > 0x10FFFF)
            return false;
    }
    return value != 0 && (value < 0xD800 || value > 0xDFFF) && value != 0xFFFE && value != 0xFFFF;
}

class Checker {
public:
    explicit Checker(std::string_view text) : text_(text) {}

    void Run() {
        if (StartsWith("<?xml") && position_ + 5 < text_.size() && IsSpace(text_[position_ + 5]))
            SkipPast("?>", "The XML declaration is not closed");
        while (position_ < text_.size())
            Step();
        if (!open_.empty())
            Fail("End tag of '" + std::string(open_.back()) + "' is missing");
        if (!hadRoot_)
            Fail("The document has no root element");
    }

private:
    [[noreturn]] void Fail(const std::string& reason) const { throw XmlFault{position_, reason}; }

    bool StartsWith(std::string_view what) const { return text_.substr(position_).starts_with(what); }

    /// The character at the position, which moves behind it.
    void Character() {
        const char byte = text_[position_];
        if (text::IsAscii(byte)) {
            if (static_cast<unsigned char>(byte) < 0x20 && !IsSpace(byte))
                Fail("A control character stands in the text");
            ++position_;
            return;
        }
        bool wellFormed = true;
        std::size_t behind = position_;
        text::NextCodePoint(text_, behind, &wellFormed);
        if (!wellFormed)
            Fail("An invalid character was found in text content");
        position_ = behind;
    }

    void CharactersUntil(std::size_t end) {
        while (position_ < end)
            Character();
    }

    void SkipPlainBlocks() {
        while (position_ + 8 <= text_.size() && IsPlainBlock(text_.data() + position_))
            position_ += 8;
    }

    void Step() {
        if (text_[position_] != '<')
            Text();
        else if (StartsWith("<!--"))
            Comment();
        else if (StartsWith("<![CDATA["))
            CData();
        else if (StartsWith("<!DOCTYPE"))
            DocumentType();
        else if (StartsWith("<?"))
            Instruction();
        else if (StartsWith("</"))
            EndTag();
        else
            StartTag();
    }

    void SkipPast(std::string_view what, const char* reason) {
        const auto end = text_.find(what, position_);
        if (end == std::string_view::npos)
            Fail(reason);
        CharactersUntil(end + what.size());
    }

    void SkipSpaces() {
        while (position_ < text_.size() && IsSpace(text_[position_]))
            ++position_;
    }

    void Text() {
        while (position_ < text_.size() && text_[position_] != '<') {
            SkipSpaces();
            if (position_ >= text_.size() || text_[position_] == '<')
                break;
            const char byte = text_[position_];
            if (open_.empty() && !IsSpace(byte))
                Fail(hadRoot_ ? "Only comments and white space may follow the root element"
                              : "Text stands in front of the root element");
            if (byte == '&')
                Reference();
            else if (byte == ']' && StartsWith("]]>"))
                Fail("']]>' may not stand in text");
            else
                Character();
        }
    }

    void Reference() {
        // "&#1114111;" is the longest that means anything; zeros in front may make it longer.
        const std::string_view rest = text_.substr(position_ + 1, 32);
        const auto end = rest.find(';');
        if (end == std::string_view::npos)
            Fail("A semicolon is missing behind '&'");
        const std::string_view body = rest.substr(0, end);
        if (body.starts_with("#") ? !IsNumericReference(body) : !IsPredefinedEntity(body))
            Fail("Reference to an undefined entity");
        position_ += end + 2;
    }

    void Comment() {
        position_ += 4;
        const auto end = text_.find("--", position_);
        if (end == std::string_view::npos)
            Fail("The comment is not closed");
        CharactersUntil(end + 2);
        if (!StartsWith(">"))
            Fail("'--' may not stand in a comment");
        ++position_;
    }

    void CData() {
        if (open_.empty())
            Fail("Text stands outside of the root element");
        SkipPast("]]>", "The CDATA section is not closed");
    }

    void Instruction() {
        const std::string_view target = text_.substr(position_ + 2, 4);
        if (text::EqualsIgnoringCase(target.substr(0, 3), "xml") &&
            (target.size() < 4 || !IsNamePart(target[3])))
            Fail("An XML declaration may only stand at the start");
        if (target.empty() || !IsNameStart(target[0]))
            Fail("A processing instruction has no name");
        SkipPast("?>", "The processing instruction is not closed");
    }

    void DocumentType() {
        if (hadRoot_ || hadType_)
            Fail("A document type may only stand in front of the root element");
        hadType_ = true;
        const auto end = text_.find_first_of("[>", position_);
        if (end == std::string_view::npos)
            Fail("The document type is not closed");
        if (text_[end] == '[')
            Fail("Document types with declarations are not accepted");
        CharactersUntil(end + 1);
    }

    std::string_view Name(const char* reason) {
        const std::size_t start = position_;
        if (position_ >= text_.size() || !IsNameStart(text_[position_]))
            Fail(reason);
        while (position_ < text_.size() && kNamePart[static_cast<unsigned char>(text_[position_])])
            Character();
        return text_.substr(start, position_ - start);
    }

    void StartTag() {
        if (open_.empty() && hadRoot_)
            Fail("Only one root element is allowed");
        ++position_;
        const std::string_view name = Name("A name was started with an invalid character");
        hadRoot_ = true;
        Attributes();
        if (StartsWith("/>")) {
            position_ += 2;
            return;
        }
        ++position_;
        if (open_.size() >= static_cast<std::size_t>(kMaxXmlDepth))
            Fail("Elements are nested too deeply");
        open_.push_back(name);
    }

    void Attributes() {
        names_.clear();
        looks_ = 0;
        for (;;) {
            const std::size_t before = position_;
            SkipSpaces();
            if (position_ >= text_.size())
                Fail("The tag is not closed");
            if (text_[position_] == '>' || StartsWith("/>"))
                break;
            if (position_ == before)
                Fail("White space is missing");
            AddName(Name("An attribute has no name"));
            AttributeValue();
        }
        if (names_.size() > kFewNames)
            CheckUnique();
    }

    /// Few names are compared as they come, and only with those that look alike.
    void AddName(std::string_view name) {
        const auto looks = (name.size() + 7U * static_cast<unsigned char>(name.front()) +
                            13U * static_cast<unsigned char>(name.back())) %
                           64;
        const std::uint64_t mark = std::uint64_t{1} << looks;
        if ((looks_ & mark) != 0 && names_.size() < kFewNames &&
            std::find(names_.begin(), names_.end(), name) != names_.end())
            FailTwice(name);
        looks_ |= mark;
        names_.push_back(name);
    }

    [[noreturn]] void FailTwice(std::string_view name) const {
        Fail("Attribute '" + std::string(name) + "' stands twice in a tag");
    }

    void AttributeValue() {
        SkipSpaces();
        if (!StartsWith("="))
            Fail("'=' is missing behind an attribute's name");
        ++position_;
        SkipSpaces();
        if (position_ >= text_.size() || (text_[position_] != '"' && text_[position_] != '\''))
            Fail("A string literal was expected, but no opening quote was found");
        const char quote = text_[position_++];
        for (SkipPlainBlocks(); position_ < text_.size() && text_[position_] != quote;) {
            if (text_[position_] == '<')
                Fail("The character '<' cannot be used in an attribute value");
            if (text_[position_] == '&')
                Reference();
            else
                Character();
        }
        if (position_ >= text_.size())
            Fail("A string literal was not closed");
        ++position_;
    }

    void CheckUnique() {
        std::sort(names_.begin(), names_.end());
        const auto twice = std::adjacent_find(names_.begin(), names_.end());
        if (twice != names_.end())
            FailTwice(*twice);
    }

    void EndTag() {
        const std::size_t start = position_;
        position_ += 2;
        const std::string_view name = Name("An end tag has no name");
        SkipSpaces();
        if (!StartsWith(">"))
            Fail("The end tag is not closed");
        if (open_.empty() || open_.back() != name) {
            position_ = start;
            Fail(open_.empty() ? "End tag '" + std::string(name) + "' has no start tag"
                               : "End tag '" + std::string(name) + "' does not match the start tag '" +
                                     std::string(open_.back()) + "'");
        }
        open_.pop_back();
        ++position_;
    }

    std::string_view text_;
    std::size_t position_ = 0;
    std::vector<std::string_view> open_;
    static constexpr std::size_t kFewNames = 64;
    std::vector<std::string_view> names_; ///< of the tag's attributes
    std::uint64_t looks_ = 0;             ///< a bit for each look that one of the names has
    bool hadRoot_ = false;
    bool hadType_ = false;
};

} // namespace

std::optional<XmlFault> CheckXml(std::string_view text) {
    if (text.size() > kMaxXmlBytes)
        return XmlFault{kMaxXmlBytes, "The text is longer than 64 MB"};
    try {
        Checker(text).Run();
    } catch (const XmlFault& fault) {
        return fault;
    }
    return std::nullopt;
}

} // namespace tovimar
