#include "platform/access/DataObjects.h"

#include "platform/access/Collections.h"
#include "platform/files/Paths.h"

namespace tovimar::platform::access {

namespace {

MissingEntry NoSuchItem() {
    return {3265, "Item not found in this collection."};
}

MissingEntry NoSuchProperty() {
    return {3270, "Property not found."};
}

std::shared_ptr<CollectionObject> MakeProperties(const std::string& name, const NamedTexts& texts) {
    auto properties = std::make_shared<CollectionObject>("Properties", 0, NoSuchProperty());
    properties->Add("Name", std::make_shared<PropertyObject>("Name", Value(name)));
    for (const auto& [property, text] : texts)
        properties->Add(property, std::make_shared<PropertyObject>(property, Value(text)));
    return properties;
}

class FieldObject : public LateBound<FieldObject> {
public:
    FieldObject(FieldDefinition field, std::int32_t position, std::string foreignName = {})
        : field_(std::move(field)), position_(position), foreignName_(std::move(foreignName)) {}
    std::string ClassName() const override { return "Field"; }
    static const MemberTable<FieldObject>& Members() {
        static const MemberTable<FieldObject> kMembers{
            {"Name", &FieldObject::ReadName},
            {"Type", &FieldObject::ReadType},
            {"Size", &FieldObject::ReadSize},
            {"Required", &FieldObject::ReadRequired},
            {"Attributes", &FieldObject::ReadAttributes},
            {"OrdinalPosition", &FieldObject::ReadPosition},
            {"SourceField", &FieldObject::ReadSourceField},
            {"SourceTable", &FieldObject::ReadSourceTable},
            {"ForeignName", &FieldObject::ReadForeignName},
            {"Properties", &FieldObject::ReadProperties},
        };
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return field_.name; }
    Value ReadType(const Arguments&) { return static_cast<std::int32_t>(field_.type); }
    Value ReadSize(const Arguments&) { return field_.size; }
    Value ReadRequired(const Arguments&) { return field_.required; }
    Value ReadAttributes(const Arguments&) {
        constexpr std::int32_t kAutoNumber = 16;
        return field_.autoNumber ? kAutoNumber : std::int32_t{0};
    }
    Value ReadPosition(const Arguments&) { return position_; }
    Value ReadSourceField(const Arguments&) { return field_.sourceField; }
    Value ReadSourceTable(const Arguments&) { return field_.sourceTable; }
    Value ReadForeignName(const Arguments&) { return foreignName_; }
    Value ReadProperties(const Arguments& arguments) {
        return ListOrItem(MakeProperties(field_.name, field_.properties), arguments);
    }

    FieldDefinition field_;
    std::int32_t position_;
    std::string foreignName_;
};

std::shared_ptr<CollectionObject> MakeFields(const std::vector<FieldDefinition>& fields, bool ownSource) {
    auto list = std::make_shared<CollectionObject>("Fields", 0, NoSuchItem());
    std::int32_t position = 0;
    for (auto field : fields) {
        field.sourceField = ownSource ? field.name : field.sourceField;
        const auto name = field.name;
        list->Add(name, std::make_shared<FieldObject>(std::move(field), position++));
    }
    return list;
}

/// A table or query; its definition is read when a member beyond the name is asked for.
class DefinitionObject : public LateBound<DefinitionObject> {
public:
    DefinitionObject(SessionRef session, ObjectKind kind, std::string name)
        : session_(std::move(session)), kind_(kind), name_(std::move(name)) {}
    std::string ClassName() const override { return kind_ == ObjectKind::Table ? "TableDef" : "QueryDef"; }
    static const MemberTable<DefinitionObject>& Members() {
        static const MemberTable<DefinitionObject> kMembers{
            {"Name", &DefinitionObject::ReadName},
            {"Fields", &DefinitionObject::ReadFields},
            {"Properties", &DefinitionObject::ReadProperties},
            {"Connect", &DefinitionObject::ReadConnect},
            {"SourceTableName", &DefinitionObject::ReadSourceTableName},
            {"Attributes", &DefinitionObject::ReadAttributes},
            {"SQL", &DefinitionObject::ReadSql},
            {"Type", &DefinitionObject::ReadType},
        };
        return kMembers;
    }

private:
    bool IsTable() const { return kind_ == ObjectKind::Table; }
    const TableDefinition& Table() {
        const auto* table = IsTable() ? Live(session_)->Model().FindTable(name_) : nullptr;
        if (!table)
            RaiseNoSuchMember(ClassName());
        return *table;
    }
    const QueryDefinition& Query() {
        const auto* query = IsTable() ? nullptr : Live(session_)->Model().FindQuery(name_);
        if (!query)
            RaiseNoSuchMember(ClassName());
        return *query;
    }

