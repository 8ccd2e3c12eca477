#pragma once

#include "platform/AutomationObject.h"
#include "platform/access/Design.h"
#include "platform/access/ExportWriter.h"

#include <functional>
#include <string>
#include <vector>

/// The host application read from files: the late-bound `Application` object with everything below it.
namespace tovimar::platform::access {

/// A folder inside an application that holds a file of this name is passed over: copies of exports that
/// aren't to be read in place of the originals.
inline constexpr const char* kNoApplicationMark = "README.copies";

/// Opens what stands at a native path: a folder of text exports, a database file (`.accdb`, `.mdb`,
/// `.accde`, `.mde`), or a folder that holds both. Exports win over the database; tables that only the
/// database knows are added. Designs are read when they are first asked for.
/// The main window (class "OMain") stands in `Env().windows` as long as the object lives.
/// Raises 0x80040001: "No Access application found in <path>." for a folder without any object, and a text
/// with the native path and the reason for a file that is no database.
HostObject OpenAccessApplication(const std::string& nativePath);

/// A form or report that was closed with its changes. Of a design only the help properties can be saved.
struct SavedObject {
    ObjectKind kind = ObjectKind::Form;
    std::string name;
    std::string exportPath; ///< Windows path of its export, empty for an object of a database file
    HelpProperties changes;

    bool HasChanges() const { return changes.contextId || changes.file; }
};
using ObjectSaver = std::function<void(const SavedObject&)>;
/// Who keeps what is saved; nothing is written without a saver. What it raises, closing the object raises.
void SetObjectSaver(const HostObject& application, ObjectSaver saver);

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

/// Reads the designs of all forms and reports for their captions. Ctrl+C cuts the list short. Raises as
/// OpenAccessApplication.
ApplicationSummary SummarizeApplication(const std::string& nativePath);
/// The same of an opened application; what was read stays with it.
ApplicationSummary SummarizeApplication(const HostObject& application);

} // namespace tovimar::platform::access
