#include "generation/CAddInSettings.h"

#include "foundation/CAddInProject.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CCodePages.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <cstdlib>
#include <variant>

namespace tovimar {
namespace {

using Parameters = CTovimarParameters;

/// An option with a rule of its own. A null `save` leaves the option as the last load left it.
struct Rule {
    void (*load)(Parameters&, const Value&);
    Value (*save)(const Parameters&);
};

constexpr const char* kBoolean = "true|false";

struct Option {
    OptionDescription description;
    std::variant<bool Parameters::*, std::string Parameters::*, Rule> target;
};

void LoadIdentifyBy(Parameters& parameters, const Value& value) {
    const std::string word = value.AsString();
    parameters.IdentifyControls = word.empty() || word == "Caption" ? 0 : 1;
}

void LoadFolder(Parameters& parameters, const Value& value) {
    const std::string folder = parameters.ReplacedTags(value.AsString());
    const std::string network = folder.starts_with("\\\\") ? "\\\\" : "";
    parameters.SetFolderForGeneratedHelp(network +
                                         text::ReplaceAll(folder.substr(network.size()), "\\\\", "\\"));
}

void LoadHeadingLevel(Parameters& parameters, const Value& value) {
    int level = parameters.MSWordTOCLowerHeadingLevel;
    PassOver([&] { level = value.AsInteger(); });
    parameters.MSWordTOCLowerHeadingLevel = level < 1 || level > 9 ? 2 : level;
}

std::string ScaleWord(double scale) {
    return scale == 2 ? "2" : scale == 1.5 ? "1.5" : "1";
}

void LoadScale(Parameters& parameters, const Value& value) {
    const std::string word = text::Trim(value.AsString());
    parameters.ImagesScale = word == "2" ? 2 : word == "1.5" ? 1.5 : 1;
}

void LoadCharset(Parameters& parameters, const Value& value) {
    constexpr int kRussian = 1049;
    parameters.Charset = value.AsString();
    if (parameters.Charset.empty())
        parameters.Charset = platform::Env().languageId == kRussian ? "windows-1251" : "windows-1252";
}

/// A style sheet of the project's folder is stored by its name, so that the project can be moved.
std::string StoredStyleSheet(const std::string& path) {
    const auto* project = Session::CurrentProject();
    const bool inProject =
        project != nullptr &&
        text::EqualsIgnoringCase(platform::FolderOf(path), platform::WithTrailingBackslash(project->Folder));
    return inProject ? platform::FileNameOf(path) : path;
}

std::string OrElse(const Value& value, const std::string& fallback) {
    const std::string text = value.AsString();
    return text.empty() ? fallback : text;
}

// clang-format off
const std::vector<Option>& Options() {
    static const std::vector<Option> options = {
        {{"Organization", "organization that made the application", ""}, &Parameters::Organization},
        {{"Author", "author of the application; the user's name when empty", ""},
         Rule{[](Parameters& p, const Value& v) { p.SetAuthor(v.AsString()); },
              [](const Parameters& p) { return Value(p.Author()); }}},
        {{"Copyright", "copyright line of the start page", ""}, &Parameters::Copyright},
        {{"Website", "web site of the application", ""}, &Parameters::Website},
        {{"EMail", "address for questions", ""}, &Parameters::email},
        {{"Registration", "address where the application is registered", ""}, &Parameters::RegistrationURL},
        {{"IdentifyBy", "objects and controls go by their caption or by their name", "Caption|Name"},
         Rule{LoadIdentifyBy, [](const Parameters& p) { return Value(p.IdentifyControls == 0 ? "Caption" : "Name"); }}},
        {{"SnapshotFormat", "format of the pictures", "Bitmap|Jpeg"},
         Rule{[](Parameters& p, const Value& v) { p.ImagesFormat = v.AsString() == "Bitmap" ? 1 : 2; },
              [](const Parameters& p) { return Value(p.ImagesFormat == 1 ? "Bitmap" : "Jpeg"); }}},
        {{"SnapshotScale", "size of the pictures' pixels; at 1.5 and 2 they are sharp on screens of high resolution", "1|1.5|2"},
         Rule{LoadScale, [](const Parameters& p) { return Value(ScaleWord(p.ImagesScale)); }}},
        {{"BulletedControlsAndMenus", "lists of controls and menus have bullets", kBoolean}, &Parameters::BulletMenusControls},
        {{"AddHotSpots", "definitions carry an image map", kBoolean}, &Parameters::HotSpots},
        {{"AssociateHelpIndex", "the compiled help has an index", kBoolean}, &Parameters::AssociateHelpIndex},
        {{"NoReportsScreenshots", "reports have no picture", kBoolean}, &Parameters::NoReportsScreenShots},
        {{"FolderForGeneratedHelp", "folder of the help project; the command line sets it with --output", ""},
         Rule{LoadFolder, [](const Parameters& p) { return Value(p.FolderForGeneratedHelp()); }}},
        {{"CompileHTMLHelp", "the help compiler runs", kBoolean}, &Parameters::CompileHTMLHelp},
        {{"OpenHTMLHelp", "the compiled help opens after the run", kBoolean}, &Parameters::OpenHTMLHelp},
        {{"SaveApplicationChanges", "help file and context ids are written into the application", kBoolean},
         &Parameters::SaveApplicationChanges},
        {{"OpenHTMLEditor", "the help editor opens after the run", kBoolean}, &Parameters::OpenHTMLEditor},
        {{"CapturePreviewAreaOnly", "reports are pictured without their window's frame", kBoolean},
         &Parameters::CapturePreviewAreaOnly},
        {{"LastUsedFolderForGeneratedHelp", "folder of the last help project", ""},
         Rule{[](Parameters& p, const Value& v) { p.LastUsedFolderForGeneratedHelp = OrElse(v, p.FolderForGeneratedHelp()); },
              [](const Parameters& p) { return Value(p.LastUsedFolderForGeneratedHelp); }}},
        {{"LastUsedFolderForCapturedImages", "folder of the last pictures", ""},
         Rule{[](Parameters& p, const Value& v) {
                  p.LastUsedFolderForCapturedImages = OrElse(v, p.FolderForGeneratedHelp() + "images");
              },
              [](const Parameters& p) { return Value(p.LastUsedFolderForCapturedImages); }}},
        {{"Charset", "character set of the pages", ""},
         Rule{LoadCharset, [](const Parameters& p) { return Value(p.Charset); }}},
        {{"CSSFullPath", "style sheet of the pages; a name alone is looked for among the templates", ""},
         Rule{[](Parameters& p, const Value& v) { p.SetCSSFullPath(v.AsString()); },
              [](const Parameters& p) { return Value(StoredStyleSheet(p.CSSFullPath())); }}},
        {{"AddControlsListForMenuList", "menu topics list their items", kBoolean}, &Parameters::AddControlsListForMenuList},
        {{"AddControlsSectionForMenuList", "menu topics have a section per item", kBoolean},
         &Parameters::AddControlsSectionForMenuList},
        {{"AddImageForForm", "form topics have a picture", kBoolean}, &Parameters::AddImageForForm},
        {{"AddHotSpotsForForm", "pictures of forms have hot spots", kBoolean}, &Parameters::AddHotSpotsForForm},
        {{"AddControlsListForForm", "form topics list their controls", kBoolean}, &Parameters::AddControlsListForForm},
        {{"AddControlsSectionForForm", "form topics have a section per control", kBoolean},
         &Parameters::AddControlsSectionForForm},
        {{"AddImageForReport", "report topics have a picture", kBoolean}, &Parameters::AddImageForReport},
        {{"AddControlsListForReport", "report topics list their controls", kBoolean}, &Parameters::AddControlsListForReport},
        {{"AddControlsSectionForReport", "report topics have a section per control", kBoolean},
         &Parameters::AddControlsSectionForReport},
        {{"SubFolderForScreenshots", "folder of the pictures below the project's", ""},
         Rule{[](Parameters& p, const Value& v) { p.SetNameOfFolderForGeneratedImages(v.AsString()); },
              [](const Parameters& p) { return Value(p.NameOfFolderForGeneratedImagesWithSlash()); }}},
        {{"FillIndexFromAppObjectsAndControls", "names of objects and controls go into the index", kBoolean},
         &Parameters::FillIndexFromAppObjectsAndControls},
        {{"AddSearchTabToHelp", "the compiled help has a full-text search", kBoolean}, &Parameters::AddSearchTabToHelp},
        {{"Language", "language of the help, by name", ""}, &Parameters::Language},
        {{"MakeNormalViewScreenshots", "pictures show forms as users see them, else in design view", kBoolean},
         &Parameters::MakeNormalViewScreenshots},
        {{"SkipInvisibleControls", "invisible controls are left out", kBoolean}, &Parameters::SkipInvisibleControls},
        {{"InsertExternalDescriptions", "descriptions stored in the database go into the topics", kBoolean},
         &Parameters::InsertExternalDescriptions},
        {{"LanguageCode", "language of the help, by code, such as EN", ""}, &Parameters::LanguageCode},
        {{"ListOfTagsToParseContentsFrom", "headings of a topic that go into the contents", ""},
         Rule{[](Parameters& p, const Value& v) { p.ListOfTagsToParseContentsFrom = OrElse(v, "H2"); },
              [](const Parameters& p) { return Value(p.ListOfTagsToParseContentsFrom); }}},
        {{"SyncTOCOnHTMLPageNavigationComplete", "the editor's contents follow the page", kBoolean},
         &Parameters::SyncTOCOnHTMLPageNavigationComplete},
        {{"GenerateHelpForTables", "tables are documented", kBoolean}, &Parameters::GenerateHelpForTables},
        {{"MSWordTOCLowerHeadingLevel", "lowest heading in a Word document's contents", "1 to 9"},
         Rule{LoadHeadingLevel,
              [](const Parameters& p) { return Value(std::to_string(p.MSWordTOCLowerHeadingLevel)); }}},
        {{"AutomatedTestModeOn", "messages answer themselves", kBoolean}, &Parameters::AutomatedTestModeOn},
        {{"GenerateHelpForQueries", "queries are documented", kBoolean}, &Parameters::GenerateHelpForQueries},
        {{"GenerateHelpForMacros", "macros are documented", kBoolean}, &Parameters::GenerateHelpForMacros},
        {{"UseProjectGroupAsSource", "the whole group of projects is the source", kBoolean},
         &Parameters::UseProjectGroupAsSource},
        {{"GenerateHelpForForms", "forms are documented", kBoolean}, &Parameters::GenerateHelpForForms},
        {{"GenerateHelpForReports", "reports are documented", kBoolean}, &Parameters::GenerateHelpForReports},
        {{"UnattendedExecution", "generation without questions", kBoolean}, &Parameters::UnattendedExecution},
        {{"WizardUnattendedExecution", "the wizard runs without questions", kBoolean},
         Rule{[](Parameters& p, const Value& v) { if (v.IsBoolean()) p.WizardUnattendedExecution = v.AsBoolean(); }, nullptr}},
        {{"VerboseTracing", "the trace holds every command", kBoolean},
         Rule{[](Parameters& p, const Value& v) { if (v.IsBoolean()) p.VerboseTracing = v.AsBoolean(); }, nullptr}},
    };
    return options;
}

const std::vector<Option>& ProjectOptions() {
    static const std::vector<Option> options = {
        {{"HelpProjectName", "name of the project's files; the source's name when not given", "", true},
         Rule{[](Parameters& p, const Value& v) { p.SetHelpProjectName(v.AsString()); }, nullptr}},
        {{"HelpProjectTitle", "title of the help", "", true},
         Rule{[](Parameters& p, const Value& v) { p.SetHelpProjectTitle(v.AsString()); }, nullptr}},
        {{"Application", "name of the application in the pages", "", true},
         Rule{[](Parameters& p, const Value& v) { p.ApplicationNameStr = v.AsString(); }, nullptr}},
    };
    return options;
}
// clang-format on

struct Loading {
    Parameters& parameters;
    const Value& value;

