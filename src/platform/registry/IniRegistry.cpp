#include "platform/registry/IniRegistry.h"

#include "platform/files/NativeFile.h"
#include "platform/text/CodePoints.h"
#include "platform/text/Text.h"

#include <cstdio>
#include <fcntl.h>
#include <filesystem>
#include <unistd.h>

namespace tovimar::platform {
namespace {

/// Line end, "=" and "%" end or split a line; "[" and "@" at its start have a meaning too.
std::string Escape(const std::string& text, bool isName) {
    std::string out;
    for (const char byte : text) {
        const bool special =
            byte == '\r' || byte == '\n' || byte == '%' ||
            (isName && (byte == '=' || byte == ']' || (out.empty() && (byte == '[' || byte == '@'))));
        if (!special) {
            out += byte;
            continue;
        }
        char code[4];
        std::snprintf(code, sizeof code, "%%%02X", static_cast<unsigned>(static_cast<unsigned char>(byte)));
        out += code;
    }
    return out;
}

int HexDigit(char digit) {
    if (digit >= '0' && digit <= '9')
        return digit - '0';
    const char lower = text::LowerAscii(digit);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

std::string Unescape(std::string_view text) {
    std::string out;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '%' && i + 2 < text.size() && HexDigit(text[i + 1]) >= 0 &&
            HexDigit(text[i + 2]) >= 0) {
            out += static_cast<char>(HexDigit(text[i + 1]) * 16 + HexDigit(text[i + 2]));
            i += 2;
        } else {
            out += text[i];
        }
    }
    return out;
}

} // namespace

void IniRegistry::Load() {
    if (loaded_)
        return;
    loaded_ = true;
    if (!std::filesystem::is_regular_file(path_))
        return;
    Key* key = nullptr;
    for (std::string line : text::Split(NativeFile(path_, O_RDONLY).ReadAll(), "\n")) {
        if (line.ends_with('\r'))
            line.pop_back();
        if (line.starts_with('[') && line.ends_with(']')) {
            const std::string name = Unescape(std::string_view(line).substr(1, line.size() - 2));
            key = &keys_[text::FoldCase(name)];
            key->name = name;
            continue;
        }
        const auto equals = line.find('=');
        if (key == nullptr || equals == std::string::npos)
            continue;
        const std::string name = equals == 1 && line[0] == '@' ? "" : Unescape(line.substr(0, equals));
        key->values[text::FoldCase(name)] = {name, Unescape(std::string_view(line).substr(equals + 1))};
    }
}

void IniRegistry::Save() const {
    std::string out;
    for (const auto& [folded, key] : keys_) {
        out += "[" + Escape(key.name, true) + "]\n";
        for (const auto& [foldedName, value] : key.values)
            out += (value.name.empty() ? "@" : Escape(value.name, true)) + "=" + Escape(value.text, false) +
                   "\n";
        out += "\n";
    }
    std::error_code failure;
    std::filesystem::create_directories(std::filesystem::path(path_).parent_path(), failure);
    NativeFile file = NativeFile::TemporaryBeside(path_);
    try {
        file.WriteAll(out);
        file.Close();
        std::filesystem::rename(file.Path(), path_);
    } catch (...) {
        unlink(file.Path().c_str());
        throw;
    }
}

std::string IniRegistry::Read(const std::string& key, const std::string& valueName) {
    Load();
    const auto found = keys_.find(text::FoldCase(key));
    if (found == keys_.end())
        return {};
    const auto value = found->second.values.find(text::FoldCase(valueName));
    return value == found->second.values.end() ? std::string() : value->second.text;
}

void IniRegistry::Write(const std::string& key, const std::string& valueName, const std::string& text) {
    Load();
    Key& place = keys_[text::FoldCase(key)];
    if (place.name.empty())
        place.name = key;
    place.values[text::FoldCase(valueName)] = {valueName, text};
    Save();
}

} // namespace tovimar::platform
