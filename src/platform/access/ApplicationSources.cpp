#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/ExportReader.h"
#include "platform/access/TableReader.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <algorithm>

/// How an application's files and databases become the lists of its model.
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

} // namespace

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
    NoteDifferences(content, nativePath);
    databaseDesigns_.emplace(nativePath, std::make_unique<DatabaseDesigns>(nativePath));
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

namespace {

/// "2 forms", and up to five of their names behind a colon.
std::string CountedNames(const char* word, const std::vector<std::string>& names) {
    constexpr std::size_t kShown = 5;
    const std::string plural = std::string_view(word) == "query" ? "queries" : std::string(word) + "s";
    std::string text = std::to_string(names.size()) + " " + (names.size() == 1 ? word : plural);
    for (std::size_t i = 0; i < std::min(names.size(), kShown); ++i)
        text += (i == 0 ? " (" : ", ") + names[i];
    return text + (names.size() > kShown ? ", ...)" : ")");
}

} // namespace

/// Exports and database of one application hold the same objects, unless one of them is out of date.
void ApplicationModel::NoteDifferences(const DatabaseContent& content, const std::string& nativePath) {
    static constexpr std::pair<ObjectKind, const char*> kWords[] = {
        {ObjectKind::Form, "form"}, {ObjectKind::Report, "report"}, {ObjectKind::Macro, "macro"}};
    for (const auto& [kind, word] : kWords) {
        if (!kindInExports_[IndexOf(kind)])
            continue;
        KeyedList<bool> inDatabase;
        std::vector<std::string> missing;
        for (const auto& object : content.names) {
            if (object.kind != kind || inDatabase.Contains(object.name))
                continue;
            inDatabase.Add(true, object.name);
            if (!ListOf(kind).Contains(object.name))
                missing.push_back(object.name);
        }
        std::vector<std::string> added;
        for (const auto& object : ListOf(kind))
            if (!inDatabase.Contains(object->name))
                added.push_back(object->name);
        if (!missing.empty())
            notes_.push_back(
                CountedNames(word, missing) + " of " + nativePath +
                (missing.size() == 1 ? " isn't" : " aren't") +
                " among the exports and left out; export again to document the database as it is.");
        if (!added.empty())
            notes_.push_back(CountedNames(word, added) + " of the exports " +
                             (added.size() == 1 ? "isn't" : "aren't") + " in " + nativePath + ".");
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

} // namespace tovimar::platform::access