    /// A text that is neither true nor false says nothing.
    void operator()(bool Parameters::*member) const {
        if (value.IsBoolean())
            parameters.*member = value.AsBoolean();
    }
    void operator()(std::string Parameters::*member) const { parameters.*member = value.AsString(); }
    void operator()(const Rule& rule) const { rule.load(parameters, value); }
};

struct Saving {
    const Parameters& parameters;
    const char* name;
    ISettings& settings;

    void operator()(bool Parameters::*member) const {
        settings.SetOptionValue(name, Value(parameters.*member));
    }
    void operator()(std::string Parameters::*member) const {
        settings.SetOptionValue(name, Value(parameters.*member));
    }
    void operator()(const Rule& rule) const {
        if (rule.save != nullptr)
            settings.SetOptionValue(name, rule.save(parameters));
    }
};

/// Contents, index and compiler project are plain text of a code page: that of the pages' charset, or of the
/// help's language when the pages are Unicode.
int AnsiCodePageOf(const Parameters& parameters) {
    constexpr int kUtf8 = 65001;
    const int page = text::CodePageByCharsetName(parameters.Charset);
    if (page != 0 && page != kUtf8)
        return page;
    CCodePages pages;
    const CCodePage* language = pages.GetCodePageByLanguageCode(text::Trim(parameters.LanguageCode));
    const int number = language == nullptr ? 0 : std::atoi(language->CP1.c_str());
    return number > 0 ? number : 1252;
}

} // namespace

void CAddInSettings::Load(ISettings& rISettings, bool vfLoadFromProjectFile) {
    Parameters* parameters = Session::Parameters();
    if (parameters == nullptr)
        return;
    const auto load = [&](const Option& option, const Value& value) {
        PassOver([&] { std::visit(Loading{*parameters, value}, option.target); });
    };
    if (vfLoadFromProjectFile)
        for (const Option& option : ProjectOptions())
            if (const Value value = rISettings.OptionValue(option.description.name);
                !value.AsString().empty())
                load(option, value);
    for (const Option& option : Options())
        load(option, rISettings.OptionValue(option.description.name));
    PassOver([&] { text::SetAnsiCodePage(AnsiCodePageOf(*parameters)); });
    if (parameters->AutomatedTestModeOn)
        SetUnattendedMessages(true, Session::TraceLog());
}

void CAddInSettings::Save(ISettings& rISettings) {
    const Parameters* parameters = Session::Parameters();
    if (parameters == nullptr)
        return;
    rISettings.SetOptionValue("Version", Value(VersionText()));
    for (const Option& option : Options())
        std::visit(Saving{*parameters, option.description.name, rISettings}, option.target);
}

void RegisterSettingsLoader() {
    SetSettingsLoaderFactory([] { return std::make_unique<CAddInSettings>(); });
}

const std::vector<OptionDescription>& OptionDescriptions() {
    static const std::vector<OptionDescription> descriptions = [] {
        std::vector<OptionDescription> all;
        for (const auto* list : {&ProjectOptions(), &Options()})
            for (const Option& option : *list)
                all.push_back(option.description);
        return all;
    }();
    return descriptions;
}

} // namespace tovimar
