#include "platform/access/ExportWriter.h"

#include "platform/Error.h"
#include "platform/access/ExportEncoding.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <vector>

namespace tovimar::platform::access {

namespace {

/// What the host writes behind the help file: everything that came with a later version than that. As found
/// in exports of several versions.
constexpr std::array<std::string_view, 26> kBehindHelpFile{"DatasheetFontName",
                                                           "PrtMip",
                                                           "PrtDevMode",
                                                           "PrtDevNames",
                                                           "PrtDevModeW",
                                                           "PrtDevNamesW",
                                                           "OnActivate",
                                                           "OnKeyDown",
                                                           "OnTimer",
                                                           "OnResize",
                                                           "OnLoad",
                                                           "AllowDatasheetView",
                                                           "FilterOnLoad",
                                                           "FitToPage",
                                                           "ShowPageMargins",
                                                           "DisplayOnSharePointSite",
                                                           "AllowLayoutView",
                                                           "DatasheetAlternateBackColor",
                                                           "DatasheetGridlinesColor12",
                                                           "FitToScreen",
                                                           "DatasheetBackThemeColorIndex",
                                                           "BorderThemeColorIndex",
                                                           "RibbonName",
                                                           "ThemeFontIndex",
                                                           "ForeThemeColorIndex",
                                                           "AlternateBackThemeColorIndex"};

bool IsBehindHelpFile(std::string_view name) {
    return std::find(kBehindHelpFile.begin(), kBehindHelpFile.end(), name) != kBehindHelpFile.end();
}

/// The context id is the last of the numbers and flags that stand in front of blobs, texts and events.
bool IsBehindContextId(std::string_view name, bool plainValue) {
    return !plainValue || name == "DatasheetGridlinesColor" || name == "TimerInterval" ||
           IsBehindHelpFile(name);
}

std::string_view Trimmed(std::string_view line) {
    const auto first = line.find_first_not_of(" \t\r");
    if (first == std::string_view::npos)
        return {};
    return line.substr(first, line.find_last_not_of(" \t\r") - first + 1);
}

/// A property of the object itself by its place in the text.
struct PropertyLines {
    std::string_view name;
    bool plainValue = true; ///< a number or flag, on one line
    std::size_t start = 0;
    std::size_t end = 0; ///< behind its last line end
};

/// The head of a form's or report's block: its own properties, which all stand in front of its parts.
class ObjectHead {
public:
    explicit ObjectHead(std::string_view source) : source_(source) {}

    /// False for a text without a form or report.
    bool Find() {
        while (Next())
            if (const auto line = Trimmed(line_); text::EqualsIgnoringCase(line, "Begin Form") ||
                                                  text::EqualsIgnoringCase(line, "Begin Report")) {
                lineEnd = line_.ends_with('\r') ? "\r\n" : "\n";
                indent = std::string(line_.substr(0, line_.find_first_not_of(" \t"))) + "    ";
                start = position_;
                TakeProperties();
                return true;
            }
        return false;
    }

    std::vector<PropertyLines> properties;
    std::string indent;
    std::string lineEnd;
    std::size_t start = 0; ///< of the line behind "Begin Form"

private:
    bool Next() {
        if (position_ >= source_.size())
            return false;
        lineStart_ = position_;
        const auto end = std::min(source_.find('\n', position_), source_.size());
        line_ = source_.substr(position_, end - position_);
        position_ = std::min(end + 1, source_.size());
        return true;
    }

    void TakeProperties() {
        while (Next()) {
            const auto line = Trimmed(line_);
            if (line.starts_with('"')) {
                if (!properties.empty())
                    properties.back().end = position_; // a long text goes on
                continue;
            }
            const auto sign = line.find('=');
            if (line == "Begin" || line.starts_with("Begin ") || line == "End")
                return;
            if (sign == std::string_view::npos)
                continue;
            if (properties.empty())
                indent = std::string(line_.substr(0, line_.find_first_not_of(" \t")));
            const auto value = Trimmed(line.substr(sign + 1));
            properties.push_back({Trimmed(line.substr(0, sign)), value != "Begin" && !value.starts_with('"'),
                                  lineStart_, position_});
            if (value == "Begin")
                SkipBlob();
        }
    }

    /// An embedded macro holds blocks of its own.
    void SkipBlob() {
        for (std::size_t depth = 1; depth > 0 && Next();) {
            const auto line = Trimmed(line_);
            if (line == "End")
                --depth;
            else if (line == "Begin" || line.starts_with("Begin ") || line.ends_with("= Begin"))
                ++depth;
        }
        properties.back().end = position_;
    }

