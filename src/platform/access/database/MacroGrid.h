#pragma once

#include "platform/access/Design.h"

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

/// Macros as a database keeps them: a grid of rows with an action, its arguments, a condition and a
/// comment. Newer versions put the macro as XML into the comments of further rows.
namespace tovimar::platform::access {

struct MacroRow {
    std::uint16_t action = 0; ///< 0 for a row without one
    std::string name;         ///< of the submacro that begins here
    std::string condition;
    std::string comment;
    std::vector<std::string> arguments; ///< up to the last that isn't empty
};

struct MacroGrid {
    std::int32_t columnsShown = 0;
    std::string version; ///< "33", "22" or empty, for macros of the year 1997
    std::vector<MacroRow> rows;
};

/// Raises 0x80040001 "The macro ..." for bytes that end too early or texts that lie outside of their row.
MacroGrid ReadMacroGrid(std::string_view bytes);

/// "OpenForm" and the like; "Action<number>" for one that isn't known.
std::string MacroActionName(std::uint16_t action);

/// The XML of the newer versions; empty where the macro has none.
std::string MacroXml(const MacroGrid& grid);

/// The event that an embedded macro's XML names ("OnClick"); empty without one.
std::string MacroEvent(const MacroGrid& grid);

/// The macro as blocks of a text export: a root of type "" with nameless rows.
std::unique_ptr<DesignObject> MacroBlocks(const MacroGrid& grid);

} // namespace tovimar::platform::access
