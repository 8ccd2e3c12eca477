#include "platform/access/AccessApplication.h"

#include "platform/Environment.h"
#include "platform/access/AccessSession.h"
#include "platform/access/CodeObjects.h"
#include "platform/access/Collections.h"
#include "platform/access/CommandBars.h"
#include "platform/access/DataObjects.h"
#include "platform/access/ProjectObjects.h"
#include "platform/access/WindowObject.h"

namespace tovimar::platform::access {

namespace {

class ScreenObject : public LateBound<ScreenObject> {
public:
    explicit ScreenObject(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "Screen"; }
    static const MemberTable<ScreenObject>& Members() {
        static const MemberTable<ScreenObject> kMembers{{"ActiveForm", &ScreenObject::ReadForm},
                                                        {"ActiveReport", &ScreenObject::ReadReport}};
        return kMembers;
    }

private:
    Value Active(ObjectKind kind, ResultCode missing, const char* word) {
        const auto active = Live(session_)->Active(kind);
        if (!active)
            throw RaisedError(missing,
                              std::string("You entered an expression that requires a ") + word +
                                  " to be the active window.",
                              ClassName());
        return ObjectValue(active);
    }
    Value ReadForm(const Arguments&) { return Active(ObjectKind::Form, 2475, "form"); }
    Value ReadReport(const Arguments&) { return Active(ObjectKind::Report, 2476, "report"); }

    SessionRef session_;
};

/// `Application`. It owns the session: with its last reference everything closes.
class ApplicationObject : public LateBound<ApplicationObject> {
public:
    explicit ApplicationObject(std::shared_ptr<AccessSession> session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "Application"; }
    static const MemberTable<ApplicationObject>& Members();
    AccessSession& Session() { return *session_; }

private:
    Value ReadProject(const Arguments&) { return ObjectValue(MakeProjectObject(session_)); }
    Value ReadData(const Arguments&) { return ObjectValue(MakeDataObject(session_)); }
    Value ReadDatabase(const Arguments&) { return ObjectValue(MakeDatabaseObject(session_)); }
    Value ReadCommand(const Arguments&) { return ObjectValue(MakeCommandObject(session_)); }
    Value ReadForms(const Arguments& arguments) { return OpenObjects("Forms", ObjectKind::Form, arguments); }
    Value ReadReports(const Arguments& arguments) {
        return OpenObjects("Reports", ObjectKind::Report, arguments);
    }
    Value ReadScreen(const Arguments&) { return ObjectValue(std::make_shared<ScreenObject>(session_)); }
    Value ReadCommandBars(const Arguments& arguments) {
        return arguments.empty() ? ObjectValue(commandBars_) : commandBars_->Get("Item", arguments);
    }
    Value ReadEditor(const Arguments&) { return ObjectValue(MakeCodeEditor(session_)); }
    Value ReadVersion(const Arguments&) { return "11.0"; }
    Value ReadName(const Arguments&) { return "Microsoft Access"; }
    Value ReadWindow(const Arguments&) { return session_->MainWindowHandle(); }
    Value ReadObjectName(const Arguments&) { return session_->currentObjectName; }
    Value ReadObjectType(const Arguments&) { return session_->currentObjectType; }
    Value Nothing(const Arguments&) { return {}; }
    Value SaveAsText(const Arguments& arguments);
    Value GetOption(const Arguments& arguments);
    Value SysCmd(const Arguments& arguments);
    Value OpenObjects(const char* className, ObjectKind kind, const Arguments& arguments);

