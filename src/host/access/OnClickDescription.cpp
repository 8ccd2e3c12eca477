// What the click of a command button does, told from the code behind it.
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/access/CDoCmdParser.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/LateBound.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

#include <vector>

namespace tovimar {
namespace {

constexpr std::int32_t kCommandButton = 104;
constexpr std::int32_t kProcedure = 0; ///< the code model's number for a Sub or Function
constexpr std::string_view kOwnName = "Me.Name";

/// Null for a form without a module.
HostObject CodeModuleOf(const HostObject& app, const HostObject& form) {
    if (!late::Flag(form, "hasmodule"))
        return nullptr;
    const std::string prefix =
        text::StartsWithIgnoringCase(late::ClassName(form), "Report_") ? "Report_" : "Form_";
    const Value projectName = late::Call(app, "GetOption", {Value("Project Name")});
    const HostObject project = late::Object(late::Object(app, "VBE"), "VBProjects", {projectName});
    const HostObject component = late::Object(project, "VBComponents", {prefix + late::Text(form, "Name")});
    return late::Object(component, "CodeModule");
}

/// The host keeps the start of the procedures' names where it isn't the control's name. Otherwise every
/// sign that the language's identifiers can't hold, such as a blank, becomes "_".
std::string ProcedureName(const HostObject& control) {
    std::string name = late::TextOrEmpty(control, "EventProcPrefix");
    if (!name.empty())
        return name + "_Click";
    for (const char character : late::Text(control, "Name")) {
        const bool asciiSign = static_cast<unsigned char>(character) < 128 && character != '_' &&
                               !(character >= '0' && character <= '9') &&
                               !(character >= 'A' && character <= 'Z') &&
                               !(character >= 'a' && character <= 'z');
        name += asciiSign ? '_' : character;
    }
    return name + "_Click";
}

std::string ProcedureLines(const HostObject& module, const std::string& procedure) {
    const std::int32_t start = late::Integer(module, "ProcStartLine", {procedure, kProcedure});
    const std::int32_t body = late::Integer(module, "ProcBodyLine", {procedure, kProcedure});
    const std::int32_t count = late::Integer(module, "ProcCountLines", {procedure, kProcedure});
    return late::Text(module, "Lines", {body, start + count - body});
}

/// Lines that go on with "_" joined, trimmed, without empty ones.
std::vector<std::string> LogicalLines(const std::string& code) {
    std::vector<std::string> lines;
    std::string kept;
    for (const std::string& piece : text::Split(code, "\n")) {
        std::string line = text::TrimWhitespace(piece);
        if (line.empty())
            continue;
        const bool goesOn = line.back() == '_';
        if (goesOn)
            line.pop_back();
        kept += (kept.empty() ? "" : " ") + line;
        if (goesOn)
            continue;
        lines.push_back(text::TrimWhitespace(kept));
        kept.clear();
    }
    return lines;
}

std::string ReferenceTo(const std::string& name, const std::string& typeName) {
    const CHelpPrjTree* tree = Session::HelpProjectTree();
    const std::string reference = tree == nullptr ? std::string() : tree->GetNodeHtmlRef(name, typeName);
    return reference.empty() ? name : reference;
}

std::string SentenceOf(const CDoCmdParser& call) {
    const CXmlMessages& messages = *Session::Messages();
    if (call.ObjTypeName().empty())
        return messages.GetMessageWithParams(call.MsgCode(), {call.ObjName()});
    const std::string code = call.MsgCode() + " " + call.ObjTypeCode();
    if (text::EqualsIgnoringCase(call.ObjName(), kOwnName))
        return messages.GetMessageWithParams(code + " " + std::string(kOwnName), {});
    return messages.GetMessageWithParams(code, {ReferenceTo(call.ObjName(), call.ObjTypeName())});
}

std::string DescriptionOfCode(const std::string& code) {
    std::string description;
    if (!text::ContainsIgnoringCase(code, "DoCmd."))
        return description;
    for (const std::string& line : LogicalLines(code)) {
        CDoCmdParser call;
        if (call.Parse(line) != kSuccess)
            continue;
        if (!description.empty())
            description += "<BR>\r\n";
        description += SentenceOf(call);
    }
    return description;
}

} // namespace

std::string CN_IDEAccFormProcessor::GetOnClickActionDescription(const HostObject& rapp,
                                                                const HostObject& rfrm,
                                                                const HostObject& rctl) {
    std::string description;
    if (late::IntegerOrZero(rctl, "ControlType") != kCommandButton)
        return description;
    Trapped("CN_IDEAccFormProcessor", "GetOnClickActionDescription", [&] {
        const std::string event = text::Trim(late::Text(rctl, "onclick"));
        if (event.empty())
            return;
        const HostObject module = CodeModuleOf(rapp, rfrm);
        if (!module || event.front() == '=')
            return;
        if (text::EqualsIgnoringCase(event, "[Event procedure]"))
            description = DescriptionOfCode(ProcedureLines(module, ProcedureName(rctl)));
        else
            description =
                Session::Messages()->GetMessageWithParams("DoCmd.Run acMacro", {ReferenceTo(event, "macro")});
    });
    return description;
}

} // namespace tovimar
