#include "platform/access/WindowObject.h"

#include "platform/Environment.h"
#include "platform/access/ControlObject.h"
#include "platform/access/DesignValues.h"
#include "platform/access/SectionObject.h"
#include "platform/windowing/WindowSystem.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

constexpr int kMaxNesting = 8;
constexpr ResultCode kNoSuchControl = 2465;
constexpr ResultCode kNoParent = 2452;
constexpr ResultCode kNoSuchSection = 2462;

/// A nested form is shown as the one around it, but as a datasheet where its own default says so.
View NestedView(View outer, const Design& design) {
    constexpr int kDatasheet = 2;
    const bool form = outer == View::Form || outer == View::Datasheet;
    if (form && design.kind == ObjectKind::Form)
        return design.root->Integer("DefaultView") == kDatasheet ? View::Datasheet : View::Form;
    return outer;
}

} // namespace

const MemberTable<WindowObject>& WindowObject::Members() {
    static const MemberTable<WindowObject> kMembers{
        {"Name", &WindowObject::ReadName},
        {"hWnd", &WindowObject::ReadHandle},
        {"Controls", &WindowObject::ReadControls},
        {"Section", &WindowObject::ReadSection},
        {"InsideWidth", &WindowObject::ReadInsideWidth, &WindowObject::WriteInsideWidth},
        {"InsideHeight", &WindowObject::ReadInsideHeight, &WindowObject::WriteInsideHeight},
        {"WindowWidth", &WindowObject::ReadWindowWidth},
        {"WindowHeight", &WindowObject::ReadWindowHeight},
        {"CurrentView", &WindowObject::ReadCurrentView},
        {"HasModule", &WindowObject::ReadHasModule},
        {"Properties", &WindowObject::ReadProperties},
        {"Parent", &WindowObject::ReadParent},
        {"Application", &WindowObject::ReadApplication},
        {"SetFocus", &WindowObject::SetFocus},
        {"Refresh", &WindowObject::Nothing},
        {"Repaint", &WindowObject::Nothing},
        {"Requery", &WindowObject::Nothing},
    };
    return kMembers;
}

WindowObject::WindowObject(SessionRef session, const Design& design, View view, bool hidden)
    : session_(std::move(session)), design_(design.shared_from_this()) {
    open_.design = design_.get();
    open_.application = &Session()->Model();
    open_.view = view;
    open_.hidden = hidden;
}

WindowObject::~WindowObject() = default;

std::shared_ptr<WindowObject> WindowObject::Nested(const std::shared_ptr<ControlObject>& frame,
                                                   const Design& design) {
    const auto outer = frame->Window();
    int depth = 1;
    for (auto window = outer; window; ++depth) {
        if (&window->DesignOf() == &design || depth > kMaxNesting)
            RaiseObjectClosed(design.name);
        const auto around = window->frame_.lock();
        window = around ? around->Window() : nullptr;
    }
    auto nested =
        std::make_shared<WindowObject>(outer->session_, design, NestedView(outer->open_.view, design), false);
    const auto& metrics = Env().windows->Metrics();
    nested->open_.insideWidth =
        RoundToEven(frame->DesignOf().Integer("Width") * 1.0 / metrics.twipsPerPixelX);
    nested->open_.insideHeight =
        RoundToEven(frame->DesignOf().Integer("Height") * 1.0 / metrics.twipsPerPixelY);
    nested->nested_ = true;
    nested->frame_ = frame;
    nested->Build();
    return nested;
}

void WindowObject::Build() {
    controls_ = std::make_shared<CollectionObject>(
        "Controls", 0,
        MissingEntry{kNoSuchControl,
                     "The application can't find the field '|' referred to in your expression."});
    for (const auto& section : open_.design->Sections())
        sections_[section.object] = section.number;
    // In the order of the source, which goes down the form.
    for (const auto& child : open_.design->root->children)
        if (const auto section = sections_.find(child.get()); section != sections_.end())
            AddControls(*child, section->second);
}

/// All controls at every depth in one list. Fillers of a control layout are no controls to a user.
void WindowObject::AddControls(const DesignObject& owner, std::int32_t section) {
    const auto self = std::static_pointer_cast<WindowObject>(shared_from_this());
    for (const auto& child : owner.children) {
        sections_[child.get()] = section;
        if (!child->Is("EmptyCell")) {
            auto control = std::make_shared<ControlObject>(self, *child);
            byDesign_[child.get()] = control;
            controls_->Add(child->name, control);
        }
        AddControls(*child, section);
    }
}

