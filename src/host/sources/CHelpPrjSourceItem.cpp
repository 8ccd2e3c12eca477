#include "host/sources/CHelpPrjSourceItem.h"

#include "host/contract/ObjectTypes.h"
#include "host/sources/SourceFileText.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/ComponentFileName.h"

#include <array>
#include <optional>
#include <string_view>

namespace tovimar {
namespace {

constexpr std::string_view kDesigner = ".Designer";

/// What stands in front of a form's name and text in a language's code.
struct Markers {
    const char* language;
    std::string_view name;
    std::string_view text;
    /// The class behind the form need not bear its name: the file's name counts.
    bool namedByFile;
};
constexpr std::array<Markers, 5> kMarkers{
    {{SourceProjectKind::kVBNet, "Me.Name = \"", "Me.Text = \"", false},
     {SourceProjectKind::kCSharp, "this.Name = \"", "this.Text = \"", false},
     {SourceProjectKind::kJSharp, "this.set_Name(\"", "this.set_Text(\"", false},
     {SourceProjectKind::kCpp, "this->Name = S\"", "this->Text = S\"", true},
     // Pages tell neither.
     {SourceProjectKind::kAspNet, "NEVERUSEDNAMEPREF", "NEVERUSEDTEXTPREF", false}}};

const Markers* MarkersOf(const std::string& language) {
    for (const Markers& markers : kMarkers)
        if (text::EqualsIgnoringCase(markers.language, language))
            return &markers;
    return nullptr;
}

/// From behind the first marker that begins a statement up to the next double quote.
std::optional<std::string> ValueBehind(std::string_view source, std::string_view marker) {
    constexpr std::string_view kBefore = " \t\n\r;";
    for (auto hit = source.find(marker); hit != std::string_view::npos;
         hit = source.find(marker, hit + marker.size())) {
        if (hit == 0 || kBefore.find(source[hit - 1]) == std::string_view::npos)
            continue;
        const auto start = hit + marker.size();
        const auto end = source.find('"', start);
        if (end == std::string_view::npos)
            return std::nullopt;
        return std::string(source.substr(start, end - start));
    }
    return std::nullopt;
}

/// "Form1" of "C:\P\Form1.Designer.cs" and of "C:\P\Form1.cs".
std::string FormNameOfFile(const std::string& path) {
    const std::string base = platform::BaseNameOf(path);
    return text::EndsWithIgnoringCase(base, kDesigner) ? base.substr(0, base.size() - kDesigner.size())
                                                       : base;
}

std::string FirstOf(const XmlNode& element, const char* name, const char* otherName) {
    const auto value = element.getAttribute(name);
    return value ? *value : element.attribute(otherName);
}

/// File types by number: forms and controls of a header file.
std::string SubTypeOf(const std::string& fileType) {
    if (fileType == "3")
        return "Form";
    return fileType == "4" ? "UserControl" : fileType;
}

} // namespace

std::string DesignerTwinOf(const std::string& path) {
    const std::string name = FormNameOfFile(path);
    const bool isDesigner = name != platform::BaseNameOf(path);
    return platform::FolderOf(path) + name + std::string(isDesigner ? std::string_view() : kDesigner) +
           platform::ExtensionOf(path);
}

void CHelpPrjSourceItem::InitFromElement(const std::string& vstrProjectName,
                                         const std::string& vstrProjectFolder, const XmlNode& element) {
    Link = element.attribute("Link");
    BuildAction = element.attribute("BuildAction");
    InitFromFile(vstrProjectName, vstrProjectFolder, FirstOf(element, "RelativePath", "RelPath"),
                 SubTypeOf(FirstOf(element, "FileType", "SubType")));
}

void CHelpPrjSourceItem::InitFromFile(const std::string& vstrProjectName,
                                      const std::string& vstrProjectFolder,
                                      const std::string& vstrRelativePath, const std::string& vstrSubType) {
    IsVSProjectItem = true;
    RelativePath = vstrRelativePath;
    InitFromTextProject(vstrProjectName,
                        SourceFilePath(vstrProjectFolder, Link.empty() ? vstrRelativePath : Link), {}, {},
                        vstrSubType);
    FormName = FormNameOfFile(FileName);
    FormCaption = FormName;
}

void CHelpPrjSourceItem::InitFromTextProject(const std::string& vstrProjectName,
                                             const std::string& vstrFileFullPath,
                                             const std::string& vstrFormName,
                                             const std::string& vstrFormCaption,
                                             const std::string& vstrSubType) {
    FileName = vstrFileFullPath;
    InitFromHost(vstrProjectName, vstrFormName, vstrFormCaption, vstrSubType);
}

void CHelpPrjSourceItem::InitFromHost(const std::string& vstrProjectName, const std::string& vstrFormName,
                                      const std::string& vstrFormCaption, const std::string& vstrSubType) {
    ProjectName = vstrProjectName;
    FormName = vstrFormName;
    FormCaption = vstrFormCaption;
    SubType = vstrSubType;
}

void CHelpPrjSourceItem::Terminate() {
    *this = {};
}

void CHelpPrjSourceItem::Parse(const std::string& vstrFileFullPath,
                               const std::string& vstrProgrammingLanguage, bool vfParseDesignerFile) {
    FormName = FormNameOfFile(vstrFileFullPath);
    FormCaption = FormName;
    const Markers* markers = MarkersOf(vstrProgrammingLanguage);
    std::string source;
    if (markers != nullptr && platform::Env().files->FileExists(vstrFileFullPath))
        source = ReadSourceFile(vstrFileFullPath);
    const auto name = markers == nullptr ? std::nullopt : ValueBehind(source, markers->name);
    const auto caption = markers == nullptr ? std::nullopt : ValueBehind(source, markers->text);
    if (!name && !caption && vfParseDesignerFile) {
        CHelpPrjSourceItem twin;
        twin.Parse(DesignerTwinOf(vstrFileFullPath), vstrProgrammingLanguage, /*vfParseDesignerFile=*/false);
        FormName = twin.FormName;
        FormCaption = twin.FormCaption;
        return;
    }
    if (name && !name->empty() && !markers->namedByFile)
        FormName = *name;
    if (caption)
        FormCaption = *caption;
}

std::int32_t CHelpPrjSourceItem::ObjType() const {
    return ObjectTypeOfText(SubType);
}

std::string CHelpPrjSourceItem::FormNameNormalized() const {
    return GetComponentFileName(FormName);
}

} // namespace tovimar