    std::shared_ptr<AccessSession> session_;
    HostObject commandBars_ = MakeCommandBars();
};

const MemberTable<ApplicationObject>& ApplicationObject::Members() {
    static const MemberTable<ApplicationObject> kMembers{
        {"CurrentProject", &ApplicationObject::ReadProject},
        {"CurrentData", &ApplicationObject::ReadData},
        {"CurrentDb", &ApplicationObject::ReadDatabase},
        {"DoCmd", &ApplicationObject::ReadCommand},
        {"Forms", &ApplicationObject::ReadForms},
        {"Reports", &ApplicationObject::ReadReports},
        {"Screen", &ApplicationObject::ReadScreen},
        {"CommandBars", &ApplicationObject::ReadCommandBars},
        {"VBE", &ApplicationObject::ReadEditor},
        {"Version", &ApplicationObject::ReadVersion},
        {"Name", &ApplicationObject::ReadName},
        {"hWndAccessApp", &ApplicationObject::ReadWindow},
        {"CurrentObjectName", &ApplicationObject::ReadObjectName},
        {"CurrentObjectType", &ApplicationObject::ReadObjectType},
        {"RefreshDatabaseWindow", &ApplicationObject::Nothing},
        {"SaveAsText", &ApplicationObject::SaveAsText},
        {"GetOption", &ApplicationObject::GetOption},
        {"SysCmd", &ApplicationObject::SysCmd},
    };
    return kMembers;
}

Value ApplicationObject::OpenObjects(const char* className, ObjectKind kind, const Arguments& arguments) {
    const bool form = kind == ObjectKind::Form;
    const auto list = std::make_shared<CollectionObject>(
        className, 0,
        MissingEntry{form ? 2450 : 2451, std::string("The application can't find the ") +
                                             (form ? "form" : "report") +
                                             " '|' referred to in a macro expression or code."});
    for (const auto& object : session_->OpenObjects(kind))
        list->Add(object->DesignOf().name, object);
    return ListOrItem(list, arguments);
}

/// Type, name, path: the object's export as it was read, in UTF-8 with its mark.
Value ApplicationObject::SaveAsText(const Arguments& arguments) {
    const auto type = IntegerAt(arguments, 0);
    if (type < 2 || type > 4)
        throw RaisedError(5, "Invalid procedure call or argument", ClassName());
    const auto exported = session_->Model().ExportText(static_cast<ObjectKind>(type), TextAt(arguments, 1));
    Env().files->WriteFile(TextAt(arguments, 2), "\xEF\xBB\xBF" + exported);
    return {};
}

Value ApplicationObject::GetOption(const Arguments& arguments) {
    if (text::EqualsIgnoringCase(TextAt(arguments, 0), "Project Name"))
        return session_->Model().ProjectName();
    return {};
}

/// 1 starts the meter with a message and its maximum, 2 moves it, 3 takes it away.
Value ApplicationObject::SysCmd(const Arguments& arguments) {
    constexpr std::int32_t kBegin = 1, kUpdate = 2, kEnd = 3;
    auto* meter = Env().hostMeter.get();
    const auto action = IntegerAt(arguments, 0);
    if (action == kBegin)
        session_->meterMessage = TextAt(arguments, 1);
    if (!meter)
        return {};
    if (action == kBegin)
        meter->Begin(session_->meterMessage, IntegerAt(arguments, 2));
    else if (action == kUpdate)
        meter->Update(session_->meterMessage, IntegerAt(arguments, 1));
    else if (action == kEnd)
        meter->End();
    return {};
}

AccessSession& SessionOf(const HostObject& application) {
    const auto opened = std::dynamic_pointer_cast<ApplicationObject>(application);
    if (!opened)
        RaiseNoSuchMember("Application");
    return opened->Session();
}

} // namespace

HostObject OpenAccessApplication(const std::string& nativePath) {
    auto session = std::make_shared<AccessSession>(std::make_unique<ApplicationModel>(nativePath));
    auto application = std::make_shared<ApplicationObject>(session);
    session->application = application;
    return application;
}

ApplicationSummary SummarizeApplication(const HostObject& application) {
    return SummarizeModel(SessionOf(application).Model());
}

void SetObjectSaver(const HostObject& application, ObjectSaver saver) {
    SessionOf(application).saver = std::move(saver);
}

} // namespace tovimar::platform::access
