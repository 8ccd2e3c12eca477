#include "foundation/CAddInSettingsXmlFile.h"

#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "foundation/TextEncodings.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"

#include <algorithm>

namespace tovimar {
namespace {

constexpr const char* kClass = "CAddInSettingsXmlFile";

std::function<std::unique_ptr<ISettingsLoadSave>()>& LoaderFactory() {
    static std::function<std::unique_ptr<ISettingsLoadSave>()> factory;
    return factory;
}

bool Holds(const std::vector<std::string>& names, const std::string& name) {
    return std::any_of(names.begin(), names.end(),
                       [&](const std::string& other) { return text::EqualsIgnoringCase(other, name); });
}

} // namespace

void SetSettingsLoaderFactory(std::function<std::unique_ptr<ISettingsLoadSave>()> factory) {
    LoaderFactory() = std::move(factory);
}

ResultCode CAddInSettingsXmlFile::Load(const std::string& vstrSettingsFullPath, bool vfLoadFromProjectFile) {
    options_.Clear();
    if (!loader_ && LoaderFactory())
        loader_ = LoaderFactory()();
    XmlParseError = {};
    ResultCode result = kSuccess;
    const ResultCode failure = Trapped(kClass, "Load", [&] {
        XmlDocument document;
        result = CXMLFile().Load(vstrSettingsFullPath, document);
        if (result != 0) {
            XmlParseError.SetErrInfo(document);
            UserWarningMessage(std::to_string(result) + " - " + XmlParseError.reason + " in '" +
                               vstrSettingsFullPath + "'");
            return;
        }
        const XmlNode options = document.selectSingleNode(
            vfLoadFromProjectFile ? "//TovimarProject/Settings/Options" : "//Settings/Options");
        if (!options) {
            result = kFailure1;
            return;
        }
        ReadOptions(options);
        if (loader_)
            loader_->Load(*this, vfLoadFromProjectFile);
    });
    return failure != 0 ? failure : result;
}

void CAddInSettingsXmlFile::ReadOptions(const XmlNode& options) {
    for (const XmlNode& node : options.childElements()) {
        const std::string name = node.attribute("Name");
        std::string value = node.attribute("Value");
        if (value.empty())
            value = node.attribute("value");
        if (!name.empty())
            options_.Add({name, value}, name);
    }
}

void CAddInSettingsXmlFile::Terminate() {
    loader_.reset();
    options_.Clear();
}

Value CAddInSettingsXmlFile::OptionValue(const std::string& vstrOptionName) {
    const CXMLOption* option = options_.Find(vstrOptionName);
    if (option == nullptr)
        return std::string();
    if (text::EqualsIgnoringCase(option->Value, "true"))
        return true;
    if (text::EqualsIgnoringCase(option->Value, "false"))
        return false;
    return option->Value;
}

void CAddInSettingsXmlFile::SetOptionValue(const std::string& vstrOptionName, const Value& value) {
    const std::string text = value.IsBoolean() ? (value.AsBoolean() ? "true" : "false") : value.AsString();
    if (CXMLOption* option = options_.Find(vstrOptionName))
        option->Value = text;
    else
        options_.Add({vstrOptionName, text}, vstrOptionName);
}

std::string CAddInSettingsXmlFile::XMLSTr(const std::vector<std::string>& rcolOptionsToSkip,
                                          const KeyedList<std::string>* rcolOptionsDefaultValues) {
    std::string out = "<Settings>\r\n<Options>\r\n";
    for (const CXMLOption& option : options_) {
        if (Holds(rcolOptionsToSkip, option.Name))
            continue;
        const std::string* fixed =
            rcolOptionsDefaultValues != nullptr ? rcolOptionsDefaultValues->Find(option.Name) : nullptr;
        const std::string value = fixed != nullptr ? *fixed : Session::Context().ReplaceTags(option.Value);
        out +=
            "    <Option Name = \"" + option.Name + "\" Value = \"" + EncodeSpecialChars(value) + "\" />\r\n";
    }
    return out + "</Options>\r\n</Settings>\r\n";
}

ResultCode CAddInSettingsXmlFile::Save(const std::string& vstrSettingsFullPath) {
    return Trapped(kClass, "Save", [&] {
        CopyToOptions();
        WriteChecked(vstrSettingsFullPath);
    });
}

void CAddInSettingsXmlFile::WriteChecked(const std::string& path) {
    auto& files = *platform::Env().files;
    const std::string temporary = TemporaryFolder() + "~" + platform::FileNameOf(path);
    KeyedList<std::string> defaults;
    defaults.Add("{Application}", "Application");
    defaults.Add("{Project Location}CHM", "FolderForGeneratedHelp");
    if (const ResultCode written = CXMLFile().SaveXml(temporary, XMLSTr({}, &defaults)); written != 0)
        throw RaisedError(written, "Error saving file " + temporary, "CAddInSettingsXmlFile.Save");
    RaiseIfIllFormed(temporary);
    files.WriteFileToDisk(path, files.ReadFile(temporary));
    files.DeleteFile(temporary);
}

void CAddInSettingsXmlFile::RaiseIfIllFormed(const std::string& path) {
    XmlDocument document;
    CXMLFile file;
    if (file.Load(path, document) == 0)
        return;
    XmlParseError = file.XmlParseError;
    throw RaisedError(kFailure1,
                      "Xml parse error on line " + XmlParseError.line + " position " + XmlParseError.linepos +
                          ", errCode = " + std::to_string(XmlParseError.errorCode) + " - " +
                          XmlParseError.reason + "\r\nPlease send file '" + path + "' to Tovimar support " +
                          kSupportAddress,
                      "CAddInSettingsXmlFile.Save");
}

void CAddInSettingsXmlFile::CopyToOptions() {
    if (!loader_ && LoaderFactory())
        loader_ = LoaderFactory()();
    if (loader_)
        loader_->Save(*this);
}

} // namespace tovimar
