// Which controls of a form, report or container the help lists; tab pages; places of controls.
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/FormFacts.h"
#include "host/access/LateBound.h"
#include "host/contract/ObjectTypes.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CN_IDEAccFormProcessor";
constexpr std::int32_t kRefreshAfterPageChange = 40;
constexpr ResultCode kObjectClosed = 2467;
constexpr int kMostParents = 64;

bool Is(const std::string& typeName, const char* word) {
    return text::EqualsIgnoringCase(typeName, word);
}

bool IsSubformFrame(const std::string& typeName) {
    return Is(typeName, "Subform") || Is(typeName, "Subreport");
}

bool InDesignView(const HostObject& form) {
    return late::IntegerOrZero(form, "currentview") == 0;
}

/// The form or report that a frame shows. A frame of a report may hold either.
HostObject InnerObject(const HostObject& frame, const std::string& typeName) {
    if (Is(typeName, "Subreport"))
        if (HostObject report = late::ObjectOrNull(frame, "Report"))
            return report;
    return late::Object(frame, "Form");
}

/// Does the frame show an object that it lies in itself?
bool ShowsAnEnclosingObject(const HostObject& frame, const HostObject& inner) {
    const std::string innerClass = late::ClassName(inner);
    HostObject outer = late::ObjectOrNull(frame, "Parent");
    for (int i = 0; outer && i < kMostParents; ++i) {
        if (text::EqualsIgnoringCase(late::ClassName(outer), innerClass))
            return true;
        outer = late::ObjectOrNull(outer, "Parent");
    }
    return outer != nullptr;
}

/// A frame without an object, or with a datasheet of a table or query, has no controls of its own.
bool HasNoControls(const HostObject& frame) {
    const std::string source = late::TextOrEmpty(frame, "SourceObject");
    return source.empty() || text::StartsWithIgnoringCase(source, "Table.") ||
           text::StartsWithIgnoringCase(source, "Query.");
}

/// Compares by name. The label of a control counts as a child of the control's container.
class DirectChildren {
public:
    DirectChildren(const HostObject& container, const HostObject& inner)
        : containerName_(late::Text(container, "Name")),
          parentName_(inner ? late::Text(inner, "Name") : containerName_) {}

    bool Include(const HostObject& child) const {
        const HostObject parent = late::ObjectOrNull(child, "Parent");
        if (!parent)
            return false;
        if (text::EqualsIgnoringCase(late::TextOrEmpty(parent, "Name"), parentName_))
            return true;
        if (!Is(late::ClassName(child), "Label"))
            return false;
        const HostObject grandparent = late::ObjectOrNull(parent, "Parent");
        return grandparent &&
               text::EqualsIgnoringCase(late::TextOrEmpty(grandparent, "Name"), containerName_);
    }

private:
    std::string containerName_;
    std::string parentName_;
};

HostObject PageOf(const HostObject& tab, std::int32_t index) {
    return late::Object(tab, "Pages", {index});
}

std::int32_t PageCount(const HostObject& tab) {
    return late::Count(late::Object(tab, "Pages"));
}

} // namespace

CControlsCollection CN_IDEAccFormProcessor::ControlsCollectionGet(const HostObject& rctl) {
    CControlsCollection controls;
    Trapped(kClass, "IClientFormProcessor_ControlsCollectionGet", [&] {
        const std::string typeName = ObjectTypeName(rctl);
        if (!IsSubformFrame(typeName) || !HasNoControls(rctl))
            controls = FilteredChildren(rctl, typeName);
    });
    return controls;
}

CControlsCollection CN_IDEAccFormProcessor::FilteredChildren(const HostObject& object,
                                                             const std::string& typeName) {
    CControlsCollection controls;
    HostObject inner;
    if (IsSubformFrame(typeName)) {
        try {
            inner = InnerObject(object, typeName);
        } catch (const RaisedError& failure) {
            // The frame names an object that the application doesn't have.
            if (failure.Number() == kObjectClosed)
                return controls;
            throw;
        }
        if (!inner || ShowsAnEnclosingObject(object, inner))
            return controls;
    }
    const HostObject children = inner ? late::Object(inner, "Controls") : ChildrenOf(object, typeName);
    if (!children)
        return controls;

    const std::int32_t objectType =
        text::StartsWithIgnoringCase(typeName, "Report_") ? ObjectType::kReport : ObjectType::kForm;
    const CTovimarParameters* parameters = Session::Parameters();
    const bool visibleOnly = parameters != nullptr && parameters->SkipInvisibleControls;
    const DirectChildren directChildren(object, inner);
    late::ForEach(children, [&](const HostObject& child) {
        if (directChildren.Include(child) && !IsSkippedControlType(ObjectTypeName(child), objectType) &&
            (!visibleOnly || late::FlagOrFalse(child, "Visible")))
            controls.Add(child);
    });
    return controls;
}

// Null for an object that contains nothing.
HostObject CN_IDEAccFormProcessor::ChildrenOf(const HostObject& object, const std::string& typeName) {
    if (Is(typeName, "TabControl"))
        return late::Object(object, "Pages");
    const bool container = text::StartsWithIgnoringCase(typeName, "Form_") ||
                           text::StartsWithIgnoringCase(typeName, "Report_") || Is(typeName, "Frame") ||
                           Is(typeName, "OptionGroup") || Is(typeName, "Page");
    return container ? late::Object(object, "Controls") : nullptr;
}

