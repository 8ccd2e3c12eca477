#include "host/server/CTovimarServerData.h"

#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarParameters.h"
#include "generation/CTovimarStats.h"
#include "generation/RunProgress.h"
#include "generation/clsHtmlHelp.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <functional>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarServerData";

template <typename Member> auto ParameterOr(Member CTovimarParameters::*member, Member absent) {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters == nullptr ? absent : parameters->*member;
}

/// One step of letting go; a failure is reported under what it was about and ends no other step.
void ReleaseStep(const char* what, const std::function<void()>& step) {
    Trapped(kClass, "Release", step, [what] { return std::string(what); });
}

} // namespace

CTovimarServerData::CTovimarServerData()
    : stats_(std::make_unique<CTovimarStats>()), traceLog_(std::make_unique<CTraceLog>()) {
    Session::SetTraceLog(traceLog_.get());
}

CTovimarServerData::~CTovimarServerData() {
    Release();
}

void CTovimarServerData::Release() {
    if (!traceLog_)
        return;
    SetUnattendedMessages(false, nullptr);
    htmlHelp_.reset();
    ReleaseStep("mobjTovimar", [this] {
        if (generator_)
            generator_->Terminate();
        Session::SetHelpProjectTree(nullptr);
        Session::SetParameters(nullptr);
        Session::SetGenerator(nullptr);
        generator_.reset();
    });
    ReleaseStep("mobjAddInSettings", [this] {
        if (settings_)
            settings_->Terminate();
        Session::SetSettings(nullptr);
        settings_.reset();
    });
    ReleaseStep("mobjProjects", [this] {
        Session::SetProjects(nullptr);
        projects_.reset();
    });
    Session::SetMessages(nullptr);
    messages_.reset();
    ReleaseStep("mobjIDEAppInstance", [this] { IDEAppInstance.reset(); });
    Session::SetTraceLog(nullptr);
    traceLog_.reset();
}

CTovimarStats& CTovimarServerData::GenerationStats() {
    return *stats_;
}

CTraceLog& CTovimarServerData::TraceLog() {
    return *Session::TraceLog();
}

clsHtmlHelp& CTovimarServerData::HtmlHelp() {
    if (!htmlHelp_)
        htmlHelp_ = std::make_unique<clsHtmlHelp>();
    return *htmlHelp_;
}

CTovimar& CTovimarServerData::Generator() {
    if (!generator_) {
        generator_ = std::make_unique<CTovimar>();
        Session::SetGenerator(generator_.get());
        Session::SetParameters(&generator_->Parameters());
    }
    return *generator_;
}

bool CTovimarServerData::GenerationInterrupted() const {
    return Session::Run().generationInterrupted;
}

void CTovimarServerData::SetGenerationInterrupted(bool vfInterrupted) {
    Session::Run().generationInterrupted = vfInterrupted;
}

bool CTovimarServerData::GenerationInProgress() const {
    return Session::Run().generationInProgress;
}

void CTovimarServerData::SetGenerationInProgress(bool vfInProgress) {
    Session::Run().generationInProgress = vfInProgress;
}

std::int32_t CTovimarServerData::HostAppMainWindowHWnd() {
    if (hostAppMainWindowHWnd_ == 0)
        hostAppMainWindowHWnd_ = HostAgent().HostAppMainWindowHWnd();
    return hostAppMainWindowHWnd_;
}

std::string CTovimarServerData::NewTovimarProjectName() {
    const std::string name = NormalizeName(platform::BaseNameOf(CurrentSourceProjectFullPath()));
    const CAddInProject* project = Session::CurrentProject();
    return name.empty() && project != nullptr ? project->Name : name;
}

std::string CTovimarServerData::NewTovimarProjectTitle() {
    const CAddInProject* project = Session::CurrentProject();
    const std::string title = project == nullptr ? std::string() : project->Title();
    return title.empty() ? NewTovimarProjectName() : title;
}

