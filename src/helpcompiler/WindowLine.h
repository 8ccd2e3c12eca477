#pragma once

#include "helpcompiler/HelpDescription.h"

#include <optional>
#include <string_view>

namespace tovimar::helpcompiler {

/// A window as a project defines it: `name="caption","contents","index","topic","home",url,text,url,text,pane
/// style,width,buttons,[left,top,right,bottom],style,extended style,show,closed,tab,tab position,notify`.
/// Nothing for a line without a name.
std::optional<WindowDefinition> ParseWindowLine(std::string_view line);

} // namespace tovimar::helpcompiler
