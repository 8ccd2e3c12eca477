#pragma once

#include "foundation/CXmlParseError.h"
#include "foundation/ISettings.h"
#include "platform/KeyedList.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace tovimar {

/// Makes the object that knows the options. The generation registers its own at program start; without
/// one the list is loaded and saved and no parameter changes.
void SetSettingsLoaderFactory(std::function<std::unique_ptr<ISettingsLoadSave>()> factory);

/// The options of the system in a file: the global settings file, or the copy inside a project file.
class CAddInSettingsXmlFile : public ISettings {
public:
    /// Reads the list and hands it to the loader. 0; the parser's code (a warning is shown) or kFailure1
    /// for a file without options: then the parameters stay as they are.
    ResultCode Load(const std::string& vstrSettingsFullPath, bool vfLoadFromProjectFile);
    /// Drops the loader and the list.
    void Terminate();

    Value OptionValue(const std::string& vstrOptionName) override;
    /// A new name is added at the end.
    void SetOptionValue(const std::string& vstrOptionName, const Value& value) override;

    /// The element `Settings` as text, one line per option, CRLF. Options named in the skip list are left
    /// out; a value in `rcolOptionsDefaultValues` (by option name) takes the place of the stored one.
    std::string XMLSTr(const std::vector<std::string>& rcolOptionsToSkip = {},
                       const KeyedList<std::string>* rcolOptionsDefaultValues = nullptr);
    /// Takes the parameters into the list and writes the file by way of a temporary one, which replaces it
    /// only when it parses. 0, or the number of the failure, which is reported.
    ResultCode Save(const std::string& vstrSettingsFullPath);
    /// Takes the parameters into the list.
    void CopyToOptions();

    CXmlParseError XmlParseError;

private:
    struct CXMLOption {
        std::string Name;
        std::string Value;
    };

    void ReadOptions(const class XmlNode& options);
    void WriteChecked(const std::string& path);
    void RaiseIfIllFormed(const std::string& path);

    KeyedList<CXMLOption> options_;
    std::unique_ptr<ISettingsLoadSave> loader_;
};

} // namespace tovimar
