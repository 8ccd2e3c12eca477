#pragma once

#include "platform/access/Design.h"

#include <cstdint>
#include <string>
#include <vector>

/// What was read of a database's designs, told to somebody who wants to know whether it is right.
namespace tovimar::platform::access {

class DatabaseDesigns;

struct InspectedProperty {
    std::string name;       ///< in text exports; "Unknown<code>" for one that isn't known
    std::uint32_t slot = 0; ///< its place among the properties of the kind of object
    std::uint16_t code = 0;
    bool isKnown = true;
    std::string value; ///< texts, numbers, "NotDefault"; of bytes their number and the first of them
};

struct InspectedObject {
    std::string type;
    std::string name; ///< empty where it has none
    std::vector<InspectedProperty> properties;
    std::vector<InspectedObject> children;
};

struct Inspection {
    ObjectKind kind = ObjectKind::Form;
    std::string name;
    std::size_t bytes = 0;     ///< of the design
    std::uint16_t version = 0; ///< of its encoding; 0 for macros and modules
    std::size_t objects = 0;
    std::size_t unknown = 0; ///< properties that aren't known
    InspectedObject root;    ///< of a form or report
    std::string text;        ///< of a macro or module
    /// Sentences: the design goes on behind its end, a list isn't full, the member list names others, ...
    /// Empty for a design that agrees with itself.
    std::vector<std::string> faults;
};

/// Never raises for a damaged design: that is a fault.
Inspection InspectObject(DatabaseDesigns& designs, ObjectKind kind, const std::string& name);

/// Forms, reports, macros and modules in this order. Raises as DatabaseDesigns::Names.
std::vector<Inspection> InspectAll(DatabaseDesigns& designs);

} // namespace tovimar::platform::access