    std::string_view source_;
    std::string_view line_;
    std::size_t position_ = 0;
    std::size_t lineStart_ = 0;
};

struct Edit {
    std::size_t start = 0;
    std::size_t end = 0;
    std::string line; ///< UTF-8
};

/// In place of the property's old lines, else in front of the first one that `isBehind`.
template <class IsBehind>
Edit PutProperty(const ObjectHead& head, std::string_view name, const std::string& value, IsBehind isBehind) {
    const std::string line = head.indent + std::string(name) + " =" + value + head.lineEnd;
    const auto old =
        std::find_if(head.properties.begin(), head.properties.end(), [&](const PropertyLines& property) {
            return text::EqualsIgnoringCase(property.name, name);
        });
    if (old != head.properties.end())
        return {old->start, old->end, line};
    const auto behind = std::find_if(head.properties.begin(), head.properties.end(), isBehind);
    if (behind != head.properties.end())
        return {behind->start, behind->start, line};
    const std::size_t place = head.properties.empty() ? head.start : head.properties.back().end;
    return {place, place, line};
}

std::string Quoted(const std::string& value) {
    return '"' + text::ReplaceAll(text::ReplaceAll(value, "\\", "\\\\"), "\"", "\\\"") + '"';
}

std::vector<Edit> EditsOf(const ObjectHead& head, const HelpProperties& properties) {
    std::vector<Edit> edits;
    if (properties.contextId)
        edits.push_back(PutProperty(head, "HelpContextId", std::to_string(*properties.contextId),
                                    [](const PropertyLines& property) {
                                        return IsBehindContextId(property.name, property.plainValue);
                                    }));
    if (properties.file)
        edits.push_back(
            PutProperty(head, "HelpFile", Quoted(*properties.file),
                        [](const PropertyLines& property) { return IsBehindHelpFile(property.name); }));
    std::stable_sort(edits.begin(), edits.end(),
                     [](const Edit& left, const Edit& right) { return left.start < right.start; });
    return edits;
}

bool IsUtf16(ExportEncoding encoding) {
    return encoding == ExportEncoding::Utf16Little || encoding == ExportEncoding::Utf16Big;
}

/// One byte per unit of the source, so that places in both are the same but for the unit's size.
std::string Narrowed(std::string_view bytes, ExportEncoding encoding) {
    constexpr char kOther = '\x80';
    const std::size_t low = encoding == ExportEncoding::Utf16Little ? 0 : 1;
    std::string narrow;
    narrow.reserve(bytes.size() / 2);
    for (std::size_t i = 0; i + 1 < bytes.size(); i += 2) {
        const char unit = bytes[i + low];
        narrow += bytes[i + 1 - low] == '\0' && unit >= 0 ? unit : kOther;
    }
    return narrow;
}

std::string Encoded(const std::string& line, ExportEncoding encoding) {
    if (encoding == ExportEncoding::Utf8)
        return line;
    if (encoding == ExportEncoding::Ansi)
        return text::AnsiCodePage().Encode(line);
    std::string bytes;
    for (const char16_t unit : text::ToUtf16(line)) {
        const char low = static_cast<char>(unit & 0xff);
        const char high = static_cast<char>(unit >> 8);
        bytes += encoding == ExportEncoding::Utf16Little ? std::string{low, high} : std::string{high, low};
    }
    return bytes;
}

} // namespace

std::string WithHelpProperties(std::string_view bytes, const HelpProperties& properties,
                               const std::string& nativePath) {
    const auto encoding = FindExportEncoding(bytes);
    const std::string narrow = IsUtf16(encoding) ? Narrowed(bytes, encoding) : std::string();
    const std::size_t unit = IsUtf16(encoding) ? 2 : 1;
    ObjectHead head(IsUtf16(encoding) ? std::string_view(narrow) : bytes);
    if (!head.Find())
        throw RaisedError(kFailure1, nativePath + ": the file holds no form or report.", "ExportWriter");
    std::string changed;
    changed.reserve(bytes.size() + 128);
    std::size_t taken = 0;
    for (const Edit& edit : EditsOf(head, properties)) {
        changed += bytes.substr(taken, edit.start * unit - taken);
        changed += Encoded(edit.line, encoding);
        taken = edit.end * unit;
    }
    changed += bytes.substr(taken);
    return changed;
}

} // namespace tovimar::platform::access
