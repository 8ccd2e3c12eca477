#include "platform/access/database/TextExport.h"

#include "platform/Environment.h"
#include "platform/Error.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>

namespace tovimar::platform::access {

namespace {

constexpr const char* kByteOrderMark = "\xEF\xBB\xBF";

/// What the host's editor keeps for itself at the head of a module; it makes these lines anew.
bool IsOwnAttribute(std::string_view line, bool behindDesign) {
    constexpr std::array<std::string_view, 3> kOwn{"Attribute VB_Base ", "Attribute VB_TemplateDerived ",
                                                   "Attribute VB_Customizable "};
    return std::any_of(kOwn.begin(), kOwn.end(),
                       [&](std::string_view own) { return line.starts_with(own); }) ||
           (behindDesign && line.starts_with("Attribute VB_Name "));
}

std::string ModuleText(const std::string& source, bool behindDesign) {
    std::string text;
    for (std::size_t at = 0; at < source.size();) {
        const auto end = std::min(source.find('\n', at), source.size() - 1) + 1;
        const auto line = std::string_view(source).substr(at, end - at);
        // The attributes stand at the head; the same words further down are the programmer's.
        if (!line.starts_with("Attribute VB_"))
            return text + source.substr(at);
        if (!IsOwnAttribute(line, behindDesign))
            text += line;
        at = end;
    }
    return text;
}

class Exporter {
public:
    Exporter(const std::string& nativePath, const std::function<void(const ExportedFile&)>& take)
        : model_(nativePath), designs_(nativePath), take_(take) {}

    std::vector<std::string> Run() {
        for (const auto& name : model_.Names(ObjectKind::Form))
            Guarded([&] { Design(ObjectKind::Form, name, "forms/", ".form", "Form_"); });
        for (const auto& name : model_.Names(ObjectKind::Report))
            Guarded([&] { Design(ObjectKind::Report, name, "reports/", ".report", "Report_"); });
        for (const auto& name : model_.Names(ObjectKind::Macro))
            Guarded([&] {
                Give("macros/", name, ".macro", ExportTreeText(*designs_.Tree(ObjectKind::Macro, name).root));
            });
        for (const auto& name : model_.Names(ObjectKind::Module))
            Guarded([&] { Module(name); });
        for (const auto& name : model_.Names(ObjectKind::Query))
            Guarded([&] { Query(name); });
        return std::move(faults_);
    }

private:
    template <class Step> void Guarded(const Step& step) {
        try {
            step();
        } catch (const RaisedError& failure) {
            faults_.emplace_back(failure.what());
        }
    }

    void Give(const char* folder, const std::string& name, const char* extension, const std::string& text) {
        take_({folder + EncodeObjectName(name) + extension, kByteOrderMark + text});
    }

    void Design(ObjectKind kind, const std::string& name, const char* folder, const char* extension,
                const char* modulePrefix) {
        const auto tree = designs_.Tree(kind, name);
        Give(folder, name, extension, ExportTreeText(*tree.root));
        if (const auto code = designs_.ModuleCode(modulePrefix + name))
            Give(folder, name, ".cls", ModuleText(*code, true));
    }

    void Module(const std::string& name) {
        for (const auto& module : designs_.Code().modules) {
            if (!text::EqualsIgnoringCase(module.name, name))
                continue;
            const auto source = ModuleText(module.source, false);
            if (module.isClass)
                return Give("modules/", name, ".cls",
                            "VERSION 1.0 CLASS\r\nBEGIN\r\n  MultiUse = -1  'True\r\nEND\r\n" + source);
            return Give("modules/", name, ".bas", source);
        }
        throw RaisedError(kFailure1,
                          designs_.NativePath() + ", module " + name + ": its code isn't in the database.",
                          "DatabaseReader");
    }

    void Query(const std::string& name) {
        if (const auto* query = model_.FindQuery(name); query != nullptr && !query->sql.empty())
            Give("queries/", name, ".sql", query->sql + "\r\n");
    }

    ApplicationModel model_;
    DatabaseDesigns designs_;
    const std::function<void(const ExportedFile&)>& take_;
    std::vector<std::string> faults_;
};

} // namespace

std::string EncodeObjectName(const std::string& name) {
    constexpr std::string_view kForbidden = "<>:\"/\\|?*%";
    constexpr std::string_view kDigits = "0123456789ABCDEF";
    std::string encoded;
    for (std::size_t i = 0; i < name.size(); ++i) {
        const auto byte = static_cast<unsigned char>(name[i]);
        const bool hides = name[i] == '.' && (i == 0 || i + 1 == name.size());
        if (hides || kForbidden.find(name[i]) != std::string_view::npos)
            encoded += {'%', kDigits[byte >> 4U], kDigits[byte & 15U]};
        else
            encoded += name[i];
    }
    return encoded;
}

std::vector<std::string> ExportDatabase(const std::string& nativePath,
                                        const std::function<void(const ExportedFile&)>& take) {
    return Exporter(nativePath, take).Run();
}

} // namespace tovimar::platform::access
