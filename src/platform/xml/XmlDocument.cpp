#include "platform/xml/XmlDocument.h"

#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlCheck.h"

#include <algorithm>
#include <pugixml.hpp>

namespace tovimar {
namespace {

// Codes as the model's callers know them: they only tell 0 from the rest, but print them.
constexpr ResultCode kNotFound = MakeResultCode(0x800C0006U);
constexpr ResultCode kIllFormed = MakeResultCode(0xC00CE556U);

constexpr unsigned kParseOptions =
    pugi::parse_default | pugi::parse_comments | pugi::parse_pi | pugi::parse_declaration;

/// Value of `encoding` in the XML declaration at the start of the bytes, lower case.
std::string DeclaredEncoding(std::string_view bytes) {
    if (!bytes.starts_with("<?xml"))
        return {};
    const std::string_view declaration = bytes.substr(0, std::min(bytes.find("?>"), std::size_t{200}));
    auto at = declaration.find("encoding");
    if (at == std::string_view::npos)
        return {};
    at = declaration.find_first_of("\"'", at);
    if (at == std::string_view::npos)
        return {};
    const auto end = declaration.find(declaration[at], at + 1);
    return end == std::string_view::npos ? std::string()
                                         : text::ToLower(declaration.substr(at + 1, end - at - 1));
}

std::string FromUtf16Bytes(std::string_view bytes, bool bigEndian) {
    std::u16string units;
    units.reserve(bytes.size() / 2);
    for (std::size_t i = 2; i + 1 < bytes.size(); i += 2) {
        const auto first = static_cast<unsigned char>(bytes[i]);
        const auto second = static_cast<unsigned char>(bytes[i + 1]);
        units += static_cast<char16_t>(bigEndian ? first << 8 | second : second << 8 | first);
    }
    return text::FromUtf16(units);
}

/// A file's bytes as UTF-8. A UTF-8 file stays as it is: wrong bytes in it are a fault of the document.
std::string ToUtf8(std::string bytes) {
    if (bytes.starts_with("\xEF\xBB\xBF"))
        return bytes.substr(3);
    if (bytes.starts_with("\xFF\xFE") || bytes.starts_with("\xFE\xFF"))
        return FromUtf16Bytes(bytes, bytes[0] == '\xFE');
    const std::string encoding = DeclaredEncoding(bytes);
    if (encoding.empty() || encoding == "utf-8" || encoding.starts_with("utf-16"))
        return bytes;
    const int page = text::CodePageByCharsetName(encoding);
    return page == 0 || page == 65001 ? bytes : text::CodePage(page).Decode(bytes);
}

void FillPlace(XmlParseReport& report, std::string_view text, std::size_t offset) {
    offset = std::min(offset, text.size());
    report.filepos = static_cast<std::int32_t>(offset);
    report.line = static_cast<std::int32_t>(
        1 + std::count(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(offset), '\n'));
    const auto before = offset == 0 ? std::string_view::npos : text.rfind('\n', offset - 1);
    const std::size_t start = before == std::string_view::npos ? 0 : before + 1;
    report.linepos = static_cast<std::int32_t>(text::Length(text.substr(start, offset - start)) + 1);
    const std::size_t end = std::min(text.find_first_of("\r\n", start), start + 200);
    report.srcText = text::MakeValidUtf8(text.substr(start, end - start));
}

} // namespace

XmlDocument::XmlDocument() : document_(std::make_unique<pugi::xml_document>()) {}
XmlDocument::~XmlDocument() = default;
XmlDocument::XmlDocument(XmlDocument&&) noexcept = default;
XmlDocument& XmlDocument::operator=(XmlDocument&&) noexcept = default;

bool XmlDocument::load(const std::string& path) {
    auto& files = *platform::Env().files;
    report_ = {};
    document_->reset();
    report_.url = files.ToNative(path);
    if (path.empty() || !files.FileExists(path)) {
        report_.errorCode = kNotFound;
        report_.reason = "The system cannot locate the object specified.";
        return false;
    }
    std::string url = report_.url;
    bool parsed = false;
    try {
        buffer_ = std::make_unique<std::string>(ToUtf8(files.ReadFile(path)));
        parsed = ParseBuffer();
    } catch (const RaisedError& error) {
        report_.errorCode = error.Number();
        report_.reason = error.what();
    }
    report_.url = std::move(url);
    return parsed;
}

bool XmlDocument::loadXML(std::string_view text) {
    if (text.starts_with("\xEF\xBB\xBF"))
        text.remove_prefix(3);
    return Parse(text);
}

bool XmlDocument::Check(std::string_view text) {
    report_ = {};
    document_->reset();
    const auto fault = CheckXml(text);
    if (!fault)
        return true;
    report_.errorCode = kIllFormed;
    report_.reason = fault->reason;
    FillPlace(report_, text, fault->offset);
    return false;
}

bool XmlDocument::Take(const pugi::xml_parse_result& result, std::string_view text) {
    if (result.status == pugi::status_ok)
        return true;
    document_->reset();
    report_.errorCode = kIllFormed;
    report_.reason = result.description();
    FillPlace(report_, text, static_cast<std::size_t>(std::max<std::ptrdiff_t>(0, result.offset)));
    return false;
}

bool XmlDocument::Parse(std::string_view text) {
    return Check(text) &&
           Take(document_->load_buffer(text.data(), text.size(), kParseOptions, pugi::encoding_utf8), text);
}

bool XmlDocument::ParseBuffer() {
    return Check(*buffer_) && Take(document_->load_buffer_inplace(buffer_->data(), buffer_->size(),
                                                                  kParseOptions, pugi::encoding_utf8),
                                   *buffer_);
}

XmlNode XmlDocument::documentElement() const {
    return XmlNode(document_->document_element().internal_object());
}

XmlNode XmlDocument::selectSingleNode(std::string_view xpath) const {
    return XmlNode(document_->internal_object()).selectSingleNode(xpath);
}

std::vector<XmlNode> XmlDocument::selectNodes(std::string_view xpath) const {
    return XmlNode(document_->internal_object()).selectNodes(xpath);
}

std::string XmlDocument::xml() const {
    std::string out;
    for (const auto child : document_->children())
        out += XmlNode(child.internal_object()).xml();
    return out;
}

} // namespace tovimar
