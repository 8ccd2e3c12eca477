#include "GenerationTest.h"

#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Product.h"
#include "generation/CAddInSettings.h"
#include "generation/HelpUtilities.h"
#include "platform/text/Text.h"

namespace tovimar::test {
namespace {

using ParametersTest = GenerationTest;

TEST_F(ParametersTest, HelpFolderReadsWithSingleBackslashes) {
    const std::vector<std::pair<std::string, std::string>> cases{
        {"C:\\help", "C:\\help\\"},
        {"C:\\a\\\\b\\", "C:\\a\\b\\"},
        {"\\\\server\\share\\\\help", "\\\\server\\share\\help\\"},
        {"{Project Location}\\CHM", "{{ProjectLocation}}CHM\\"},
        {"C:\\help ", "C:\\help \\"},
        {"", ""},
    };
    for (const auto& [stored, read] : cases) {
        Parameters().SetFolderForGeneratedHelp(stored);
        EXPECT_EQ(read, Parameters().FolderForGeneratedHelp()) << stored;
    }
}

TEST_F(ParametersTest, MissingValuesFallBack) {
    Parameters().SetNameOfFolderForGeneratedImages("");
    EXPECT_EQ(project->Folder + "images\\", Parameters().FolderForGeneratedImages());
    Parameters().SetNameOfFolderForGeneratedImages("pics\\");
    EXPECT_EQ("pics", Parameters().NameOfFolderForGeneratedImages());
    EXPECT_EQ("pics\\", Parameters().NameOfFolderForGeneratedImagesWithSlash());

    Parameters().SetCSSFullPath("Office10.css");
    EXPECT_EQ(project->Folder + "Office10.css", Parameters().CSSFullPath());
    Parameters().SetCSSFullPath("C:\\css\\a.css");
    EXPECT_EQ("C:\\css\\a.css", Parameters().CSSFullPath());
    Parameters().SetCSSFullPath("");
    EXPECT_EQ("", Parameters().CSSFullPath());

    environment->userName = "Alma";
    EXPECT_EQ("Alma", Parameters().Author());
    environment->userName = "Boris";
    EXPECT_EQ("Alma", Parameters().Author());

    Parameters().SetHelpProjectName("");
    EXPECT_EQ("Shop", Parameters().HelpProjectTitle());
    EXPECT_EQ(project->Folder + "Shop.chm", Parameters().CompiledHelpFullPath());
    EXPECT_EQ(".jpg", Parameters().ImagesFileExt());
    Parameters().ImagesFormat = 1;
    EXPECT_EQ("bmp", Parameters().ImagesType());
}

TEST_F(ParametersTest, DoubleBracedTagsGoFirstAndCaseCounts) {
    Parameters().ApplicationNameStr = "{Organization} Shop";
    Parameters().Organization = "Acme";
    EXPECT_EQ("Acme Shop|Acme|{{application}}|{{Unknown}}",
              Parameters().ReplacedTags("{{Application}}|{Organization}|{{application}}|{{Unknown}}"));
    EXPECT_EQ("Shop in D:\\Apps\\", Parameters().ReplacedTags("{ProjectName} in {{Project Location}}"));
    EXPECT_EQ(TitleAndVersion() + "|" + VersionText(),
              Parameters().ReplacedTags("{{HtmlTovimarTitleAndVersion}}|{{HtmlTovimarVersion}}"));
    answers["CurrentSourceProjectLocation"] = "";
    EXPECT_EQ(environment->folders.temporary, Parameters().ReplacedTags("{Project Location}"));

    sent.clear();
    std::string bypassed = "{ProjectName}{Project Location}";
    EXPECT_EQ("NF", Parameters().ReplaceTags(bypassed, true, "F", "N"));
    EXPECT_EQ("plain", Parameters().ReplacedTags("plain"));
    EXPECT_TRUE(sent.empty()) << "no tag of the source project, no question to the host";
}

TEST_F(ParametersTest, PagesAreFilledFromTemplates) {
    Parameters().ApplicationNameStr = "Shop";
    const std::string source = WriteFile("page.htm", "{{Application}} {{body}} {{Other}}");
    const std::string target = Path("help\\page.htm");
    EXPECT_EQ("Shop a|b {{Other}}", ReplaceTagsAndCopy(source, target, {" {{BODY}} | a|b ", "{{Other}}"}));
    EXPECT_EQ("Shop a|b {{Other}}", ReadFile(target));

    EXPECT_EQ("", ReplaceTagsAndCopy(Path("absent.htm"), target, {}));
    EXPECT_EQ("", ReadFile(target)) << "a missing template gives an empty page";
    EXPECT_EQ("<link href=\"a.css\" type=\"text/css\" rel=\"stylesheet\" >",
              GetStyleSheetLinkHtml("C:\\x\\a.css"));
    EXPECT_EQ("", GetStyleSheetLinkHtml(""));

    const std::string folderInTheWay = Path("help");
    try {
        ReplaceTagsAndCopy(source, folderInTheWay, {});
        FAIL() << "a folder was written over";
    } catch (const RaisedError& error) {
        EXPECT_EQ("Error saving file " + folderInTheWay, std::string(error.what()));
    }
}

class SettingsTest : public GenerationTest {
protected:
    SettingsTest() { RegisterSettingsLoader(); }

