#include "host/server/CXmlCommand.h"

#include "foundation/Session.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <array>
#include <charconv>
#include <utility>

namespace tovimar {
namespace {

constexpr std::string_view kPlainPunctuation = " !#$%()*+,.:;=?@[]_";

bool IsPlain(char character) {
    return (character >= 'a' && character <= 'z') || (character >= 'A' && character <= 'Z') ||
           (character >= '0' && character <= '9') ||
           kPlainPunctuation.find(character) != std::string_view::npos;
}

/// Characters that end no attribute and start no reference pass, everything else goes by its number.
void AppendEncoded(std::string& target, std::string_view value) {
    std::size_t plain = 0;
    while (plain < value.size() && IsPlain(value[plain]))
        ++plain;
    target.append(value.substr(0, plain));
    if (plain == value.size())
        return;
    for (const char32_t codePoint : text::ToCodePoints(value.substr(plain))) {
        if (codePoint < 128 && IsPlain(static_cast<char>(codePoint)))
            target += static_cast<char>(codePoint);
        else
            target.append("&#").append(std::to_string(static_cast<std::uint32_t>(codePoint))).append(";");
    }
}

/// The character behind the name of a reference, 0 for none that is known here.
char32_t CodePointOfReference(std::string_view name) {
    constexpr std::array<std::pair<std::string_view, char32_t>, 6> kNamed{
        {{"amp", U'&'}, {"lt", U'<'}, {"gt", U'>'}, {"quot", U'"'}, {"apos", U'\''}, {"nbsp", U'\u00A0'}}};
    for (const auto& [known, codePoint] : kNamed)
        if (known == name)
            return codePoint;
    if (name.size() < 2 || name[0] != '#')
        return 0;
    const bool hexadecimal = name[1] == 'x' || name[1] == 'X';
    const std::string_view digits = name.substr(hexadecimal ? 2 : 1);
    std::uint32_t number = 0;
    const auto [end, error] =
        std::from_chars(digits.data(), digits.data() + digits.size(), number, hexadecimal ? 16 : 10);
    const bool whole = error == std::errc() && end == digits.data() + digits.size() && !digits.empty();
    const bool character = number <= 0x10FFFF && (number < 0xD800 || number > 0xDFFF);
    return whole && character ? static_cast<char32_t>(number) : 0;
}

/// The word in front of an "="; empty where something stands there that no name holds.
std::string NameIn(std::string_view pairStart) {
    const std::string start = text::Trim(pairStart);
    const bool plain = text::IsValidUtf8(start) && start.find_first_of("<>&\"'/\t\r\n") == std::string::npos;
    return plain ? start.substr(start.rfind(' ') + 1) : std::string();
}

} // namespace

CXmlCommand& CXmlCommand::Build(const std::string& vstrName, CommandParameters pairs) {
    name_ = vstrName;
    values_.Clear();
    Text.clear();
    for (const auto& [name, value] : pairs)
        AddParamValue(name, value);
    return *this;
}

std::string CXmlCommand::EncodeValue(std::string_view vstrValue) {
    std::string encoded;
    encoded.reserve(vstrValue.size());
    AppendEncoded(encoded, vstrValue);
    return encoded;
}

std::string CXmlCommand::Serialize() const {
    std::string command = "<cmd name=\"";
    AppendEncoded(command, name_);
    command += "\"><params ";
    for (const auto& [name, value] : values_.Entries()) {
        command.append(name).append("=\"");
        AppendEncoded(command, value);
        command += "\" ";
    }
    command += "/>";
    if (!Text.empty())
        command.append("<text>").append(Text).append("</text>");
    return command += "</cmd>";
}

CXmlCommand& CXmlCommand::Deserialize(std::string_view vstrCommandText) {
    name_.clear();
    values_.Clear();
    Text.clear();
    if (!DeserializeXml(vstrCommandText))
        Scan(vstrCommandText);
    return *this;
}

bool CXmlCommand::DeserializeXml(std::string_view commandText) {
    // No parser hands out the character 0, and one that takes it cuts the value there.
    if (commandText.find("&#0;") != std::string_view::npos)
        return false;
    XmlDocument document;
    if (!document.loadXML(commandText))
        return false;
    const XmlNode command = document.documentElement();
    name_ = command.attribute("name");
    for (const XmlNode& element : command.childElements()) {
        if (element.nodeName() == "params") {
            for (std::size_t i = 0; i < element.attributeCount(); ++i)
                AddParamValue(element.attributeName(i), element.attributeValue(i));
        } else if (element.nodeName() == "text") {
            if (const XmlNode content = element.firstChild())
                Text = content.xml();
        }
    }
    return true;
}

// The descriptions of a host's objects may hold what no parser accepts; the command must still be read.
void CXmlCommand::Scan(std::string_view commandText) {
    constexpr std::string_view kStart = "<cmd name=\"";
    constexpr std::string_view kParams = "<params ";
    constexpr std::string_view kText = "<text>";
    const auto start = commandText.find(kStart);
    if (start == std::string_view::npos)
        return;
    const auto nameEnd = commandText.find('"', start + kStart.size());
    if (nameEnd == std::string_view::npos)
        return;
    name_ =
        ReplaceSpecialCharsRev(commandText.substr(start + kStart.size(), nameEnd - start - kStart.size()));

    const auto params = commandText.find(kParams, nameEnd);
    const auto text = commandText.find(kText, nameEnd);
    if (params < text)
        ScanParameters(commandText, params + kParams.size());
    if (text == std::string_view::npos)
        return;
    const auto textEnd = commandText.find("</text>", text);
    if (textEnd != std::string_view::npos)
        Text = std::string(commandText.substr(text + kText.size(), textEnd - text - kText.size()));
}

void CXmlCommand::ScanParameters(std::string_view commandText, std::size_t from) {
    while (true) {
        // The element ends at its slash: values hold none, they are encoded.
        const auto nameStart = commandText.find_first_not_of(' ', from);
        if (nameStart == std::string_view::npos || commandText[nameStart] == '/' ||
            commandText[nameStart] == '>')
            return;
        const auto equals = commandText.find('=', nameStart);
        const auto open = commandText.find('"', equals);
        if (equals == std::string_view::npos || open == std::string_view::npos)
            return;
        const auto close = commandText.find('"', open + 1);
        const std::string name = NameIn(commandText.substr(nameStart, equals - nameStart));
        if (close == std::string_view::npos || name.empty())
            return;
        AddParamValue(name, ReplaceSpecialCharsRev(commandText.substr(open + 1, close - open - 1)));
        from = close + 1;
    }
}

std::string CXmlCommand::GetParamValue(std::string_view vstrName) const {
    CheckErrorLimit();
    if (Session::Run().generationInterrupted)
        return {};
    const std::string* value = values_.Find(vstrName);
    if (value == nullptr)
        throw RaisedError(
            9, "Subscript out of range: parameter " + std::string(vstrName) + " of command " + name_,
            "CXmlCommand.GetParamValue");
    return *value;
}

std::string CXmlCommand::GetParamValue(std::size_t vlngIndex) const {
    CheckErrorLimit();
    return Session::Run().generationInterrupted ? std::string() : values_.At(vlngIndex);
}

void CXmlCommand::AddParamValue(const std::string& vstrParamName, const std::string& value) {
    if (std::string* existing = values_.Find(vstrParamName))
        *existing = value;
    else
        values_.Add(value, vstrParamName);
}

std::string CXmlCommand::ReplaceSpecialCharsRev(std::string_view vstrText) {
    if (vstrText.find("&#") == std::string_view::npos)
        return std::string(vstrText);
    constexpr std::size_t kLongestReference = 12;
    std::string decoded;
    decoded.reserve(vstrText.size());
    std::size_t position = 0;
    while (position < vstrText.size()) {
        const auto ampersand = vstrText.find('&', position);
        decoded.append(vstrText.substr(position, ampersand - position));
        if (ampersand == std::string_view::npos)
            break;
        const auto length = vstrText.substr(ampersand, kLongestReference).find(';');
        const bool ended = length != std::string_view::npos;
        const auto name = ended ? vstrText.substr(ampersand + 1, length - 1) : std::string_view();
        const char32_t codePoint = CodePointOfReference(name);
        if (codePoint != 0 || name == "#0") {
            decoded += text::FromCodePoint(codePoint);
            position = ampersand + length + 1;
        } else {
            decoded += '&';
            position = ampersand + 1;
        }
    }
    return decoded;
}

} // namespace tovimar
