#include "foundation/CAddInProject.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjCheckSums.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/SitemapText.h"

#include <cstdio>
#include <optional>

/// The project file, read and written.
namespace tovimar {

namespace {

std::string Now() {
    const auto now = platform::Env().clock->Now();
    char text[32];
    std::snprintf(text, sizeof text, "%04d-%02d-%02d %02d:%02d:%02d", now.year, now.month, now.day, now.hour,
                  now.minute, now.second);
    return text;
}

void Trace(const std::string& message) {
    Session::TraceLog()->addMessage(message);
}

std::string Seconds(double seconds) {
    char text[32];
    std::snprintf(text, sizeof text, "%.2f", seconds);
    return text;
}

} // namespace

/// What one load carries along.
struct CHelpPrjTree::LoadRun {
    std::shared_ptr<XmlDocument> document = std::make_shared<XmlDocument>();
    XmlNode rootElement;
    std::string path;
    bool external = false;
    bool loadControls = false;
    /// Part of a tree on its way to another place: all of it comes through, the groups of kinds that were
    /// left out since, too.
    bool piece = false;
    double buildTimeTotal = 0;
    double addControlsTimeTotal = 0;
    std::optional<bool> withoutQueries;

    /// The host is asked once, and only when there is something to leave out.
    bool SourceHasNoQueries() {
        if (!withoutQueries.has_value())
            withoutQueries =
                Session::ServerAgent() != nullptr && Session::ServerAgent()->CurrentSourceProjectIsADPorADE();
        return *withoutQueries;
    }

