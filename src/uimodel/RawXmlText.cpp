#include "uimodel/RawXmlText.h"

#include "foundation/TextEncodings.h"
#include "platform/text/Text.h"
#include "uimodel/DefinitionText.h"

namespace tovimar {

using namespace definition;

void AppendRawRoot(std::string& out, const RawRoot& root) {
    out.append("<").append(root.tag);
    Append(out, " Name = \"", EncodeXmlName(root.name));
    Append(out, "Text = \"", EncodeXmlText(root.caption));
    Append(out, "Caption = \"", EncodeXmlText(root.caption));
    AppendPair(out, "WindowSize = \"", root.width, root.height);
    Append(out, "BorderStyle = \"", root.borderStyle);
    Append(out, "NamePrefix = \"", Escaped(root.namePrefix));
    AppendPair(out, "ClientAreaOffset = \"", root.clientAreaOffsetX, root.clientAreaOffsetY);
    Append(out, "OriginalClassName = \"", EncodeXmlName(root.originalClassName));
    if (root.helpContextId >= 1 || root.helpContextId == -1)
        Append(out, "HelpContextId = \"", root.helpContextId);
    AppendPlain(out, "SourceProjectType = \"", root.sourceProjectType);
    if (root.window != 0)
        Append(out, "HWND = \"", root.window);
    AppendUnlessEmpty(out, "Description = \"", EncodeXmlText(root.description));
    out.append(">").append(kLineEnd);
}

void AppendRawControl(std::string& out, const RawControl& control, const std::vector<std::string>& children) {
    const std::string indent = Indent(control.level);
    out.append(indent).append("<").append(control.type);
    Append(out, " Name = \"", EncodeXmlName(control.name));
    Append(out, "Text = \"", EncodeXmlText(control.text));
    Append(out, "Caption = \"", EncodeXmlText(control.caption));
    AppendPair(out, "Location = \"", control.left, control.top);
    AppendPair(out, "Size = \"", control.width, control.height);
    AppendUnlessEmpty(out, "TabPageTab = \"", control.tabPageTab);
    if (control.tabIndex > -1)
        Append(out, "TabIndex = \"", control.tabIndex);
    if (control.index > 0)
        Append(out, "Index = \"", control.index);
    if (control.helpContextId > 0)
        Append(out, "HelpContextId = \"", control.helpContextId);
    AppendUnlessEmpty(out, "Description = \"", EncodeXmlText(control.description));
    AppendPlain(out, "SectionName = \"", control.sectionName);
    AppendUnlessEmpty(out, "ParentControlName = \"", EncodeXmlName(control.parentControlName));
    AppendPlain(out, "OriginalClassName = \"", control.originalClassName);
    if (control.level > 0)
        Append(out, "Level = \"", control.level);
    if (control.tabPageIndex > -1)
        Append(out, "TabPageIndex = \"", control.tabPageIndex);
    if (children.empty()) {
        out.append("/>");
        return;
    }
    out.append(">").append(kLineEnd).append(indent).append("<Controls>").append(kLineEnd);
    out.append(text::Join(children, kLineEnd)).append(kLineEnd);
    out.append(indent).append("</Controls>").append(kLineEnd);
    out.append(indent).append("</").append(control.type).append(">");
}

} // namespace tovimar
