#include "host/sources/BuildProjectForms.h"

#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <unordered_map>

namespace tovimar {
namespace {

// Whatever prefix the file's namespace has.
constexpr const char* kItems = "*[local-name()='ItemGroup']/*[@Include]";

struct Entry {
    BuildProjectForm file;
    std::string owner; ///< path of the file that it depends on, empty without one
};

std::string ChildText(const XmlNode& node, std::string_view name) {
    for (const XmlNode& child : node.childElements())
        if (child.baseName() == name)
            return text::TrimWhitespace(child.text());
    return {};
}

/// What depends on a source file is a part of the form there; what depends on a resource or a page isn't.
std::string OwnerOf(const XmlNode& element, const std::string& path) {
    const std::string owner = ChildText(element, "DependentUpon");
    const bool isSource = text::EqualsIgnoringCase(platform::ExtensionOf(owner), platform::ExtensionOf(path));
    return isSource ? platform::FolderOf(path) + owner : std::string();
}

std::vector<Entry> EntriesOf(const XmlNode& project) {
    std::vector<Entry> entries;
    for (const XmlNode& element : project.selectNodes(kItems)) {
        const std::string action = element.baseName();
        if (action != "Compile" && action != "Content")
            continue;
        const std::string path = element.attribute("Include");
        const std::string subType = action == "Compile" ? ChildText(element, "SubType") : std::string();
        entries.push_back({{path, subType, action}, OwnerOf(element, path)});
    }
    return entries;
}

/// The project's entries, looked up by path without regard to case.
class Parts {
public:
    explicit Parts(const std::vector<Entry>& entries) {
        for (const Entry& entry : entries)
            if (entry.owner.empty())
                owners_.emplace(text::FoldCase(entry.file.path), &entry);
        for (const Entry& entry : entries)
            if (!entry.owner.empty() && IsDesigner(entry))
                designers_.emplace(text::FoldCase(entry.owner), &entry);
    }

    /// The designer's file that stands for a form of its own file and other parts; null for none.
    const Entry* DesignerOf(const std::string& path) const { return Find(designers_, path); }

    /// Told by the form's own file where the project has it and that says what it is.
    std::string SubTypeOf(const Entry& designer) const {
        const Entry* owner = Find(owners_, designer.owner);
        const std::string& told = owner == nullptr ? designer.file.subType : owner->file.subType;
        return told.empty() ? "Form" : told;
    }

private:
    using Index = std::unordered_map<std::string, const Entry*>;

    static const Entry* Find(const Index& index, const std::string& path) {
        const auto found = index.find(text::FoldCase(path));
        return found == index.end() ? nullptr : found->second;
    }

    /// A form may have parts beside the designer's; a part without the form's own file can only be that.
    bool IsDesigner(const Entry& part) const {
        return text::ContainsIgnoringCase(part.file.path, ".Designer") ||
               Find(owners_, part.owner) == nullptr;
    }

    Index owners_;
    Index designers_;
};

} // namespace

bool IsFormSubType(const std::string& subType) {
    return text::EqualsIgnoringCase(subType, "Form") || text::EqualsIgnoringCase(subType, "UserControl");
}

std::vector<BuildProjectForm> BuildProjectForms(const XmlNode& project) {
    const std::vector<Entry> entries = EntriesOf(project);
    const Parts parts(entries);
    std::vector<BuildProjectForm> forms;
    for (const Entry& entry : entries) {
        BuildProjectForm form = entry.file;
        const bool isPart = !entry.owner.empty();
        const Entry* designer = parts.DesignerOf(isPart ? entry.owner : form.path);
        if (isPart ? designer != &entry : designer != nullptr)
            continue;
        if (isPart)
            form.subType = parts.SubTypeOf(entry);
        if (IsFormSubType(form.subType) || form.buildAction == "Content")
            forms.push_back(std::move(form));
    }
    return forms;
}

} // namespace tovimar
