#pragma once

#include "platform/access/AccessSession.h"
#include "platform/access/Collections.h"
#include "platform/access/OpenObject.h"

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace tovimar::platform::access {

class ControlObject;

/// An open form or report: class "Form_<name>" or "Report_<name>". A subform control has one of its own,
/// which shares the window of the outermost form.
class WindowObject : public LateBound<WindowObject> {
public:
    WindowObject(SessionRef session, const Design& design, View view, bool hidden);
    ~WindowObject() override;

    /// Controls and sections need the finished object; called once after construction.
    void Build();
    /// The nested form of a subform control. Raises 2467 for a form that is its own ancestor, or that lies
    /// deeper than 8 levels.
    static std::shared_ptr<WindowObject> Nested(const std::shared_ptr<ControlObject>& frame,
                                                const Design& design);

    std::string ClassName() const override;
    static const MemberTable<WindowObject>& Members();

    const Design& DesignOf() const { return *open_.design; }
    ObjectKind Kind() const { return open_.design->kind; }
    OpenObject& Opened() { return open_; }
    bool IsNested() const { return nested_; }
    void MarkClosed() { closed_ = true; }

    /// The control's automation object; the same one at each call.
    std::shared_ptr<ControlObject> ControlOf(const DesignObject& object);
    std::int32_t SectionOf(const DesignObject& object) const;
    std::shared_ptr<AccessSession> Session() const { return Live(session_); }
    /// Page shown by a tab control, from 0.
    int CurrentPage(const DesignObject& tab) const;
    void SetCurrentPage(const DesignObject& tab, int page);
    /// Place of a control among the columns of the datasheet, from 1; 0 for one that is no column.
    std::int32_t DatasheetPosition(const DesignObject& control) const;
    /// Twips; in form view what is shown of the section, which for a continuous form are several records.
    std::int32_t SectionHeight(const DesignObject& section, std::int32_t number) const;

    /// Where a preview prints the first of a section; null in other views.
    const std::pair<int, int>* PrintedPlace(std::int32_t section);

protected:
    std::optional<Value> FindOther(std::string_view name, const Arguments& arguments) override;
    void WriteOther(std::string_view name, const Value& value) override;

private:
    void AddControls(const DesignObject& owner, std::int32_t section);
    void CheckOpen() const;
    WindowObject& Outermost() const;
    void Resize(int& side, const Value& twips, bool horizontal);
    std::int32_t WindowSide(bool horizontal) const;
    int LeastSide(bool horizontal) const;

    Value ReadName(const Arguments&);
    Value ReadHandle(const Arguments&);
    Value ReadControls(const Arguments& arguments);
    Value ReadSection(const Arguments& arguments);
    Value ReadInsideWidth(const Arguments&);
    Value ReadInsideHeight(const Arguments&);
    void WriteInsideWidth(const Value& value);
    void WriteInsideHeight(const Value& value);
    Value ReadWindowWidth(const Arguments&);
    Value ReadWindowHeight(const Arguments&);
    Value ReadCurrentView(const Arguments&);
    Value ReadHasModule(const Arguments&);
    Value ReadProperties(const Arguments& arguments);
    Value ReadParent(const Arguments&);
    Value ReadApplication(const Arguments&);
    Value SetFocus(const Arguments&);
    Value Nothing(const Arguments&) { return {}; }

    SessionRef session_;
    std::shared_ptr<const Design> design_;
    OpenObject open_;
    bool nested_ = false;
    bool closed_ = false;
    std::weak_ptr<ControlObject> frame_; ///< the subform control of a nested form
    int depth_ = 0;
    std::shared_ptr<CollectionObject> controls_;
    std::unordered_map<const DesignObject*, std::shared_ptr<ControlObject>> byDesign_;
    std::unordered_map<const DesignObject*, std::int32_t> sections_;
    std::unordered_map<std::int32_t, HostObject> sectionObjects_;
    std::optional<std::map<int, std::pair<int, int>>> printed_; ///< none until it is asked for
    std::shared_ptr<OwnerProperties> properties_;
};

} // namespace tovimar::platform::access
