#include "host/access/CN_IDEAccContext.h"

#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "generation/RunProgress.h"
#include "host/access/AccessCommands.h"
#include "host/access/AccessProject.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CXmlCommand.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "uimodel/CClientUIObjectRawXml.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccContext";
constexpr ResultCode kObjectClosed = 2467;
constexpr std::int32_t kMeterStart = 1;
constexpr std::int32_t kMeterMove = 2;
constexpr std::int32_t kMeterRemove = 3;

} // namespace

CN_IDEAccContext::CN_IDEAccContext() = default;
CN_IDEAccContext::~CN_IDEAccContext() = default;

ResultCode CN_IDEAccContext::Connect(HostObject robjHostIDE) {
    if (!robjHostIDE)
        return kGeneralFailure;
    application_ = std::move(robjHostIDE);
    formProcessor_ = std::make_unique<CN_IDEAccFormProcessor>();
    formProcessor_->SetIdeAppInstance(application_);
    return kSuccess;
}

ResultCode CN_IDEAccContext::Disconnect() {
    if (formProcessor_)
        formProcessor_->Terminate();
    formProcessor_.reset();
    currentProject_.reset();
    application_.reset();
    return kSuccess;
}

std::string CN_IDEAccContext::ProcessCallBack(const std::string& vstrXmlCommand) {
    if (access_project::FullName(application_).empty())
        currentProject_.reset();
    CXmlCommand command;
    command.Deserialize(vstrXmlCommand);
    bool mayAsk = application_ != nullptr && !Session::Run().generationInterrupted;
    if (mayAsk) {
        CheckErrorLimit();
        mayAsk = !Session::Run().generationInterrupted;
    }
    if (mayAsk)
        Trapped(kClass, "IHostIDEContext_ProcessCallBack", [&] { RunAccessCommand(*this, command); });
    else
        command.AddParamValue("RetValue", "0");
    return command.Serialize();
}

HostObject CN_IDEAccContext::GetCurrentProjectItemByName(const std::string&) {
    return nullptr;
}

HostObject CN_IDEAccContext::CurrentProject() {
    if (currentProject_)
        return currentProject_;
    return access_project::FullName(application_).empty()
               ? nullptr
               : late::ObjectOrNull(application_, "CurrentProject");
}

void CN_IDEAccContext::SetCurrentSourceProject(const std::string& vstrProjectName) {
    if (!vstrProjectName.empty() || currentProject_)
        currentProject_ = late::Object(application_, "CurrentProject");
}

// The host has one project at a time.
std::string CN_IDEAccContext::SourceProjectsList() {
    return platform::BaseNameOf(access_project::FullName(application_));
}

bool CN_IDEAccContext::AreThereAnySourceProjectsOpened() {
    return CurrentProject() != nullptr;
}

std::string CN_IDEAccContext::CurrentSourceProjectFullPath() {
    return late::TextOrEmpty(CurrentProject(), "FullName");
}

std::string CN_IDEAccContext::CurrentSourceProjectName() {
    return platform::BaseNameOf(late::TextOrEmpty(CurrentProject(), "Name"));
}

std::string CN_IDEAccContext::CurrentSourceProjectTypeName() {
    return SourceProjectKind::kMSAccess;
}

std::string CN_IDEAccContext::CurrentSourceProjectLocation() {
    return platform::WithTrailingBackslash(late::TextOrEmpty(CurrentProject(), "Path"));
}

bool CN_IDEAccContext::CurrentSourceProjectIsDirty() {
    return late::Count(late::Object(application_, "Forms")) > 0 ||
           late::Count(late::Object(application_, "Reports")) > 0;
}

bool CN_IDEAccContext::CurrentSourceProjectIsMDEorADE() {
    return access_project::IsMDEorADE(application_);
}

bool CN_IDEAccContext::CurrentSourceProjectIsADPorADE() {
    return access_project::IsADPorADE(application_);
}

std::int32_t CN_IDEAccContext::HostAppMainWindowHWnd() {
    return late::Integer(application_, "hWndAccessApp");
}

std::string CN_IDEAccContext::CurrentObjectName() {
    return late::Text(application_, "CurrentObjectName");
}

std::int32_t CN_IDEAccContext::CurrentObjectType() {
    return late::Integer(application_, "CurrentObjectType");
}

std::string CN_IDEAccContext::ActiveObjectName() {
    const HostObject screen = late::ObjectOrNull(application_, "Screen");
    const std::string form = late::TextOrEmpty(late::ObjectOrNull(screen, "ActiveForm"), "Name");
    return form.empty() ? late::TextOrEmpty(late::ObjectOrNull(screen, "ActiveReport"), "Name") : form;
}

