#include "platform/access/CodeObjects.h"

namespace tovimar::platform::access {

namespace {

constexpr ResultCode kSubscript = 9;

/// The code behind a component's name: "Form_Orders", "Report_Sales", or a module's own name. The host has
/// no component for a form without code.
std::optional<std::string> CodeOf(ApplicationModel& model, const std::string& component) {
    for (const auto& [prefix, kind] :
         {std::pair("Form_", ObjectKind::Form), std::pair("Report_", ObjectKind::Report)}) {
        if (!text::StartsWithIgnoringCase(component, prefix))
            continue;
        const auto* design = model.FindDesign(kind, component.substr(std::string_view(prefix).size()));
        if (design && !design->code.empty())
            return design->code;
    }
    return model.ModuleCode(component);
}

class Component : public LateBound<Component> {
public:
    Component(std::string name, HostObject module) : name_(std::move(name)), module_(std::move(module)) {}
    std::string ClassName() const override { return "VBComponent"; }
    static const MemberTable<Component>& Members() {
        static const MemberTable<Component> kMembers{{"Name", &Component::ReadName},
                                                     {"CodeModule", &Component::ReadModule}};
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return name_; }
    Value ReadModule(const Arguments&) { return ObjectValue(module_); }

    std::string name_;
    HostObject module_;
};

/// Components are made when they are asked for: reading all code of an application takes long.
class Components : public LateBound<Components> {
public:
    explicit Components(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "VBComponents"; }
    static const MemberTable<Components>& Members() {
        static const MemberTable<Components> kMembers{{"Item", &Components::ReadItem},
                                                      {"Count", &Components::ReadCount}};
        return kMembers;
    }
    Value At(const Value& key) {
        const auto name = key.IsInteger() ? NameAt(key.AsInteger()) : key.AsString();
        const auto code = CodeOf(Live(session_)->Model(), name);
        if (!code)
            throw RaisedError(kSubscript, "Subscript out of range", ClassName());
        return ObjectValue(std::make_shared<Component>(name, std::make_shared<CodeModule>(name, *code)));
    }

private:
    std::vector<std::string> Names() {
        auto& model = Live(session_)->Model();
        std::vector<std::string> names;
        for (const auto& [prefix, kind] :
             {std::pair("Form_", ObjectKind::Form), std::pair("Report_", ObjectKind::Report),
              std::pair("", ObjectKind::Module)})
            for (const auto& name : model.Names(kind))
                if (CodeOf(model, prefix + name))
                    names.push_back(prefix + name);
        return names;
    }
    std::string NameAt(std::int32_t position) {
        const auto names = Names();
        const bool known = position >= 1 && static_cast<std::size_t>(position) <= names.size();
        return known ? names[static_cast<std::size_t>(position) - 1] : std::string();
    }
    Value ReadItem(const Arguments& arguments) { return At(ArgumentAt(arguments, 0)); }
    Value ReadCount(const Arguments&) { return static_cast<std::int32_t>(Names().size()); }

    SessionRef session_;
};

class Project : public LateBound<Project> {
public:
    explicit Project(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "VBProject"; }
    static const MemberTable<Project>& Members() {
        static const MemberTable<Project> kMembers{{"Name", &Project::ReadName},
                                                   {"VBComponents", &Project::ReadComponents}};
        return kMembers;
    }

private:
    Value ReadName(const Arguments&) { return Live(session_)->Model().ProjectName(); }
    Value ReadComponents(const Arguments& arguments) {
        const auto components = std::make_shared<Components>(session_);
        return arguments.empty() ? ObjectValue(components) : components->At(arguments[0]);
    }

    SessionRef session_;
};

class Editor : public LateBound<Editor> {
public:
    explicit Editor(SessionRef session) : session_(std::move(session)) {}
    std::string ClassName() const override { return "VBE"; }
    static const MemberTable<Editor>& Members() {
        static const MemberTable<Editor> kMembers{{"VBProjects", &Editor::ReadProjects},
                                                  {"ActiveVBProject", &Editor::ReadActive}};
        return kMembers;
    }

private:
    Value ReadProjects(const Arguments& arguments) {
        const auto projects = std::make_shared<CollectionObject>("VBProjects", 1, MissingEntry{});
        projects->Add(Live(session_)->Model().ProjectName(), std::make_shared<Project>(session_));
        return ListOrItem(projects, arguments);
    }
    Value ReadActive(const Arguments&) { return ObjectValue(std::make_shared<Project>(session_)); }

    SessionRef session_;
};

} // namespace

HostObject MakeCodeEditor(const SessionRef& session) {
    return std::make_shared<Editor>(session);
}

} // namespace tovimar::platform::access
