#pragma once

#include "platform/KeyedList.h"

#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>

namespace tovimar {

/// A parameter of a command: numbers go as decimal text, Booleans as "True" and "False".
struct CommandParameter {
    CommandParameter(const char* parameterName, const std::string& parameterValue)
        : name(parameterName), value(parameterValue) {}
    CommandParameter(const char* parameterName, const char* parameterValue)
        : name(parameterName), value(parameterValue) {}
    CommandParameter(const char* parameterName, bool parameterValue)
        : name(parameterName), value(parameterValue ? "True" : "False") {}
    CommandParameter(const char* parameterName, std::int32_t parameterValue)
        : name(parameterName), value(std::to_string(parameterValue)) {}

    std::string name;
    std::string value;
};
using CommandParameters = std::initializer_list<CommandParameter>;

/// One question to the host, or its answer, as text:
///
///     <cmd name="NAME"><params A="1" B="2" /><text>TEXT</text></cmd>
///
/// `params` is always there, `text` only when it isn't empty. A blank stands behind every closing quote.
/// Values are encoded, the text is carried as it stands. Parameter names ignore case.
class CXmlCommand {
public:
    CXmlCommand& Build(const std::string& vstrName, CommandParameters pairs = {});
    std::string Serialize() const;
    /// Reads the text form, also one that is no well-formed XML.
    CXmlCommand& Deserialize(std::string_view vstrCommandText);

    const std::string& Name() const { return name_; }
    /// 1-based. Raises 9 for a position that isn't there.
    const std::string& GetParamName(std::size_t vlngIndex) const { return values_.KeyAt(vlngIndex); }
    /// Empty once the run was stopped. Raises 9 for a name or position that isn't there.
    std::string GetParamValue(std::string_view vstrName) const;
    std::string GetParamValue(std::size_t vlngIndex) const;
    bool ParamDefined(std::string_view vstrParamName) const { return values_.Contains(vstrParamName); }
    std::size_t ParamCount() const { return values_.Count(); }
    /// Appends a new parameter; the value of an existing one is replaced in its place.
    void AddParamValue(const std::string& vstrParamName, const std::string& value);

    /// What a value looks like in the text: letters, digits, the blank and ! # $ % ( ) * + , . : ; = ? @ [ ]
    /// _ pass, everything else becomes a reference by number. Names in list answers are encoded in this way
    /// too, so that a name may hold the separator.
    static std::string EncodeValue(std::string_view vstrValue);
    /// References by number and the basic named ones replaced, in one pass; a text without "&#" stays.
    static std::string ReplaceSpecialCharsRev(std::string_view vstrText);

    /// Bulk results, such as the description of an object.
    std::string Text;

private:
    bool DeserializeXml(std::string_view commandText);
    void Scan(std::string_view commandText);
    void ScanParameters(std::string_view commandText, std::size_t from);

    std::string name_;
    KeyedList<std::string> values_;
};

} // namespace tovimar
