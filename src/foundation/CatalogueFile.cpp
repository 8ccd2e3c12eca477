#include "foundation/CAddInProjects.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <algorithm>

/// Reading and writing the catalogue's file.
namespace tovimar {
namespace {

constexpr const char* kClass = "CAddInProjects";
constexpr const char* kEmptyCatalogue = "<Projects>\r\n</Projects>";

std::string ProjectLine(const CAddInProject& project) {
    return "    <Project Name = \"" + EncodeSpecialChars(project.Name) + "\" FileName = \"" +
           EncodeSpecialChars(project.FileName) + "\" Folder = \"" + EncodeSpecialChars(project.Folder) +
           "\" SourceProjectFullPath = \"" + EncodeSpecialChars(project.SourceProjectFullPath) +
           "\" SUID = \"" + project.SUID + "\" HUID = \"" + project.HUID + "\" />\r\n";
}

/// Loads the catalogue, and its backup in its place when it is broken.
void LoadOrRepair(const std::string& path, XmlDocument& document) {
    auto& files = *platform::Env().files;
    CXMLFile file;
    if (file.Load(path, document) == 0)
        return;
    if (files.FileExists(path + ".bak")) {
        files.CopyFile(path + ".bak", path);
        if (file.Load(path, document) == 0)
            return;
    }
    throw RaisedError(kFailure2, "XML Projects file parse error [" + path + "]", "CAddInProjects.Init");
}

std::string EitherAttribute(const XmlNode& element, const char* lower, const char* upper) {
    const std::string value = element.attribute(lower);
    return value.empty() ? element.attribute(upper) : value;
}

/// An identifier is written as it is, so one that holds a mark of the file's form would break the file.
std::string IdentifierOf(const XmlNode& element, const char* name) {
    std::string identifier = element.attribute(name);
    const auto breaksTheFile = [](char byte) {
        return static_cast<unsigned char>(byte) < ' ' || byte == '"' || byte == '<' || byte == '&';
    };
    if (std::any_of(identifier.begin(), identifier.end(), breaksTheFile))
        identifier.clear();
    return identifier;
}

std::unique_ptr<CAddInProject> ProjectOf(const XmlNode& element) {
    auto project = std::make_unique<CAddInProject>();
    project->Name = EitherAttribute(element, "name", "Name");
    project->FileName = element.attribute("FileName");
    project->Folder = element.attribute("Folder");
    project->SourceProjectFullPath = element.attribute("SourceProjectFullPath");
    project->SUID = IdentifierOf(element, "SUID");
    project->HUID = IdentifierOf(element, "HUID");
    project->IsNew = false;
    return project;
}

std::string KeyOf(const CAddInProject& project) {
    return text::FoldCase(project.TvpFullPath());
}

/// Title and pictures folder stand in the project's own file.
void ReadProjectFile(CAddInProject& project, const std::string& path) {
    XmlDocument document;
    if (CXMLFile().Load(path, document) != 0)
        throw RaisedError(kFailure3,
                          "XML project file parse error [" + path +
                              "]\r\nThis project will be removed from the list of available projects.",
                          "CAddInProjects.Init");
    project.SetTitle(document.selectSingleNode("//Project").attribute("title"));
    const XmlNode option =
        document.selectSingleNode("//Settings/Options/Option[@Name=\"SubFolderForScreenshots\"]");
    if (option)
        project.PicsSubfolderName = option.attribute("Value");
}

} // namespace

ResultCode CAddInProjects::Init(const std::string& vstrProjectsDefFullPath) {
    if (loading_)
        return kSuccess;
    loading_ = true;
    path_ = vstrProjectsDefFullPath;
    const ResultCode result = Trapped(kClass, "Init", [&] { ReadCatalogue(); });
    loading_ = false;
    return result;
}

void CAddInProjects::ReadCatalogue() {
    auto& files = *platform::Env().files;
    if (!path_.empty() && !files.FileExists(path_)) {
        files.MakeFolders(platform::FolderOf(path_));
        CXMLFile().SaveXml(path_, kEmptyCatalogue);
    }
    if (path_.empty() || !files.FileExists(path_)) {
        ShowMessage(path_.empty() ? "Projects definitions XML file is not defined."
                                  : "Can't find project definitions XML file '" + path_ + "'",
                    kMsgCritical, kApplicationTitle, {}, 0, "CAddInProjects.Init");
        return;
    }
    XmlDocument document;
    LoadOrRepair(path_, document);
    const XmlNode projects = document.selectSingleNode("//Projects");
    if (!projects)
        throw RaisedError(kFailure1, "XML Projects file parse error [" + path_ + "]", "CAddInProjects.Init");
    for (const XmlNode& element : projects.childElements())
        ReadProject(element);
    NoteListed(projects);
    loaded_ = true;
}

void CAddInProjects::ReadProject(const XmlNode& element) {
    auto project = ProjectOf(element);
    try {
        const std::string path = project->TvpFullPath();
        if (!path.empty() && !platform::Env().files->FileExists(path))
            project->Name.clear();
        else if (!path.empty())
            ReadProjectFile(*project, path);
        if (!project->Name.empty())
            Add(std::move(project));
    } catch (const RaisedError& error) {
        UserWarningMessage(error.what());
    }
}

void CAddInProjects::NoteListed(const XmlNode& projects) {
    listed_.clear();
    for (const XmlNode& element : projects.childElements())
        listed_.insert(KeyOf(*ProjectOf(element)));
}

ResultCode CAddInProjects::SaveCurrentProject(const std::string& vstrFullPath2Save) {
    const bool ownFile = vstrFullPath2Save.empty() && current_ != nullptr;
    return Save(ownFile ? current_->TvpFullPath() : vstrFullPath2Save);
}

ResultCode CAddInProjects::Save(const std::string& vstrProjectTreeFullPathToSave) {
    ResultCode tree = kSuccess;
    ResultCode catalogue = kSuccess;
    const ResultCode trapped = Trapped(
        kClass, "Save",
        [&] {
            Projects();
            if (!vstrProjectTreeFullPathToSave.empty())
                tree = SaveTree(vstrProjectTreeFullPathToSave);
            catalogue = SaveCatalogue();
        },
        [&] { return "File = " + path_; });
    return tree != kSuccess ? tree : trapped != kSuccess ? trapped : catalogue;
}

ResultCode CAddInProjects::SaveTree(const std::string& path) {
    std::string attributes;
    if (current_ != nullptr)
        attributes = "Name = \"" + EncodeSpecialChars(current_->Name) + "\" SUID = \"" + current_->SUID +
                     "\" HUID = \"" + current_->HUID + "\" ";
    return Session::Context().SaveTree(path, attributes,
                                       current_ != nullptr ? current_->PicsSubfolderName : std::string());
}

ResultCode CAddInProjects::SaveCatalogue() {
    const auto lock = platform::Env().files->LockFolder(platform::FolderOf(path_));
    TakeOverChanges();
    std::string text = "<Projects>\r\n";
    std::set<std::string> written;
    for (const auto& project : list_) {
        if (project->TvpFullPath().empty())
            continue;
        if (project->Title().empty())
            project->SetTitle(Session::Context().HelpProjectTitle());
        text += ProjectLine(*project);
        project->IsNew = false;
        written.insert(KeyOf(*project));
    }
    const ResultCode result = WriteCatalogue(text + "</Projects>");
    if (result == kSuccess)
        listed_ = std::move(written);
    return result;
}

/// The file may have been written by another process since: what it listed comes in, what it forgot goes.
void CAddInProjects::TakeOverChanges() {
    XmlDocument document;
    if (!platform::Env().files->FileExists(path_) || CXMLFile().Load(path_, document) != 0)
        return;
    std::set<std::string> inFile;
    for (const XmlNode& element : document.selectSingleNode("//Projects").childElements()) {
        const std::string key = KeyOf(*ProjectOf(element));
        inFile.insert(key);
        if (!listed_.contains(key))
            ReadProject(element);
    }
    for (std::size_t i = list_.Count(); i > 0; --i) {
        const std::string key = KeyOf(*list_.At(i));
        if (list_.At(i).get() != current_ && listed_.contains(key) && !inFile.contains(key))
            Remove(i);
    }
}

ResultCode CAddInProjects::WriteCatalogue(const std::string& text) {
    auto& environment = platform::Env();
    auto& files = *environment.files;
    const bool hadFile = files.FileExists(path_);
    if (hadFile)
        files.CopyFile(path_, path_ + ".bak");
    CXMLFile file;
    const ResultCode result = file.SaveXml(path_, text, Durability::OnDisk);
    environment.doEvents();
    XmlDocument document;
    const ResultCode unreadable = file.Load(path_, document);
    if (unreadable != kSuccess && hadFile)
        files.CopyFile(path_ + ".bak", path_);
    return result != kSuccess ? result : unreadable;
}

} // namespace tovimar
