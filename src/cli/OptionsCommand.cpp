#include "cli/Commands.h"
#include "cli/Console.h"
#include "foundation/Paths.h"
#include "generation/CAddInSettings.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <map>

namespace tovimar::cli {
namespace {

std::map<std::string, std::string> Defaults() {
    std::map<std::string, std::string> defaults;
    XmlDocument settings;
    if (settings.load(GlobalSettingsFile()))
        for (const XmlNode& option : settings.selectNodes("//Settings/Options/Option"))
            defaults[option.attribute("Name")] = option.attribute("Value");
    return defaults;
}

} // namespace

int ShowOptions() {
    auto defaults = Defaults();
    std::string lines;
    for (const OptionDescription& option : OptionDescriptions()) {
        const std::string values = text::ReplaceAll(option.values, "|", ", ");
        lines += std::string(option.name) + "=" + (option.ofProject ? std::string() : defaults[option.name]) +
                 "\n    " + option.meaning + (values.empty() ? "" : " (" + values + ")") + "\n";
    }
    PrintResult(lines);
    return kDone;
}

} // namespace tovimar::cli
