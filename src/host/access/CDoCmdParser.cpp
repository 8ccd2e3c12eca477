#include "host/access/CDoCmdParser.h"

#include "foundation/CTraceLog.h"
#include "foundation/Session.h"
#include "platform/text/Text.h"

#include <array>
#include <string_view>
#include <vector>

namespace tovimar {
namespace {

constexpr ResultCode kUnknownLine = MakeResultCode(0x8003FE07U);
constexpr std::string_view kPrefix = "DoCmd.";

/// Where an action finds its object: a fixed type with the name as the first argument, the type as the first
/// and the name as the second, or nothing at all.
enum class ObjectFrom { Nothing, FixedType, Arguments };
struct Action {
    std::string_view name;
    std::string_view msgCode;
    ObjectFrom from;
    std::string_view type;
};
constexpr std::array<Action, 11> kActions{
    {{"RunMacro", "DoCmd.Run", ObjectFrom::FixedType, "macro"},
     {"PrintOut", "DoCmd.PrintOut", ObjectFrom::Nothing, ""},
     {"Close", "DoCmd.Close", ObjectFrom::Arguments, ""},
     {"Save", "DoCmd.Save", ObjectFrom::Arguments, ""},
     {"OpenTable", "DoCmd.Open", ObjectFrom::FixedType, "Table"},
     {"OpenQuery", "DoCmd.Open", ObjectFrom::FixedType, "Query"},
     {"OpenView", "DoCmd.Open", ObjectFrom::FixedType, "View"},
     {"OpenStoredProcedure", "DoCmd.Open", ObjectFrom::FixedType, "StoredProcedure"},
     {"OpenForm", "DoCmd.Open", ObjectFrom::FixedType, "Form"},
     {"OpenReport", "DoCmd.Open", ObjectFrom::FixedType, "Report"},
     {"OpenDataAccessPage", "DoCmd.Open", ObjectFrom::FixedType, "DataAccessPage"}}};

struct TypeArgument {
    std::string_view symbol;
    std::string_view number;
    std::string_view name;
};
constexpr std::array<TypeArgument, 9> kTypes{{{"acTable", "0", "Table"},
                                              {"acQuery", "1", "Query"},
                                              {"acForm", "2", "Form"},
                                              {"acReport", "3", "Report"},
                                              {"acMacro", "4", "Macro"},
                                              {"acModule", "5", "Module"},
                                              {"acDataAccessPage", "6", "DataAccessPage"},
                                              {"acServerView", "7", "View"},
                                              {"acStoredProcedure", "9", "StoredProcedure"}}};

const Action* FindAction(const std::string& name) {
    for (const Action& action : kActions)
        if (text::EqualsIgnoringCase(action.name, name))
            return &action;
    return nullptr;
}

std::string TypeNameOf(const std::string& argument) {
    const std::string trimmed = text::Trim(argument);
    for (const TypeArgument& type : kTypes)
        if (text::EqualsIgnoringCase(type.symbol, trimmed) || type.number == trimmed)
            return std::string(type.name);
    return {};
}

std::string ObjectNameOf(const std::string& argument) {
    return text::Trim(text::ReplaceAll(argument, "\"", ""));
}

/// Apart at the commas that stand neither in a quoted text nor in brackets.
std::vector<std::string> SplitArguments(const std::string& list) {
    std::vector<std::string> arguments(1);
    bool quoted = false;
    int depth = 0;
    for (const char sign : list) {
        if (sign == '"')
            quoted = !quoted;
        else if (!quoted && (sign == '(' || sign == ')'))
            depth += sign == '(' ? 1 : -1;
        if (sign == ',' && !quoted && depth <= 0)
            arguments.emplace_back();
        else
            arguments.back() += sign;
    }
    return arguments;
}

/// Arguments that tell the object, in the places that they have without their names: its type, if the
/// action asks for one, stands in front.
constexpr std::array<std::string_view, 9> kNamesOfName{"ObjectName", "FormName",      "ReportName",
                                                       "QueryName",  "TableName",     "MacroName",
                                                       "ViewName",   "ProcedureName", "DataAccessPageName"};

std::size_t PlaceOf(const std::string& argumentName, bool typeInFront, std::size_t otherwise) {
    if (text::EqualsIgnoringCase(argumentName, "ObjectType"))
        return 0;
    for (const std::string_view name : kNamesOfName)
        if (text::EqualsIgnoringCase(argumentName, name))
            return typeInFront ? 1 : 0;
    return otherwise;
}

/// The first two arguments, which alone matter; absent ones are empty.
std::array<std::string, 2> FirstArguments(const std::string& list, bool typeInFront) {
    std::array<std::string, 2> first;
    const std::vector<std::string> arguments = SplitArguments(list);
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        std::string value = text::TrimWhitespace(arguments[i]);
        std::size_t place = i;
        const auto sign = value.find(":=");
        if (sign != std::string::npos && value.find('"') > sign) {
            place = PlaceOf(text::TrimWhitespace(value.substr(0, sign)), typeInFront, first.size());
            value = text::TrimWhitespace(value.substr(sign + 2));
        }
        if (place < first.size())
            first[place] = value;
    }
    return first;
}

} // namespace

ResultCode CDoCmdParser::Parse(const std::string& vstrCodeLine) {
    actionName_.clear();
    const std::string line = text::TrimWhitespace(vstrCodeLine);
    if (!text::StartsWithIgnoringCase(line, kPrefix))
        return kUnknownLine;
    const std::string call = line.substr(kPrefix.size());
    const auto blank = call.find_first_of(" \t");
    actionName_ = call.substr(0, blank);
    if (actionName_.empty())
        return kUnknownLine;

    objTypeName_.clear();
    objName_.clear();
    msgCode_.clear();
    objNameIsQuoted_ = false;

    const Action* action = FindAction(actionName_);
    if (action == nullptr)
        return kUnknownLine;
    msgCode_ = action->msgCode;
    objTypeName_ = action->type;
    if (action->from == ObjectFrom::Nothing)
        return kSuccess;
    const bool typeInFront = action->from == ObjectFrom::Arguments;
    const std::string list =
        blank == std::string::npos ? std::string() : text::TrimWhitespace(call.substr(blank));
    const auto arguments = FirstArguments(list, typeInFront);
    if (typeInFront)
        objTypeName_ = TypeNameOf(arguments[0]);
    const std::string& name = arguments[typeInFront ? 1 : 0];
    objNameIsQuoted_ = name.starts_with('"');
    objName_ = ObjectNameOf(name);
    return kSuccess;
}

std::string CDoCmdParser::DebugPrintStr() const {
    return actionName_ + " " + objTypeName_ + " " + objName_ + " " + msgCode_;
}

void CDoCmdParser::DebugPrint() const {
    Session::TraceLog()->addMessage(DebugPrintStr());
}

} // namespace tovimar
