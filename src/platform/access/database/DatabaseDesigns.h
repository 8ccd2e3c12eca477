#pragma once

#include "platform/access/Design.h"
#include "platform/access/ExportReader.h"
#include "platform/access/database/DesignBlob.h"
#include "platform/access/database/MemberList.h"
#include "platform/access/database/StorageReader.h"
#include "platform/access/database/VbaProject.h"

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace tovimar::platform::access {

/// The designs, macros and code of one database. Its storage is read at the first question, what an object
/// is when it is asked for.
class DatabaseDesigns {
public:
    explicit DatabaseDesigns(std::string nativePath) : nativePath_(std::move(nativePath)) {}

    /// Names of the forms, reports, macros or modules that are kept here, in the order of the storage;
    /// leftovers of the clipboard are passed over. Raises as ReadStorage.
    std::vector<std::string> Names(ObjectKind kind);
    /// Whether a design of that name is there; false, too, for a database whose storage can't be read.
    bool Has(ObjectKind kind, const std::string& name);
    /// Raises 0x80040001 "<path>, <kind> <name>: <reason>" for a design that is missing or damaged, and for
    /// the databases of 1997 and older, whose designs can't be read.
    ExportTree Tree(ObjectKind kind, const std::string& name);
    /// The binary design and member list as they are; null bytes of a missing one are empty.
    std::string_view Blob(ObjectKind kind, const std::string& name);
    std::string_view MemberBytes(ObjectKind kind, const std::string& name);
    std::string_view Delta(ObjectKind kind, const std::string& name);

    /// Source of the module of that name ("Form_Orders" behind a form); none when there isn't one.
    std::optional<std::string> ModuleCode(const std::string& name);
    const VbaProject& Code();
    /// The file of a shared picture, empty for an unknown name.
    std::string Picture(const std::string& name);
    /// The file of the theme in use, empty for a database without one.
    std::string Theme();
    const std::string& NativePath() const { return nativePath_; }

private:
    const Storage& Kept();
    const StorageNode* Folder(ObjectKind kind, const std::string& name);
    std::string_view Stream(ObjectKind kind, const std::string& name, std::string_view stream);
    [[noreturn]] void Fail(ObjectKind kind, const std::string& name, const std::string& reason) const;

    std::string nativePath_;
    std::optional<StoredDesigns> stored_;
    std::map<ObjectKind, std::map<std::string, const StorageNode*>> folders_; ///< by folded name
    std::map<ObjectKind, std::vector<std::string>> names_;
    std::optional<VbaProject> code_;
};

} // namespace tovimar::platform::access
