#pragma once

#include "platform/access/Design.h"
#include "platform/access/LateBound.h"

#include <memory>

namespace tovimar::platform::access {

class WindowObject;

/// A section of an open form or report.
class SectionObject : public LateBound<SectionObject> {
public:
    SectionObject(const std::shared_ptr<WindowObject>& window, const DesignObject& design,
                  std::int32_t number)
        : window_(window), design_(&design), number_(number) {}

    std::string ClassName() const override { return "Section"; }
    static const MemberTable<SectionObject>& Members();

protected:
    std::optional<Value> FindOther(std::string_view name, const Arguments& arguments) override;

private:
    Value ReadHeight(const Arguments&);
    Value ReadName(const Arguments&) { return design_->name; }
    Value ReadPrintedLeft(const Arguments&) { return PrintedPlace().first; }
    Value ReadPrintedTop(const Arguments&) { return PrintedPlace().second; }
    /// Pixels in the client area of a preview. Raises 438 in other views and for a section that isn't
    /// printed.
    std::pair<int, int> PrintedPlace();
    Value ReadNumber(const Arguments&) { return number_; }
    Value ReadProperties(const Arguments& arguments);

    std::weak_ptr<WindowObject> window_;
    const DesignObject* design_;
    std::int32_t number_;
};

} // namespace tovimar::platform::access
