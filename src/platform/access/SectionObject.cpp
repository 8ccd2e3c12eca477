#include "platform/access/SectionObject.h"

#include "platform/access/Collections.h"
#include "platform/access/DesignValues.h"
#include "platform/access/WindowObject.h"

namespace tovimar::platform::access {

const MemberTable<SectionObject>& SectionObject::Members() {
    static const MemberTable<SectionObject> kMembers{{"Name", &SectionObject::ReadName},
                                                     {"Height", &SectionObject::ReadHeight},
                                                     {"Section", &SectionObject::ReadNumber},
                                                     {"PrintedLeft", &SectionObject::ReadPrintedLeft},
                                                     {"PrintedTop", &SectionObject::ReadPrintedTop},
                                                     {"Properties", &SectionObject::ReadProperties}};
    return kMembers;
}

Value SectionObject::ReadHeight(const Arguments&) {
    const auto window = window_.lock();
    if (!window)
        RaiseObjectClosed(ClassName());
    return window->SectionHeight(*design_, number_);
}

std::pair<int, int> SectionObject::PrintedPlace() {
    const auto window = window_.lock();
    const auto* place = window ? window->PrintedPlace(number_) : nullptr;
    if (place == nullptr)
        RaiseNoSuchMember(ClassName());
    return *place;
}

std::optional<Value> SectionObject::FindOther(std::string_view name, const Arguments&) {
    return EffectiveValue(*design_, name);
}

Value SectionObject::ReadProperties(const Arguments& arguments) {
    const auto* design = design_;
    const auto properties =
        std::make_shared<OwnerProperties>(shared_from_this(), [design] { return PropertyNames(*design); });
    return arguments.empty() ? ObjectValue(properties) : properties->Entry(arguments[0]);
}

} // namespace tovimar::platform::access
