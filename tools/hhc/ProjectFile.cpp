#include "ProjectFile.h"

#include "helpcompiler/LanguageCodePage.h"
#include "helpcompiler/ProjectFolder.h"
#include "platform/text/Text.h"

#include <fstream>
#include <set>
#include <sstream>

namespace hhc {
namespace fs = std::filesystem;
namespace text = tovimar::text;
namespace helpcompiler = tovimar::helpcompiler;
namespace {

class Translator {
public:
    Translator(const fs::path& path, const std::string& bytes)
        : path_(path), folder_(path.parent_path()), files_(folder_) {
        std::istringstream lines(bytes);
        for (std::string line; std::getline(lines, line);)
            lines_.push_back(text::TrimWhitespace(line));
        for (const std::string& line : lines_)
            if (const auto [key, value] = Split(line); key == "language")
                page_ = text::CodePage(helpcompiler::CodePageOfLanguage(helpcompiler::LanguageOf(value)));
    }

    TranslatedProject Run() {
        for (const std::string& line : lines_)
            Append(line);
        if (result_.compiledFile.empty())
            result_.compiledFile = fs::path(path_).replace_extension(".chm");
        return std::move(result_);
    }

private:
    static std::pair<std::string, std::string> Split(const std::string& line) {
        const auto sign = line.find('=');
        if (sign == std::string::npos)
            return {};
        return {text::ToLower(text::TrimWhitespace(line.substr(0, sign))),
                text::TrimWhitespace(line.substr(sign + 1))};
    }

    void Append(const std::string& line) {
        if (line.starts_with('[')) {
            section_ = text::ToLower(line);
            Put(line);
        } else if (section_ == "[options]") {
            AppendOption(line);
        } else if (section_ == "[files]" && !line.empty()) {
            AppendFile(line);
        } else if (section_ == "[alias]" && line.find('=') != std::string::npos) {
            AppendAlias(line);
        } else if (section_ == "[map]") {
            AppendMapLine(line);
        } else if (section_ != "[text popups]") {
            Put(line);
        }
    }

    void AppendOption(const std::string& line) {
        const auto [key, value] = Split(line);
        const bool isInput = key == "contents file" || key == "index file";
        if (key == "compiled file") {
            const std::string name = ToUtf8(helpcompiler::WithSlashes(value));
            result_.compiledFile = folder_ / name;
            Put("Compiled file=" + name);
        } else if (isInput || key == "default topic") {
            const std::string name = OnDisk(value);
            if (isInput && !value.empty() && !Exists(name))
                result_.missing.push_back(name);
            else
                Put(key + "=" + name);
        } else {
            Put(line);
        }
    }

    void AppendAlias(const std::string& line) {
        const auto sign = line.find('=');
        const std::string page = OnDisk(text::TrimWhitespace(line.substr(sign + 1)));
        if (!Exists(page))
            return;
        aliases_.insert(text::TrimWhitespace(line.substr(0, sign)));
        Put(line.substr(0, sign + 1) + page);
    }

    /// The compiler breaks off over a number without an alias, such as that of a list page which the
    /// application kept out of its help, so the defines of a header are put in one by one.
    void AppendMapLine(const std::string& line) {
        if (!line.starts_with("#include ")) {
            AppendDefine(line);
            return;
        }
        std::ifstream header(folder_ / OnDisk(text::TrimWhitespace(line.substr(9))));
        for (std::string define; std::getline(header, define);)
            AppendDefine(text::TrimWhitespace(define));
    }

    void AppendDefine(const std::string& line) {
        std::istringstream words(line);
        std::string define, name, number;
        if (words >> define >> name >> number && define == "#define" && aliases_.contains(name))
            Put("#define " + name + " " + number);
    }

    void AppendFile(const std::string& line) {
        const std::string name = OnDisk(line);
        if (!Exists(name)) {
            result_.missing.push_back(name);
            return;
        }
        result_.hasFiles = true;
        if (listed_.insert(name).second)
            Put(name);
    }

    std::string ToUtf8(const std::string& name) const {
        return text::IsValidUtf8(name) ? name : page_.Decode(name);
    }

    bool Exists(const std::string& name) const {
        std::error_code ignored;
        return !name.empty() && fs::is_regular_file(folder_ / name, ignored);
    }

    /// The name with the spelling of the disk.
    std::string OnDisk(const std::string& line) {
        const std::string name = ToUtf8(helpcompiler::WithSlashes(line));
        return files_.Find(name).value_or(name);
    }

    void Put(const std::string& line) { result_.text += line + "\n"; }

    fs::path path_;
    fs::path folder_;
    std::vector<std::string> lines_;
    text::CodePage page_{1252};
    helpcompiler::ProjectFolder files_;
    std::string section_;
    std::set<std::string> listed_;
    std::set<std::string> aliases_;
    TranslatedProject result_;
};

} // namespace

TranslatedProject Translate(const fs::path& path, const std::string& bytes) {
    return Translator(path, bytes).Run();
}

} // namespace hhc
