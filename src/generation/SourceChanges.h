#pragma once

#include "platform/AutomationObject.h"

#include <cstddef>
#include <string>
#include <vector>

namespace tovimar {

namespace platform::access {
struct SavedObject;
}

/// What a run writes back into the application: the help properties of forms and reports, as text exports
/// that differ from the application's own in these lines only. Objects of a database file can't be written.
class SourceChanges {
public:
    /// Copies that an earlier run left: of objects that need no change any more, or of some that this run
    /// doesn't come to.
    enum class Earlier { Remove, Keep };
    enum class Target {
        Copies,   ///< into a tree of folders of its own, changed files only
        Originals ///< over the exports; each one stays beside its new text as "NAME.bak"
    };

    /// `sourceFolder` holds the exports, `copiesFolder` takes the copies; Windows paths.
    SourceChanges(Target target, const std::string& sourceFolder, const std::string& copiesFolder);

    /// Takes everything that the application saves from now on; it mustn't save after this object's end.
    void Attach(const HostObject& application, Earlier earlier = Earlier::Remove);

    std::size_t Written() const { return written_; }
    /// Names of saved objects that have no export.
    const std::vector<std::string>& NotWritten() const { return notWritten_; }
    /// Why an export wasn't written, with its path; it stands as it was. One file that is locked or
    /// read-only keeps nobody from the others.
    const std::vector<std::string>& Failures() const { return failures_; }
    const std::string& CopiesFolder() const { return copiesFolder_; }

private:
    void Take(const platform::access::SavedObject& saved);
    void Write(const platform::access::SavedObject& saved);
    void WriteOriginal(const std::string& path, const std::string& bytes) const;
    void WriteCopy(const std::string& path, const std::string& bytes) const;
    void RemoveCopies() const;

    Target target_;
    std::string sourceFolder_;
    std::string copiesFolder_;
    std::size_t written_ = 0;
    std::vector<std::string> notWritten_;
    std::vector<std::string> failures_;
};

} // namespace tovimar
