#pragma once

#include "helpcompiler/HelpDescription.h"
#include "helpcompiler/SearchIndex.h"
#include "helpcompiler/TopicTables.h"

#include <vector>

namespace tovimar::helpcompiler {

/// All streams that the viewer reads besides the files of the project, in a fixed order: those that aren't
/// compressed first. `search` has a page's words under the number of its topic.
std::vector<InternalFile> MakeInternalFiles(const HelpDescription& help, const TopicTables& topics,
                                            const SearchIndex& search);

/// The single streams.
std::string SystemStream(const HelpDescription& help, const std::string& indexHeader, bool binaryIndex);
std::string IndexHeaderStream(const HelpDescription& help, std::size_t topics, StringTable& strings);
std::string WindowsStream(const std::vector<WindowDefinition>& windows, StringTable& strings);
std::string ContextStream(const std::vector<ContextTarget>& contexts, StringTable& strings);
std::string ObjectStream(const HelpDescription& help);

} // namespace tovimar::helpcompiler
