#include "platform/access/ApplicationModel.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ExportReader.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/TableReader.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

std::string Native(const std::string& path) {
    return Env().files->ToNative(path);
}

std::string ReadText(const std::string& path) {
    return DecodeExportText(Env().files->ReadFile(path));
}

std::size_t IndexOf(ObjectKind kind) {
    return static_cast<std::size_t>(kind);
}

/// A read design takes about ten times its text.
constexpr std::size_t kKeptDesignBytes = 8U << 20U;

template <typename Visit> void ForEachNamed(const DesignObject& root, const Visit& visit) {
    std::vector<const DesignObject*> open{&root};
    while (!open.empty()) {
        const DesignObject& object = *open.back();
        open.pop_back();
        if (!object.name.empty())
            visit(object);
        for (const auto& child : object.children)
            open.push_back(child.get());
    }
}

} // namespace

ApplicationModel::ApplicationModel(const std::string& nativePath) {
    auto& files = *Env().files;
    const auto path = WithoutTrailingBackslash(files.FromNative(nativePath));
    if (files.FolderExists(path) || files.FolderExists(path + "\\"))
        OpenFolder(path);
    else if (files.FileExists(path))
        OpenDatabaseFile(path);
    else
        throw RaisedError(kFailure1, "No Access application found in " + nativePath + ".",
                          "AccessApplication");
    SortNames();
    const bool found =
        std::any_of(std::begin(names_), std::end(names_), [](const auto& names) { return !names.empty(); });
    if (!found)
        throw RaisedError(kFailure1, "No Access application found in " + nativePath + ".",
                          "AccessApplication");
}

ApplicationModel::~ApplicationModel() = default;

void ApplicationModel::SortNames() {
    for (const auto kind : {ObjectKind::Form, ObjectKind::Report, ObjectKind::Macro, ObjectKind::Module})
        for (const auto& object : ListOf(kind))
            names_[IndexOf(kind)].push_back(object->name);
    for (const auto& table : tables_)
        names_[IndexOf(ObjectKind::Table)].push_back(table->definition.name);
    for (const auto& query : queries_)
        names_[IndexOf(ObjectKind::Query)].push_back(query->definition.name);
    for (auto& names : names_)
        std::sort(names.begin(), names.end(), [](const std::string& left, const std::string& right) {
            const int order = text::CompareIgnoringCase(left, right);
            return order != 0 ? order < 0 : left < right;
        });
}

ApplicationModel::Objects& ApplicationModel::ListOf(ObjectKind kind) {
    switch (kind) {
    case ObjectKind::Form:
        return forms_;
    case ObjectKind::Report:
        return reports_;
    case ObjectKind::Macro:
        return macros_;
    default:
        return modules_;
    }
}

const std::vector<std::string>& ApplicationModel::Names(ObjectKind kind) const {
    return names_[IndexOf(kind)];
}

bool ApplicationModel::Contains(ObjectKind kind, const std::string& name) const {
    auto& self = const_cast<ApplicationModel&>(*this);
    if (kind == ObjectKind::Table)
        return tables_.Contains(name);
    if (kind == ObjectKind::Query)
        return queries_.Contains(name);
    return self.ListOf(kind).Contains(name);
}

std::string ApplicationModel::NameOf(ObjectKind kind, const std::string& name) const {
    auto& self = const_cast<ApplicationModel&>(*this);
    if (kind == ObjectKind::Table) {
        const auto* table = tables_.Find(name);
        return table ? (*table)->definition.name : name;
    }
    if (kind == ObjectKind::Query) {
        const auto* query = queries_.Find(name);
        return query ? (*query)->definition.name : name;
    }
    const auto* object = self.ListOf(kind).Find(name);
    return object ? (*object)->name : name;
}

ApplicationModel::Object& ApplicationModel::Demand(ObjectKind kind, const std::string& name) {
    auto* object = ListOf(kind).Find(name);
    if (!object)
        throw RaisedError(kFailure1, std::string("There is no ") + KindWord(kind) + " " + name + ".",
                          "AccessApplication");
    Load(kind, **object);
    return **object;
}

void ApplicationModel::Load(ObjectKind kind, Object& object) {
    if (object.loaded)
        return;
    object.loaded = true;
    try {
        auto tree = TreeOf(kind, object, object.length);
        const auto source = object.path.empty() ? object.database : Native(object.path);
        object.design = DesignOfTree(std::move(tree), kind, object.name, source);
        if (!object.codePath.empty())
            object.design->code = ReadText(object.codePath);
        object.length += object.design->code.size();
        readLength_ += object.length;
        readDesigns_.push_back(&object);
        if (!object.stowed.empty())
            RestoreWrittenValues(object);
    } catch (const RaisedError& failure) {
        object.error = failure.what();
    }
}

