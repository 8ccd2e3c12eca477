#include "uimodel/CClientUIObjectRawXml.h"

#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/IClientFormProcessor.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "uimodel/HostProperty.h"
#include "uimodel/RawXmlText.h"
#include "uimodel/RawXmlWalk.h"

namespace tovimar {

namespace {

constexpr const char* kClass = "CClientUIObjectRawXml";

void Trace(const char* step, const std::string& value) {
    const CTovimarParameters* parameters = Session::Parameters();
    if (parameters != nullptr && parameters->VerboseTracing)
        Session::TraceLog()->addMessage(step + value);
}

/// Opens the object and closes it again when the caller doesn't want it kept open.
class OpenedObject {
public:
    OpenedObject(IClientFormProcessor& processor, const HostObject& component, bool report, bool keepOpen)
        : processor_(processor), component_(component), report_(report), keepOpen_(keepOpen),
          object_(report ? processor.FindActualReportOfComponent(component)
                         : processor.FindActualFormOfComponent(component)) {}

    const HostObject& Object() const { return object_; }

    void Close() {
        if (keepOpen_)
            return;
        if (report_)
            processor_.ActualReportClose(component_, object_, /*vfSave=*/false);
        else
            processor_.ActualFormClose(component_, object_, /*vfSave=*/false);
    }

private:
    IClientFormProcessor& processor_;
    const HostObject& component_;
    bool report_;
    bool keepOpen_;
    HostObject object_;
};

std::string CaptionOf(IClientFormProcessor& processor, const HostObject& object, const HostObject& component,
                      const std::string& name) {
    std::string caption = processor.ComponentCaptionGet(object);
    Trace("Get_(2): caption = ", caption);
    if (caption.empty())
        caption = processor.ComponentCaptionGet(component);
    Trace("Get_(3): caption = ", caption);
    if (caption.empty())
        caption = name;
    Trace("Get_(4): caption = ", caption);
    return caption;
}

RawRoot ReadRoot(IClientFormProcessor& processor, const HostObject& object, const HostObject& component,
                 std::int32_t hostWindow, bool previewAreaOnly) {
    RawRoot root;
    root.name = HostProperty::Text(component, "Name");
    root.originalClassName = processor.ObjectTypeName(object);
    processor.GetComponentWidthAndHeightInTwips(component, object, root.width, root.height, previewAreaOnly);
    root.clientAreaOffsetX = processor.FormClientAreaOffsetX(object);
    root.clientAreaOffsetY = processor.FormClientAreaOffsetY(object);
    root.window = processor.GetComponentHwnd(hostWindow, component, object);
    Trace("Get_(1): hwnd = ", std::to_string(root.window));
    root.helpContextId = processor.GetComponentHelpContextId(component, object);
    root.caption = CaptionOf(processor, object, component, root.name);
    root.borderStyle = processor.BorderStyle(object);
    return root;
}

std::string WalkedObject(IClientFormProcessor& processor, const HostObject& object,
                         const HostObject& component, const RawRoot& root) {
    std::string xml;
    AppendRawRoot(xml, root);
    const std::string sections = processor.FormSectionsXML(object);
    processor.myDoevents();
    processor.SetFirstPageVisibleForTabControls(object);
    if (!sections.empty())
        xml.append("\r\n<Sections>\r\n").append(sections).append("</Sections>");
    xml.append("\r\n<Controls>");
    RawXmlWalk walk(processor, component, object);
    for (const HostObject& control : processor.ControlsCollectionGet(object)) {
        const std::string element = walk.ControlXml(control, 1);
        if (!element.empty())
            xml.append("\r\n").append(element);
    }
    xml.append("\r\n</Controls>\r\n").append(processor.FormMenusXML(object));
    return xml.append("</").append(root.tag).append(">\r\n");
}

/// Kind names of objects without a window, as elements and in questions to the host.
bool HasFieldsOnly(std::int32_t objectType) {
    return objectType == ObjectType::kTable || objectType == ObjectType::kQuery ||
           objectType == ObjectType::kMacro || objectType == ObjectType::kWorksheet ||
           objectType == ObjectType::kChart;
}

std::string DescriptionOf(std::int32_t objectType, const std::string& name) {
    CTovimarServerAgent* agent = Session::ServerAgent();
    if (agent == nullptr)
        return {};
    if (objectType == ObjectType::kQuery)
        return agent->GetQueryDescription(name);
    return objectType == ObjectType::kMacro ? agent->GetMacroDescription(name)
                                            : agent->GetComponentDescription(name);
}

RawControl FieldOf(const HostObject& entry) {
    RawControl field;
    field.type = "Field";
    field.name = HostProperty::Text(entry, "Name");
    field.text = HostProperty::Text(entry, "Caption");
    field.caption = field.text;
    field.description = HostProperty::Text(entry, "Description");
    field.tabIndex = HostProperty::Integer(entry, "TabIndex", -1);
    field.originalClassName = "Field";
    field.level = 1;
    return field;
}

} // namespace

std::string CClientUIObjectRawXml::Get_(IClientFormProcessor& processor, std::int32_t objectType,
                                        const HostObject& component, std::int32_t hostWindow,
                                        const std::string& sourceProjectTypeName,
                                        const std::string& namePrefix, bool vfKeepOpen,
                                        bool vfCaptureReportPreviewArea) {
    if (HasFieldsOnly(objectType))
        return Get1_(processor, objectType, component, sourceProjectTypeName, namePrefix);
    std::string xml;
    Trapped(kClass, "Get_", [&] {
        const bool report = objectType != ObjectType::kForm;
        OpenedObject opened(processor, component, report, vfKeepOpen);
        processor.myDoevents();
        if (opened.Object() == nullptr)
            return;
        RawRoot root =
            ReadRoot(processor, opened.Object(), component, hostWindow, vfCaptureReportPreviewArea);
        root.tag = report ? "Report" : "Form";
        root.namePrefix = namePrefix;
        root.sourceProjectType = sourceProjectTypeName;
        xml = WalkedObject(processor, opened.Object(), component, root);
        opened.Close();
    });
    return xml;
}

std::string CClientUIObjectRawXml::Get1_(IClientFormProcessor& processor, std::int32_t objectType,
                                         const HostObject& component,
                                         const std::string& sourceProjectTypeName,
                                         const std::string& namePrefix) {
    std::string xml;
    Trapped(kClass, "Get1_", [&] {
        processor.myDoevents();
        RawRoot root;
        root.tag = ObjectTypeText(objectType);
        root.name = HostProperty::Text(component, "Name");
        root.caption = root.name;
        root.helpContextId = processor.GetComponentHelpContextId(component, nullptr);
        root.namePrefix = namePrefix;
        root.sourceProjectType = sourceProjectTypeName;
        root.description = DescriptionOf(objectType, root.name);
        std::string written;
        AppendRawRoot(written, root);
        written.append("\r\n<Sections>\r\n</Sections>\r\n<Controls>");
        for (const HostObject& entry : processor.FieldsCollectionGet(root.name, root.tag)) {
            written.append("\r\n");
            AppendRawControl(written, FieldOf(entry), {});
        }
        written.append("\r\n</Controls>\r\n").append(processor.FormMenusXML(component));
        xml = written.append("</").append(root.tag).append(">\r\n");
    });
    return xml;
}

} // namespace tovimar
