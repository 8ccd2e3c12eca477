/// The topic pass: one depth-first walk over the tree that turns every node into a file, and what needs the
/// whole tree behind it.
#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXmlMessages.h"
#include "foundation/ErrorTrap.h"
#include "foundation/NameEncoding.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarStats.h"
#include "generation/HelpUtilities.h"
#include "generation/ObjectTopic.h"
#include "generation/RunProgress.h"
#include "generation/clsFrmRptHelpContextIds.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/CXmlCommand.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/imaging/PictureSize.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/clsHHK.h"
#include "topics/clsHTMLFile.h"
#include "uimodel/CClientUIObjectXml.h"
#include "uimodel/CXmlForm.h"

#include <cmath>
#include <optional>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimar";
constexpr std::int32_t kSourceObject = 999;

using Tags = std::vector<std::string>;

bool Interrupted() {
    return Session::Run().generationInterrupted;
}

bool IsListPage(std::int32_t processCode) {
    return (processCode >= 1 && processCode <= 5) || processCode == ObjectType::kWorksheet ||
           processCode == ObjectType::kChart;
}

/// Sections of an object's topic: they have no file of their own.
bool IsSection(const CHelpPrjTreeNode& node) {
    return node.IsControl || node.IsMenu;
}

/// What the walk carries from node to node.
struct Walk {
    CTovimar& generator;
    std::int32_t maxNodes;
    std::int32_t& counter;
    bool regenerate;
    /// Of the call that runs; says what a failing step was saving.
    std::string savingDetail;
    double intervalStart = platform::Env().clock->Timer();
};

std::string MeterText(const CHelpPrjTreeNode& node, std::int32_t level) {
    std::string text = "Processing TOC node at level " + std::to_string(level);
    if (const std::string type = node.NodeComponentTypeName(); !type.empty())
        return text + " - " + type + ". [" + node.Name() + "]...";
    return text + ". [" + node.Caption() + "]...";
}

void ShowNode(const CHelpPrjTreeNode& node, std::int32_t level, Walk& walk) {
    ++walk.counter;
    HostAgent().ProgressMeterInit(MeterText(node, level), walk.maxNodes);
    HostAgent().ProgressMeterUpdate(walk.counter);
    if (!walk.generator.NodeStarted || node.HasSerializer())
        return;
    const std::string kind = node.NodeComponentTypeName();
    walk.generator.NodeStarted(
        {kind, kind.empty() ? node.Caption() : node.Name(), walk.counter, walk.maxNodes});
}

/// The ids of an object that isn't made again still count as used.
void ExtractSavedIds(const CHelpPrjTreeNode& node, CTovimar& generator) {
    if (!node.IsObjectNode())
        return;
    if (const auto form = generator.HelpProjectTree().Definitions().Load(node.XmlFormFullPath()))
        generator.HelpContextIds().ExtractUsedHelpContextIds(*form);
}

/// A picture with more pixels than it is shown with says how large that is.
std::string ShownSize(const std::string& picture, const CTovimarParameters& parameters) {
    std::string result;
    if (parameters.ImagesScale == 1)
        return result;
    PassOver([&] {
        if (const auto size = platform::PictureSize(platform::Env().files->ReadFile(picture))) {
            const auto shown = [&](int pixels) {
                return std::to_string(std::lround(pixels / parameters.ImagesScale));
            };
            result = "WIDTH=\"" + shown(size->first) + "\" HEIGHT=\"" + shown(size->second) + "\" ";
        }
    });
    return result;
}

/// A database without relations has no page of them.
Tags DatamodelTags(CHelpPrjTreeNode& node, const CTovimarParameters& parameters) {
    if (!text::EqualsIgnoringCase(node.Tag, "Datamodel"))
        return {};
    const std::string relations = HostAgent().ScreenshotDatamodelWindow();
    if (relations.empty()) {
        node.SetSkipped(true);
        return {};
    }
    const std::string file = "Datamodel" + parameters.ImagesFileExt();
    return {"{{DatamodelImage}}|<IMG SRC=\"" + parameters.NameOfFolderForGeneratedImagesWithSlash() + file +
                "\" BORDER=0 " + ShownSize(parameters.FolderForGeneratedImages() + file, parameters) +
                "ALT=\"{{DatamodelCaption}}\" />",
            "{{Relationships}}|" + relations};
}

/// An existing page of an existing project is never overwritten; only its title and look are renewed.
void MakePlainPage(CHelpPrjTreeNode& node, const Tags& tags, CTovimar& generator) {
    if (generator.HelpProjectTree().NewHtmlHelpProject || node.GeneratedHTMLFile().empty()) {
        node.SetGeneratedHTMLFile(node.TemplateHtmlFileNameExtOnly());
        ReplaceTagsAndCopy(node.TemplateHtmlFileFullPath(), node.GeneratedHTMLFileFullPath(), tags);
    }
    if (node.HtmlTitle().empty())
        node.SetHtmlTitle(node.Caption());
    clsHTMLFile page;
    if (page.Load(node.GeneratedHTMLFileFullPath()) == kSuccess)
        SavePage(page, node, node.HtmlTitle(), node.Caption());
}