    Value ReadName(const Arguments&) { return name_; }
    Value ReadFields(const Arguments& arguments) {
        if (!fields_ && IsTable())
            fields_ = MakeFields(Table().fields, /*ownSource=*/true);
        else if (!fields_)
            fields_ = MakeFields(Live(session_)->Model().QueryFields(name_), /*ownSource=*/false);
        return ListOrItem(fields_, arguments);
    }
    Value ReadProperties(const Arguments& arguments) {
        return ListOrItem(MakeProperties(name_, IsTable() ? Table().properties : Query().properties),
                          arguments);
    }
    Value ReadConnect(const Arguments&) { return IsTable() ? Value(Table().connect) : Value(""); }
    Value ReadSourceTableName(const Arguments&) { return Table().sourceTable; }
    Value ReadAttributes(const Arguments&) { return Table().attributes; }
    Value ReadSql(const Arguments&) { return Query().sql; }
    Value ReadType(const Arguments&) {
        // The data library's numbers of query types, by the operation.
        constexpr std::int32_t kTypes[] = {0, 0, 80, 64, 48, 32, 16, 96, 112, 128};
        const auto operation = Query().operation;
        return operation >= 1 && operation <= 9 ? kTypes[operation] : std::int32_t{0};
    }

    SessionRef session_;
    ObjectKind kind_;
    std::string name_;
    std::shared_ptr<CollectionObject> fields_;
};

class RelationObject : public LateBound<RelationObject> {
public:
    explicit RelationObject(RelationDefinition relation) : relation_(std::move(relation)) {}
    std::string ClassName() const override { return "Relation"; }
    static const MemberTable<RelationObject>& Members() {
        static const MemberTable<RelationObject> kMembers{
            {"Name", &RelationObject::ReadName},
            {"Table", &RelationObject::ReadTable},
            {"ForeignTable", &RelationObject::ReadForeignTable},
            {"Attributes", &RelationObject::ReadAttributes},
            {"Fields", &RelationObject::ReadFields},
        };
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return relation_.name; }
    Value ReadTable(const Arguments&) { return relation_.table; }
    Value ReadForeignTable(const Arguments&) { return relation_.foreignTable; }
    Value ReadAttributes(const Arguments&) { return relation_.attributes; }
    Value ReadFields(const Arguments& arguments) {
        const auto list = std::make_shared<CollectionObject>("Fields", 0, NoSuchItem());
        std::int32_t position = 0;
        for (const auto& [name, foreignName] : relation_.fields) {
            FieldDefinition field;
            field.name = name;
            list->Add(name, std::make_shared<FieldObject>(std::move(field), position++, foreignName));
        }
        return ListOrItem(list, arguments);
    }

