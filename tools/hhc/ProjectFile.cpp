#include "ProjectFile.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <iconv.h>
#include <map>
#include <set>
#include <sstream>
#include <string_view>

namespace hhc {
namespace fs = std::filesystem;
namespace {

std::string Trimmed(std::string_view text) {
    const auto first = text.find_first_not_of(" \t\r");
    if (first == std::string_view::npos)
        return {};
    return std::string(text.substr(first, text.find_last_not_of(" \t\r") - first + 1));
}

std::string Lower(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

/// Null-terminated result of iconv, or nothing when the bytes don't fit the encoding.
std::string Converted(const std::string& bytes, const char* encoding) {
    const iconv_t converter = iconv_open("UTF-8", encoding);
    if (converter == reinterpret_cast<iconv_t>(-1))
        return {};
    std::string result(bytes.size() * 4, '\0');
    char* in = const_cast<char*>(bytes.data());
    char* out = result.data();
    std::size_t inLeft = bytes.size();
    std::size_t outLeft = result.size();
    const bool failed = iconv(converter, &in, &inLeft, &out, &outLeft) == static_cast<std::size_t>(-1);
    iconv_close(converter);
    result.resize(failed ? 0 : result.size() - outLeft);
    return result;
}

/// ANSI code page of a language by the primary part of its identifier ("0x419" is Russian).
const char* EncodingOfLanguage(const std::string& identifier) {
    struct Entry {
        unsigned primary;
        const char* encoding;
    };
    constexpr std::array<Entry, 15> kTable{{{0x02, "CP1251"},
                                            {0x05, "CP1250"},
                                            {0x08, "CP1253"},
                                            {0x0e, "CP1250"},
                                            {0x15, "CP1250"},
                                            {0x18, "CP1250"},
                                            {0x19, "CP1251"},
                                            {0x1a, "CP1250"},
                                            {0x1b, "CP1250"},
                                            {0x1f, "CP1254"},
                                            {0x22, "CP1251"},
                                            {0x23, "CP1251"},
                                            {0x24, "CP1250"},
                                            {0x25, "CP1257"},
                                            {0x27, "CP1257"}}};
    const auto primary = static_cast<unsigned>(std::strtoul(identifier.c_str(), nullptr, 16) & 0x3ffU);
    for (const Entry& entry : kTable)
        if (entry.primary == primary)
            return entry.encoding;
    return "CP1252";
}

class Translator {
public:
    Translator(const fs::path& path, const std::string& bytes) : path_(path), folder_(path.parent_path()) {
        std::istringstream lines(bytes);
        for (std::string line; std::getline(lines, line);)
            lines_.push_back(Trimmed(line));
        for (const std::string& line : lines_)
            if (const auto [key, value] = Split(line); key == "language")
                encoding_ = EncodingOfLanguage(value);
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
        return {Lower(Trimmed(std::string_view(line).substr(0, sign))),
                Trimmed(std::string_view(line).substr(sign + 1))};
    }

    void Append(const std::string& line) {
        if (line.starts_with('[')) {
            section_ = Lower(line);
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
            const std::string name = ToUtf8(Forward(value));
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
        const std::string page = OnDisk(Trimmed(std::string_view(line).substr(sign + 1)));
        if (!Exists(page))
            return;
        aliases_.insert(Trimmed(std::string_view(line).substr(0, sign)));
        Put(line.substr(0, sign + 1) + page);
    }

    /// The compiler breaks off over a number without an alias, such as that of a list page which the
    /// application kept out of its help, so the defines of a header are put in one by one.
    void AppendMapLine(const std::string& line) {
        if (!line.starts_with("#include ")) {
            AppendDefine(line);
            return;
        }
        std::ifstream header(folder_ / OnDisk(Trimmed(std::string_view(line).substr(9))));
        for (std::string define; std::getline(header, define);)
            AppendDefine(Trimmed(define));
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

    static std::string Forward(std::string name) {
        std::replace(name.begin(), name.end(), '\\', '/');
        return name;
    }

    std::string ToUtf8(const std::string& name) const {
        const std::string same = Converted(name, "UTF-8");
        if (!same.empty() || name.empty())
            return same;
        return Converted(name, encoding_);
    }

    bool Exists(const std::string& name) const {
        std::error_code ignored;
        return !name.empty() && fs::is_regular_file(folder_ / name, ignored);
    }

    /// The name with the spelling of the disk, each part looked up without regard to case.
    std::string OnDisk(const std::string& line) {
        const std::string name = ToUtf8(Forward(line));
        if (name.empty() || Exists(name))
            return name;
        fs::path found;
        for (const fs::path& part : fs::path(name))
            found /= InFolder(folder_ / found, part.string());
        return found.string();
    }

    const std::string& InFolder(const fs::path& folder, const std::string& name) {
        auto [place, added] = listings_.try_emplace(folder.string());
        if (added) {
            std::error_code error;
            for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
                 entry.increment(error))
                place->second.emplace(Lower(entry->path().filename().string()),
                                      entry->path().filename().string());
        }
        return place->second.try_emplace(Lower(name), name).first->second;
    }

    void Put(const std::string& line) { result_.text += line + "\n"; }

    fs::path path_;
    fs::path folder_;
    std::vector<std::string> lines_;
    const char* encoding_ = "CP1252";
    std::string section_;
    std::map<std::string, std::map<std::string, std::string>> listings_;
    std::set<std::string> listed_;
    std::set<std::string> aliases_;
    TranslatedProject result_;
};

} // namespace

TranslatedProject Translate(const fs::path& path, const std::string& bytes) {
    return Translator(path, bytes).Run();
}

} // namespace hhc