    void Load(const std::string& options, bool fromProject = false) {
        const std::string settings = "<Settings><Options>" + options + "</Options></Settings>";
        const std::string path = WriteFile(
            "settings.xml", fromProject ? "<TovimarProject>" + settings + "</TovimarProject>" : settings);
        ASSERT_EQ(kSuccess, file.Load(path, fromProject));
    }
    static std::string Option(const std::string& name, const std::string& value) {
        return "<Option Name=\"" + name + "\" Value=\"" + value + "\"/>";
    }

    CAddInSettingsXmlFile file;
};

TEST_F(SettingsTest, OptionsFollowTheirRules) {
    Parameters().GenerateHelpForMacros = true;
    Load(Option("IdentifyBy", "Name") + Option("SnapshotFormat", "Bitmap") +
         Option("AddSearchTabToHelp", "TRUE") + Option("GenerateHelpForTables", "False") +
         Option("AddImageForForm", "maybe") + Option("MSWordTOCLowerHeadingLevel", "10") +
         Option("FolderForGeneratedHelp", "{Project Location}CHM\\\\x") + Option("Application", "Other"));
    const auto& p = Parameters();
    EXPECT_EQ(1, p.IdentifyControls);
    EXPECT_EQ(1, p.ImagesFormat);
    EXPECT_TRUE(p.AddSearchTabToHelp);
    EXPECT_FALSE(p.GenerateHelpForTables);
    EXPECT_TRUE(p.GenerateHelpForMacros) << "an absent option changes nothing";
    EXPECT_FALSE(p.AddImageForForm) << "neither true nor false says nothing";
    EXPECT_EQ(2, p.MSWordTOCLowerHeadingLevel);
    EXPECT_EQ("D:\\Apps\\CHM\\x\\", p.FolderForGeneratedHelp());
    EXPECT_EQ("D:\\Apps\\CHM\\x\\images", p.LastUsedFolderForCapturedImages);
    EXPECT_EQ("H2", p.ListOfTagsToParseContentsFrom);
    EXPECT_EQ("windows-1252", p.Charset);
    EXPECT_NE("Other", p.ApplicationNameStr) << "the global file names no application";

    environment->languageId = 1049;
    Load(Option("IdentifyBy", "Caption") + Option("Application", "Other") + Option("HelpProjectTitle", ""),
         true);
    EXPECT_EQ(0, p.IdentifyControls);
    EXPECT_EQ("windows-1251", p.Charset);
    EXPECT_EQ(1251, text::AnsiCodePage().Number());
    EXPECT_EQ("Other", p.ApplicationNameStr);
}

TEST_F(SettingsTest, EveryOptionComesBackFromTheStore) {
    Load(Option("IdentifyBy", "Name") + Option("SnapshotFormat", "Jpeg") +
         Option("CSSFullPath", "C:\\a.css") + Option("VerboseTracing", "kept") +
         Option("HelpProjectName", "kept"));
    Parameters().AddHotSpotsForForm = true;
    file.CopyToOptions();
    EXPECT_EQ(Value("C:\\a.css"), file.OptionValue("CSSFullPath"));
    Parameters().SetCSSFullPath("own.css");
    file.CopyToOptions();
    EXPECT_EQ(Value("own.css"), file.OptionValue("CSSFullPath")) << "the project may be moved";
    EXPECT_EQ(Value("Name"), file.OptionValue("IdentifyBy"));
    EXPECT_EQ(Value("Jpeg"), file.OptionValue("SnapshotFormat"));
    EXPECT_EQ(Value(true), file.OptionValue("AddHotSpotsForForm"));
    EXPECT_EQ(Value("images\\"), file.OptionValue("SubFolderForScreenshots"));
    EXPECT_EQ(Value("2"), file.OptionValue("MSWordTOCLowerHeadingLevel"));
    EXPECT_EQ(Value("kept"), file.OptionValue("VerboseTracing")) << "only ever read";
    EXPECT_EQ(Value("kept"), file.OptionValue("HelpProjectName")) << "only ever read";
    EXPECT_EQ(Value(VersionText()), file.OptionValue("Version"));
}

} // namespace
} // namespace tovimar::test
