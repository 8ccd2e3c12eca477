#include "generation/HelpProjectText.h"

#include "platform/files/Paths.h"

namespace tovimar {
namespace {

constexpr const char* kLineEnd = "\r\n";

class Lines {
public:
    Lines& operator<<(const std::string& line) {
        text_ += line;
        text_ += kLineEnd;
        return *this;
    }
    std::string Take() { return std::move(text_); }

private:
    std::string text_;
};

} // namespace

std::string HelpProjectText(const HelpProjectContents& contents) {
    const std::string& name = contents.name;
    Lines lines;
    lines << "[Options]";
    lines << "Binary index = No";
    lines << "Compatibility = 1.1 Or later";
    lines << "Compiled file = " + name + ".chm";
    lines << "Contents file = " + name + ".hhc";
    lines << "index file = " + (contents.associateIndex ? name + ".hhk" : std::string());
    lines << "Default Topic = " + platform::FileNameOf(contents.defaultTopic);
    lines << "Display compile progress=Yes";
    lines << std::string("Full-text search=") + (contents.fullTextSearch ? "Yes" : "No");
    if (!contents.language.empty())
        lines << "Language=" + contents.language;
    lines << "Title=" + contents.title;
    lines << "[Files]";
    for (const auto* files : {&contents.topics, &contents.pictures})
        for (const std::string& file : *files)
            lines << file;
    lines << ""
          << "[ALIAS]";
    for (const std::string& topic : contents.topics)
        lines << "IDH_" + platform::BaseNameOf(topic) + "=" + topic;
    lines << ""
          << "[MAP]"
          << "#include " + name + ".h";
    lines << "[TEXT POPUPS]"
          << "#include " + name + ".h"
          << "#include " + name + ".txt";
    return lines.Take();
}

std::string TextPopupsText(const std::vector<std::string>& topics) {
    std::string text;
    for (const std::string& topic : topics)
        text += ".topic " + platform::BaseNameOf(topic) + " " + kLineEnd + "Refers to : " + topic + kLineEnd;
    return text + kLineEnd;
}

} // namespace tovimar
