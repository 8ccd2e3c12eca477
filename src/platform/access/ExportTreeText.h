#pragma once

#include "platform/access/Design.h"

#include <string>

namespace tovimar::platform::access {

/// The blocks of an export as text, UTF-8 without mark, lines ended by CRLF: what ParseExportTree reads back.
/// `root` is the nameless one of ExportTree; blocks in blocks stand in a nameless block of their own, as the
/// host writes them. Texts are broken behind 80 characters.
/// Texts of properties that end with "EmMacro" are lines of a block and go as they are.
std::string ExportTreeText(const DesignObject& root);

/// The lines of a block's properties and children at a depth, as they stand between "Begin" and "End".
std::string BlockLines(const DesignObject& block, int depth);

} // namespace tovimar::platform::access
