#pragma once

#include <string>
#include <vector>

namespace tovimar {

/// What the compiler's project file says.
struct HelpProjectContents {
    std::string name; ///< of the project's files, without extension
    std::string title;
    std::string defaultTopic;
    bool associateIndex = true;
    bool fullTextSearch = true;
    std::string language;              ///< "0x409 English (United States)"; empty leaves the line out
    std::vector<std::string> topics;   ///< file names
    std::vector<std::string> pictures; ///< with their folder
};

/// The text of the `.hhp` file, lines ended by CRLF.
std::string HelpProjectText(const HelpProjectContents& contents);
/// The text of the file of text popups that the project includes.
std::string TextPopupsText(const std::vector<std::string>& topics);

} // namespace tovimar