void CN_IDEAccContext::SysCmd(std::int32_t action, const AutomationObject::Arguments& arguments) {
    AutomationObject::Arguments all{action};
    all.insert(all.end(), arguments.begin(), arguments.end());
    late::Call(application_, "SysCmd", all);
}

// The status bar shows no other characters than those of transliterated text.
void CN_IDEAccContext::ProgressMeterInit(const std::string& vstrMsg, std::int32_t vlngMaxVal) {
    TraceText([&] { return LongDateAndTime() + " -> " + vstrMsg + " " + std::to_string(vlngMaxVal); });
    meter_ = {NormalizeName(vstrMsg), /*defined=*/true, /*shown=*/true, vlngMaxVal, 0};
    SysCmd(kMeterStart, {meter_.message, meter_.maximum});
}

void CN_IDEAccContext::ProgressMeterUpdate(std::int32_t vlngCurVal) {
    if (!meter_.shown)
        return;
    SysCmd(kMeterMove, {vlngCurVal});
    meter_.value = vlngCurVal;
}

void CN_IDEAccContext::ProgressMeterRemove() {
    TraceText([] { return LongDateAndTime() + " Remove progress meter"; });
    meter_ = {};
    SysCmd(kMeterRemove);
}

void CN_IDEAccContext::ProgressMeterToggle(bool) {
    if (!meter_.defined)
        return;
    if (meter_.shown) {
        SysCmd(kMeterRemove);
    } else {
        SysCmd(kMeterStart, {meter_.message, meter_.maximum});
        SysCmd(kMeterMove, {meter_.value});
    }
    meter_.shown = !meter_.shown;
}

void CN_IDEAccContext::HourglassOn() {
    if (hourglassCount_++ == 0)
        late::Call(late::Object(application_, "DoCmd"), "Hourglass", {true});
}

void CN_IDEAccContext::HourglassOff() {
    if (--hourglassCount_ >= 1)
        return;
    hourglassCount_ = 0;
    late::Call(late::Object(application_, "DoCmd"), "Hourglass", {false});
}

void CN_IDEAccContext::HourglassOffFinal() {
    late::Call(late::Object(application_, "DoCmd"), "Hourglass", {false});
}

void CN_IDEAccContext::myDoevents() {
    platform::Env().doEvents();
}

// Whoever asked sees that no file came. That a design can't be read is told once, when it is to be opened.
void CN_IDEAccContext::SaveAsText(std::int32_t type, const std::string& name, const std::string& path) {
    try {
        late::Call(application_, "SaveAsText", {type, name, path});
    } catch (const RaisedError& failure) {
        TraceText([&] { return "SaveAsText [" + name + "]: " + failure.what(); });
    }
}

bool CN_IDEAccContext::ComponentExists(std::int32_t vlngCompType, const std::string& vstrCompName) {
    if (vlngCompType != ObjectType::kForm && vlngCompType != ObjectType::kReport)
        return true;
    try {
        return CatalogueEntry(vlngCompType, vstrCompName) != nullptr;
    } catch (const RaisedError&) {
        return false;
    }
}

std::string CN_IDEAccContext::FormNamePrefix() {
    return formProcessor_->FormNamePrefix();
}
std::string CN_IDEAccContext::ReportNamePrefix() {
    return formProcessor_->ReportNamePrefix();
}
std::string CN_IDEAccContext::TableNamePrefix() {
    return formProcessor_->TableNamePrefix();
}
std::string CN_IDEAccContext::QueryNamePrefix() {
    return formProcessor_->QueryNamePrefix();
}
std::string CN_IDEAccContext::MacroNamePrefix() {
    return formProcessor_->MacroNamePrefix();
}

// Queries of a client of a database server can't be read: there is no entry for them.
HostObject CN_IDEAccContext::CatalogueEntry(std::int32_t type, const std::string& name) {
    const auto ofProject = [&](const char* catalogue) {
        return late::Object(late::Object(application_, "CurrentProject"), catalogue, {name});
    };
    switch (type) {
    case ObjectType::kForm:
        return ofProject("AllForms");
    case ObjectType::kReport:
        return ofProject("AllReports");
    case ObjectType::kMacro:
        return ofProject("AllMacros");
    case ObjectType::kTable:
        return late::Object(late::Object(application_, "CurrentData"), "AllTables", {name});
    case ObjectType::kQuery:
        return CurrentSourceProjectIsADPorADE()
                   ? nullptr
                   : late::Object(late::Object(application_, "CurrentData"), "AllQueries", {name});
    default:
        throw RaisedError(kFailure1, "Undefined object type code - " + std::to_string(type), kClass);
    }
}

