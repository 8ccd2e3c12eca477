#include "foundation/BackupFileName.h"
#include "foundation/CAddInProject.h"
#include "foundation/InputBox.h"
#include "foundation/NameEncoding.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/TreeEdit.h"
#include "project/WebHelpFiles.h"
#include "topics/clsHTMLFile.h"
#include "uimodel/DefinitionText.h"

/// Pages that the writer adds: new ones, and ones that exist.
namespace tovimar {
namespace {

std::string ProjectFolder() {
    const auto* project = Session::CurrentProject();
    return platform::WithTrailingBackslash(project == nullptr ? std::string() : project->Folder);
}

/// What the node of a page holds.
struct PageNode {
    std::string caption; ///< as an attribute's text
    std::string title;   ///< likewise
    std::string templateFile;
    std::string path;
    std::string css;
};

/// The key is the element's name, too.
std::string PageXml(const CHelpPrjTreeNode& parent, const PageNode& page) {
    const std::string key = "newNode" + CHelpPrjTreeNode::GeneratedKeySuffix() + "x";
    std::string xml = "<" + key + " Level=\"" + std::to_string(parent.Level + 1) + "\" Caption = \"" +
                      page.caption + "\" Title = \"" + page.title + "\" ";
    const auto add = [&](const char* name, const std::string& value) {
        if (!value.empty())
            definition::AppendPlain(xml, std::string(name) + " = \"", value);
    };
    add("TemplateHtmlFile", page.templateFile);
    add("GeneratedHtmlFIle", page.path);
    add("Charset", Session::Parameters()->Charset);
    add("CSSFullPath", page.css);
    add("icon", "document");
    add("Key", key);
    add("pkey", parent.Key());
    return xml + "/>";
}

/// That of a topic with the same page, else the file's name made readable.
std::string CaptionOf(const CHelpPrjTree& tree, const std::string& path) {
    const std::string name = platform::FileNameOf(path);
    for (const auto* node : tree.MapItems())
        if (text::EqualsIgnoringCase(node->GeneratedHTMLFile(), name) && node->Bookmark().empty())
            if (auto caption = node->Caption(); !caption.empty())
                return caption;
    return text::ReplaceAll(platform::BaseNameOf(path), "_", " ");
}

/// The page in the project's folder: one that lies elsewhere is copied there. A page of its name gets a
/// backup.
std::string InProjectFolder(const std::string& path) {
    const std::string folder = ProjectFolder();
    if (text::EqualsIgnoringCase(platform::WithTrailingBackslash(platform::FolderOf(path)), folder))
        return path;
    std::string copy = folder + platform::FileNameOf(path);
    BackUpFile(copy);
    platform::Env().files->CopyFile(path, copy);
    return copy;
}

class AddEdit : public TreeEdit {
public:
    const char* Name() const override { return "Add"; }
    bool Run(TreeEditRun& run) const override {
        if (run.node == nullptr || !run.parameter)
            return false;
        const std::string caption = CaptionOf(run.tree, *run.parameter);
        const std::string page = InProjectFolder(*run.parameter);
        AddWebHelpScriptToFile(page);
        run.AddNode(PageXml(
            *run.node,
            {definition::Escaped(caption), definition::Escaped(platform::BaseNameOf(page)), {}, page, {}}));
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override {
        UndoInsertion(run, done);
    }
};

class NewEdit : public TreeEdit {
public:
    const char* Name() const override { return "AddNew"; }
    bool Run(TreeEditRun& run) const override {
        if (run.node == nullptr)
            return false;
        std::string page;
        const std::string title = AskTitle(run.parameter.value_or(std::string()), page);
        if (title.empty())
            return false;
        WritePage(title, page);
        const std::string encoded = EncodeSpecialChars(title);
        run.AddNode(PageXml(*run.node, {encoded, encoded, platform::FileNameOf(DefaultTopicTemplate()), page,
                                        Session::Parameters()->CSSFullPath()}));
        if (run.answer != nullptr)
            *run.answer = title;
        return true;
    }
    void Undo(TreeEditRun& run, const CHelpPrjTreeOperation& done) const override {
        UndoInsertion(run, done);
    }

private:
    /// Until the title's page is free; empty when the user gives up.
    static std::string AskTitle(const std::string& defaultTitle, std::string& page) {
        for (;;) {
            std::string title =
                InputBox("Give topic title", kApplicationTitle, defaultTitle, "CHelpPrjTreeOperation.AddNew");
            if (title.empty())
                return title;
            page = ProjectFolder() + NormalizeName(title) + ".htm";
            if (!platform::Env().files->FileExists(page))
                return title;
            TreeEditRun::Tell("'" + title + "' - HTML page with this file name already exists.",
                              "CHelpPrjTreeOperation.AddNew");
        }
    }
    /// Before its node: a node without a page would be worse than a page without a node.
    static void WritePage(const std::string& title, const std::string& path) {
        clsHTMLFile page;
        page.LoadText(path, platform::Env().files->ReadFile(DefaultTopicTemplate()));
        page.Title = page.Caption = EncodeSpecialChars(title);
        page.Charset = Session::Parameters()->Charset;
        page.CSSFullPath = Session::Parameters()->CSSFullPath();
        AddWebHelpScript(page.HTML);
        if (const ResultCode result = page.Save(path); result != kSuccess)
            throw RaisedError(result, "The page '" + path + "' can't be written",
                              "CHelpPrjTreeOperation.AddNew");
    }
};

} // namespace

const TreeEdit* TopicEditOf(const std::string& opCode) {
    static const AddEdit add;
    static const NewEdit created;
    if (text::EqualsIgnoringCase(opCode, "Add"))
        return &add;
    return text::EqualsIgnoringCase(opCode, "New") ? &created : nullptr;
}

} // namespace tovimar
