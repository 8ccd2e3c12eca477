#pragma once

#include "platform/access/Design.h"

#include <string>
#include <vector>

/// Finds the parts of an application among the files of a folder, by content first and by name second.
namespace tovimar::platform::access {

enum class PartKind {
    Form,
    Report,
    Query,
    Macro,
    Module,
    Table,
    Code,            ///< module of a form or report in a file of its own beside it
    TableProperties, ///< schema beside a table's statement
    LinkedTable,
    QueryInfo, ///< properties beside a query's statement
    Documents, ///< properties of all forms, reports, macros and modules in one file
    Relation,
    TableData,
    Picture,
    PictureInfo,
    ProjectInfo
};

struct ApplicationPart {
    PartKind kind = PartKind::Form;
    std::string name; ///< of the object: the file's name without extension, escapes of the layout decoded
    std::string path; ///< Windows path
};

struct ApplicationFolder {
    std::string path;                   ///< Windows path without a trailing backslash
    std::vector<ApplicationPart> parts; ///< sorted by path without regard to case
    std::vector<std::string> databases; ///< Windows paths: of the folder itself first, then of its subfolders
    std::size_t topLevelDatabases = 0;  ///< how many of them lie in the folder itself
};

/// Reads every file of the folder that may be a part, at most 20000 files, three folders deep; hidden
/// folders are passed over.
ApplicationFolder ScanApplicationFolder(const std::string& path);

/// Object name for a file name without its extension: "%5C" and the like stand for characters that a
/// file's name can't hold; any other percent sign is itself.
std::string DecodeObjectName(const std::string& fileName);

} // namespace tovimar::platform::access
