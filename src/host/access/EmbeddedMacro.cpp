#include "host/access/EmbeddedMacro.h"

#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <array>
#include <utility>

namespace tovimar {
namespace {

constexpr std::string_view kXmlMark = "_AXL:";

struct MacroAction {
    std::string name;
    std::vector<std::string> arguments;
};

/// The newer names of actions that code knows by their older ones.
std::string NameInCode(const std::string& action) {
    constexpr std::array<std::pair<std::string_view, const char*>, 3> kNames{
        {{"CloseWindow", "Close"}, {"SaveObject", "Save"}, {"PrintObject", "PrintOut"}}};
    for (const auto& [newer, older] : kNames)
        if (text::EqualsIgnoringCase(action, newer))
            return older;
    return action;
}

bool TakesObjectType(const std::string& action) {
    return text::EqualsIgnoringCase(action, "Close") || text::EqualsIgnoringCase(action, "Save");
}

/// Quotes inside a name would end it.
std::string Quoted(const std::string& name) {
    return '"' + text::ReplaceAll(name, "\"", "") + '"';
}

std::string CommandOf(const MacroAction& action) {
    const std::string name = NameInCode(action.name);
    const auto argument = [&action](std::size_t i) {
        return i < action.arguments.size() ? action.arguments[i] : std::string();
    };
    std::string command = "DoCmd." + name;
    if (TakesObjectType(name))
        command += " " + argument(0) + ", " + Quoted(argument(1));
    else if (!action.arguments.empty())
        command += " " + Quoted(argument(0));
    return command;
}

MacroAction ActionOfBlock(const platform::access::DesignObject& block) {
    MacroAction action;
    for (const auto& [property, value] : block.properties) {
        if (text::EqualsIgnoringCase(property, "Action"))
            action.name = value.text;
        else if (text::EqualsIgnoringCase(property, "Argument"))
            action.arguments.push_back(value.text);
    }
    return action;
}

/// The XML stands in pieces, one to a comment.
std::string XmlOf(const platform::access::DesignObject& macro) {
    std::string xml;
    for (const auto& block : macro.children)
        for (const auto& [property, value] : block->properties)
            if (text::EqualsIgnoringCase(property, "Comment") && value.text.starts_with(kXmlMark))
                xml += value.text.substr(kXmlMark.size());
    return xml;
}

MacroAction ActionOfElement(const XmlNode& element) {
    MacroAction action{element.attribute("Name"), {}};
    // The object stands in front of the others: behind its type, or alone.
    std::string type;
    std::string name;
    for (const XmlNode& argument : element.childElements()) {
        const std::string word = argument.attribute("Name");
        if (word == "ObjectType")
            type = "ac" + argument.text();
        else if (text::EndsWithIgnoringCase(word, "Name") && name.empty())
            name = argument.text();
    }
    if (TakesObjectType(NameInCode(action.name)))
        action.arguments = {type, name};
    else if (!name.empty())
        action.arguments = {name};
    return action;
}

std::vector<MacroAction> ActionsOf(const platform::access::DesignObject& macro) {
    std::vector<MacroAction> actions;
    for (const auto& block : macro.children)
        if (MacroAction action = ActionOfBlock(*block); !action.name.empty())
            actions.push_back(std::move(action));
    if (!actions.empty())
        return actions;
    XmlDocument document;
    if (document.loadXML(XmlOf(macro)))
        for (const XmlNode& element : document.selectNodes("//*[local-name()='Action']"))
            actions.push_back(ActionOfElement(element));
    return actions;
}

} // namespace

std::vector<std::string> CommandsOfEmbeddedMacro(std::string_view macro) {
    const auto tree = platform::access::ParseExportTree(macro, "OnClickEmMacro");
    std::vector<std::string> commands;
    for (const MacroAction& action : ActionsOf(*tree.root))
        commands.push_back(CommandOf(action));
    return commands;
}

} // namespace tovimar
