#include "host/FakeAccess.h"

#include <algorithm>

namespace tovimar::test {
namespace {

[[noreturn]] void RaiseNoMember(std::string_view member) {
    throw RaisedError(438, "Object doesn't support this property or method: " + std::string(member), "Fake");
}

} // namespace

Value FakeObject::Get(std::string_view member, const Arguments& arguments) {
    if (const auto method = methods.find(Key(member)); method != methods.end())
        return method->second(arguments);
    if (text::EqualsIgnoringCase(member, "Properties") && arguments.size() == 1)
        return PropertyCalled(arguments[0].AsString());
    const auto value = values.find(Key(member));
    if (value == values.end())
        RaiseNoMember(member);
    if (arguments.empty() || !value->second.AsObject())
        return value->second;
    return value->second.AsObject()->Get("Item", arguments);
}

Value FakeObject::PropertyCalled(const std::string& name) {
    auto property = std::make_shared<FakeObject>("Property");
    property->With("Value", Get(name));
    return HostObject(property);
}

Value FakeList::Get(std::string_view member, const Arguments& arguments) {
    if (text::EqualsIgnoringCase(member, "Count"))
        return static_cast<std::int32_t>(items.size());
    if (!text::EqualsIgnoringCase(member, "Item"))
        RaiseNoMember(member);
    if (arguments.at(0).IsInteger())
        return HostObject(items.at(static_cast<std::size_t>(arguments[0].AsInteger())));
    for (const Fake& item : items)
        if (text::EqualsIgnoringCase(item->Get("Name").AsString(), arguments[0].AsString()))
            return HostObject(item);
    throw RaisedError(missing, "No item " + arguments[0].AsString(), "Fake");
}

Fake MakeFake(const std::string& className, const std::string& name) {
    auto object = std::make_shared<FakeObject>(className);
    if (!name.empty())
        object->With("Name", name);
    return object;
}

std::shared_ptr<FakeList> MakeList(std::vector<Fake> items) {
    auto list = std::make_shared<FakeList>();
    list->items = std::move(items);
    return list;
}

Fake AddControl(const Fake& form, const Fake& parent, const std::string& className, const std::string& name,
                int left, int top, int width, int height) {
    const auto listOf = [](const Fake& owner) {
        return std::dynamic_pointer_cast<FakeList>(owner->Get("Controls").AsObject());
    };
    Fake control = MakeFake(className, name);
    control->With("Parent", HostObject(parent)).With("Visible", true).With("Section", 0);
    control->With("Left", left).With("Top", top).With("Width", width).With("Height", height);
    control->With("Controls", HostObject(MakeList()));
    listOf(form)->items.push_back(control);
    if (parent != form && parent->values.count("controls") != 0)
        listOf(parent)->items.push_back(control);
    return control;
}

FakeAccess::FakeAccess()
    : app(MakeFake("Application")), project(MakeFake("CurrentProject", "Orders.accdb")),
      database(MakeFake("Database")) {
    for (const char* name : {"AllForms", "AllReports", "AllTables", "AllQueries", "AllMacros", "Forms",
                             "Reports", "TableDefs", "QueryDefs", "Relations"})
        lists[name] = MakeList();
    project->With("FullName", "C:\\Data\\Orders.accdb").With("Path", "C:\\Data").With("ProjectType", 2);
    const Fake data = MakeFake("CurrentData");
    for (const char* name : {"AllForms", "AllReports", "AllMacros"})
        project->With(name, HostObject(lists[name]));
    for (const char* name : {"AllTables", "AllQueries"})
        data->With(name, HostObject(lists[name]));
    for (const char* name : {"TableDefs", "QueryDefs", "Relations"})
        database->With(name, HostObject(lists[name]));

    const Fake doCmd = MakeFake("DoCmd");
    for (const char* name : {"Hourglass", "RunCommand", "SelectObject"})
        doCmd->On(name, [this, name](const auto& arguments) {
            Log(name, arguments);
            return Value();
        });
    doCmd->On("OpenForm", [this](const auto& a) {
        Log("OpenForm", a);
        return Open("Forms", "Form_", a);
    });
    doCmd->On("OpenReport", [this](const auto& a) {
        Log("OpenReport", a);
        return Open("Reports", "Report_", a);
    });
    doCmd->On("Close", [this](const auto& a) {
        Log("Close", a);
        auto& open = lists[a.at(0).AsInteger() == 2 ? "Forms" : "Reports"]->items;
        std::erase_if(open, [&](const Fake& o) { return o->Get("Name").AsString() == a.at(1).AsString(); });
        return Value();
    });
    app->With("CurrentProject", HostObject(project)).With("CurrentData", HostObject(data));
    app->With("CurrentDb", HostObject(database)).With("DoCmd", HostObject(doCmd));
    app->With("Forms", HostObject(lists["Forms"])).With("Reports", HostObject(lists["Reports"]));
    app->With("hWndAccessApp", 4711).With("Version", "16.0");
    app->On("RefreshDatabaseWindow", [](const auto&) { return Value(); });
    app->On("SysCmd", [this](const auto& arguments) {
        Log("SysCmd", arguments);
        return Value();
    });
    app->On("SaveAsText", [this](const auto& arguments) {
        if (saveAsText)
            saveAsText(arguments.at(1).AsString(), arguments.at(2).AsString());
        return Value();
    });
}

void FakeAccess::Log(const std::string& member, const AutomationObject::Arguments& arguments) {
    std::string line = member;
    for (const Value& argument : arguments)
        line += " " + (argument.IsNull() ? std::string("-") : argument.AsString());
    calls.push_back(line);
}

Fake FakeAccess::AddPlain(const char* catalogue, const std::string& name) {
    Fake entry = MakeFake("AccessObject", name);
    lists[catalogue]->items.push_back(entry);
    return entry;
}

Fake FakeAccess::AddDesign(const char* prefix, const char* catalogue, const std::string& name) {
    AddPlain(catalogue, name);
    Fake design = MakeFake(prefix + name, name);
    design->With("Controls", HostObject(MakeList())).With("hWnd", 77).With("Caption", name);
    design->With("HelpContextId", 0).With("HelpFile", "").With("BorderStyle", 2).With("DefaultView", 0);
    design->With("Width", 6000).With("InsideWidth", 100).With("InsideHeight", 200).With("hasmodule", false);
    design->On("SetFocus", [](const auto&) { return Value(); });
    designs_[prefix + name] = design;
    return design;
}

Fake FakeAccess::AddForm(const std::string& name) {
    return AddDesign("Form_", "AllForms", name);
}

Fake FakeAccess::AddReport(const std::string& name) {
    return AddDesign("Report_", "AllReports", name);
}

Value FakeAccess::Open(const char* openList, const std::string& prefix,
                       const AutomationObject::Arguments& arguments) {
    if (!openFailures.empty()) {
        const ResultCode number = openFailures.front();
        openFailures.erase(openFailures.begin());
        throw RaisedError(number, "Orders.form, line 7: no End", "DoCmd");
    }
    const Fake design = designs_.at(prefix + arguments.at(0).AsString());
    // The numbers of the views to open (normal, design, preview, datasheet) as the numbers of open views.
    constexpr std::int32_t kCurrentViews[] = {1, 0, 5, 2};
    design->With("currentview", kCurrentViews[arguments.at(1).AsInteger()]);
    lists[openList]->items.push_back(design);
    return {};
}

} // namespace tovimar::test
