#include "platform/access/ProjectObjects.h"

#include "platform/access/Collections.h"
#include "platform/access/DataObjects.h"
#include "platform/files/Paths.h"

namespace tovimar::platform::access {

namespace {

MissingEntry NoSuchObject() {
    return {kObjectClosed, "The expression you entered refers to an object that is closed or doesn't exist."};
}

/// An object in the catalogue; nothing is opened for it.
class CatalogueObject : public LateBound<CatalogueObject> {
public:
    CatalogueObject(SessionRef session, ObjectKind kind, std::string name)
        : session_(std::move(session)), kind_(kind), name_(std::move(name)) {}
    std::string ClassName() const override { return "AccessObject"; }
    static const MemberTable<CatalogueObject>& Members() {
        static const MemberTable<CatalogueObject> kMembers{
            {"Name", &CatalogueObject::ReadName},
            {"FullName", &CatalogueObject::ReadName},
            {"Type", &CatalogueObject::ReadType},
            {"IsLoaded", &CatalogueObject::ReadIsLoaded},
        };
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadType(const Arguments&) { return static_cast<std::int32_t>(kind_); }
    Value ReadIsLoaded(const Arguments&) { return Live(session_)->FindOpen(kind_, name_) != nullptr; }

    SessionRef session_;
    ObjectKind kind_;
    std::string name_;
};

/// Forms and reports of which only the name is known can't be opened, so the catalogue leaves them out; a
/// summary of the application names them.
bool IsListed(const ApplicationModel& model, ObjectKind kind, const std::string& name) {
    return (kind != ObjectKind::Form && kind != ObjectKind::Report) || model.DesignKnown(kind, name);
}

Value Catalogue(const SessionRef& session, const char* className, ObjectKind kind,
                const AutomationObject::Arguments& arguments) {
    const auto& model = Live(session)->Model();
    if (!arguments.empty() && arguments[0].IsString() && model.Contains(kind, arguments[0].AsString()) &&
        IsListed(model, kind, arguments[0].AsString()))
        return ObjectValue(
            std::make_shared<CatalogueObject>(session, kind, model.NameOf(kind, arguments[0].AsString())));
    const auto list = std::make_shared<CollectionObject>(className, 0, NoSuchObject());
    for (const auto& name : model.Names(kind))
        if (IsListed(model, kind, name))
            list->Add(name, std::make_shared<CatalogueObject>(session, kind, name));
    return ListOrItem(list, arguments);
}

class ConnectionObject : public LateBound<ConnectionObject> {
public:
    explicit ConnectionObject(std::string path) : path_(std::move(path)) {}
    std::string ClassName() const override { return "Connection"; }
    static const MemberTable<ConnectionObject>& Members() {
        static const MemberTable<ConnectionObject> kMembers{
            {"ConnectionString", &ConnectionObject::ReadConnectionString}};
        return kMembers;
    }

private:
    Value ReadConnectionString(const Arguments&) { return "Data Source=" + path_; }
    std::string path_;
};

class ProjectObject : public LateBound<ProjectObject> {
public:
    explicit ProjectObject(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "CurrentProject"; }
    static const MemberTable<ProjectObject>& Members() {
        static const MemberTable<ProjectObject> kMembers{
            {"FullName", &ProjectObject::ReadFullName},
            {"Name", &ProjectObject::ReadName},
            {"Path", &ProjectObject::ReadPath},
            {"ProjectType", &ProjectObject::ReadProjectType},
            {"AllForms", &ProjectObject::ReadForms},
            {"AllReports", &ProjectObject::ReadReports},
            {"AllMacros", &ProjectObject::ReadMacros},
            {"AllModules", &ProjectObject::ReadModules},
            {"Connection", &ProjectObject::ReadConnection},
            {"Properties", &ProjectObject::ReadProperties},
        };
        return kMembers;
    }

private:
    ApplicationModel& Model() { return Live(session_)->Model(); }
    Value ReadFullName(const Arguments&) { return Model().FullName(); }
    Value ReadName(const Arguments&) { return FileNameOf(Model().FullName()); }
    Value ReadPath(const Arguments&) { return Model().Folder(); }
    /// A local database.
    Value ReadProjectType(const Arguments&) { return 2; }
    Value ReadForms(const Arguments& arguments) {
        return Catalogue(session_, "AllForms", ObjectKind::Form, arguments);
    }
    Value ReadReports(const Arguments& arguments) {
        return Catalogue(session_, "AllReports", ObjectKind::Report, arguments);
    }
    Value ReadMacros(const Arguments& arguments) {
        return Catalogue(session_, "AllMacros", ObjectKind::Macro, arguments);
    }
    Value ReadModules(const Arguments& arguments) {
        return Catalogue(session_, "AllModules", ObjectKind::Module, arguments);
    }
    Value ReadConnection(const Arguments&) {
        return ObjectValue(std::make_shared<ConnectionObject>(Model().FullName()));
    }
    Value ReadProperties(const Arguments& arguments) {
        const auto properties = MakeDatabaseProperties(session_);
        return arguments.empty() ? ObjectValue(properties) : properties->Get("Item", arguments);
    }

