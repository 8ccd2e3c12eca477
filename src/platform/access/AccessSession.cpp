#include "platform/access/AccessSession.h"

#include "platform/Environment.h"
#include "platform/access/MainWindow.h"
#include "platform/access/WindowObject.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr ResultCode kNoSuchForm = 2102;
constexpr ResultCode kNoSuchReport = 2103;

RelationshipTable TableOf(ApplicationModel& model, const std::string& name) {
    RelationshipTable box{name, {}, {}};
    const auto* table = model.FindTable(name);
    if (!table)
        return box;
    for (const auto& field : table->fields) {
        box.fields.push_back(field.name);
        box.inPrimaryKey.push_back(field.inPrimaryKey);
    }
    return box;
}

} // namespace

std::shared_ptr<AccessSession> Live(const SessionRef& session) {
    auto live = session.lock();
    if (!live)
        RaiseObjectClosed("Application");
    return live;
}

AccessSession::AccessSession(std::unique_ptr<ApplicationModel> model) : model_(std::move(model)) {
    mainWindow_ = Env().windows->Open(std::make_unique<MainWindow>(BaseTitle()));
}

AccessSession::~AccessSession() {
    for (const auto& object : open_)
        object->MarkClosed();
    // The windows read their objects when they paint, so they go first.
    if (auto* windows = Env().windows.get())
        windows->Close(mainWindow_);
}

std::string AccessSession::BaseTitle() const {
    return "Microsoft Access - " + model_->ProjectName();
}

std::shared_ptr<WindowObject> AccessSession::FindOpen(ObjectKind kind, const std::string& name) const {
    const auto found = std::find_if(open_.begin(), open_.end(), [&](const auto& object) {
        return object->Kind() == kind && text::EqualsIgnoringCase(object->DesignOf().name, name);
    });
    return found == open_.end() ? nullptr : *found;
}

std::vector<std::shared_ptr<WindowObject>> AccessSession::OpenObjects(ObjectKind kind) const {
    std::vector<std::shared_ptr<WindowObject>> objects;
    for (const auto& object : open_)
        if (object->Kind() == kind)
            objects.push_back(object);
    return objects;
}

void AccessSession::Open(ObjectKind kind, const std::string& name, View view, bool hidden) {
    const bool form = kind == ObjectKind::Form;
    if (!model_->Contains(kind, name))
        throw RaisedError(form ? kNoSuchForm : kNoSuchReport,
                          std::string("The ") + (form ? "form" : "report") + " name '" + name +
                              "' is misspelled or refers to a " + (form ? "form" : "report") +
                              " that doesn't exist.",
                          "DoCmd");
    if (const auto known = FindOpen(kind, name)) {
        if (known->Opened().view == view && known->Opened().hidden == hidden)
            return Activate(known);
        Close(kind, name);
    }
    const auto& design = model_->OpenDesign(kind, name);
    auto object = std::make_shared<WindowObject>(weak_from_this(), design, view, hidden);
    object->Build();
    auto& opened = object->Opened();
    auto& windows = *Env().windows;
    SetInitialSize(opened, windows.Metrics());
    open_.push_back(object);
    if (!hidden)
        OpenWindows(opened);
    Activate(object);
}

void AccessSession::OpenWindows(OpenObject& opened) {
    auto& windows = *Env().windows;
    auto window = MakeObjectWindow(opened, windows.Metrics());
    window->parent = mainWindow_;
    opened.window = windows.Open(std::move(window));
    if (opened.view != View::Preview)
        return;
    auto page = MakePreviewPageWindow(opened, windows.Metrics());
    page->parent = opened.window;
    windows.Open(std::move(page));
}

void AccessSession::Close(ObjectKind kind, const std::string& name, Saving saving) {
    const auto object = FindOpen(kind, name);
    if (!object)
        return;
    const SavedObject saved = saving == Saving::Yes ? model_->ChangesOf(object->DesignOf()) : SavedObject();
    if (object->Opened().window != 0)
        Env().windows->Close(object->Opened().window);
    object->MarkClosed();
    std::erase(open_, object);
    if (open_.empty())
        model_->TrimDesigns();
    if (saver && saved.HasChanges())
        saver(saved);
}

std::shared_ptr<WindowObject> AccessSession::Active(ObjectKind kind) const {
    auto active = active_[kind == ObjectKind::Form ? 0 : 1].lock();
    const bool open = active && std::find(open_.begin(), open_.end(), active) != open_.end();
    return open ? active : nullptr;
}

void AccessSession::Activate(const std::shared_ptr<WindowObject>& object) {
    if (object->Opened().hidden)
        return;
    active_[object->Kind() == ObjectKind::Form ? 0 : 1] = object;
    currentObjectName = object->DesignOf().name;
    currentObjectType = static_cast<std::int32_t>(object->Kind());
}

/// The tables that take part in a relation, in the order of the relations.
void AccessSession::OpenRelationships() {
    auto& windows = *Env().windows;
    for (auto child = windows.FirstChild(mainWindow_); child != 0; child = windows.NextSibling(child))
        if (windows.Find(child)->className == "OSysRel")
            return;
    std::vector<RelationshipTable> tables;
    std::vector<RelationshipLine> lines;
    const auto add = [&](const std::string& name) {
        const bool known = std::any_of(tables.begin(), tables.end(), [&](const auto& table) {
            return text::EqualsIgnoringCase(table.name, name);
        });
        if (!known)
            tables.push_back(TableOf(*model_, name));
    };
    for (const auto& relation : model_->Relations()) {
        add(relation.table);
        add(relation.foreignTable);
        for (const auto& [field, foreignField] : relation.fields)
            lines.push_back(
                {relation.table, field, relation.foreignTable, foreignField, (relation.attributes & 1) != 0});
    }
    auto window = MakeRelationshipsWindow(tables, lines, windows.Metrics());
    window->parent = mainWindow_;
    windows.Open(std::move(window));
}

} // namespace tovimar::platform::access
