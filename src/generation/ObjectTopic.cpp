#include "generation/ObjectTopic.h"

#include "foundation/BackupFileName.h"
#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarStats.h"
#include "generation/HelpUtilities.h"
#include "generation/RunProgress.h"
#include "generation/clsFrmRptHelpContextIds.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ComponentFileName.h"
#include "screenshots/Screenshot.h"
#include "topics/TopicNames.h"
#include "topics/clsHTMLFile.h"
#include "uimodel/CXmlForm.h"

namespace tovimar {
namespace {

CTovimarStats& Stats() {
    return RunData().GenerationStats();
}

} // namespace

void SetPageLook(clsHTMLFile& page, const CHelpPrjTreeNode& node) {
    const auto* parameters = Session::Parameters();
    page.CSSFullPath = node.CSSFullPath();
    if (page.CSSFullPath.empty())
        page.CSSFullPath = parameters->CSSFullPath();
    page.Charset = node.Charset();
    if (page.Charset.empty())
        page.Charset = parameters->Charset;
}

void SavePage(clsHTMLFile& page, const CHelpPrjTreeNode& node, const std::string& title,
              const std::string& caption) {
    page.Title = title;
    page.Caption = caption;
    SetPageLook(page, node);
    page.Save();
}

bool ObjectTopic::Find() {
    auto& host = HostAgent();
    type_ = node_.ObjectType();
    if (const std::string source = node_.SourceProjectName(); !source.empty()) {
        host.SetCurrentSourceProject(source);
        TraceText([&] { return "ProcessHelpTreeAndGenerateHelp1.SetCurrentSourceProject " + source; });
    }
    const bool exists = host.ComponentExistsTest(type_, node_.Name());
    TraceText([&] {
        return LongDateAndTime() + ": ComponentName = " + node_.Name() +
               ", ObjectType = " + std::to_string(type_) + ", Exists = " + (exists ? "True" : "False");
    });
    if (!exists)
        node_.SetSkipped(true);
    return exists;
}

void ObjectTopic::Make() {
    CountObject();
    DeleteOldTopic();
    FixPaths();
    form_ = generator_.CreateNormalizedXmlDef(type_, node_.Name(), 0, /*vfInDesignView=*/true,
                                              /*vfReplaceHtml=*/false, 0, picture_, topic_,
                                              /*vfPreviewAreaOnly=*/false, {}, /*vfKeepOpened=*/true);
    if (!form_->Name.empty())
        TakeOver();
    HostAgent().CloseComponent(type_, node_.Name(), /*saveComponentFlag=*/false);
    form_->hWnd = 0;
    Render();
    SaveDefinition();
    FinishPage();
}

void ObjectTopic::CountObject() const {
    if (type_ == ObjectType::kForm) {
        ++Stats().HelpProvidersQty;
        ++Stats().FormHelpContextIdsQty;
    } else if (type_ == ObjectType::kReport) {
        ++Stats().ReportHelpContextIdsQty;
    }
}

/// A failure further down must leave no old topic behind. In a help that lives on it is a writer's: that of
/// an object whose entry was taken out of the contents.
void ObjectTopic::DeleteOldTopic() const {
    const std::string old = node_.GeneratedHTMLFileFullPath();
    if (!node_.IsObjectNode() || old.empty() || !platform::Env().files->FileExists(old))
        return;
    if (node_.RegenerateHelpFiles && !BackUpFile(old))
        throw RaisedError(kFailure1, "No backup of '" + old + "' can be written", "ObjectTopic");
    platform::Env().files->DeleteFile(old);
}

void ObjectTopic::FixPaths() {
    const auto& parameters = generator_.Parameters();
    if (node_.GeneratedHTMLFile().empty()) {
        const std::string name = GetComponentFileName(node_.Name());
        topic_ = parameters.FolderForGeneratedHelp() + name + ".htm";
        picture_ = parameters.FolderForGeneratedImages() + name;
        node_.SetGeneratedHTMLFile(topic_);
    } else {
        topic_ = node_.GeneratedHTMLFileFullPath();
        picture_ = platform::FolderOf(topic_) + parameters.NameOfFolderForGeneratedImagesWithSlash() +
                   platform::BaseNameOf(node_.GeneratedHTMLFile());
    }
    picture_ += parameters.ImagesFileExt();
}

/// Takes what the definition says into the node, the counters and the table of ids, and takes the picture.
void ObjectTopic::TakeOver() {
    auto& host = HostAgent();
    Stats().ControlSectionsQty += static_cast<std::int32_t>(form_->Controls.Count());
    form_->SourceProjectName = host.CurrentSourceProjectName();
    node_.SetSourceProjectName(form_->SourceProjectName);
    node_.SetSourceProjectType(form_->SourceProjectType);
    generator_.HelpContextIds().ExtractUsedHelpContextIds(*form_);
    generator_.HelpContextIds().RecallEarlierIds(*form_);
    const bool pictured = type_ == ObjectType::kForm ||
                          (type_ == ObjectType::kReport && generator_.Parameters().AddImageForReport);
    if (!pictured)
        return;
    const std::int32_t window = host.ActivateComponent(type_, node_.Name(), /*forceOpenInDesignView=*/false,
                                                       /*forceOpenAsHidden=*/false);
    Screenshot().LocateObjectsAndTakeScreenshots(generator_.Parameters().ImagesType(), window, *form_);
    ++Stats().ScreenshotsQty;
}

void ObjectTopic::Render() {
    if (form_->StylesheetFullPath().empty())
        form_->SetStylesheetFullPath(generator_.Parameters().CSSFullPath());
    if (form_->Charset.empty())
        form_->Charset = generator_.Parameters().Charset;
    form_->HeldTopic = &topicText_;
    switch (type_) {
    case ObjectType::kForm:
        form_->SaveHTMLEx(topic_, /*HtmlOfReport=*/false);
        break;
    case ObjectType::kReport:
        form_->SaveHTMLEx(topic_, /*HtmlOfReport=*/true);
        break;
    case ObjectType::kTable:
        form_->SaveHTML4Table(topic_, "table.htm", /*HtmlOfReport=*/true);
        break;
    case ObjectType::kQuery:
        form_->SaveHTML4Table(topic_, "query.htm", /*HtmlOfReport=*/true, false, true, {},
                              HostAgent().GetQueryXmlStr(form_->Name));
        break;
    case ObjectType::kMacro:
        form_->SaveHTML4Table(topic_, "macro.htm", /*HtmlOfReport=*/true);
        break;
    case ObjectType::kWorksheet:
        TraceText([] { return std::string("1. CTovimar.GetWksHtml"); });
        RenderWorksheet("worksheet.htm");
        break;
    case ObjectType::kChart:
        RenderWorksheet("chart.htm");
        break;
    default:
        throw RaisedError(kFailure1, "Unknown ProcessCode = " + std::to_string(type_) + " for " + form_->Name,
                          "CTovimar.ProcessHelpTreeAndGenerateHelp1");
    }
}

void ObjectTopic::RenderWorksheet(const char* templateFile) {
    const std::string cells = HostAgent().GetWksHtml(node_.Name());
    if (type_ == ObjectType::kWorksheet)
        TraceText([] { return std::string("2. CTovimar.GetWksHtml"); });
    form_->SaveHTML4Worksheet(topic_, templateFile, /*HtmlOfReport=*/true, false, true, {}, {}, cells);
}

void ObjectTopic::SaveDefinition() {
    form_->HeldTopic = nullptr;
    const auto* project = Session::CurrentProject();
    const std::string folder = project->XmlFormsFolder();
    const std::string file = node_.XmlFormFileName();
    savingDetail_ = "XmlFolder = " + folder + "\r\nXmlFile = " + file;
    CreateFolderPath(folder);
    generator_.HelpProjectTree().Definitions().Save(form_, platform::Join(folder, file));
    savingDetail_.clear();
}

void ObjectTopic::FinishPage() {
    clsHTMLFile page;
    const bool held = !topicText_.empty();
    if ((held ? page.LoadText(topic_, std::move(topicText_)) : page.Load(topic_)) != kSuccess)
        return;
    const bool byCaption = generator_.Parameters().IdentifyControls == 0;
    SavePage(page, node_, StripAccelerators(byCaption ? form_->Text : form_->Name),
             StripAccelerators(byCaption ? form_->Caption() : form_->Name));
}

} // namespace tovimar