std::string WindowObject::ClassName() const {
    return (Kind() == ObjectKind::Form ? "Form_" : "Report_") + open_.design->name;
}

void WindowObject::CheckOpen() const {
    if (closed_ || session_.expired())
        RaiseObjectClosed(ClassName());
    if (nested_)
        Outermost();
}

WindowObject& WindowObject::Outermost() const {
    if (!nested_)
        return const_cast<WindowObject&>(*this);
    const auto frame = frame_.lock();
    if (!frame)
        RaiseObjectClosed(ClassName());
    auto& outermost = frame->Window()->Outermost();
    outermost.CheckOpen();
    return outermost;
}

std::shared_ptr<ControlObject> WindowObject::ControlOf(const DesignObject& object) {
    const auto found = byDesign_.find(&object);
    return found == byDesign_.end() ? nullptr : found->second;
}

std::int32_t WindowObject::SectionOf(const DesignObject& object) const {
    const auto found = sections_.find(&object);
    return found == sections_.end() ? 0 : found->second;
}

int WindowObject::CurrentPage(const DesignObject& tab) const {
    const auto& pages = Outermost().open_.currentPages;
    const auto found = pages.find(&tab);
    return found == pages.end() ? 0 : found->second;
}

/// A page that there isn't leaves the control as it is.
void WindowObject::SetCurrentPage(const DesignObject& tab, int page) {
    int pages = 0;
    for (const auto& child : tab.children)
        pages += child->Is("Page") ? 1 : 0;
    auto& opened = Outermost().open_;
    if (page < 0 || page >= pages || CurrentPage(tab) == page)
        return;
    opened.currentPages[&tab] = page;
    Env().windows->Invalidate(opened.window);
}

std::int32_t WindowObject::DatasheetPosition(const DesignObject& control) const {
    const auto columns = DatasheetColumns(*open_.design);
    const auto found = std::find(columns.begin(), columns.end(), &control);
    return found == columns.end() ? 0 : static_cast<std::int32_t>(found - columns.begin()) + 1;
}

std::int32_t WindowObject::SectionHeight(const DesignObject& section, std::int32_t number) const {
    const auto twips = section.Integer("Height");
    if (open_.view != View::Form)
        return twips;
    const auto& metrics = Env().windows->Metrics();
    const auto shown = open_.Sections(metrics);
    const auto index = static_cast<std::size_t>(number);
    if (index >= shown.pixels.size())
        return twips;
    const int pixels = RoundToEven(static_cast<double>(twips) / metrics.twipsPerPixelY);
    return pixels == shown.pixels[index] ? twips : shown.pixels[index] * metrics.twipsPerPixelY;
}

const std::pair<int, int>* WindowObject::PrintedPlace(std::int32_t section) {
    if (!printed_)
        printed_ = open_.PrintedSections(Env().windows->Metrics(), nested_);
    const auto found = printed_->find(section);
    return found == printed_->end() ? nullptr : &found->second;
}

std::optional<Value> WindowObject::FindOther(std::string_view name, const Arguments&) {
    CheckOpen();
    const auto session = Session();
    if (const Value* written = session->Model().WrittenValue(open_.design, name))
        return *written;
    return EffectiveValue(*open_.design->root, name);
}

void WindowObject::WriteOther(std::string_view name, const Value& value) {
    CheckOpen();
    if (!EffectiveValue(*open_.design->root, name))
        RaiseNoSuchMember(ClassName());
    Session()->Model().WrittenValues(open_.design)[text::FoldCase(name)] = value;
}

Value WindowObject::ReadName(const Arguments&) {
    CheckOpen();
    return open_.design->name;
}

Value WindowObject::ReadHandle(const Arguments&) {
    CheckOpen();
    return Outermost().open_.window;
}

Value WindowObject::ReadControls(const Arguments& arguments) {
    CheckOpen();
    return ListOrItem(controls_, arguments);
}

