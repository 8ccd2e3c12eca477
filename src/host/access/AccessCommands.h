#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

class CN_IDEAccContext;
class CXmlCommand;

/// Carries a command out and puts its result, if it has one, under "RetValue"; names ignore case. Raises
/// 0x80040001 "Undefined callback command [NAME]" for an unknown one.
void RunAccessCommand(CN_IDEAccContext& context, CXmlCommand& command);

} // namespace tovimar
