#include "helpcompiler/Markup.h"

#include "platform/text/Caseless.h"

#include <algorithm>

namespace tovimar::helpcompiler {
namespace {

bool IsBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\f';
}

bool IsLetter(char c) {
    const char lower = text::CaselessAscii(c);
    return lower >= 'a' && lower <= 'z';
}

std::string Lower(std::string_view name) {
    std::string out(name);
    std::transform(out.begin(), out.end(), out.begin(), text::CaselessAscii);
    return out;
}

/// Tags that may stand inside of these are text.
bool HoldsRawText(std::string_view name) {
    return name == "script" || name == "style" || name == "title" || name == "textarea" || name == "xmp";
}

} // namespace

bool EqualsCaseless(std::string_view left, std::string_view right) {
    return text::CaselessEqual()(left, right);
}

std::string_view MarkupToken::Attribute(std::string_view wanted) const {
    for (const MarkupAttribute& attribute : attributes)
        if (EqualsCaseless(attribute.name, wanted))
            return attribute.value;
    return {};
}

bool MarkupScanner::Next(MarkupToken& token) {
    if (place_ >= text_.size())
        return false;
    token.attributes.clear();
    if (!rawName_.empty()) {
        ReadRawText(token);
        if (!token.source.empty())
            return true;
    }
    const std::size_t start = place_;
    for (; place_ < text_.size(); ++place_) {
        place_ = std::min(text_.find('<', place_), text_.size());
        const char next = place_ + 1 < text_.size() ? text_[place_ + 1] : ' ';
        if (IsLetter(next) || next == '/' || next == '!' || next == '?')
            break;
    }
    place_ = std::min(place_, text_.size());
    token.name.clear();
    if (place_ > start) {
        token.kind = MarkupToken::Kind::Text;
        token.source = text_.substr(start, place_ - start);
        return true;
    }
    const char next = text_[place_ + 1];
    if (next == '!' || next == '?')
        ReadDeclaration(token);
    else
        ReadTag(token);
    token.source = text_.substr(start, place_ - start);
    return true;
}

void MarkupScanner::ReadDeclaration(MarkupToken& token) {
    token.kind = MarkupToken::Kind::Comment;
    const bool comment = text_.substr(place_).starts_with("<!--");
    const std::string_view end = comment ? "-->" : ">";
    const std::size_t found = text_.find(end, place_ + (comment ? 4 : 2));
    place_ = found == std::string_view::npos ? text_.size() : found + end.size();
}

void MarkupScanner::ReadTag(MarkupToken& token) {
    const bool closing = text_[place_ + 1] == '/';
    token.kind = closing ? MarkupToken::Kind::CloseTag : MarkupToken::Kind::OpenTag;
    const std::size_t start = place_ += closing ? 2 : 1;
    while (place_ < text_.size() && !IsBlank(text_[place_]) && text_[place_] != '>' && text_[place_] != '/')
        ++place_;
    token.name = Lower(text_.substr(start, place_ - start));
    ReadAttributes(token);
    if (!closing && HoldsRawText(token.name))
        rawName_ = token.name;
}

void MarkupScanner::ReadAttributes(MarkupToken& token) {
    while (place_ < text_.size() && text_[place_] != '>') {
        if (IsBlank(text_[place_]) || text_[place_] == '/') {
            ++place_;
            continue;
        }
        const std::size_t start = place_++;
        while (place_ < text_.size() && !IsBlank(text_[place_]) && text_[place_] != '=' &&
               text_[place_] != '>' && text_[place_] != '/')
            ++place_;
        MarkupAttribute attribute{text_.substr(start, place_ - start), {}};
        SkipBlanks();
        if (place_ < text_.size() && text_[place_] == '=')
            attribute.value = ReadValue();
        token.attributes.push_back(attribute);
    }
    if (place_ < text_.size())
        ++place_;
}

std::string_view MarkupScanner::ReadValue() {
    ++place_;
    SkipBlanks();
    if (place_ >= text_.size())
        return {};
    const char quote = text_[place_];
    if (quote == '"' || quote == '\'') {
        const std::size_t start = ++place_;
        const std::size_t end = std::min(text_.find(quote, start), text_.size());
        place_ = std::min(end + 1, text_.size());
        return text_.substr(start, end - start);
    }
    const std::size_t start = place_;
    while (place_ < text_.size() && !IsBlank(text_[place_]) && text_[place_] != '>')
        ++place_;
    return text_.substr(start, place_ - start);
}

void MarkupScanner::SkipBlanks() {
    while (place_ < text_.size() && IsBlank(text_[place_]))
        ++place_;
}

void MarkupScanner::ReadRawText(MarkupToken& token) {
    const std::size_t end = FindClosing(rawName_);
    token.kind = MarkupToken::Kind::RawText;
    token.name = std::move(rawName_);
    token.source = text_.substr(place_, end - place_);
    rawName_.clear();
    place_ = end;
}

std::size_t MarkupScanner::FindClosing(std::string_view name) const {
    for (std::size_t found = text_.find("</", place_); found != std::string_view::npos;
         found = text_.find("</", found + 2))
        if (EqualsCaseless(text_.substr(found + 2, name.size()), name))
            return found;
    return text_.size();
}

int MarkupScanner::LineOf(std::string_view piece) {
    const auto place = static_cast<std::size_t>(piece.data() - text_.data());
    for (; counted_ < place; ++counted_)
        if (text_[counted_] == '\n')
            ++line_;
    return line_;
}

} // namespace tovimar::helpcompiler