void CTovimarServerData::LoadSettings(bool vfSkipIfLoaded) {
    if ((vfSkipIfLoaded && projects_) || settingsLoaded_)
        return;
    // Set first: loading asks for paths, which may lead back here.
    settingsLoaded_ = true;
    Generator();
    TraceText([] { return "Settings = " + GlobalSettingsFile(); });
    TraceText([] { return "Projects = " + CataloguePath(); });
    ReLoadSettings(GlobalSettingsFile(), /*vfLoadSettingsFromTvpFile=*/false);
    // The settings name the language, and with it the folder of the messages.
    TraceText([] { return "Messages = " + MessageFile(); });
    messages_ = std::make_unique<CXmlMessages>();
    Session::SetMessages(messages_.get());
    messages_->Load(MessageFile());
    if (!projects_) {
        projects_ = std::make_unique<CAddInProjects>();
        Session::SetProjects(projects_.get());
        projects_->Init(CataloguePath());
    }
}

ResultCode CTovimarServerData::ReLoadSettings(const std::string& vstrSettingsFileFullPath,
                                              bool vfLoadSettingsFromTvpFile) {
    if (!settings_) {
        settings_ = std::make_unique<CAddInSettingsXmlFile>();
        Session::SetSettings(settings_.get());
    }
    return settings_->Load(vstrSettingsFileFullPath, vfLoadSettingsFromTvpFile);
}

bool CTovimarServerData::IsMSAccessDbOpened() {
    if (HostAgent().AreThereAnySourceProjectsOpened())
        return true;
    ShowMessage("Please open MS Access database or project before running Add-in.", kMsgExclamation,
                kApplicationTitle);
    return false;
}

void CTovimarServerData::TraceProgress(const char* operation, std::int32_t value) {
    TraceText([&] {
        return std::string(kClass) + "." + operation + ": " + LongDateAndTime() + " - " + lastProgressText_ +
               " = " + std::to_string(value);
    });
}

void CTovimarServerData::ProgressBarInit(const std::string& vstrMessage, std::int32_t vlngMaximum) {
    lastProgressText_ = vstrMessage;
    TraceProgress("ProgressBarInit", vlngMaximum);
    platform::Env().progressWindow->Begin(vstrMessage, vlngMaximum);
    progressOpen_ = true;
    progressValue_ = 0;
}

void CTovimarServerData::ProgressBarUpdate(const std::string& vstrMessage, std::int32_t vlngValue) {
    if (!progressOpen_)
        return;
    lastProgressText_ = vstrMessage;
    progressValue_ = vlngValue;
    TraceProgress("ProgressBarUpdate", vlngValue);
    platform::Env().progressWindow->Update(vstrMessage, vlngValue);
}

void CTovimarServerData::ProgressBarDispose() {
    if (!progressOpen_)
        return;
    TraceProgress("ProgressBarDispose", progressValue_);
    platform::Env().progressWindow->End();
    progressOpen_ = false;
}

std::string CTovimarServerData::ReplaceTags(const std::string& text) {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters == nullptr ? text : parameters->ReplacedTags(text);
}

bool CTovimarServerData::AutomatedTestModeOn() {
    return ParameterOr(&CTovimarParameters::AutomatedTestModeOn, false);
}

bool CTovimarServerData::WizardUnattendedExecution() {
    return ParameterOr(&CTovimarParameters::WizardUnattendedExecution, false);
}

bool CTovimarServerData::VerboseTracing() {
    return ParameterOr(&CTovimarParameters::VerboseTracing, false);
}

std::string CTovimarServerData::Language() {
    return ParameterOr(&CTovimarParameters::Language, std::string());
}

std::string CTovimarServerData::LanguageCode() {
    return ParameterOr(&CTovimarParameters::LanguageCode, std::string());
}

std::string CTovimarServerData::HelpProjectTitle() {
    const CTovimarParameters* parameters = Session::Parameters();
    return parameters == nullptr ? std::string() : parameters->HelpProjectTitle();
}

std::string CTovimarServerData::CurrentSourceProjectFullPath() {
    return HostAgent().CurrentSourceProjectFullPath();
}

std::string CTovimarServerData::SourceProjectsList() {
    return CTovimarActions::concatProjectsListFromCollection(HostAgent().GetSourceProjectsList());
}

ResultCode CTovimarServerData::SaveTree(const std::string& path, const std::string& extraAttributes,
                                        const std::string& picsSubfolderName) {
    CHelpPrjTree* tree = Session::HelpProjectTree();
    if (tree == nullptr || tree->Root() == nullptr)
        return kSuccess;
    tree->Root()->SetPicsSubfolderName(picsSubfolderName);
    return tree->SaveXml(path, /*vfSkipSerializers=*/true, extraAttributes);
}

} // namespace tovimar