void NameListPage(CHelpPrjTreeNode& node) {
    if (!node.TemplateHtmlFile().empty())
        node.SetGeneratedHTMLFile(node.TemplateHtmlFileNameExtOnly());
    else
        node.SetGeneratedHTMLFile(text::ReplaceAll(NormalizeName(node.Caption()), " ", "_") + ".htm");
}

std::string ListOfLinks(CHelpPrjTreeNode& node) {
    std::vector<std::string> links;
    for (const auto& child : node.Children())
        if (!child->HasSerializer() && !child->Skipped())
            links.push_back("<LI>" + child->HTMLFileRef(true));
    return text::Join(links, "\r\n");
}

void MakeListPage(CHelpPrjTreeNode& node, const CTovimarParameters& parameters) {
    const std::string source = node.TemplateHtmlFileFullPath();
    if (!IsListPage(node.ProcessCode()) || source.empty())
        return;
    const Tags tags{"{{StyleSheetLinkHtml}}|" + GetStyleSheetLinkHtml(parameters.CSSFullPath()),
                    "{{charset}}|" + parameters.Charset, "{{HtmlPageTitle}}|" + node.Caption(),
                    "{{HtmlTopicCaption}}|" + node.Caption(), "{{BODY}}|" + ListOfLinks(node)};
    if (node.GeneratedHTMLFile().empty() && CHelpPrjTree::IsGroupTemplateNode(node))
        node.SetGeneratedHTMLFile(node.TemplateHtmlFileNameExtOnly());
    ReplaceTagsAndCopy(source, node.GeneratedHTMLFileFullPath(), tags);
}

/// What the object before has cost.
void TraceInterval(Walk& walk) {
    TraceText([&] {
        const double now = platform::Env().clock->Timer();
        std::string line =
            "Timestamp: elapsed time = " + std::to_string(now - walk.intervalStart) + " seconds.";
        walk.intervalStart = now;
        return line;
    });
}

void MakeObjectTopic(CHelpPrjTreeNode& node, Walk& walk) {
    ObjectTopic topic(walk.generator, node);
    const bool exists = topic.Find();
    TraceInterval(walk);
    if (!exists)
        return;
    try {
        topic.Make();
    } catch (...) {
        walk.savingDetail = topic.SavingDetail();
        throw;
    }
}

void MakeNode(CHelpPrjTreeNode& node, Walk& walk) {
    const Tags tags = DatamodelTags(node, walk.generator.Parameters());
    if (node.Skipped() || node.HasSerializer())
        return;
    const std::int32_t processCode = node.ProcessCode();
    if (processCode == 0)
        MakePlainPage(node, tags, walk.generator);
    else if (processCode == kSourceObject)
        MakeObjectTopic(node, walk);
    else if (IsListPage(processCode))
        NameListPage(node);
}

void AddKeywords(CHelpPrjTreeNode& node, clsHHK& index) {
    for (const std::string& word : node.IndexesCollection())
        index.AddCustomLink(node.Caption(), word, node.GeneratedHTMLFile(), {});
}

void CountPage(const CHelpPrjTreeNode& node) {
    const std::string path = node.GeneratedHTMLFileFullPath();
    if (!path.empty() && platform::Env().files->FileExists(path))
        ++RunData().GenerationStats().HelpPagesQty;
}

/// The whole work on one child of the walk. False ends the loop over its siblings.
bool ProcessChild(CHelpPrjTreeNode& child, std::int32_t level, Walk& walk) {
    CheckErrorLimit();
    if (Interrupted())
        return false;
    ShowNode(child, level, walk);
    platform::Env().doEvents();
    MakeNode(child, walk);
    walk.generator.ProcessHelpTreeAndGenerateHelp1(level + 1, child, /*vfShowProgress=*/false, walk.maxNodes,
                                                   walk.counter, walk.regenerate);
    if (Interrupted())
        return false;
    MakeListPage(child, walk.generator.Parameters());
    AddKeywords(child, walk.generator.HelpIndex());
    CountPage(child);
    return true;
}