    SessionRef session_;
};

class DataObject : public LateBound<DataObject> {
public:
    explicit DataObject(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "CurrentData"; }
    static const MemberTable<DataObject>& Members() {
        static const MemberTable<DataObject> kMembers{{"AllTables", &DataObject::ReadTables},
                                                      {"AllQueries", &DataObject::ReadQueries}};
        return kMembers;
    }

private:
    Value ReadTables(const Arguments& arguments) {
        return Catalogue(session_, "AllTables", ObjectKind::Table, arguments);
    }
    Value ReadQueries(const Arguments& arguments) {
        return Catalogue(session_, "AllQueries", ObjectKind::Query, arguments);
    }

    SessionRef session_;
};

class CommandObject : public LateBound<CommandObject> {
public:
    explicit CommandObject(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "DoCmd"; }
    static const MemberTable<CommandObject>& Members() {
        static const MemberTable<CommandObject> kMembers{
            {"OpenForm", &CommandObject::OpenForm},
            {"OpenReport", &CommandObject::OpenReport},
            {"Close", &CommandObject::Close},
            {"Hourglass", &CommandObject::Nothing},
            {"SelectObject", &CommandObject::SelectObject},
            {"RunCommand", &CommandObject::RunCommand},
            {"SetWarnings", &CommandObject::Nothing},
            {"Echo", &CommandObject::Nothing},
        };
        return kMembers;
    }

private:
    /// OpenForm name, view, filter, condition, data mode, window mode.
    Value OpenForm(const Arguments& arguments) {
        constexpr std::int32_t kDesign = 1, kPreview = 2, kDatasheet = 3, kHidden = 1;
        const auto session = Live(session_);
        const auto name = TextAt(arguments, 0);
        const auto asked = IntegerAt(arguments, 1);
        auto view = asked == kDesign ? View::Design : asked == kDatasheet ? View::Datasheet : View::Form;
        // In its normal view a form that is a datasheet by default shows as one.
        const auto* design = session->Model().FindDesign(ObjectKind::Form, name);
        if (view == View::Form && asked != kPreview && design && design->root->Integer("DefaultView") == 2)
            view = View::Datasheet;
        session->Open(ObjectKind::Form, name, view, IntegerAt(arguments, 5) == kHidden);
        return {};
    }
    /// OpenReport name, view, filter, condition, window mode. There is no printer: the normal view previews.
    Value OpenReport(const Arguments& arguments) {
        constexpr std::int32_t kDesign = 1, kHidden = 1;
        const auto view = IntegerAt(arguments, 1) == kDesign ? View::Design : View::Preview;
        Live(session_)->Open(ObjectKind::Report, TextAt(arguments, 0), view,
                             IntegerAt(arguments, 4) == kHidden);
        return {};
    }
    /// Close type, name, save; without arguments the active object.
    Value Close(const Arguments& arguments) {
        const auto session = Live(session_);
        const auto type = IntegerAt(arguments, 0, session->currentObjectType);
        const auto name = arguments.size() > 1 ? TextAt(arguments, 1) : session->currentObjectName;
        constexpr std::int32_t kSave = 1;
        const auto saving =
            IntegerAt(arguments, 2) == kSave ? AccessSession::Saving::Yes : AccessSession::Saving::No;
        if (type == 2 || type == 3)
            session->Close(static_cast<ObjectKind>(type), name, saving);
        return {};
    }
    Value SelectObject(const Arguments& arguments) {
        const auto session = Live(session_);
        session->currentObjectType = IntegerAt(arguments, 0);
        session->currentObjectName = TextAt(arguments, 1);
        return {};
    }
    Value RunCommand(const Arguments& arguments) {
        constexpr std::int32_t kRelationships = 133;
        if (IntegerAt(arguments, 0) == kRelationships)
            Live(session_)->OpenRelationships();
        return {};
    }
    Value Nothing(const Arguments&) { return {}; }

    SessionRef session_;
};

} // namespace

HostObject MakeProjectObject(const SessionRef& session) {
    return std::make_shared<ProjectObject>(session);
}

HostObject MakeDataObject(const SessionRef& session) {
    return std::make_shared<DataObject>(session);
}

HostObject MakeCommandObject(const SessionRef& session) {
    return std::make_shared<CommandObject>(session);
}

} // namespace tovimar::platform::access
