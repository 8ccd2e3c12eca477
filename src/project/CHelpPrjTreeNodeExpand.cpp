#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/IClassFactory.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/contract/IXmlSerializer.h"
#include "host/server/CTovimarServerAgent.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

/// Placeholders and the object nodes that they stand for.
namespace tovimar {

namespace {

void Trace(const std::string& message) {
    Session::TraceLog()->addMessage(message);
}

const char* Word(bool value) {
    return value ? "True" : "False";
}

/// The elements of all fragments in one document, since every document takes a page of 32 KiB. Empty when one
/// of them is damaged; each is then read by itself.
std::pair<std::shared_ptr<XmlDocument>, std::vector<XmlNode>>
ReadTogether(const KeyedList<std::string>& fragments) {
    std::string all = "<Objects>";
    for (const auto& fragment : fragments)
        all += fragment;
    auto document = std::make_shared<XmlDocument>();
    if (CXMLFile().LoadXml(all + "</Objects>", *document) != kSuccess)
        return {};
    auto elements = document->documentElement().childElements();
    if (elements.size() != fragments.Count())
        return {};
    return {std::move(document), std::move(elements)};
}

} // namespace

void CHelpPrjTreeNode::ExpandSerializerNodes(IClassFactory& rIClassFactory, CHelpPrjTree& robjTree,
                                             IHelpPrjSourceProject* rprj) {
    Trapped("CHelpPrjTreeNode", "ExpandSerializerNodes", [&] {
        if (!HasSerializer()) {
            // Object nodes come in behind the children that stand here now; they hold no placeholders.
            const auto count = children_.Count();
            for (std::size_t i = 1; i <= count; ++i)
                children_.At(i)->ExpandSerializerNodes(rIClassFactory, robjTree, rprj);
            return;
        }
        const auto* project = Session::CurrentProject();
        const auto* parameters = Session::Parameters();
        const bool several = project != nullptr && project->HasSeveralSourceProjects;
        const bool group = parameters != nullptr && parameters->UseProjectGroupAsSource;
        Trace(std::string("HasSeveralSourceProjects = ") + Word(several) +
              ", UseProjectGroupAsSource = " + Word(group));
        std::unique_ptr<IXmlSerializer> serializer;
        rIClassFactory.CreateObject(Serializer(), serializer);
        SetSkipped(true);
        if (serializer == nullptr)
            return;
        if (several && group && Session::ServerAgent() != nullptr)
            ExpandProjectGroup(robjTree, *serializer);
        else
            ExpandSerializerNodes4CurrentProject(robjTree, rprj, *serializer);
    });
}

void CHelpPrjTreeNode::ExpandProjectGroup(CHelpPrjTree& tree, IXmlSerializer& serializer) {
    auto& agent = *Session::ServerAgent();
    auto& project = *Session::CurrentProject();
    project.RefreshSourceProjectsList();
    const std::string list = project.SourceProjectsList();
    Trace("SourceProjectsList = " + list);
    const auto remembered = agent.CurrentSourceProjectName();
    for (const auto& name : text::Split(list, "|")) {
        if (name.empty())
            continue;
        agent.SetCurrentSourceProject(name);
        tree.ForgetSourceProject();
        serializer.Reset();
        const auto source = agent.ParseSourceProject();
        const std::size_t before = Parent == nullptr ? 0 : Parent->children_.Count();
        ExpandSerializerNodes4CurrentProject(tree, source.get(), serializer);
        // Where several are open an object is looked for in its own.
        for (std::size_t i = before + 1; Parent != nullptr && i <= Parent->children_.Count(); ++i)
            if (auto& made = *Parent->children_.At(i); made.SourceProjectName().empty())
                made.SetSourceProjectName(name);
    }
    agent.SetCurrentSourceProject(remembered);
    tree.ForgetSourceProject();
}

void CHelpPrjTreeNode::ExpandSerializerNodes4CurrentProject(CHelpPrjTree& robjTree,
                                                            IHelpPrjSourceProject* rprj,
                                                            IXmlSerializer& rIXML) {
    if (rprj == nullptr || Parent == nullptr)
        return;
    const std::string projectName = robjTree.SourceProjectName();
    const auto fragments = rIXML.XmlCollection(robjTree, *rprj);
    const auto together = ReadTogether(fragments);
    const auto& document = together.first;
    const auto& elements = together.second;
    for (std::size_t i = 0; i < fragments.Count() && !StopRequested(); ++i)
        // One object that doesn't come through must not cost the others.
        Trapped("CHelpPrjTreeNode", "ExpandSerializerNodes4CurrentProject", [&] {
            const auto& fragment = fragments.At(i + 1);
            if (document != nullptr)
                AppendFragment(robjTree, fragment, document, elements[i], projectName);
            else
                ReadFragment(robjTree, fragment, projectName);
        });
}

void CHelpPrjTreeNode::ReadFragment(CHelpPrjTree& tree, const std::string& fragment,
                                    const std::string& projectName) {
    auto document = std::make_shared<XmlDocument>();
    CXMLFile file;
    const auto result = file.LoadXml(fragment, *document);
    if (result != kSuccess)
        throw RaisedError(result, file.XmlParseError.reason + " in " + text::Left(fragment, 200));
    AppendFragment(tree, fragment, document, document->documentElement(), projectName);
}

void CHelpPrjTreeNode::AppendFragment(CHelpPrjTree& tree, const std::string& fragment,
                                      const std::shared_ptr<XmlDocument>& document, const XmlNode& element,
                                      const std::string& projectName) {
    const auto traceHead = [&](const char* step) {
        return "ProjectName = " + projectName + ", ExpandSerializerNodes4CurrentProject(" + step + ") = ";
    };
    Trace(traceHead("1") + fragment);

    auto node = std::make_unique<CHelpPrjTreeNode>();
    node->Build(1, document, element);
    node->HelpPrjTree = &tree;
    if (auto* agent = Session::ServerAgent())
        agent->ProgressMeterInit("Expanding node [" + node->Caption() + "]...", 2);
    node->Level = Level;
    node->Parent = Parent;
    node->NewUIObject = true;
    const auto key = tree.GetNewKeyIfGivenExists(node->Key(), projectName);
    if (key.empty())
        return;
    node->SetKey(key);
    auto& placed = *node;
    Parent->children_.Add(std::move(node));
    tree.AddToMap(placed);
    tree.Index().Added(placed);
    if (Session::TraceLog()->IsOn())
        Trace(traceHead("2") + placed.XMLSTr(1, true, true, false, {}));
}

} // namespace tovimar