    bool LeavesOut(std::string_view tag) {
        const auto* parameters = Session::Parameters();
        const auto on = [&](bool CTovimarParameters::*flag) {
            return parameters == nullptr || parameters->*flag;
        };
        if (tag == "Tables")
            return !on(&CTovimarParameters::GenerateHelpForTables);
        if (tag == "Queries")
            return !on(&CTovimarParameters::GenerateHelpForQueries) || SourceHasNoQueries();
        if (tag == "Macros")
            return !on(&CTovimarParameters::GenerateHelpForMacros) || SourceHasNoQueries();
        return false;
    }
};

ResultCode CHelpPrjTree::Load(const std::string& vstrTreeDefFullPath, bool vfNewHtmlHelpProject,
                              bool vfLoadingExternalProject, const std::string& vstrXml,
                              bool vfLoadControls) {
    ResultCode result = kSuccess;
    const auto failed = Trapped(
        "CHelpPrjTree", "Load",
        [&] {
            NewHtmlHelpProject = vfNewHtmlHelpProject;
            ForgetSourceProject();
            LoadRun run;
            run.path = vstrTreeDefFullPath;
            run.external = vfLoadingExternalProject;
            run.loadControls = vfLoadControls;
            run.piece = !vstrXml.empty();
            result = LoadTree(run, vstrXml);
        },
        [&] { return "TreeDefFullPath = " + vstrTreeDefFullPath; });
    return failed != kSuccess ? failed : result;
}

ResultCode CHelpPrjTree::LoadTree(LoadRun& run, const std::string& xml) {
    auto result = LoadDocument(run, xml);
    if (result != kSuccess)
        return result;
    Trace("CHelpPrjTree.Load(1): " + Now());
    document_ = run.document;
    if (run.rootElement) {
        const auto start = platform::Env().clock->Timer();
        result = BuildXmlNodes(run, 1, run.rootElement, nullptr);
        if (result != kSuccess)
            return result;
        run.buildTimeTotal = platform::Env().clock->Timer() - start;
        Trace("CHelpPrjTree.BuildXmlNodes(2): " + Now() +
              ", BuildTimeTotal = " + Seconds(run.buildTimeTotal - run.addControlsTimeTotal) +
              ", AddControlsTimeTotal = " + Seconds(run.addControlsTimeTotal));
    }
    // The piece of a copied subtree has no pages of its own to watch.
    if (xml.empty()) {
        checkSums_ = std::make_unique<CHelpPrjCheckSums>();
        InitCheckSums(run.path);
    }
    Trace("CHelpPrjTree.Load(2): " + Now());
    loaded_ = true;
    return kSuccess;
}

ResultCode CHelpPrjTree::LoadDocument(LoadRun& run, const std::string& xml) {
    CXMLFile file;
    const auto result = xml.empty() ? file.Load(run.path, *run.document) : file.LoadXml(xml, *run.document);
    if (result != kSuccess) {
        if (file.XmlParseError.errorCode != 0)
            UserWarningMessage(std::to_string(result) + " - " + file.XmlParseError.reason + run.path);
        return result;
    }
    run.rootElement =
        xml.empty() ? run.document->selectSingleNode("//Project") : run.document->documentElement();
    return kSuccess;
}

ResultCode CHelpPrjTree::BuildXmlNodes(LoadRun& run, std::int32_t level, const XmlNode& element,
                                       CHelpPrjTreeNode* parent) {
    if (level == 1)
        Trace("CHelpPrjTree.BuildXmlNodes(1): " + Now());
    auto built = std::make_unique<CHelpPrjTreeNode>();
    if (!built->Build(level, run.document, element)) {
        ShowMessage(std::string("Error while building treeview node.") + kCrLf +
                        "Treeview loading terminated.",
                    kMsgOk, kApplicationTitle);
        return kGeneralFailure;
    }
    auto* node = PlaceBuiltNode(level, parent, std::move(built));
    if (node == nullptr)
        return kSuccess;
    if (run.loadControls && IsObjectTag(node->Tag)) {
        if (StopRequested())
            return kGeneralFailure;
        auto& clock = *platform::Env().clock;
        const auto start = clock.Timer();
        auto controlLevel = level;
        AddControls(*node, controlLevel, run.external, run.path);
        run.addControlsTimeTotal += clock.Timer() - start;
    }
    for (auto child = element.firstChild(); child; child = child.nextSibling()) {
        if (!child.IsElement() || (!run.piece && run.LeavesOut(child.tagName())))
            continue;
        const auto result = BuildXmlNodes(run, level + 1, child, node);
        if (result != kSuccess)
            return result;
    }
    return kSuccess;
}

/// Null when the node's key couldn't be made unique; its subtree is left out with it.
CHelpPrjTreeNode* CHelpPrjTree::PlaceBuiltNode(std::int32_t level, CHelpPrjTreeNode* parent,
                                               std::unique_ptr<CHelpPrjTreeNode> node) {
    if (level > 1) {
        // The plain case of `addItem`, many thousand times in a load.
        auto& made = *node;
        made.HelpPrjTree = this;
        if (!map_.Add(&made, made.Key()))
            return addItem(parent, std::move(node), /*vfAutoUniqueKey=*/true, nullptr, nullptr,
                           /*vfAddChildNodesToMap=*/true);
        PlaceAmongSiblings(*parent, std::move(node), nullptr, nullptr, false, false);
        return &made;
    }
    Reset();
    root_ = std::move(node);
    root_->IsRootNode = true;
    AddToMap(*root_);
    return root_.get();
}

void CHelpPrjTree::SyncRootWithParameters() {
    auto* parameters = Session::Parameters();
    auto* settings = Session::Settings();
    if (root_ == nullptr || parameters == nullptr)
        return;
    const auto name = root_->Name();
    if (name.empty()) {
        root_->SetName(parameters->HelpProjectName());
    } else {
        if (settings != nullptr)
            settings->SetOptionValue("HelpProjectName", name);
        parameters->SetHelpProjectName(name);
    }
    const auto title = root_->HtmlTitle();
    if (title.empty()) {
        root_->SetHtmlTitle(parameters->HelpProjectTitle());
        return;
    }
    if (settings != nullptr)
        settings->SetOptionValue("HelpProjectTitle", title);
    parameters->SetHelpProjectTitle(title);
    if (auto* project = Session::CurrentProject())
        project->SetTitle(title);
}

std::string CHelpPrjTree::GetXMLStr(bool vfSkipSerializers, const std::string& vstrExtraAttrs) {
    ForgetSourceProject();
    if (root_ == nullptr)
        return {};
    return root_->XMLSTr(1, vfSkipSerializers, /*vfExtInfo=*/true, /*vfIncludeXMLHeader=*/false,
                         vstrExtraAttrs);
}

std::string CHelpPrjTree::ProjectFileText(bool skipSerializers, const std::string& extraAttrs) {
    std::string text = std::string(kXmlHeader) + kCrLf + "<TovimarProject>" + kCrLf +
                       GetXMLStr(skipSerializers, extraAttrs) + kCrLf;
    if (auto* settings = Session::Settings()) {
        // A project file never holds where it lies: it can be moved.
        KeyedList<std::string> fixedValues;
        fixedValues.Add("{Project Location}CHM", "FolderForGeneratedHelp");
        text += settings->XMLSTr(
            {"LastUsedFolderForGeneratedHelp", "LastUsedFolderForCapturedImages", "DefaultHtmlFullPath"},
            &fixedValues);
        text += kCrLf;
    }
    text += "</TovimarProject>";
    return text::ReplaceAll(text, "\r\n\r\n", kCrLf);
}

ResultCode CHelpPrjTree::SaveXml(const std::string& vstrXmlFileFullPath, bool vfSkipSerializers,
                                 const std::string& vstrExtraAttrs) {
    bool readOnly = false;
    return Trapped(
        "CHelpPrjTree", "SaveXml",
        [&] {
            ForgetSourceProject();
            SyncRootWithParameters();
            const auto text = ProjectFileText(vfSkipSerializers, vstrExtraAttrs);
            readOnly = ExistsAndReadOnly(vstrXmlFileFullPath);
            CXMLFile file;
            const auto result = file.SaveXml(vstrXmlFileFullPath, text, Durability::OnDisk);
            if (result == kSuccess)
                return;
            Trace(text);
            if (file.XmlParseError.errorCode != 0)
                throw RaisedError(kFailure1, std::to_string(result) + " - " + file.XmlParseError.reason,
                                  "SaveXML.CHelpPrjTree");
            throw RaisedError(kFailure2, "Error saving XML file " + vstrXmlFileFullPath,
                              "SaveXML.CHelpPrjTree");
        },
        [&] { return "XmlFile = " + vstrXmlFileFullPath + kCrLf + ReadOnlyDetail(readOnly); });
}

} // namespace tovimar
