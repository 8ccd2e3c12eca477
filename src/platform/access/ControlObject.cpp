#include "platform/access/ControlObject.h"

#include "platform/access/DesignValues.h"
#include "platform/access/WindowObject.h"

namespace tovimar::platform::access {

namespace {

constexpr ResultCode kNoSuchControl = 2465;

MissingEntry NoSuchControl() {
    return {kNoSuchControl, "The application can't find the field '|' referred to in your expression."};
}

/// "Form.Orders" and "Report.Sales" name the kind; a bare name is one of the window's own kind.
std::pair<ObjectKind, std::string> SourceOf(const std::string& sourceObject, ObjectKind own) {
    if (text::StartsWithIgnoringCase(sourceObject, "Form."))
        return {ObjectKind::Form, sourceObject.substr(5)};
    if (text::StartsWithIgnoringCase(sourceObject, "Report."))
        return {ObjectKind::Report, sourceObject.substr(7)};
    if (text::StartsWithIgnoringCase(sourceObject, "Table.") ||
        text::StartsWithIgnoringCase(sourceObject, "Query."))
        return {ObjectKind::Table, {}};
    return {own, sourceObject};
}

} // namespace

const MemberTable<ControlObject>& ControlObject::Members() {
    static const MemberTable<ControlObject> kMembers{
        {"Name", &ControlObject::ReadName},
        {"ControlType", &ControlObject::ReadControlType},
        {"Parent", &ControlObject::ReadParent},
        {"Section", &ControlObject::ReadSection},
        {"Visible", &ControlObject::ReadVisible},
        {"Controls", &ControlObject::ReadControls},
        {"Pages", &ControlObject::ReadPages},
        {"PageIndex", &ControlObject::ReadPageIndex},
        {"Form", &ControlObject::ReadForm},
        {"Report", &ControlObject::ReadReport},
        {"Value", &ControlObject::ReadValue, &ControlObject::WriteValue},
        {"ColumnWidth", &ControlObject::ReadColumnWidth},
        {"ColumnOrder", &ControlObject::ReadColumnOrder},
        {"Properties", &ControlObject::ReadProperties},
        {"SetFocus", &ControlObject::Nothing},
        {"Requery", &ControlObject::Nothing},
    };
    return kMembers;
}

std::string ControlObject::ClassName() const {
    return ControlClassName(design_->type);
}

std::shared_ptr<WindowObject> ControlObject::Window() const {
    auto window = window_.lock();
    if (!window)
        RaiseObjectClosed("Control");
    return window;
}

std::optional<Value> ControlObject::FindOther(std::string_view name, const Arguments&) {
    const auto session = Window()->Session();
    if (const Value* written = session->Model().WrittenValue(design_, name))
        return *written;
    return EffectiveValue(*design_, name);
}

void ControlObject::WriteOther(std::string_view name, const Value& value) {
    const auto session = Window()->Session();
    if (!EffectiveValue(*design_, name))
        RaiseNoSuchMember(ClassName());
    session->Model().WrittenValues(design_)[text::FoldCase(name)] = value;
}

Value ControlObject::ReadName(const Arguments&) {
    return design_->name;
}

Value ControlObject::ReadControlType(const Arguments&) {
    return ControlTypeNumber(design_->type);
}

/// The control or page around this one, else the form or report.
Value ControlObject::ReadParent(const Arguments&) {
    const auto window = Window();
    if (design_->parent && ControlTypeNumber(design_->parent->type) != 0)
        return ObjectValue(window->ControlOf(*design_->parent));
    return ObjectValue(window);
}

Value ControlObject::ReadSection(const Arguments&) {
    return Window()->SectionOf(*design_);
}

/// What stands in a section that the view hides isn't to be seen, whatever the control itself says.
Value ControlObject::ReadVisible(const Arguments&) {
    const auto window = Window();
    const auto number = window->SectionOf(*design_);
    const auto* section = window->Opened().design->Section(number);
    if (section && !SectionIsShown(window->Opened().view, number, section->Flag("Visible")))
        return false;
    return ReadOther("Visible", {});
}

std::shared_ptr<CollectionObject> ControlObject::Children() {
    if (!children_) {
        children_ = std::make_shared<CollectionObject>("Children", 0, NoSuchControl());
        AddDescendants(*design_, *children_);
    }
    return children_;
}

void ControlObject::AddDescendants(const DesignObject& owner, CollectionObject& list) {
    for (const auto& child : owner.children) {
        if (const auto control = Window()->ControlOf(*child))
            list.Add(child->name, control);
        AddDescendants(*child, list);
    }
}

Value ControlObject::ReadControls(const Arguments& arguments) {
    return ListOrItem(Children(), arguments);
}

Value ControlObject::ReadPages(const Arguments& arguments) {
    if (!design_->Is("Tab"))
        RaiseNoSuchMember(ClassName());
    if (!pages_) {
        pages_ = std::make_shared<CollectionObject>("Pages", 0, NoSuchControl());
        for (const auto& child : design_->children)
            if (child->Is("Page"))
                pages_->Add(child->name, Window()->ControlOf(*child));
    }
    return ListOrItem(pages_, arguments);
}

Value ControlObject::ReadPageIndex(const Arguments&) {
    if (!design_->Is("Page") || !design_->parent)
        RaiseNoSuchMember(ClassName());
    std::int32_t index = 0;
    for (const auto& child : design_->parent->children) {
        if (child.get() == design_)
            break;
        index += child->Is("Page") ? 1 : 0;
    }
    return index;
}

std::shared_ptr<WindowObject> ControlObject::NestedWindow(ObjectKind kind) {
    if (!design_->Is("Subform"))
        RaiseNoSuchMember(ClassName());
    if (!nested_) {
        const auto window = Window();
        const auto session = window->Session();
        const auto [sourceKind, name] = SourceOf(design_->Text("SourceObject"), window->Kind());
        const auto* design =
            sourceKind == ObjectKind::Table ? nullptr : session->Model().FindDesign(sourceKind, name);
        if (!design)
            RaiseObjectClosed(design_->name);
        nested_ = WindowObject::Nested(std::static_pointer_cast<ControlObject>(shared_from_this()), *design);
    }
    if (nested_->Kind() != kind)
        RaiseObjectClosed(design_->name);
    return nested_;
}

Value ControlObject::ReadForm(const Arguments&) {
    return ObjectValue(NestedWindow(ObjectKind::Form));
}

Value ControlObject::ReadReport(const Arguments&) {
    return ObjectValue(NestedWindow(ObjectKind::Report));
}

/// A tab control's value is the page that it shows; other controls have no record at hand.
Value ControlObject::ReadValue(const Arguments&) {
    if (design_->Is("Tab"))
        return static_cast<std::int32_t>(Window()->CurrentPage(*design_));
    if (!BuiltInDefault(design_->type, "ControlSource"))
        RaiseNoSuchMember(ClassName());
    return {};
}

void ControlObject::WriteValue(const Value& value) {
    if (design_->Is("Tab"))
        Window()->SetCurrentPage(*design_, value.AsInteger());
    else
        ReadValue({});
}

/// In a datasheet width and order are those that are shown, so that a column is found where it is painted.
Value ControlObject::ReadColumnWidth(const Arguments&) {
    const auto window = Window();
    if (window->Opened().view != View::Datasheet || !EffectiveValue(*design_, "ColumnWidth"))
        return ReadOther("ColumnWidth", {});
    return window->DatasheetPosition(*design_) > 0 ? access::DatasheetColumnWidth(*design_) : 0;
}

Value ControlObject::ReadColumnOrder(const Arguments&) {
    const auto window = Window();
    if (window->Opened().view != View::Datasheet || !EffectiveValue(*design_, "ColumnOrder"))
        return ReadOther("ColumnOrder", {});
    return window->DatasheetPosition(*design_);
}

std::optional<Value> ControlObject::FindProperty(const std::string& name) {
    auto value = Find(name);
    return value && value->IsObject() ? std::nullopt : value;
}

Value ControlObject::ReadProperties(const Arguments& arguments) {
    const auto* design = design_;
    const auto properties =
        std::make_shared<OwnerProperties>(shared_from_this(), [design] { return PropertyNames(*design); });
    return arguments.empty() ? ObjectValue(properties) : properties->Entry(arguments[0]);
}

} // namespace tovimar::platform::access
