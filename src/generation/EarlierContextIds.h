#pragma once

#include <cstdint>
#include <string>
#include <unordered_map>
#include <unordered_set>

namespace tovimar {

/// The help context ids that an earlier run gave, by object and control: the numbers live on in the compiled
/// help, in the developer's code and in what was written into the application, so a run that makes the
/// project anew gives the same ones again. Numbers of objects that are gone aren't given to others.
class EarlierContextIds {
public:
    /// Reads the saved definitions of a project; what doesn't load is passed over.
    void Load(const std::string& definitionsFolder);

    /// 0 for an object or control that had none. `control` is empty for the object itself, the control's
    /// name, or "parent/child" for a control inside another.
    std::int32_t IdOf(const std::string& object, const std::string& control) const;
    bool Holds(std::int32_t id) const { return ids_.contains(id); }

private:
    void Take(const std::string& object, const std::string& control, std::int32_t id);

    std::unordered_map<std::string, std::int32_t> byOwner_;
    std::unordered_set<std::int32_t> ids_;
};

} // namespace tovimar
