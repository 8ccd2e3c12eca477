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

    std::vector<std::string> arguments;
    if (blank != std::string::npos)
        arguments = text::Split(text::TrimWhitespace(call.substr(blank)), ",");
    arguments.resize(std::max<std::size_t>(arguments.size(), 2));
    objTypeName_.clear();
    objName_.clear();
    msgCode_.clear();

    const Action* action = FindAction(actionName_);
    if (action == nullptr)
        return kUnknownLine;
    msgCode_ = action->msgCode;
    if (action->from == ObjectFrom::FixedType) {
        objTypeName_ = action->type;
        objName_ = ObjectNameOf(arguments[0]);
    } else if (action->from == ObjectFrom::Arguments) {
        objTypeName_ = TypeNameOf(arguments[0]);
        objName_ = ObjectNameOf(arguments[1]);
    }
    return kSuccess;
}

std::string CDoCmdParser::DebugPrintStr() const {
    return actionName_ + " " + objTypeName_ + " " + objName_ + " " + msgCode_;
}

void CDoCmdParser::DebugPrint() const {
    Session::TraceLog()->addMessage(DebugPrintStr());
}

} // namespace tovimar
