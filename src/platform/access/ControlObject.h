#pragma once

#include "platform/access/Collections.h"
#include "platform/access/Design.h"
#include "platform/access/LateBound.h"

#include <memory>
#include <string>

namespace tovimar::platform::access {

class WindowObject;

/// A control of an open form or report. It belongs to its window object and raises 2467 without it.
class ControlObject : public LateBound<ControlObject> {
public:
    ControlObject(const std::shared_ptr<WindowObject>& window, const DesignObject& design)
        : window_(window), design_(&design) {}

    std::string ClassName() const override;
    static const MemberTable<ControlObject>& Members();

    std::optional<Value> FindProperty(const std::string& name) override;

    const DesignObject& DesignOf() const { return *design_; }
    std::shared_ptr<WindowObject> Window() const;
    /// The subform's own form; raises 2467 when there is none.
    std::shared_ptr<WindowObject> NestedWindow(ObjectKind kind);

protected:
    std::optional<Value> FindOther(std::string_view name, const Arguments& arguments) override;
    void WriteOther(std::string_view name, const Value& value) override;

private:
    std::shared_ptr<CollectionObject> Children();
    void AddDescendants(const DesignObject& owner, CollectionObject& list);

    Value ReadName(const Arguments&);
    Value ReadControlType(const Arguments&);
    Value ReadParent(const Arguments&);
    Value ReadSection(const Arguments&);
    Value ReadVisible(const Arguments&);
    Value ReadControls(const Arguments& arguments);
    Value ReadPages(const Arguments& arguments);
    Value ReadPageIndex(const Arguments&);
    Value ReadForm(const Arguments&);
    Value ReadReport(const Arguments&);
    Value ReadValue(const Arguments&);
    void WriteValue(const Value& value);
    Value ReadColumnWidth(const Arguments&);
    Value ReadColumnOrder(const Arguments&);
    Value ReadProperties(const Arguments& arguments);
    Value Nothing(const Arguments&) { return {}; }

    std::weak_ptr<WindowObject> window_;
    const DesignObject* design_; ///< of the application's model, which outlives the window
    std::shared_ptr<CollectionObject> children_;
    std::shared_ptr<CollectionObject> pages_;
    std::shared_ptr<WindowObject> nested_;
};

} // namespace tovimar::platform::access
