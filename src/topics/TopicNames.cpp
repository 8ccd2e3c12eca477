#include "topics/TopicNames.h"

#include "foundation/NameEncoding.h"
#include "platform/text/Text.h"
#include "uimodel/CXmlForm.h"
#include "uimodel/DefinitionText.h"

namespace tovimar {

namespace {

constexpr std::string_view kEncodedMark = "&#38;";

/// Deletes each encoded mark but the one that another follows.
std::string WithoutEncodedMarks(const std::string& caption) {
    std::string kept;
    std::size_t begin = 0;
    std::size_t found = caption.find(kEncodedMark);
    for (; found != std::string::npos; found = caption.find(kEncodedMark, begin)) {
        kept.append(caption, begin, found - begin);
        begin = found + kEncodedMark.size();
        const std::size_t next = caption.find_first_not_of(' ', begin);
        if (next != std::string::npos && caption.compare(next, kEncodedMark.size(), kEncodedMark) == 0)
            kept.append(kEncodedMark);
    }
    return kept.append(caption, begin);
}

} // namespace

std::string WithoutTags(const std::string& text) {
    return text::ReplaceAll(text::ReplaceAll(text, "<", "&lt;"), ">", "&gt;");
}

std::string StripAccelerators(std::string_view caption, bool vfEncoded) {
    std::string kept;
    kept.reserve(caption.size());
    for (std::size_t i = 0; i < caption.size(); ++i) {
        const char next = i + 1 < caption.size() ? caption[i + 1] : '\0';
        if (caption[i] != '&' || next == '&' || next == '#')
            kept.push_back(caption[i]);
    }
    return vfEncoded ? WithoutEncodedMarks(kept) : kept;
}

std::string FormBookmarkPrefix(const CXmlForm& form) {
    return NormalizeName(form.NamePrefix.empty() ? form.Name : form.NamePrefix + "_" + form.Name);
}

std::string FormDisplayName(const CXmlForm& form) {
    return WithoutTags(StripAccelerators(definition::IdentifiedByName() ? form.Name : form.Caption()));
}

std::string MenuDisplayName(const CXmlMenu& menu) {
    return WithoutTags(StripAccelerators(definition::IdentifiedByName() ? menu.Name : menu.Text));
}

std::string ControlDisplayName(const CXmlControl& ctl) {
    const std::string caption = ctl.Caption();
    const bool byName = definition::IdentifiedByName();
    const std::string& wanted = byName ? ctl.Name : caption;
    const std::string& other = byName ? caption : ctl.Name;
    return WithoutTags(StripAccelerators(wanted.empty() ? other : wanted));
}

std::string ControlBookmark(const CXmlControl& ctl) {
    return NormalizeName(ctl.HtmlBookMarkName());
}

std::string MenuBookmark(const CXmlMenu& menu) {
    return NormalizeName(menu.Name);
}

} // namespace tovimar
