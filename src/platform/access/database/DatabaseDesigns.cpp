#include "platform/access/database/DatabaseDesigns.h"

#include "platform/Error.h"
#include "platform/access/database/BlobTree.h"
#include "platform/access/database/MacroGrid.h"
#include "platform/text/Text.h"

#include <array>
#include <utility>

namespace tovimar::platform::access {

namespace {

constexpr auto kContainers = std::to_array<std::pair<ObjectKind, std::string_view>>(
    {{ObjectKind::Form, "Forms"}, {ObjectKind::Report, "Reports"}, {ObjectKind::Macro, "Scripts"}});

} // namespace

const Storage& DatabaseDesigns::Kept() {
    if (stored_)
        return stored_->tree;
    stored_ = ReadStorage(nativePath_);
    const auto& tree = stored_->tree;
    for (const auto& [kind, container] : kContainers) {
        const auto* folder = tree.Find({container});
        const auto* names = folder != nullptr ? tree.Child(*folder, "\x03"
                                                                    "DirData")
                                              : nullptr;
        if (names == nullptr)
            continue;
        for (const auto& [name, number] : ReadFolderNames(names->bytes)) {
            const auto* object = tree.Child(*folder, std::to_string(number));
            if (object == nullptr || name.starts_with("~TMPCLP"))
                continue;
            if (folders_[kind].emplace(text::FoldCase(name), object).second)
                names_[kind].push_back(name);
        }
    }
    return tree;
}

std::vector<std::string> DatabaseDesigns::Names(ObjectKind kind) {
    Kept();
    if (kind != ObjectKind::Module)
        return names_[kind];
    std::vector<std::string> names;
    for (const auto& module : Code().modules)
        if (!module.name.starts_with("Form_") && !module.name.starts_with("Report_"))
            names.push_back(module.name);
    return names;
}

bool DatabaseDesigns::Has(ObjectKind kind, const std::string& name) {
    try {
        return kind == ObjectKind::Module ? ModuleCode(name).has_value() : !Blob(kind, name).empty();
    } catch (const RaisedError&) {
        return false; // opening the object tells why
    }
}

const StorageNode* DatabaseDesigns::Folder(ObjectKind kind, const std::string& name) {
    Kept();
    const auto& folders = folders_[kind];
    const auto found = folders.find(text::FoldCase(name));
    return found == folders.end() ? nullptr : found->second;
}

std::string_view DatabaseDesigns::Stream(ObjectKind kind, const std::string& name, std::string_view stream) {
    const auto* folder = Folder(kind, name);
    const auto* node = folder != nullptr ? Kept().Child(*folder, stream) : nullptr;
    return node != nullptr ? std::string_view(node->bytes) : std::string_view();
}

std::string_view DatabaseDesigns::Blob(ObjectKind kind, const std::string& name) {
    return Stream(kind, name, "Blob");
}
std::string_view DatabaseDesigns::MemberBytes(ObjectKind kind, const std::string& name) {
    return Stream(kind, name, "TypeInfo");
}
std::string_view DatabaseDesigns::Delta(ObjectKind kind, const std::string& name) {
    return Stream(kind, name, "BlobDelta");
}

void DatabaseDesigns::Fail(ObjectKind kind, const std::string& name, const std::string& reason) const {
    throw RaisedError(kFailure1, nativePath_ + ", " + KindWord(kind) + " " + name + ": " + reason,
                      "DatabaseReader");
}

ExportTree DatabaseDesigns::Tree(ObjectKind kind, const std::string& name) {
    if (Kept().IsEmpty())
        Fail(kind, name,
             "the database is of 1997 or older, which keeps designs in a form that can't be read.");
    const auto blob = Blob(kind, name);
    if (blob.empty())
        Fail(kind, name, "its design isn't in the database.");
    ExportTree tree;
    try {
        if (kind == ObjectKind::Macro) {
            tree.root = MacroBlocks(ReadMacroGrid(blob));
            return tree;
        }
        auto design = ReadDesignBlob(blob);
        if (const auto delta = Delta(kind, name); !delta.empty())
            MergeDelta(design, delta);
        tree.root = BlobBlocks(design);
    } catch (const RaisedError& failure) {
        Fail(kind, name, failure.what());
    }
    tree.code = ModuleCode((kind == ObjectKind::Form ? "Form_" : "Report_") + name).value_or("");
    return tree;
}

std::string DatabaseDesigns::Picture(const std::string& name) {
    Kept();
    for (const auto& resource : stored_->resources)
        if (resource.type == "img" && text::EqualsIgnoringCase(resource.name, name))
            return resource.bytes;
    return {};
}

std::string DatabaseDesigns::Theme() {
    Kept();
    const StoredResource* theme = nullptr;
    for (const auto& resource : stored_->resources)
        if (resource.type == "thmx" && (theme == nullptr || resource.name == stored_->themeName))
            theme = &resource;
    return theme != nullptr ? theme->bytes : std::string();
}

const VbaProject& DatabaseDesigns::Code() {
    if (!code_)
        code_ = ReadVbaProject(Kept());
    return *code_;
}

std::optional<std::string> DatabaseDesigns::ModuleCode(const std::string& name) {
    for (const auto& module : Code().modules)
        if (text::EqualsIgnoringCase(module.name, name))
            return module.source;
    return std::nullopt;
}

} // namespace tovimar::platform::access
