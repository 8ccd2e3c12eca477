#pragma once

#include "platform/access/database/Storage.h"

#include <string>
#include <string_view>
#include <vector>

/// Source of the code modules, as [MS-OVBA] describes it: compressed, behind a directory that is
/// compressed itself.
namespace tovimar::platform::access {

struct VbaModule {
    std::string name; ///< "Form_Orders" for the module behind a form, "Report_..." behind a report
    bool isClass = false;
    std::string source; ///< UTF-8, lines end with CRLF
};

struct VbaProject {
    std::string name;    ///< empty when it isn't known
    int codePage = 1252; ///< of the code and of the names in member lists
    std::vector<VbaModule> modules;
    std::vector<std::string> faults; ///< modules that can't be read, with the reason
};

/// Raises 0x80040001 "The code ..." for bytes that end too early, go back before their start, or unpack to
/// more than `most` bytes.
std::string UnpackCode(std::string_view packed, std::size_t most = std::size_t{16} << 20U);

/// Without a code project the result is empty. A damaged directory gives a fault and no modules.
VbaProject ReadVbaProject(const Storage& storage);

} // namespace tovimar::platform::access
