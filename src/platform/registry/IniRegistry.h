#pragma once

#include "platform/Environment.h"

#include <map>

namespace tovimar::platform {

/// The registry in an ini file: one section per key, one line `name=text` per value, the default value
/// under "@". Line ends, "%" and "=" in names and texts stand as %0D, %0A, %25, %3D. UTF-8. The file is
/// read at the first use and written whole at every change.
class IniRegistry : public Registry {
public:
    explicit IniRegistry(std::string nativePath) : path_(std::move(nativePath)) {}

    std::string Read(const std::string& key, const std::string& valueName) override;
    void Write(const std::string& key, const std::string& valueName, const std::string& text) override;

private:
    struct Value {
        std::string name, text;
    };
    struct Key {
        std::string name;
        std::map<std::string, Value> values; // by folded name
    };

    void Load();
    void Save() const;

    std::string path_;
    bool loaded_ = false;
    std::map<std::string, Key> keys_; // by folded name
};

} // namespace tovimar::platform
