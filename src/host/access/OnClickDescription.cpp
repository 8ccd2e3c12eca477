// What the click of a command button does, told from the code or the macro behind it.
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/access/CDoCmdParser.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/EmbeddedMacro.h"
#include "host/access/EventCode.h"
#include "host/access/LateBound.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"

#include <utility>
#include <vector>

namespace tovimar {
namespace {

constexpr std::int32_t kCommandButton = 104;
constexpr std::int32_t kProcedure = 0; ///< the code model's number for a Sub or Function
constexpr std::string_view kOwnName = "Me.Name";
constexpr const char* kMacro = "macro";
constexpr const char* kRunMacro = "DoCmd.Run acMacro";

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

/// HTML that links to an object's topic; empty for one without a topic.
std::string TopicLink(const std::string& name, const std::string& typeName) {
    const CHelpPrjTree* tree = Session::HelpProjectTree();
    return tree == nullptr ? std::string() : tree->GetNodeHtmlRef(name, typeName);
}

/// A macro of a group, "Daily.Print", is told in the topic of its group.
std::string ReferenceTo(const std::string& name, const std::string& typeName) {
    if (const std::string link = TopicLink(name, typeName); !link.empty())
        return link;
    const auto point = name.find('.');
    if (point == std::string::npos || !text::EqualsIgnoringCase(typeName, kMacro))
        return name;
    const std::string group = TopicLink(name.substr(0, point), typeName);
    return group.empty() ? name : group + name.substr(point);
}

/// Tells a procedure's commands one after the other.
class CommandsTeller {
public:
    /// `module` may be null; its constants are asked for only when a command names one.
    explicit CommandsTeller(HostObject module) : module_(std::move(module)) {}

    void Tell(const std::string& statement) {
        names_.Take(statement);
        CDoCmdParser call;
        if (call.Parse(statement) != kSuccess)
            return;
        if (!text_.empty())
            text_ += "<BR>\r\n";
        text_ += SentenceOf(call);
    }
    const std::string& Text() const { return text_; }

private:
    std::string SentenceOf(const CDoCmdParser& call) {
        const CXmlMessages& messages = *Session::Messages();
        if (call.ObjTypeName().empty())
            return messages.GetMessageWithParams(call.MsgCode(), {call.ObjName()});
        const std::string code = call.MsgCode() + " " + call.ObjTypeCode();
        const std::string own = messages.GetMessage(code + " " + std::string(kOwnName));
        // Without a name the object at hand is meant.
        if (text::EqualsIgnoringCase(call.ObjName(), kOwnName) || (call.ObjName().empty() && !own.empty()))
            return own;
        return messages.GetMessageWithParams(code, {ReferenceTo(NameMeantBy(call), call.ObjTypeName())});
    }

    /// A variable or constant stands for the text that it was given.
    std::string NameMeantBy(const CDoCmdParser& call) {
        const std::string& name = call.ObjName();
        if (call.ObjNameIsQuoted())
            return name;
        if (const std::string* text = names_.Find(name))
            return *text;
        const std::string* text = Constants().Find(name);
        return text == nullptr ? name : *text;
    }

    const TextNames& Constants() {
        if (HostObject module = std::exchange(module_, nullptr))
            PassOver([&] {
                const std::int32_t count = late::Integer(module, "CountOfLines");
                for (const std::string& line : EventStatements(late::Text(module, "Lines", {1, count})))
                    if (FindOutsideQuotes(line, "Const ") != std::string::npos)
                        constants_.Take(line);
            });
        return constants_;
    }

    HostObject module_;
    TextNames names_;     ///< of the procedure
    TextNames constants_; ///< of the module
    std::string text_;
};

std::string DescriptionOfCode(const HostObject& module, const std::string& code) {
    if (!text::ContainsIgnoringCase(code, "DoCmd."))
        return {};
    CommandsTeller teller(module);
    for (const std::string& statement : EventStatements(code))
        teller.Tell(statement);
    return teller.Text();
}

std::string DescriptionOfEmbeddedMacro(const HostObject& control) {
    CommandsTeller teller(nullptr);
    for (const std::string& command : CommandsOfEmbeddedMacro(late::TextOrEmpty(control, "OnClickEmMacro")))
        teller.Tell(command);
    return teller.Text();
}

std::string DescriptionOfEvent(const HostObject& app, const HostObject& form, const HostObject& control) {
    const std::string event = text::Trim(late::Text(control, "onclick"));
    if (event.empty())
        return {};
    // Such a macro needs no module.
    if (text::EqualsIgnoringCase(event, "[Embedded Macro]"))
        return DescriptionOfEmbeddedMacro(control);
    const HostObject module = CodeModuleOf(app, form);
    if (!module || event.front() == '=')
        return {};
    if (text::EqualsIgnoringCase(event, "[Event procedure]"))
        return DescriptionOfCode(module, ProcedureLines(module, ProcedureName(control)));
    return Session::Messages()->GetMessageWithParams(kRunMacro, {ReferenceTo(event, kMacro)});
}

} // namespace

std::string CN_IDEAccFormProcessor::GetOnClickActionDescription(const HostObject& rapp,
                                                                const HostObject& rfrm,
                                                                const HostObject& rctl) {
    std::string description;
    if (late::IntegerOrZero(rctl, "ControlType") != kCommandButton)
        return description;
    Trapped("CN_IDEAccFormProcessor", "GetOnClickActionDescription",
            [&] { description = DescriptionOfEvent(rapp, rfrm, rctl); });
    return description;
}

} // namespace tovimar