/// A section that isn't shown in this view is absent, as it is in the picture.
Value WindowObject::ReadSection(const Arguments& arguments) {
    CheckOpen();
    const auto number = IntegerAt(arguments, 0);
    const auto heights = open_.Sections(Env().windows->Metrics());
    const auto index = static_cast<std::size_t>(number);
    const bool shown = number >= 0 && (index >= heights.present.size() || heights.present[index]);
    const auto* section = shown ? open_.design->Section(number) : nullptr;
    if (!section)
        throw RaisedError(kNoSuchSection, "The section number you entered is invalid.", ClassName());
    auto& object = sectionObjects_[number];
    if (!object)
        object = std::make_shared<SectionObject>(std::static_pointer_cast<WindowObject>(shared_from_this()),
                                                 *section, number);
    return ObjectValue(object);
}

Value WindowObject::ReadInsideWidth(const Arguments&) {
    CheckOpen();
    return open_.insideWidth * Env().windows->Metrics().twipsPerPixelX;
}

Value WindowObject::ReadInsideHeight(const Arguments&) {
    CheckOpen();
    return open_.insideHeight * Env().windows->Metrics().twipsPerPixelY;
}

void WindowObject::WriteInsideWidth(const Value& value) {
    Resize(open_.insideWidth, value, /*horizontal=*/true);
}

void WindowObject::WriteInsideHeight(const Value& value) {
    Resize(open_.insideHeight, value, /*horizontal=*/false);
}

/// A design window doesn't get too small for its surface: tabs and controls may reach beyond the form's
/// width.
int WindowObject::LeastSide(bool horizontal) const {
    if (open_.view != View::Design || nested_)
        return 0;
    OpenObject whole = open_;
    SetInitialSize(whole, Env().windows->Metrics());
    return horizontal ? whole.insideWidth : whole.insideHeight;
}

/// The window grows and shrinks with its client area; its frame stays.
void WindowObject::Resize(int& side, const Value& twips, bool horizontal) {
    constexpr double kMostPixels = 16000;
    CheckOpen();
    auto& windows = *Env().windows;
    const auto& metrics = windows.Metrics();
    const double perPixel = horizontal ? metrics.twipsPerPixelX : metrics.twipsPerPixelY;
    const int asked = RoundToEven(std::clamp(twips.AsDouble() / perPixel, 0.0, kMostPixels));
    const int pixels = std::max(asked, LeastSide(horizontal));
    const int growth = pixels - side;
    side = pixels;
    auto* window = windows.Find(open_.window);
    if (!window || growth == 0)
        return;
    (horizontal ? window->rectangle.right : window->rectangle.bottom) += growth;
    (horizontal ? window->client.right : window->client.bottom) += growth;
    windows.Invalidate(open_.window);
}

std::int32_t WindowObject::WindowSide(bool horizontal) const {
    CheckOpen();
    auto& windows = *Env().windows;
    const auto& metrics = windows.Metrics();
    const auto* window = windows.Find(Outermost().open_.window);
    if (horizontal)
        return (window ? window->rectangle.Width() : open_.insideWidth) * metrics.twipsPerPixelX;
    return (window ? window->rectangle.Height() : open_.insideHeight) * metrics.twipsPerPixelY;
}

Value WindowObject::ReadWindowWidth(const Arguments&) {
    return WindowSide(/*horizontal=*/true);
}

Value WindowObject::ReadWindowHeight(const Arguments&) {
    return WindowSide(/*horizontal=*/false);
}

Value WindowObject::ReadCurrentView(const Arguments&) {
    CheckOpen();
    return static_cast<std::int32_t>(open_.view);
}

Value WindowObject::ReadHasModule(const Arguments&) {
    CheckOpen();
    return !open_.design->code.empty();
}

Value WindowObject::ReadProperties(const Arguments& arguments) {
    CheckOpen();
    const auto* root = open_.design->root.get();
    const auto properties =
        std::make_shared<OwnerProperties>(shared_from_this(), [root] { return PropertyNames(*root); });
    return arguments.empty() ? ObjectValue(properties) : properties->Entry(arguments[0]);
}

Value WindowObject::ReadParent(const Arguments&) {
    CheckOpen();
    const auto frame = frame_.lock();
    if (!frame)
        throw RaisedError(kNoParent,
                          "The expression you entered has an invalid reference to the Parent property.",
                          ClassName());
    return ObjectValue(frame->Window());
}

Value WindowObject::ReadApplication(const Arguments&) {
    CheckOpen();
    return ObjectValue(Session()->application.lock());
}

Value WindowObject::SetFocus(const Arguments&) {
    CheckOpen();
    if (!nested_)
        Session()->Activate(std::static_pointer_cast<WindowObject>(shared_from_this()));
    return {};
}

} // namespace tovimar::platform::access