HostObject CN_IDEAccContext::OpenObjectByName(std::int32_t type, const std::string& name) {
    return late::ObjectOrNull(application_, type == ObjectType::kForm ? "Forms" : "Reports", {name});
}

HostObject CN_IDEAccContext::FindActual(std::int32_t type, const std::string& name, bool hidden,
                                        bool designView) {
    const bool form = type == ObjectType::kForm;
    const HostObject entry = CatalogueEntry(form ? ObjectType::kForm : ObjectType::kReport, name);
    return form ? formProcessor_->FindActualFormOfComponent(entry, hidden, designView)
                : formProcessor_->FindActualReportOfComponent(entry, hidden, designView);
}

std::int32_t CN_IDEAccContext::ActivateComponent(std::int32_t vlngCompType, const std::string& vstrCompName,
                                                 bool vfForceOpenInDesignView, bool vfForceOpenAsHidden) {
    const HostObject open =
        FindActual(vlngCompType, vstrCompName, vfForceOpenAsHidden, vfForceOpenInDesignView);
    return open ? late::Integer(open, "hWnd") : 0;
}

void CN_IDEAccContext::SetComponentHelp(std::int32_t vlngCompType, const std::string& vstrCompName,
                                        std::int32_t vlngHelpContextId) {
    const HostObject open =
        FindActual(vlngCompType, vstrCompName, /*hidden=*/true, vlngCompType != ObjectType::kForm);
    if (!open)
        return;
    try {
        formProcessor_->SetComponentHelpContextId(nullptr, open, vlngHelpContextId);
    } catch (const RaisedError& failure) {
        if (failure.Number() != kObjectClosed)
            throw;
    }
}

// An object that isn't open needs no closing.
void CN_IDEAccContext::CloseComponent(std::int32_t vlngCompType, const std::string& vstrCompName,
                                      bool vfSave) {
    const HostObject open = OpenObjectByName(vlngCompType, vstrCompName);
    if (!open)
        return;
    if (vlngCompType == ObjectType::kForm)
        formProcessor_->ActualFormClose(nullptr, open, vfSave);
    else
        formProcessor_->ActualReportClose(nullptr, open, vfSave);
}

void CN_IDEAccContext::CorrectInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                                   bool vfCompIsInDesignView) {
    if (const HostObject open = OpenObjectByName(vlngObjType, vstrObjName))
        formProcessor_->CorrectInsideWidthAndHeight(vlngObjType, open, vfCompIsInDesignView);
}

void CN_IDEAccContext::ResetInsideWidthAndHeight(std::int32_t vlngObjType, const std::string& vstrObjName,
                                                 bool vfCompIsInDesignView) {
    if (const HostObject open = OpenObjectByName(vlngObjType, vstrObjName))
        formProcessor_->ResetInsideWidthAndHeight(vlngObjType, open, vfCompIsInDesignView);
}

std::string CN_IDEAccContext::ProcessComponent(const CXmlCommand& command) {
    const std::int32_t type = Value(command.GetParamValue("ObjectType")).AsInteger();
    const std::string name = command.GetParamValue("ComponentName");
    const std::int32_t hostWindow = Value(command.GetParamValue("HostAppIDEHwnd")).AsInteger();
    const bool previewOnly = Value(command.GetParamValue("CaptureRptPreviewAreaOnly")).AsBoolean();
    const std::string sourceType = command.GetParamValue("SourceProjectTypeName");
    const bool keepOpen = Value(command.GetParamValue("KeepSourceObjectOpened")).AsBoolean();

    const HostObject entry = CatalogueEntry(type, name);
    std::string description;
    if (entry)
        description = CClientUIObjectRawXml().Get_(*formProcessor_, type, entry, hostWindow, sourceType,
                                                   std::string(), keepOpen, previewOnly);
    if (description.empty())
        throw RaisedError(kFailure2, "Error processing source project component [" + name + "]", kClass);
    return description;
}

void CN_IDEAccContext::UnhideDbWindow() {
    if (late::TextOrEmpty(application_, "Version") == "9.0")
        late::Call(late::Object(application_, "DoCmd"), "SelectObject", {0, "", true});
}

} // namespace tovimar