ResultCode ProcessChildren(CHelpPrjTreeNode& node, std::int32_t level, Walk& walk) {
    for (const auto& child : node.Children()) {
        if (IsSection(*child))
            continue;
        if (walk.regenerate && !child->RegenerateHelpFiles) {
            ExtractSavedIds(*child, walk.generator);
            const ResultCode result = walk.generator.ProcessHelpTreeAndGenerateHelp1(
                level + 1, *child, /*vfShowProgress=*/false, walk.maxNodes, walk.counter, walk.regenerate);
            if (result != kSuccess)
                return result;
        } else if (!ProcessChild(*child, level, walk)) {
            break;
        }
    }
    return kSuccess;
}

void MakeStartPage(CHelpPrjTreeNode& root, bool newProject, bool regenerate,
                   const CTovimarParameters& parameters) {
    if (root.GeneratedHTMLFile().empty())
        root.SetGeneratedHTMLFile(root.TemplateHtmlFileNameExtOnly());
    const std::string path = root.GeneratedHTMLFileFullPath();
    if (newProject) {
        // The welcome page of the general template points to a page of dialogs; an application has forms.
        Tags tags;
        if (text::EqualsIgnoringCase(root.TemplateHtmlFile(), "Welcome.htm"))
            tags = {"<a href=\"Dialogs.htm\">|<a href=\"Forms.htm\">", "Dialogs</a>|Forms</a>"};
        ReplaceTagsAndCopy(root.TemplateHtmlFileFullPath(), path, tags);
    }
    if (root.HtmlTitle().empty())
        root.SetHtmlTitle(root.Caption());
    clsHTMLFile page;
    if (regenerate || page.Load(path) != kSuccess)
        return;
    if (const std::string css = parameters.CSSFullPath(); !css.empty())
        root.SetCSSFullPath(css);
    if (!parameters.Charset.empty())
        root.SetCharset(parameters.Charset);
    SavePage(page, root, root.HtmlTitle(), root.Caption());
}

void MakePrintedContents(CHelpPrjTreeNode& root, const CTovimarParameters& parameters) {
    clsHTMLFile page;
    if (page.Load(ContentsPageTemplate()) != kSuccess)
        return;
    const std::string contents = "<UL>" + root.ContentsHTML(1, true) + "</UL>\r\n";
    page.HTML = text::ReplaceAllIgnoringCase(page.HTML, "{{TOC}}", contents);
    page.HTML = Session::Messages()->ReplaceParameters(page.HTML);
    // Saving puts the heading back as it was loaded.
    page.Caption = Session::Messages()->ReplaceParameters(page.Caption);
    page.CSSFullPath = parameters.CSSFullPath();
    page.Save(parameters.FolderForGeneratedHelp() + parameters.HelpProjectName() + "TOC.htm");
}

/// The pass writes over the definitions of an earlier run.
void StartContextIds(std::unique_ptr<clsFrmRptHelpContextIds>& ids) {
    ids = std::make_unique<clsFrmRptHelpContextIds>();
    const auto* project = Session::CurrentProject();
    if (project != nullptr && platform::Env().files->FileExists(project->TvpFullPath()))
        ids->LoadEarlierIds(project->XmlFormsFolder());
}

struct StyleSheetCopy {
    std::string source;
    std::string target;
};

/// A style sheet that stands in the help's folder is the user's and survives.
void CopyStyleSheet(StyleSheetCopy& copy, const CTovimarParameters& parameters) {
    auto& files = *platform::Env().files;
    copy.source = parameters.CSSFullPath();
    if (copy.source.empty())
        return;
    copy.target = parameters.FolderForGeneratedHelp() + platform::FileNameOf(copy.source);
    if (!files.FileExists(copy.source))
        copy.source = FindTemplate(copy.source);
    if (!files.FileExists(copy.source))
        copy.source = DefaultStyleSheetFile();
    if (!files.FileExists(copy.target))
        files.CopyFile(copy.source, copy.target);
}

} // namespace

void CTovimar::ProcessHelpTreeAndGenerateHelp(std::int32_t level, CHelpPrjTreeNode& node, bool vfShowProgress,
                                              std::int32_t maxNodes, std::int32_t& counter,
                                              bool vfRegenerate) {
    if (Interrupted())
        return;
    Trapped(kClass, "ProcessHelpTreeAndGenerateHelp", [&] {
        if (!vfRegenerate && level == 0)
            StartContextIds(helpContextIds_);
        std::optional<HostMeter> meter;
        if (vfShowProgress)
            meter.emplace("Processing TOC...", maxNodes);
        HostAgent().SetUseProjectGroupAsSourceFlag(parameters_->UseProjectGroupAsSource);
        if (ProcessHelpTreeAndGenerateHelp1(level, node, vfShowProgress, maxNodes, counter, vfRegenerate) !=
            kSuccess)
            Session::Run().generationInterrupted = true;
        else
            ProcessHelpTreeAndGenerateHelp2(node, vfRegenerate);
    });
}

