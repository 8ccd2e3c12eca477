#pragma once

#include "platform/AutomationObject.h"
#include "platform/access/Design.h"

#include <string>
#include <vector>

/// The host application read from files: the late-bound `Application` object with everything below it.
namespace tovimar::platform::access {

/// Opens what stands at a native path: a folder of text exports, a database file (`.accdb`, `.mdb`,
/// `.accde`, `.mde`), or a folder that holds both. Exports win over the database; tables that only the
/// database knows are added. Designs are read when they are first asked for.
/// The main window (class "OMain") stands in `Env().windows` as long as the object lives.
/// Raises 0x80040001: "No Access application found in <path>." for a folder without any object, and a text
/// with the native path and the reason for a file that is no database.
HostObject OpenAccessApplication(const std::string& nativePath);

/// One object as a listing shows it.
struct ObjectSummary {
    ObjectKind kind = ObjectKind::Form;
    std::string name;
    std::string caption;     ///< empty where the object has none
    bool designKnown = true; ///< false: the database gives the name only
    std::string error;       ///< why the object can't be opened; empty for a sound one
};

struct ApplicationSummary {
    std::string name;
    std::string fullName; ///< Windows path of the database, see CurrentProject.FullName
    /// By kind in the order of ObjectKind, within a kind sorted without regard to case. No system tables.
    std::vector<ObjectSummary> objects;
    /// Sentences for a person, such as how many forms are known by name only.
    std::vector<std::string> notes;
};

/// Reads the designs of all forms and reports for their captions. Raises as OpenAccessApplication.
ApplicationSummary SummarizeApplication(const std::string& nativePath);
/// The same of an opened application; what was read stays with it.
ApplicationSummary SummarizeApplication(const HostObject& application);

} // namespace tovimar::platform::access