CControlsCollection CN_IDEAccFormProcessor::TabPageControlsCollectionGet(const HostObject& rctlTab,
                                                                         std::int32_t vlngTabIdx) {
    CControlsCollection controls;
    Trapped(kClass, "IClientFormProcessor_TabPageControlsCollectionGet", [&] {
        constexpr std::int32_t kAnyObject = -1;
        const HostObject page = PageOf(rctlTab, vlngTabIdx);
        const DirectChildren directChildren(page, nullptr);
        late::ForEach(late::Object(page, "Controls"), [&](const HostObject& child) {
            if (directChildren.Include(child) && !IsSkippedControlType(ObjectTypeName(child), kAnyObject))
                controls.Add(child);
        });
    });
    return controls;
}

void CN_IDEAccFormProcessor::SetFirstPageVisibleForTabControls(const HostObject& rfrmActual) {
    Trapped(kClass, "IClientFormProcessor_SetFirstPageVisibleForTabControls", [&] {
        const bool designView = InDesignView(rfrmActual);
        late::ForEach(late::Object(rfrmActual, "Controls"), [&](const HostObject& control) {
            if (!Is(late::ClassName(control), "TabControl"))
                return;
            const std::int32_t pages = PageCount(control);
            std::int32_t first = 0;
            while (!designView && first < pages && !late::FlagOrFalse(PageOf(control, first), "Visible"))
                ++first;
            // With every page hidden there is none to show, and the host may say so.
            if (first < pages)
                late::Set(control, "Value", first);
            else
                PassOver([&] { late::Set(control, "Value", first); });
            myDoevents();
        });
    });
}

HostObject CN_IDEAccFormProcessor::TabPageActivate(const HostObject& rfrmActual,
                                                   const HostObject& rctlTabComp,
                                                   std::int32_t vlngTabPageIdx) {
    HostObject shown;
    Trapped(kClass, "IClientFormProcessor_TabPageActivate", [&] {
        const bool designView = InDesignView(rfrmActual);
        const HostObject page = PageOf(rctlTabComp, vlngTabPageIdx);
        if (!designView && !late::FlagOrFalse(page, "Visible"))
            return;
        late::Set(rctlTabComp, "Value", vlngTabPageIdx);
        myDoevents();
        if (designView)
            late::Call(late::Object(application_, "DoCmd"), "RunCommand", {kRefreshAfterPageChange});
        shown = page;
    });
    return shown;
}

std::string CN_IDEAccFormProcessor::TabPageCaptionGet(const HostObject& rctlTabComp, std::int32_t vlngTabIdx,
                                                      bool vfSetTabAsActive) {
    std::string caption;
    Trapped(kClass, "IClientFormProcessor_TabPageCaptionGet", [&] {
        if (vfSetTabAsActive) {
            late::Set(rctlTabComp, "Value", vlngTabIdx);
            myDoevents();
        }
        const HostObject page = PageOf(rctlTabComp, vlngTabIdx);
        caption = late::TextOrEmpty(page, "Caption");
        if (caption.empty())
            caption = late::Text(page, "Name");
        caption = text::ReplaceAll(caption, "&", "");
    });
    return caption;
}

std::string CN_IDEAccFormProcessor::TabControlCaptionGet(const HostObject& rctlTab) {
    std::string caption;
    Trapped(kClass, "IClientFormProcessor_TabControlCaptionGet",
            [&] { caption = "TAB:" + text::ReplaceAll(late::Text(rctlTab, "Name"), "&", ""); });
    return caption;
}

std::int32_t CN_IDEAccFormProcessor::TabControlPagesQtyGet(const HostObject& rctlTab) {
    std::int32_t pages = 0;
    Trapped(kClass, "IClientFormProcessor_TabControlPagesQtyGet", [&] { pages = PageCount(rctlTab); });
    return pages;
}

void CN_IDEAccFormProcessor::GetControlRectangleInTwips(const HostObject&, const HostObject& rctl,
                                                        std::int32_t& rlngLeft, std::int32_t& rlngTop,
                                                        std::int32_t& rlngWidth, std::int32_t& rlngHeight) {
    platform::Rectangle rectangle;
    Trapped(kClass, "IClientFormProcessor_GetControlRectangleInTwips", [&] {
        const HostObject form = clsAccFormDimensions::FormOf(rctl);
        if (form && FactsOf(form).isDatasheet)
            PlaceInDatasheet(form, rctl, rectangle);
        else
            rectangle = dimensions_.ControlRectangle(rctl, /*vfRulerOn=*/false);
    });
    rlngLeft = rectangle.left;
    rlngTop = rectangle.top;
    rlngWidth = rectangle.Width();
    rlngHeight = rectangle.Height();
}

// A control without a column, such as a label, doesn't show in a datasheet.
void CN_IDEAccFormProcessor::PlaceInDatasheet(const HostObject& form, const HostObject& control,
                                              platform::Rectangle& rectangle) {
    const auto& columns = FactsOf(form).columns;
    const auto column = columns.find(late::Text(control, "Name"));
    if (column == columns.end())
        return;
    rectangle = platform::access::ColumnRectangle(platform::Env().windows->Metrics(), column->second.left,
                                                  column->second.width);
}

void CN_IDEAccFormProcessor::GetTabPageTabRectangleInTwips(std::int32_t vlngTabIdx, const HostObject&,
                                                           const HostObject& rctl, std::int32_t& rlngLeft,
                                                           std::int32_t& rlngTop, std::int32_t& rlngWidth,
                                                           std::int32_t& rlngHeight) {
    platform::Rectangle rectangle;
    Trapped(kClass, "IClientFormProcessor_GetTabPageTabRectangleInTwips",
            [&] { rectangle = dimensions_.TabRectangle(rctl, vlngTabIdx, /*vfRulerOn=*/false); });
    rlngLeft = rectangle.left;
    rlngTop = rectangle.top;
    rlngWidth = rectangle.Width();
    rlngHeight = rectangle.Height();
}

} // namespace tovimar
