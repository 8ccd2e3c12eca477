#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/SitemapText.h"
#include "uimodel/CXmlForm.h"

/// Files of a node and the look-ups by them.
namespace tovimar {

namespace {

std::string CurrentFolder() {
    const auto* project = Session::CurrentProject();
    return project == nullptr ? std::string() : project->Folder;
}

} // namespace

std::string CHelpPrjTreeNode::TemplateAttribute() const {
    for (const auto property : {NodeProperty::TemplateHtmlFile, NodeProperty::Html, NodeProperty::Htm})
        if (auto value = PropertyValue(property); !value.empty())
            return value;
    return {};
}

std::string CHelpPrjTreeNode::TemplateHtmlFile() const {
    if (!templateFileKnown_) {
        templateFile_ = TemplateAttribute();
        templateFileKnown_ = true;
    }
    return templateFile_;
}

void CHelpPrjTreeNode::SetTemplateHtmlFile(const std::string& value) {
    if (terminated_)
        return;
    templateFile_ = value;
    templateFileKnown_ = true;
}

std::string CHelpPrjTreeNode::TemplateHtmlFileNameExtOnly() const {
    return platform::FileNameOf(TemplateHtmlFile());
}

std::string CHelpPrjTreeNode::TemplateHtmlFileFullPath() const {
    const auto file = TemplateHtmlFile();
    if (file.empty() || platform::HasDrive(file))
        return file;
    return FindTemplate(file);
}

std::string CHelpPrjTreeNode::GeneratedAttribute() const {
    auto value = PropertyValue(NodeProperty::GeneratedHtmlFile);
    return value.empty() ? PropertyValue(NodeProperty::GenHtml) : value;
}

std::string CHelpPrjTreeNode::GeneratedHTMLFile() const {
    if (!generatedFileKnown_) {
        generatedFile_ = platform::FileNameOf(GeneratedAttribute());
        generatedFileKnown_ = true;
    }
    return generatedFile_;
}

void CHelpPrjTreeNode::SetGeneratedHTMLFile(const std::string& value) {
    if (terminated_)
        return;
    auto* index =
        HelpPrjTree != nullptr && HelpPrjTree->MapItem(Key()) == this ? &HelpPrjTree->Index() : nullptr;
    if (index != nullptr)
        index->FileNameGoes(*this);
    generatedFile_ = platform::FileNameOf(value);
    generatedFileKnown_ = true;
    if (index != nullptr)
        index->FileNameComes(*this);
}

std::string CHelpPrjTreeNode::GeneratedHTMLFileFullPath() const {
    const auto file = GeneratedHTMLFile();
    return file.empty() ? file : platform::Join(CurrentFolder(), file);
}

std::string CHelpPrjTreeNode::HTMLFileNameNoExt() const {
    return platform::BaseNameOf(GeneratedHTMLFile());
}
std::string CHelpPrjTreeNode::XmlFormFileName() const {
    return HTMLFileNameNoExt() + ".xml";
}

std::string CHelpPrjTreeNode::XmlFormFullPath() const {
    const auto* project = Session::CurrentProject();
    return platform::Join(project == nullptr ? std::string() : project->XmlFormsFolder(), XmlFormFileName());
}

std::string CHelpPrjTreeNode::ContentsText() const {
    if (IdentifiedByName()) {
        auto name = Name();
        if (!name.empty())
            return name;
    }
    return Caption();
}

std::string CHelpPrjTreeNode::HTMLFileRef(bool vfBold) const {
    const auto text = text::ReplaceAll(IdentifiedByName() ? Name() : Caption(), "&", "");
    return "<a href=\"" + GeneratedHTMLFile() + "\">" + (vfBold ? "<B>" + text + "</B>" : text) + "</a>";
}

std::shared_ptr<CXmlForm> CHelpPrjTreeNode::LoadXmlForm() const {
    std::shared_ptr<CXmlForm> form;
    Trapped("CHelpPrjTreeNode", "LoadXmlForm", [&] {
        if (NodeComponentTypeName().empty())
            return;
        DefinitionCache alone;
        auto& cache = HelpPrjTree != nullptr ? HelpPrjTree->Definitions() : alone;
        form = cache.Load(XmlFormFullPath());
    });
    return form;
}

void CHelpPrjTreeNode::SaveXmlForm(CXmlForm& rfrm) const {
    Trapped("CHelpPrjTreeNode", "SaveXmlForm", [&] {
        if (ObjectType() != 2 && ObjectType() != 3)
            throw RaisedError(kFailure1, "Xml form is not defined for this object type",
                              "CHelpPrjTreeNode.SaveXmlForm");
        const auto* project = Session::CurrentProject();
        rfrm.SaveXml(project == nullptr ? std::string() : project->XmlFormsFolder());
    });
}

bool CHelpPrjTreeNode::NodeFileNameDefined(const std::string& vstrFileNameToCheck) const {
    const auto name = platform::FileNameOf(vstrFileNameToCheck);
    if (HelpPrjTree != nullptr && HelpPrjTree->Root() == this) {
        const std::size_t own = text::EqualsIgnoringCase(GeneratedHTMLFile(), name) ? 1 : 0;
        return HelpPrjTree->Index().FilesNamed(*this, name) > own;
    }
    for (const auto& child : children_)
        if (text::EqualsIgnoringCase(child->GeneratedHTMLFile(), name) || child->NodeFileNameDefined(name))
            return true;
    return false;
}

bool CHelpPrjTreeNode::HtmlFileNameIsUsed(const std::string& vstrHTMLFileNameNoExt) const {
    if (HelpPrjTree != nullptr && HelpPrjTree->Root() == this)
        return HelpPrjTree->Index().BaseNamesNamed(*this, vstrHTMLFileNameNoExt) > 0;
    if (text::EqualsIgnoringCase(HTMLFileNameNoExt(), vstrHTMLFileNameNoExt))
        return true;
    for (const auto& child : children_)
        if (child->HtmlFileNameIsUsed(vstrHTMLFileNameNoExt))
            return true;
    return false;
}

const CHelpPrjTreeNode* CHelpPrjTreeNode::FindByNameAndTag(const std::string& name, const std::string& tag,
                                                           bool needsFile) const {
    if (HelpPrjTree != nullptr && HelpPrjTree->Root() == this)
        return HelpPrjTree->Index().ByNameAndTag(*this, name, tag, needsFile);
    if (text::EqualsIgnoringCase(Name(), name) && text::EqualsIgnoringCase(Tag, tag) &&
        !(needsFile && GeneratedHTMLFile().empty()))
        return this;
    for (const auto& child : children_)
        if (const auto* found = child->FindByNameAndTag(name, tag, needsFile))
            return found;
    return nullptr;
}

std::string CHelpPrjTreeNode::GetNodeHtmlRef(const std::string& vstrObjName,
                                             const std::string& vstrObjTypeName) const {
    const auto* found = FindByNameAndTag(vstrObjName, vstrObjTypeName, /*needsFile=*/false);
    return found == nullptr ? std::string() : found->HTMLFileRef(/*vfBold=*/false);
}

std::string CHelpPrjTreeNode::GetNodeHtmlFileNameNoExt(const std::string& vstrObjName,
                                                       const std::string& vstrObjTypeName) const {
    const auto* found = FindByNameAndTag(vstrObjName, vstrObjTypeName, /*needsFile=*/true);
    return found == nullptr ? std::string() : found->HTMLFileNameNoExt();
}

void CHelpPrjTreeNode::GetHtmlFilesCollection(KeyedList<std::string>& rcol) const {
    const auto path = GeneratedHTMLFileFullPath();
    if (!path.empty() && !rcol.Contains(path))
        rcol.Add(path, path);
    for (const auto& child : children_)
        child->GetHtmlFilesCollection(rcol);
}

} // namespace tovimar
