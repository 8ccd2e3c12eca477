#include "host/sources/XmlSourceProject.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "host/sources/BuildProjectForms.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

namespace tovimar {

XmlSourceProject::XmlSourceProject(XmlProjectFormat format)
    : SourceProjectLists(format.className, format.kind), format_(std::move(format)) {}

bool XmlSourceProject::Read(const std::string& path) {
    return !HelpForFormsWanted() || ReadDocument(path);
}

bool XmlSourceProject::ReadDocument(const std::string& path) {
    XmlDocument document;
    CXMLFile file;
    if (file.Load(path, document) != kSuccess) {
        const CXmlParseError& error = file.XmlParseError;
        throw RaisedError(error.errorCode,
                          error.URL + ", line " + error.line + ", position " + error.linepos + ": " +
                              error.reason,
                          ClassName());
    }
    const std::string folder = platform::FolderOf(path);
    for (const char* element : format_.elements)
        if (const XmlNode found = document.selectSingleNode(element)) {
            ReadItems(found, folder);
            return true;
        }
    const XmlNode root = document.documentElement();
    if (!format_.readsBuildItems || root.baseName() != "Project")
        return false;
    ReadBuildItems(root, folder);
    return true;
}

void XmlSourceProject::ReadItems(const XmlNode& element, const std::string& folder) {
    for (const XmlNode& file : element.selectNodes(format_.items)) {
        auto item = std::make_unique<CHelpPrjSourceItem>();
        item->InitFromElement(Name(), folder, file);
        AddItem(std::move(item));
    }
}

void XmlSourceProject::ReadBuildItems(const XmlNode& project, const std::string& folder) {
    for (const BuildProjectForm& form : BuildProjectForms(project)) {
        auto item = std::make_unique<CHelpPrjSourceItem>();
        item->InitFromFile(Name(), folder, form.path, form.subType);
        item->BuildAction = form.buildAction;
        AddItem(std::move(item));
    }
}

bool XmlSourceProject::IsListed(CHelpPrjSourceItem& item) const {
    return IsFormSubType(item.SubType);
}

void XmlSourceProject::AddItem(std::unique_ptr<CHelpPrjSourceItem> item) {
    platform::FileSystem& files = *platform::Env().files;
    const std::string path = item->FileName;
    if (!IsListed(*item) || !(files.FileExists(path) || files.FileExists(DesignerTwinOf(path))))
        return;
    Trapped(ClassName(), "IHelpPrjSourceProject_Init", [&] { item->Parse(path, format_.kind); });
    if (IsUsableName("Source Form skipped ", item->FormName))
        Add(forms_, std::move(item));
}

} // namespace tovimar
