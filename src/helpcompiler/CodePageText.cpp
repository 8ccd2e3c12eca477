#include "helpcompiler/CodePageText.h"

#include "helpcompiler/Markup.h"
#include "helpcompiler/WordTable.h"
#include "platform/text/ByteOrderMark.h"
#include "platform/text/CodePoints.h"

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <optional>

namespace tovimar::helpcompiler {
namespace {

/// What is written for a character that the code page can't hold.
enum class Escape { Reference, Script, StyleSheet };

std::string Escaped(char32_t character, Escape escape) {
    const auto number = static_cast<std::uint32_t>(character);
    if (escape == Escape::Reference)
        return "&#" + std::to_string(number) + ";";
    char digits[16];
    std::string out;
    if (escape == Escape::StyleSheet) {
        std::snprintf(digits, sizeof digits, "\\%X ", number);
        return digits;
    }
    for (const char16_t unit : text::ToUtf16(text::FromCodePoint(character))) {
        std::snprintf(digits, sizeof digits, "\\u%04X", static_cast<unsigned>(unit));
        out += digits;
    }
    return out;
}

void AppendEncoded(std::string& out, std::string_view utf8, const text::CodePage& page, Escape escape) {
    const bool singleByte = !IsDoubleByte(page.Number());
    for (std::size_t i = 0; i < utf8.size();) {
        const std::size_t end = text::SkipAscii(utf8, i);
        out.append(utf8.substr(i, end - i));
        i = end;
        if (i >= utf8.size())
            break;
        const char32_t character = text::NextCodePoint(utf8, i);
        const std::uint8_t byte = singleByte ? page.AnsiValue(character) : '?';
        if (byte != '?')
            out.push_back(static_cast<char>(byte));
        else if (!singleByte && page.CanEncode(character))
            out += page.Encode(text::FromCodePoint(character));
        else
            out += Escaped(character, escape);
    }
}

/// The charset's name inside of `content="text/html; charset=utf-8"` or as an attribute of its own.
std::string_view CharsetIn(const MarkupToken& meta) {
    constexpr std::string_view kSign = "charset=";
    std::string_view text = meta.Attribute("charset");
    if (!text.empty())
        return text;
    text = meta.Attribute("content");
    const auto found =
        std::search(text.begin(), text.end(), kSign.begin(), kSign.end(), [](char left, char right) {
            return EqualsCaseless({&left, 1}, {&right, 1});
        });
    if (found == text.end())
        return {};
    text.remove_prefix(static_cast<std::size_t>(found - text.begin()) + kSign.size());
    return text.substr(0, text.find_first_of(" ;\"'"));
}

/// The encoding that an XML declaration names.
std::string_view EncodingIn(std::string_view declaration) {
    constexpr std::string_view kSign = "encoding=";
    const std::size_t found = declaration.find(kSign);
    if (!declaration.starts_with("<?xml") || found == std::string_view::npos)
        return {};
    declaration.remove_prefix(found + kSign.size() + 1);
    return declaration.substr(0, declaration.find_first_of("\"'"));
}

bool IsUtf8Name(std::string_view charset) {
    return EqualsCaseless(charset, "utf-8") || EqualsCaseless(charset, "utf8");
}

bool NamesUtf8(std::string_view bytes) {
    MarkupScanner scanner(bytes);
    for (MarkupToken token; scanner.Next(token);) {
        if (token.kind == MarkupToken::Kind::OpenTag && token.name == "meta" && IsUtf8Name(CharsetIn(token)))
            return true;
        if (token.kind == MarkupToken::Kind::Comment && IsUtf8Name(EncodingIn(token.source)))
            return true;
        if (token.name == "body")
            return false;
    }
    return false;
}

/// The page's text in UTF-8; nothing when it isn't of Unicode.
std::optional<std::string> UnicodeText(std::string_view bytes) {
    if (auto marked = text::DecodeMarked(bytes))
        return marked;
    if (!NamesUtf8(bytes))
        return std::nullopt;
    return text::MakeValidUtf8(bytes);
}

class PageConverter {
public:
    PageConverter(std::string_view text, const text::CodePage& page) : text_(text), page_(page) {}

    std::string Convert() {
        MarkupScanner scanner(text_);
        for (MarkupToken token; scanner.Next(token);) {
            if (token.kind == MarkupToken::Kind::RawText)
                Append(token.source, EscapeIn(token.name));
            else if (token.kind == MarkupToken::Kind::OpenTag && token.name == "meta")
                AppendNaming(token.source, CharsetIn(token));
            else if (token.kind == MarkupToken::Kind::Comment)
                AppendNaming(token.source, EncodingIn(token.source));
            else
                Append(token.source, Escape::Reference);
            if (token.kind == MarkupToken::Kind::OpenTag && token.name == "head")
                afterHead_ = out_.size();
        }
        if (!named_ && afterHead_ != 0)
            out_.insert(afterHead_, "<meta http-equiv=\"Content-Type\" content=\"text/html; charset=" +
                                        CharsetName(page_.Number()) + "\">");
        return std::move(out_);
    }

private:
    static Escape EscapeIn(std::string_view tag) {
        if (tag == "script")
            return Escape::Script;
        return tag == "style" ? Escape::StyleSheet : Escape::Reference;
    }

    void Append(std::string_view text, Escape escape) { AppendEncoded(out_, text, page_, escape); }

    /// The tag with another charset in place of `charset`, which is a piece of it or empty.
    void AppendNaming(std::string_view tag, std::string_view charset) {
        if (charset.empty()) {
            Append(tag, Escape::Reference);
            return;
        }
        const auto start = static_cast<std::size_t>(charset.data() - tag.data());
        Append(tag.substr(0, start), Escape::Reference);
        out_ += CharsetName(page_.Number());
        Append(tag.substr(start + charset.size()), Escape::Reference);
        named_ = true;
    }

    std::string_view text_;
    const text::CodePage& page_;
    std::string out_;
    std::size_t afterHead_ = 0;
    bool named_ = false;
};

} // namespace

std::string CharsetName(int codePage) {
    switch (codePage) {
    case 932:
        return "shift_jis";
    case 936:
        return "gb2312";
    case 949:
        return "ks_c_5601-1987";
    case 950:
        return "big5";
    default:
        return "windows-" + std::to_string(codePage);
    }
}

std::string InCodePage(std::string_view bytes, const text::CodePage& page) {
    const auto text = UnicodeText(bytes);
    return text ? PageConverter(*text, page).Convert() : std::string(bytes);
}

} // namespace tovimar::helpcompiler
