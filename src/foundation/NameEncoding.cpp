#include "foundation/NameEncoding.h"

#include "foundation/CXMLFile.h"
#include "foundation/Paths.h"
#include "platform/Environment.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <array>
#include <charconv>
#include <optional>
#include <unordered_map>

namespace tovimar {
namespace {

/// Replacements by UTF-16 unit; ASCII, which most names are, without hashing.
struct NameTable {
    std::array<std::optional<std::string>, 128> ascii;
    std::unordered_map<char32_t, std::string> others;
};

std::optional<NameTable>& Table() {
    static std::optional<NameTable> table;
    return table;
}

/// The attribute of that name in any case; none when it stands nowhere.
std::optional<std::string> AttributeInLowerCase(const XmlNode& node, const char* name) {
    for (std::size_t i = 0; i < node.attributeCount(); ++i)
        if (text::ToLower(node.attributeName(i)) == name)
            return node.attributeValue(i);
    return std::nullopt;
}

void AddEntry(NameTable& table, const XmlNode& node) {
    const auto code = AttributeInLowerCase(node, "u");
    const auto replacement = AttributeInLowerCase(node, "t");
    if (!code || !replacement)
        return;
    std::uint32_t unit = 0;
    const char* end = code->data() + code->size();
    const auto [stop, error] = std::from_chars(code->data(), end, unit, 16);
    if (error != std::errc() || stop != end || unit > 0xFFFF)
        return;
    if (unit < 128) {
        if (!table.ascii[unit])
            table.ascii[unit] = *replacement;
    } else {
        table.others.try_emplace(unit, *replacement);
    }
}

NameTable LoadTable() {
    NameTable table;
    XmlDocument document;
    const std::string path = SettingsFolder() + "ObjectNameEncoding.xml";
    if (!platform::Env().files->FileExists(path) || CXMLFile().Load(path, document) != 0)
        return table;
    for (const XmlNode& node : document.selectSingleNode("/EncodingTable").childElements())
        AddEntry(table, node);
    return table;
}

} // namespace

std::string NormalizeName(const std::string& text) {
    auto& table = Table();
    if (!table)
        table = LoadTable();
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        const std::size_t start = i;
        const char32_t codePoint = text::NextCodePoint(text, i);
        if (codePoint < 128) {
            const auto& replacement = table->ascii[codePoint];
            if (replacement)
                out += *replacement;
            else
                out += text[start];
            continue;
        }
        const auto found = table->others.find(codePoint);
        if (found != table->others.end())
            out += found->second;
        else
            out.append(text, start, i - start);
    }
    return out;
}

void ForgetNameEncodingTable() {
    Table().reset();
}

} // namespace tovimar
