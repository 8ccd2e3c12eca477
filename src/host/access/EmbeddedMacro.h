#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// The commands of a macro that an event keeps in itself, as lines of code: an action OpenForm is
/// `DoCmd.OpenForm "Orders"`. The text is either kind that the host writes: blocks "Begin ... End" with
/// "Action" and "Argument" rows, or, where these hold no action, the XML in their comments behind "_AXL:".
/// Actions without an object that the reader asks for come without arguments. Nothing for other texts.
std::vector<std::string> CommandsOfEmbeddedMacro(std::string_view macro);

} // namespace tovimar
