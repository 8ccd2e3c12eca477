#include "foundation/CXmlMessages.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <algorithm>

namespace tovimar {
namespace {

std::size_t FirstByte(const std::string& name) {
    return static_cast<unsigned char>(text::LowerAscii(name[0]));
}

/// Number in "{12}" at `position`, 0 for anything else; `length` is that of the whole.
std::size_t PlaceholderAt(const std::string& text, std::size_t position, std::size_t& length) {
    std::size_t number = 0;
    std::size_t end = position + 1;
    while (end < text.size() && end < position + 4 && text[end] >= '0' && text[end] <= '9')
        number = number * 10 + static_cast<std::size_t>(text[end++] - '0');
    if (end >= text.size() || text[end] != '}')
        return 0;
    length = end + 1 - position;
    return number;
}

} // namespace

std::string CXmlMessages::GetMessage(const std::string& vstrMsgCode) const {
    const std::string* text = messages_.Find(vstrMsgCode);
    return text != nullptr ? *text : std::string();
}

std::string CXmlMessages::GetMessageWithParams(const std::string& vstrMsgCode,
                                               const std::vector<std::string>& parameters) const {
    const std::string text = GetMessage(vstrMsgCode);
    std::string out;
    for (std::size_t i = 0; i < text.size();) {
        std::size_t length = 0;
        const std::size_t number = text[i] == '{' ? PlaceholderAt(text, i, length) : 0;
        if (number < 1 || number > parameters.size()) {
            out += text[i++];
            continue;
        }
        out += parameters[number - 1];
        i += length;
    }
    return out;
}

ResultCode CXmlMessages::Reload(const std::string& vstrXmlFileFullPath) {
    *this = {};
    return Load(vstrXmlFileFullPath);
}

ResultCode CXmlMessages::Load(const std::string& vstrXmlFileFullPath) {
    return Trapped("CXmlMessages", "Load", [&] {
        ReadFile(vstrXmlFileFullPath);
        PrepareParameters();
    });
}

void CXmlMessages::ReadFile(const std::string& path) {
    XmlDocument document;
    CXMLFile file;
    if (file.Load(path, document) != 0)
        throw RaisedError(file.XmlParseError.errorCode, file.XmlParseError.reason + " in '" + path + "'",
                          "CXmlMessages.Load");
    for (const XmlNode& node : document.selectSingleNode("/Messages").childElements()) {
        const std::string code = node.attribute("Code");
        const std::string text = node.attribute("Text");
        if (code.empty() || text.empty() || messages_.Contains(code))
            continue;
        messages_.Add(text, code);
        if (node.attribute("T").empty())
            continue;
        const bool first = text::EqualsIgnoringCase(code, "Copyright");
        parameters_.insert(first ? parameters_.begin() : parameters_.end(), Parameter{code, text, {}});
    }
}

/// One pass gives what replacing name after name gives as long as no name stands inside another; a message
/// that holds names of later parameters is expanded beforehand.
void CXmlMessages::PrepareParameters() {
    onePass_ = true;
    for (auto& positions : byFirstByte_)
        positions.clear();
    for (const auto& parameter : parameters_) {
        onePass_ = onePass_ && text::IsAscii(parameter.name);
        for (const auto& other : parameters_)
            onePass_ =
                onePass_ && (&other == &parameter || !text::ContainsIgnoringCase(other.name, parameter.name));
    }
    for (std::size_t i = parameters_.size(); i > 0 && onePass_; --i) {
        Parameter& parameter = parameters_[i - 1];
        parameter.expanded = ReplaceInOnePass(parameter.text);
        auto& positions = byFirstByte_[FirstByte(parameter.name)];
        positions.insert(positions.begin(), i - 1);
    }
}

const CXmlMessages::Parameter* CXmlMessages::ParameterAt(const std::string& text,
                                                         std::size_t position) const {
    const auto first = static_cast<unsigned char>(text::LowerAscii(text[position]));
    for (const std::size_t i : byFirstByte_[first]) {
        const std::string_view here = std::string_view(text).substr(position, parameters_[i].name.size());
        if (text::EqualsIgnoringCase(here, parameters_[i].name))
            return &parameters_[i];
    }
    return nullptr;
}

std::string CXmlMessages::ReplaceInOnePass(const std::string& text) const {
    std::string out;
    out.reserve(text.size());
    std::size_t done = 0;
    for (std::size_t i = 0; i < text.size();) {
        const Parameter* parameter = ParameterAt(text, i);
        if (parameter == nullptr) {
            ++i;
            continue;
        }
        out.append(text, done, i - done);
        out += parameter->expanded;
        i += parameter->name.size();
        done = i;
    }
    out.append(text, done);
    return out;
}

std::string CXmlMessages::ReplaceParameters(const std::string& vstr) const {
    if (onePass_)
        return ReplaceInOnePass(vstr);
    std::string text = vstr;
    for (const auto& parameter : parameters_)
        text = text::ReplaceAllIgnoringCase(text, parameter.name, parameter.text);
    return text;
}

} // namespace tovimar
