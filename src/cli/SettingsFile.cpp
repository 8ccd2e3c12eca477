#include "cli/SettingsFile.h"

#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/xml/XmlDocument.h"

#include <string_view>

namespace tovimar::cli {
namespace {

constexpr std::string_view kOption = "<Option ";
constexpr std::string_view kEnd = "</Options>";

/// Place and length of an option's element; the length is 0 for one that isn't there.
struct Place {
    std::size_t at = 0;
    std::size_t length = 0;
};

std::string ElementText(const std::string& name, const std::string& value) {
    return "<Option Name = \"" + name + "\" Value = \"" + EncodeSpecialChars(value) + "\" />";
}

/// The end of the tag that begins at `at`, outside of quotes.
std::size_t TagEnd(const std::string& text, std::size_t at) {
    char quote = 0;
    for (; at < text.size(); ++at) {
        const char c = text[at];
        if (quote != 0)
            quote = c == quote ? '\0' : quote;
        else if (c == '"' || c == '\'')
            quote = c;
        else if (c == '>')
            return at + 1;
    }
    return text.size();
}

Place FindElement(const std::string& text, const std::string& name) {
    for (auto at = text.find(kOption); at != std::string::npos; at = text.find(kOption, at + 1)) {
        const std::size_t length = TagEnd(text, at) - at;
        XmlDocument element;
        if (text[at + length - 2] == '/' && element.loadXML(text.substr(at, length)) &&
            element.documentElement().attribute("Name") == name)
            return {at, length};
    }
    return {};
}

/// Before the end of the list, in a line that ends as that one does.
std::string WithAdded(std::string text, const std::string& element) {
    auto at = text.find(kEnd);
    if (at == std::string::npos)
        return text;
    const auto line = text.rfind('\n', at);
    if (line != std::string::npos && text.find_first_not_of(" \t", line + 1) == at)
        at = line + 1;
    const auto end = text.find('\n', at);
    const bool unixLines = end != std::string::npos && text[end - 1] != '\r';
    return text.insert(at, "    " + element + (unixLines ? "\n" : "\r\n"));
}

} // namespace

SettingsFile::SettingsFile(std::string path)
    : path_(std::move(path)), text_(platform::Env().files->ReadFile(path_)) {
    Parse();
}

void SettingsFile::Parse() {
    XmlDocument document;
    if (!document.loadXML(text_))
        throw RaisedError(kFailure1, "'" + path_ + "' can't be read: " + document.parseError().reason);
    const XmlNode options = document.selectSingleNode("//Settings/Options");
    if (!options)
        throw RaisedError(kFailure1, "'" + path_ + "' has no options");
    values_.clear();
    for (const XmlNode& option : options.childElements()) {
        const std::string value = option.attribute("Value");
        values_[option.attribute("Name")] = value.empty() ? option.attribute("value") : value;
    }
}

std::string SettingsFile::Value(const std::string& name) const {
    const auto found = values_.find(name);
    return found == values_.end() ? std::string() : found->second;
}

void SettingsFile::SetValue(const std::string& name, const std::string& value) {
    const std::string before = text_;
    const Place place = FindElement(text_, name);
    const std::string element = ElementText(name, value);
    if (place.length > 0)
        text_.replace(place.at, place.length, element);
    else
        text_ = WithAdded(std::move(text_), element);
    Parse();
    if (Value(name) != value)
        throw RaisedError(kFailure1, "'" + path_ + "' can't take the value of " + name);
    if (text_ != before)
        platform::Env().files->WriteFile(path_, text_);
}

} // namespace tovimar::cli
