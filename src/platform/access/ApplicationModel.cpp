#include "platform/access/ApplicationModel.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ExportReader.h"
#include "platform/access/TableReader.h"
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

bool IsDatabasePath(const std::string& path) {
    const auto extension = text::ToLower(ExtensionOf(path));
    return extension == ".accdb" || extension == ".mdb" || extension == ".accde" || extension == ".mde";
}

std::size_t IndexOf(ObjectKind kind) {
    return static_cast<std::size_t>(kind);
}

ObjectKind KindOfPart(PartKind kind) {
    switch (kind) {
    case PartKind::Form:
        return ObjectKind::Form;
    case PartKind::Report:
        return ObjectKind::Report;
    case PartKind::Macro:
        return ObjectKind::Macro;
    case PartKind::Query:
        return ObjectKind::Query;
    case PartKind::Module:
        return ObjectKind::Module;
    default:
        return ObjectKind::Table;
    }
}

const char* KindWord(ObjectKind kind) {
    switch (kind) {
    case ObjectKind::Form:
        return "form";
    case ObjectKind::Report:
        return "report";
    case ObjectKind::Macro:
        return "macro";
    case ObjectKind::Query:
        return "query";
    case ObjectKind::Table:
        return "table";
    case ObjectKind::Module:
        return "module";
    }
    return "object";
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

void ApplicationModel::OpenDatabaseFile(const std::string& path) {
    fullName_ = path;
    folder_ = WithoutTrailingBackslash(FolderOf(path));
    if (!IsDatabasePath(path))
        throw RaisedError(kFailure1, Native(path) + ": the file is no Access database.", "AccessApplication");
    TakeDatabase(path, /*topLevel=*/true);
}

void ApplicationModel::OpenFolder(const std::string& path) {
    folder_ = path;
    const auto folder = ScanApplicationFolder(path);
    if (folder.topLevelDatabases == 1)
        fullName_ = folder.databases.front();
    else
        fullName_ = path + "\\" + FileNameOf(path) + ".accdb";
    for (const auto& part : folder.parts)
        TakePart(part);
    for (const auto& code : codePaths_)
        TakeCode(code);
    for (const auto& [name, info] : queryInfos_)
        if (auto* query = queries_.Find(name))
            (*query)->infoPath = info;
    if (!documentsPath_.empty())
        TakeDocuments(documentsPath_);
    const bool exports =
        std::any_of(std::begin(kindInExports_), std::end(kindInExports_), [](bool any) { return any; });
    for (std::size_t i = 0; i < folder.databases.size(); ++i) {
        try {
            TakeDatabase(folder.databases[i], i < folder.topLevelDatabases);
        } catch (const RaisedError&) {
            // Beside sound exports a database that can't be read only lacks its data.
            if (!exports)
                throw;
        }
    }
}

void ApplicationModel::TakeObject(ObjectKind kind, const ApplicationPart& part) {
    kindInExports_[IndexOf(kind)] = true;
    auto& objects = ListOf(kind);
    if (objects.Contains(part.name))
        return;
    auto object = std::make_unique<Object>();
    object->name = part.name;
    object->path = part.path;
    objects.Add(std::move(object), part.name);
}

void ApplicationModel::TakeQuery(const ApplicationPart& part) {
    kindInExports_[IndexOf(ObjectKind::Query)] = true;
    if (queries_.Contains(part.name))
        return;
    auto query = std::make_unique<Query>();
    query->path = part.path;
    query->definition.name = part.name;
    queries_.Add(std::move(query), part.name);
}

void ApplicationModel::TakeCode(const std::string& path) {
    for (auto* objects : {&forms_, &reports_}) {
        auto* object = objects->Find(DecodeObjectName(BaseNameOf(path)));
        if (object && text::EqualsIgnoringCase(FolderOf((*object)->path), FolderOf(path)))
            (*object)->codePath = path;
    }
}

void ApplicationModel::TakePart(const ApplicationPart& part) {
    switch (part.kind) {
    case PartKind::Form:
    case PartKind::Report:
    case PartKind::Macro:
    case PartKind::Module:
        return TakeObject(KindOfPart(part.kind), part);
    case PartKind::Query:
        return TakeQuery(part);
    case PartKind::Code:
        codePaths_.push_back(part.path);
        return;
    case PartKind::Relation:
        return TakeRelation(part.path);
    case PartKind::Table:
        TableNamed(part.name).sqlPath = part.path;
        return;
    case PartKind::TableProperties:
        TableNamed(part.name).schemaPath = part.path;
        return;
    case PartKind::LinkedTable:
        TableNamed(part.name).linkPath = part.path;
        return;
    case PartKind::TableData:
        TableNamed(part.name).dataPath = part.path;
        return;
    case PartKind::QueryInfo:
        queryInfos_.emplace_back(part.name, part.path);
        return;
    case PartKind::Documents:
        documentsPath_ = part.path;
        return;
    case PartKind::ProjectInfo:
        projectInfoPath_ = part.path;
        return;
    case PartKind::Picture:
        if (!pictures_.Contains(part.name))
            pictures_.Add(part.path, part.name);
        return;
    case PartKind::PictureInfo:
        return;
    }
}

/// Descriptions that stand in files of their own; without them the application is the same.
void ApplicationModel::TakeDocuments(const std::string& path) {
    static const std::pair<const char*, ObjectKind> kContainers[] = {{"Forms", ObjectKind::Form},
                                                                     {"Reports", ObjectKind::Report},
                                                                     {"Scripts", ObjectKind::Macro},
                                                                     {"Modules", ObjectKind::Module}};
    try {
        for (auto& document : ReadDocuments(ReadText(path), Native(path)))
            for (const auto& [container, kind] : kContainers)
                if (document.container == container)
                    if (auto* object = ListOf(kind).Find(document.name))
                        (*object)->properties = std::move(document.properties);
    } catch (const RaisedError&) {
        return;
    }
}

void ApplicationModel::TakeRelation(const std::string& path) {
    try {
        auto relation = ReadRelation(ReadText(path), Native(path));
        if (!relation.table.empty() && !relation.foreignTable.empty())
            relations_.push_back(std::move(relation));
    } catch (const RaisedError&) {
        return; // one damaged relation hides nothing but itself
    }
}

/// Exports win: of a database beside them only tables, relations, and kinds that the exports lack are taken.
void ApplicationModel::TakeDatabase(const std::string& path, bool topLevel) {
    const auto nativePath = Native(path);
    auto content = ReadDatabase(nativePath);
    TakeDatabaseTables(content, nativePath);
    for (auto& relation : content.relations) {
        const bool known =
            std::any_of(relations_.begin(), relations_.end(), [&](const RelationDefinition& other) {
                return text::EqualsIgnoringCase(other.name, relation.name);
            });
        if (!known)
            relations_.push_back(std::move(relation));
    }
    if (!topLevel)
        return;
    for (auto& query : content.queries) {
        if (kindInExports_[IndexOf(ObjectKind::Query)] || queries_.Contains(query.name))
            continue;
        const auto name = query.name;
        queries_.Add(std::make_unique<Query>(), name);
        (*queries_.Find(name))->definition = std::move(query);
        (*queries_.Find(name))->loaded = true;
    }
    for (auto& [kind, name, properties] : content.names) {
        auto& objects = ListOf(kind);
        if (kindInExports_[IndexOf(kind)] || objects.Contains(name))
            continue;
        objects.Add(std::make_unique<Object>(), name);
        (*objects.Find(name))->name = name;
        (*objects.Find(name))->database = nativePath;
        (*objects.Find(name))->properties = std::move(properties);
    }
}

void ApplicationModel::TakeDatabaseTables(DatabaseContent& content, const std::string& nativePath) {
    for (auto& definition : content.tables) {
        auto* known = tables_.Find(definition.name);
        if (known) {
            if ((*known)->database.empty() && definition.connect.empty())
                (*known)->database = nativePath;
            continue;
        }
        auto& table = TableNamed(definition.name);
        table.definition = std::move(definition);
        table.database = nativePath;
        table.loaded = true;
    }
}

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
    for (const auto& known : Names(kind))
        if (text::EqualsIgnoringCase(known, name))
            return known;
    return name;
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
    if (object.path.empty()) {
        object.error = object.database + ": of the " + KindWord(kind) + " " + object.name +
                       " only the name is known, its design isn't.";
        return;
    }
    try {
        object.design = ReadDesign(ReadText(object.path), kind, object.name, Native(object.path));
        if (!object.codePath.empty())
            object.design->code = ReadText(object.codePath);
    } catch (const RaisedError& failure) {
        object.error = failure.what();
    }
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
    return object && !(*object)->path.empty();
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
    auto exported = ReadText(object.path);
    if (!object.codePath.empty())
        exported += "CodeBehindForm\r\n" + object.design->code;
    return exported;
}

std::optional<std::string> ApplicationModel::ModuleCode(const std::string& name) {
    const auto* object = modules_.Find(name);
    if (!object || (*object)->path.empty())
        return std::nullopt;
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