ExportTree ApplicationModel::TreeOf(ObjectKind kind, const Object& object, std::size_t& length) {
    if (object.path.empty()) {
        auto& designs = DesignsOf(object);
        // Texts are kept in two bytes a character; everything else is as long as in an export.
        length = designs.Blob(kind, object.name).size();
        return designs.Tree(kind, object.name);
    }
    const std::string exported = ReadText(object.path);
    length = exported.size();
    return ParseExportTree(exported, Native(object.path));
}

DatabaseDesigns& ApplicationModel::DesignsOf(const Object& object) {
    return *databaseDesigns_.at(object.database);
}

void ApplicationModel::TrimDesigns() {
    while (readLength_ > kKeptDesignBytes && !readDesigns_.empty()) {
        Object& oldest = *readDesigns_.front();
        readDesigns_.pop_front();
        if (!written_.empty())
            StowWrittenValues(oldest);
        readLength_ -= oldest.length;
        oldest.design.reset();
        oldest.loaded = false;
    }
}

void ApplicationModel::StowWrittenValues(Object& object) {
    const auto stow = [&](const void* owner, const std::string& name) {
        if (auto values = written_.extract(owner))
            object.stowed.emplace(name, std::move(values.mapped()));
    };
    stow(object.design.get(), {});
    ForEachNamed(*object.design->root, [&](const DesignObject& part) { stow(&part, part.name); });
}

void ApplicationModel::RestoreWrittenValues(Object& object) {
    const auto restore = [&](const void* owner, const std::string& name) {
        if (auto values = object.stowed.extract(name))
            written_.emplace(owner, std::move(values.mapped()));
    };
    restore(object.design.get(), {});
    ForEachNamed(*object.design->root, [&](const DesignObject& part) { restore(&part, part.name); });
}

const Design& ApplicationModel::OpenDesign(ObjectKind kind, const std::string& name) {
    const auto& object = Demand(kind, name);
    if (!object.design)
        throw RaisedError(kFailure1, object.error, "AccessApplication");
    return *object.design;
}

std::string ApplicationModel::DesignError(ObjectKind kind, const std::string& name) {
    return Demand(kind, name).error;
}

bool ApplicationModel::DesignKnown(ObjectKind kind, const std::string& name) const {
    auto& self = const_cast<ApplicationModel&>(*this);
    const auto* object = self.ListOf(kind).Find(name);
    return object && (!(*object)->path.empty() || self.DesignsOf(**object).Has(kind, name));
}

NamedTexts ApplicationModel::DocumentProperties(ObjectKind kind, const std::string& name) const {
    const auto* object = const_cast<ApplicationModel&>(*this).ListOf(kind).Find(name);
    return object ? (*object)->properties : NamedTexts();
}

const Design* ApplicationModel::FindDesign(ObjectKind kind, const std::string& name) {
    return ListOf(kind).Contains(name) ? Demand(kind, name).design.get() : nullptr;
}

std::string ApplicationModel::ExportText(ObjectKind kind, const std::string& name) {
    OpenDesign(kind, name);
    const auto& object = Demand(kind, name);
    std::size_t length = 0;
    auto exported =
        object.path.empty() ? ExportTreeText(*TreeOf(kind, object, length).root) : ReadText(object.path);
    if (object.path.empty() && !object.design->code.empty())
        exported += "CodeBehindForm\r\n" + object.design->code;
    if (!object.codePath.empty())
        exported += "CodeBehindForm\r\n" + object.design->code;
    return exported;
}

SavedObject ApplicationModel::ChangesOf(const Design& design) const {
    SavedObject saved{design.kind, design.name, {}, {}};
    if (const auto* object = const_cast<ApplicationModel&>(*this).ListOf(design.kind).Find(design.name))
        saved.exportPath = (*object)->path;
    if (const Value* id = WrittenValue(&design, "HelpContextId"))
        saved.changes.contextId = id->AsInteger();
    if (const Value* file = WrittenValue(&design, "HelpFile"))
        saved.changes.file = file->AsString();
    return saved;
}

std::optional<std::string> ApplicationModel::ModuleCode(const std::string& name) {
    const auto* object = modules_.Find(name);
    if (!object)
        return std::nullopt;
    if ((*object)->path.empty())
        return DesignsOf(**object).ModuleCode((*object)->name);
    return ReadText((*object)->path);
}

std::string ApplicationModel::ProjectName() {
    std::string name;
    if (!projectInfoPath_.empty()) {
        try {
            name = JsonText(ReadText(projectInfoPath_), Native(projectInfoPath_), {"Items", "Name"});
        } catch (const RaisedError&) {
            name.clear(); // the database's name stands in, as the host does for a new project
        }
    }
    return name.empty() ? BaseNameOf(fullName_) : name;
}

} // namespace tovimar::platform::access