ResultCode CTovimar::ProcessHelpTreeAndGenerateHelp1(std::int32_t level, CHelpPrjTreeNode& node,
                                                     bool /*vfShowProgress*/, std::int32_t maxNodes,
                                                     std::int32_t& counter, bool vfRegenerate) {
    if (node.Children().Empty())
        return kSuccess;
    Walk walk{*this, maxNodes, counter, vfRegenerate, {}};
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(
        kClass, "ProcessHelpTreeAndGenerateHelp1",
        [&] {
            TraceText([&] { return node.XMLSTr(1, true, true, false, {}); });
            if (!Interrupted())
                result = ProcessChildren(node, level, walk);
        },
        [&] { return walk.savingDetail; });
    return trapped != kSuccess ? trapped : result;
}

void CTovimar::ProcessHelpTreeAndGenerateHelp2(CHelpPrjTreeNode& node, bool vfRegenerate) {
    if (Interrupted())
        return;
    StyleSheetCopy copy;
    Trapped(
        kClass, "ProcessHelpTreeAndGenerateHelp2",
        [&] {
            MakeStartPage(node, HelpProjectTree().NewHtmlHelpProject, vfRegenerate, *parameters_);
            MakePrintedContents(node, *parameters_);
            CopyStyleSheet(copy, *parameters_);
            TraceTimestamp("Assigning Help Context Ids.");
            HelpContextIds().AssignHelpContextIds();
            TraceTimestamp("Setting Help Context Ids.");
            HelpContextIds().SetHelpContextIds();
        },
        [&] { return "Src = '" + copy.source + "', Dst = '" + copy.target + "'"; });
}

std::string CTovimar::CreateXmlDefForComponent(std::int32_t objType, const std::string& name,
                                               std::int32_t hostHwnd, bool vfInDesignView, bool vfReplaceHtml,
                                               std::int32_t picType, const std::string& picFullPath,
                                               const std::string& htmlFullPath, bool vfPreviewAreaOnly,
                                               const std::string& sourceTypeName, bool vfKeepOpened) {
    auto* server = Session::Server();
    if (server == nullptr)
        return {};
    CXmlCommand command;
    command.Build("ProcessComponent", {{"ObjectType", objType},
                                       {"ComponentName", name},
                                       {"HostAppIdeHwnd", hostHwnd},
                                       {"IsInDesignView", vfInDesignView},
                                       {"PictureSaveType", picType},
                                       {"PicFullPath", picFullPath},
                                       {"HtmlFullPath", htmlFullPath},
                                       {"ReplaceHtml", vfReplaceHtml},
                                       {"PicSubFolder", parameters_->NameOfFolderForGeneratedImages()},
                                       {"CaptureRptPreviewAreaOnly", vfPreviewAreaOnly},
                                       {"NoReportsScreenShots", parameters_->NoReportsScreenShots},
                                       {"SourceProjectTypeName", sourceTypeName},
                                       {"KeepSourceObjectOpened", vfKeepOpened}});
    CXmlCommand answer;
    return answer.Deserialize(server->SendCommand(command.Serialize())).Text;
}

std::unique_ptr<CXmlForm>
CTovimar::CreateNormalizedXmlDef(std::int32_t objType, const std::string& name, std::int32_t /*hostHwnd*/,
                                 bool vfInDesignView, bool /*vfReplaceHtml*/, std::int32_t /*picType*/,
                                 const std::string& picFullPath, const std::string& htmlFullPath,
                                 bool /*vfPreviewAreaOnly*/, const std::string& /*sourceTypeName*/,
                                 bool /*vfKeepOpened*/) {
    const std::string sourceType = HostAgent().CurrentSourceProjectTypeName();
    const std::string raw = CreateXmlDefForComponent(
        objType, name, HostAgent().HostAppMainWindowHWnd(), vfInDesignView, /*vfReplaceHtml=*/false,
        parameters_->ImagesFormat, picFullPath, htmlFullPath, parameters_->CapturePreviewAreaOnly, sourceType,
        /*vfKeepOpened=*/true);
    const std::string adjusted = CClientUIObjectXml().Adjust(
        raw, objType, /*vfCompIsInDesignView=*/true, parameters_->ImagesFormat, picFullPath, htmlFullPath,
        parameters_->NameOfFolderForGeneratedImagesWithSlash(),
        /*vfControlLocationIsAbsolute=*/text::EqualsIgnoringCase(sourceType, SourceProjectKind::kMSAccess));
    auto form = std::make_unique<CXmlForm>();
    form->LoadXml(adjusted);
    if (parameters_->HotSpots)
        form->HasMap = true;
    form->SortControlsUsingTabIndex();
    form->SetHtmlFullPath(htmlFullPath);
    form->SetPicFullPath(picFullPath);
    return form;
}

} // namespace tovimar