    RelationDefinition relation_;
};

/// A named object of the database with its properties: `Containers("Scripts").Documents("AutoExec")`.
class DocumentObject : public LateBound<DocumentObject> {
public:
    DocumentObject(SessionRef session, ObjectKind kind, std::string name)
        : session_(std::move(session)), kind_(kind), name_(std::move(name)) {}
    std::string ClassName() const override { return "Document"; }
    static const MemberTable<DocumentObject>& Members() {
        static const MemberTable<DocumentObject> kMembers{{"Name", &DocumentObject::ReadName},
                                                          {"Properties", &DocumentObject::ReadProperties}};
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadProperties(const Arguments& arguments) {
        return ListOrItem(MakeProperties(name_, Live(session_)->Model().DocumentProperties(kind_, name_)),
                          arguments);
    }

    SessionRef session_;
    ObjectKind kind_;
    std::string name_;
};

class ContainerObject : public LateBound<ContainerObject> {
public:
    ContainerObject(SessionRef session, std::string name, ObjectKind kind)
        : session_(std::move(session)), name_(std::move(name)), kind_(kind) {}
    std::string ClassName() const override { return "Container"; }
    static const MemberTable<ContainerObject>& Members() {
        static const MemberTable<ContainerObject> kMembers{{"Name", &ContainerObject::ReadName},
                                                           {"Documents", &ContainerObject::ReadDocuments}};
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadDocuments(const Arguments& arguments) {
        const auto list = std::make_shared<CollectionObject>("Documents", 0, NoSuchItem());
        for (const auto& name : Live(session_)->Model().Names(kind_))
            list->Add(name, std::make_shared<DocumentObject>(session_, kind_, name));
        return ListOrItem(list, arguments);
    }

    SessionRef session_;
    std::string name_;
    ObjectKind kind_;
};

class DatabaseObject : public LateBound<DatabaseObject> {
public:
    explicit DatabaseObject(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "Database"; }
    static const MemberTable<DatabaseObject>& Members() {
        static const MemberTable<DatabaseObject> kMembers{
            {"Name", &DatabaseObject::ReadName},
            {"TableDefs", &DatabaseObject::ReadTables},
            {"QueryDefs", &DatabaseObject::ReadQueries},
            {"Relations", &DatabaseObject::ReadRelations},
            {"Containers", &DatabaseObject::ReadContainers},
            {"Properties", &DatabaseObject::ReadProperties},
            {"Close", &DatabaseObject::Close},
        };
        return kMembers;
    }

private:
    Value Definitions(const char* className, ObjectKind kind, const Arguments& arguments) {
        const auto& model = Live(session_)->Model();
        // Most callers ask for one by name; the whole list isn't made for that.
        if (!arguments.empty() && arguments[0].IsString() && model.Contains(kind, arguments[0].AsString()))
            return ObjectValue(std::make_shared<DefinitionObject>(
                session_, kind, model.NameOf(kind, arguments[0].AsString())));
        const auto list = std::make_shared<CollectionObject>(className, 0, NoSuchItem());
        for (const auto& name : model.Names(kind))
            list->Add(name, std::make_shared<DefinitionObject>(session_, kind, name));
        return ListOrItem(list, arguments);
    }
    Value ReadName(const Arguments&) { return Live(session_)->Model().FullName(); }
    Value ReadTables(const Arguments& arguments) {
        return Definitions("TableDefs", ObjectKind::Table, arguments);
    }
    Value ReadQueries(const Arguments& arguments) {
        return Definitions("QueryDefs", ObjectKind::Query, arguments);
    }
    Value ReadRelations(const Arguments& arguments) {
        const auto list = std::make_shared<CollectionObject>("Relations", 0, NoSuchItem());
        for (const auto& relation : Live(session_)->Model().Relations())
            list->Add(relation.name, std::make_shared<RelationObject>(relation));
        return ListOrItem(list, arguments);
    }
    Value ReadContainers(const Arguments& arguments) {
        const auto list = std::make_shared<CollectionObject>("Containers", 0, NoSuchItem());
        for (const auto& [name, kind] :
             {std::pair("Forms", ObjectKind::Form), std::pair("Reports", ObjectKind::Report),
              std::pair("Scripts", ObjectKind::Macro), std::pair("Modules", ObjectKind::Module)})
            list->Add(name, std::make_shared<ContainerObject>(session_, name, kind));
        return ListOrItem(list, arguments);
    }
    Value ReadProperties(const Arguments& arguments) {
        const auto properties = MakeDatabaseProperties(session_);
        return arguments.empty() ? ObjectValue(properties) : properties->Get("Item", arguments);
    }
    Value Close(const Arguments&) { return {}; }

    SessionRef session_;
};

} // namespace

HostObject MakeDatabaseObject(const SessionRef& session) {
    return std::make_shared<DatabaseObject>(session);
}

HostObject MakeDatabaseProperties(const SessionRef& session) {
    const auto& model = Live(session)->Model();
    NamedTexts texts;
    const auto extension = text::ToLower(ExtensionOf(model.FullName()));
    if (extension == ".accde" || extension == ".mde")
        texts.emplace_back("MDE", "T");
    return MakeProperties(model.FullName(), texts);
}

} // namespace tovimar::platform::access
