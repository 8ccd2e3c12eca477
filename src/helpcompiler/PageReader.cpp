#include "helpcompiler/PageReader.h"

#include "helpcompiler/Markup.h"
#include "helpcompiler/WordTable.h"

#include <algorithm>
#include <array>

namespace tovimar::helpcompiler {
namespace {

struct Referring {
    std::string_view tag;
    std::string_view attribute;
    PageReference::Kind kind;
};

constexpr auto kLink = PageReference::Kind::Link;
constexpr auto kNeeded = PageReference::Kind::Needed;
constexpr std::array<Referring, 17> kReferring{{{"a", "href", kLink},
                                                {"area", "href", kLink},
                                                {"form", "action", kLink},
                                                {"img", "src", kNeeded},
                                                {"img", "lowsrc", kNeeded},
                                                {"input", "src", kNeeded},
                                                {"script", "src", kNeeded},
                                                {"frame", "src", kNeeded},
                                                {"iframe", "src", kNeeded},
                                                {"embed", "src", kNeeded},
                                                {"bgsound", "src", kNeeded},
                                                {"object", "data", kNeeded},
                                                {"body", "background", kNeeded},
                                                {"table", "background", kNeeded},
                                                {"td", "background", kNeeded},
                                                {"th", "background", kNeeded},
                                                {"tr", "background", kNeeded}}};

std::string_view Trimmed(std::string_view text) {
    constexpr std::string_view kBlanks = " \t\r\n\f";
    const auto first = text.find_first_not_of(kBlanks);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

/// Runs of blanks and line ends become one blank.
std::string InOneLine(std::string_view text) {
    std::string out;
    for (const char c : Trimmed(text)) {
        const bool blank = c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\f';
        if (!blank)
            out.push_back(c);
        else if (out.back() != ' ')
            out.push_back(' ');
    }
    return out;
}

class Reader {
public:
    Reader(std::string_view bytes, const text::CodePage& page) : scanner_(bytes), page_(page) {}

    PageContent Read() {
        for (MarkupToken token; scanner_.Next(token);) {
            if (token.kind == MarkupToken::Kind::Text)
                AddWords(token.source, body_);
            else if (token.kind == MarkupToken::Kind::RawText)
                TakeRawText(token);
            else if (token.kind == MarkupToken::Kind::OpenTag)
                TakeTag(token);
        }
        content_.words.text += body_;
        return std::move(content_);
    }

private:
    void AddWords(std::string_view source, std::string& out) {
        content_.words.characters += static_cast<std::uint32_t>(source.size());
        const auto add = [&](std::string_view word) { out.append(word).push_back('\0'); };
        if (source.find('&') == std::string_view::npos)
            SplitWords(source, page_.Number(), add);
        else
            SplitWords(DecodeReferences(source, page_, Unheld::Blank), page_.Number(), add);
    }

    void TakeRawText(const MarkupToken& token) {
        if (token.name == "title" && !hasTitle_) {
            hasTitle_ = true;
            content_.title = InOneLine(DecodeReferences(token.source, page_, Unheld::Keep));
            AddWords(token.source, content_.words.text);
            for (const char c : content_.words.text)
                content_.words.titleWords += c == '\0' ? 1 : 0;
        } else if (token.name == "style") {
            for (PageReference& reference : ReadStyleSheet(token.source, scanner_.LineOf(token.source)))
                content_.references.push_back(std::move(reference));
        } else if (token.name == "textarea" || token.name == "xmp") {
            AddWords(token.source, body_);
        }
    }

    void TakeTag(const MarkupToken& token) {
        if (token.attributes.empty())
            return;
        for (const Referring& referring : kReferring)
            if (referring.tag == token.name)
                AddReference(token, token.Attribute(referring.attribute), referring.kind);
        if (token.name == "link" && IsNeededLink(token.Attribute("rel")))
            AddReference(token, token.Attribute("href"), kNeeded);
        if (const std::string_view style = token.Attribute("style"); !style.empty())
            for (PageReference& reference : ReadStyleSheet(style, scanner_.LineOf(token.source)))
                content_.references.push_back(std::move(reference));
    }

    static bool IsNeededLink(std::string_view relation) {
        return EqualsCaseless(relation, "stylesheet") || EqualsCaseless(relation, "shortcut icon") ||
               EqualsCaseless(relation, "icon");
    }

    void AddReference(const MarkupToken& token, std::string_view target, PageReference::Kind kind) {
        const std::string_view trimmed = Trimmed(target);
        if (!trimmed.empty())
            content_.references.push_back(
                {kind, DecodeReferences(trimmed, page_, Unheld::Keep), scanner_.LineOf(token.source)});
    }

    MarkupScanner scanner_;
    const text::CodePage& page_;
    PageContent content_;
    std::string body_;
    bool hasTitle_ = false;
};

/// The text in quotes or up to ")", from `place` on; `place` moves behind it.
std::string_view StyleSheetName(std::string_view bytes, std::size_t& place) {
    place = std::min(bytes.find_first_not_of(" \t\r\n", place), bytes.size());
    const char quote = place < bytes.size() ? bytes[place] : ')';
    const bool quoted = quote == '"' || quote == '\'';
    const std::size_t start = place + (quoted ? 1 : 0);
    place = std::min(bytes.find(quoted ? quote : ')', start), bytes.size());
    return Trimmed(bytes.substr(start, place - start));
}

} // namespace

PageContent ReadPage(std::string_view bytes, const text::CodePage& page) {
    return Reader(bytes, page).Read();
}

std::vector<PageReference> ReadStyleSheet(std::string_view bytes, int firstLine) {
    std::vector<PageReference> found;
    std::size_t counted = 0;
    for (std::size_t place = 0; place < bytes.size(); ++place) {
        const std::string_view rest = bytes.substr(place);
        const std::size_t start = place;
        if (rest.starts_with("/*"))
            place = std::min(bytes.find("*/", place + 2), bytes.size());
        else if (EqualsCaseless(rest.substr(0, 4), "url("))
            place += 4;
        else if (EqualsCaseless(rest.substr(0, 8), "@import "))
            place += 8;
        else
            continue;
        if (rest.starts_with("/*") || EqualsCaseless(bytes.substr(place, 4), "url("))
            continue;
        for (; counted < start; ++counted)
            firstLine += bytes[counted] == '\n' ? 1 : 0;
        if (const std::string_view name = StyleSheetName(bytes, place); !name.empty())
            found.push_back({PageReference::Kind::Needed, std::string(name), firstLine});
    }
    return found;
}

} // namespace tovimar::helpcompiler
