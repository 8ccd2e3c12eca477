#include "cli/HelpFolder.h"
#include "cli/Program.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <random>

namespace tovimar::test {
namespace {

std::string Repeated(const std::string& text, int times) {
    std::string all;
    for (int i = 0; i < times; ++i)
        all += text;
    return all;
}

std::string InUtf16(const std::string& ascii) {
    std::string bytes = "\xff\xfe";
    for (const char c : ascii) {
        bytes += c;
        bytes += '\0';
    }
    return bytes;
}

class BadInputTest : public ProgramTest {
protected:
    Outcome Generate(const std::string& source) {
        return Run({"generate", source, "--output", "help", "--no-compile"});
    }
    /// Fails with that, and the output folder isn't made.
    void ExpectRefused(const std::string& source, const std::string& errors) {
        Generate(source).ExpectExit(1).ExpectOutput("").ExpectErrors("Reading " + source + "\n" + errors);
        EXPECT_FALSE(fs::exists(Folder() / "help")) << source;
    }
    std::vector<std::string> Pages() const {
        std::vector<std::string> pages;
        for (const std::string& file : FilesBelow(Folder() / "help"))
            if (file.find("_Form_") != std::string::npos && file.ends_with(".htm"))
                pages.push_back(file);
        return pages;
    }
};

TEST_F(BadInputTest, ADamagedExportIsNamedWithItsPlaceAndNothingIsWritten) {
    const std::string sound = FormExport("Sound", ControlExport("TextBox", "Town"));
    const struct {
        const char* folder;
        std::string bytes;
        std::string place;
    } cases[] = {
        {"truncated", sound.substr(0, sound.find("Height =1500")),
         "line 15: the file ends inside the block that begins in line 11."},
        {"halved", InUtf16(sound).substr(0, 401),
         "line 11: the file ends inside the block that begins in line 10."},
        {"deep",
         "Version =21\r\nBegin Form\r\n" + Repeated("Begin Section\r\n", 10000) + Repeated("End\r\n", 10001),
         "line 202: blocks are nested deeper than 200."},
    };
    for (const auto& damaged : cases) {
        const std::string folder = damaged.folder;
        Write(folder + "/forms/Sound.form", sound);
        Write(folder + "/forms/Bad.form", damaged.bytes);
        ExpectRefused(folder, "tovimar: error: <FOLDER>/" + folder + "/forms/Bad.form, " + damaged.place +
                                  "\ntovimar: error: 1 of 2 objects of '<FOLDER>/" + folder +
                                  "' can't be read; nothing was written\n");
    }
}

TEST_F(BadInputTest, NoApplicationAtAll) {
    fs::create_directories(Folder() / "empty");
    ExpectRefused("empty", "tovimar: error: No Access application found in empty.\n");

    std::minstd_rand random(1);
    std::string noise;
    for (int i = 0; i < 100'000; ++i)
        noise += static_cast<char>(random() >> 8);
    Write("noise.accdb", noise);
    ExpectRefused("noise.accdb", "tovimar: error: <FOLDER>/noise.accdb: the file is no Access database.\n");
    Write("damaged.accdb", std::string("\0\1\0\0Standard ACE DB\0", 20) + noise);
    ExpectRefused("damaged.accdb",
                  "tovimar: error: <FOLDER>/damaged.accdb: the database can't be read; it may "
                  "be damaged or encrypted.\n");
}

TEST_F(BadInputTest, BytesThatAreNoUtf8AreReadAsTheAnsiCodePage) {
    Write("app/forms/Odd.form", FormExport("Gr\xf6\xdf"
                                           "e \xff"));
    Generate("app").ExpectExit(0);
    EXPECT_NE(ReadWhole(Folder() / "help/app_Form_Odd.htm")
                  .find("<title>Gr\xc3\xb6\xc3\x9f"
                        "e \xc3\xbf"),
              std::string::npos);
}

TEST_F(BadInputTest, AnEventWithoutItsProcedureIsToldAndTheTopicIsMade) {
    const std::string button =
        ControlExport("CommandButton", "Go", "                    OnClick =\"[Event Procedure]\"\r\n");
    Write("app/forms/One.form", FormExport("One", button) + "CodeBehindForm\r\nOption Explicit\r\n");
    Generate("app").ExpectExit(1).ExpectErrorsHold(
        "tovimar: error: Error 35: Sub or Function not defined: Go_Click in Form_One\n");
    EXPECT_THAT(Pages(), ::testing::ElementsAre("app_Form_One.htm"));
}

TEST_F(BadInputTest, SubformsThatHoldThemselves) {
    const auto holding = [](const std::string& form) {
        return FormExport(
            "Loop",
            ControlExport("Subform", "sub", "                    SourceObject =\"Form." + form + "\"\r\n"));
    };
    Write("app/forms/Self.form", holding("Self"));
    Write("app/forms/There.form", holding("Back"));
    Write("app/forms/Back.form", holding("There"));
    Generate("app").ExpectExit(0);
    EXPECT_THAT(Pages(),
                ::testing::ElementsAre("app_Form_Back.htm", "app_Form_Self.htm", "app_Form_There.htm"));
    EXPECT_THAT(HelpFolder(Folder() / "help").Faults(), ::testing::IsEmpty());
}

TEST_F(BadInputTest, AreasOfASubformEndAtItsFrame) {
    Write("app/forms/Outer.form",
          FormExport("Outer", ControlExport("Subform", "sub",
                                            "                    SourceObject =\"Form.Inner\"\r\n")));
    Write("app/forms/Inner.form",
          FormExport("Inner", ControlExport("TextBox", "cut", "                    Width =4000\r\n") +
                                  ControlExport("TextBox", "hidden", "                    Left =4000\r\n")));
    Generate("app").ExpectExit(0);
    EXPECT_THAT(HelpFolder(Folder() / "help").Faults(), ::testing::IsEmpty());
    const std::string page = ReadWhole(Folder() / "help/app_Form_Outer.htm");
    EXPECT_NE(page.find("HREF=\"#Outer_cut\" FRAME"), std::string::npos);
    EXPECT_EQ(page.find("HREF=\"#Outer_hidden\" FRAME"), std::string::npos);
}

TEST_F(BadInputTest, StrangeNamesOfObjectsStayInTheFolder) {
    const std::string cyrillic = "\xd0\x97\xd0\xb0\xd0\xba\xd0\xb0\xd0\xb7\xd1\x8b";
    for (const std::string& name :
         {std::string("..%5C..%5Cx"), std::string("..%2F..%2Fy"), std::string(".."), std::string("No # 1"),
          std::string("100% off"), std::string("It's"), std::string("<b>A & B"), std::string("a%3Fb%2A%3A"),
          std::string("CON"), std::string(200, 'L'), cyrillic})
        Write("app/forms/" + name + ".form", FormExport("A form", ControlExport("TextBox", "A '1' # % <x>")));
    Write("app/tbldefs/T.sql", "CREATE TABLE [T] (\r\n  [Field # % 'x'] VARCHAR (10)\r\n)\r\n");
    const auto before = FilesBelow(Folder() / "app");
    Generate("app").ExpectExit(0);
    EXPECT_EQ(Pages().size(), 11U);
    for (const std::string& page : Pages()) {
        EXPECT_EQ(page.find_first_of("#%?*:<>'\"\\& "), std::string::npos) << page;
        EXPECT_TRUE(std::all_of(page.begin(), page.end(), [](char c) { return c > 32 && c < 127; })) << page;
    }
    EXPECT_THAT(HelpFolder(Folder() / "help").Faults(), ::testing::IsEmpty());
    EXPECT_EQ(FilesBelow(Folder() / "app"), before);
    std::vector<std::string> beside;
    for (const auto& entry : fs::directory_iterator(Folder()))
        beside.push_back(entry.path().filename().string());
    EXPECT_THAT(beside, ::testing::UnorderedElementsAre("app", "help", "user"));
}

TEST_F(BadInputTest, DoubleQuotesInANameAreToldAndLeftOut) {
    Write("app/forms/Say %22hi%22.form", FormExport("Hi"));
    Write("app/forms/One.form", FormExport("One"));
    Generate("app").ExpectExit(0).ExpectErrorsHold(
        "tovimar: warning: Source Form skipped Say \"hi\".\n  Please remove double quotes from its name.\n");
    EXPECT_THAT(Pages(), ::testing::ElementsAre("app_Form_One.htm"));
}

TEST_F(BadInputTest, AFolderThatCannotBeWritten) {
    Write("file", "in the way");
    for (const std::string& folder : {(Folder() / "file/help").string(), std::string("/proc/help")})
        Run({"generate", kSample, "--output", folder, "--no-compile"})
            .ExpectExit(1)
            .ExpectOutput("")
            .ExpectErrors(
                "Reading <SOURCE>/samples/orchard\ntovimar: error: Target folder '" +
                WithPlaceholders(folder) +
                "/'\n   cannot be created.\n  Please select or enter another target folder name.\n");
}

TEST_F(BadInputTest, WithoutTheCompilerNothingIsWritten) {
    LeaveTheCompilerBehind();
    Run({"generate", kSample, "--output", "help"})
        .ExpectExit(1)
        .ExpectErrors("Reading <SOURCE>/samples/orchard\n"
                      "tovimar: error: the help compiler isn't installed; nothing was written\n"
                      "  It is the file hhc.exe beside the command; --no-compile writes everything but the "
                      ".chm.\n");
    EXPECT_FALSE(fs::exists(Folder() / "help"));
}

TEST_F(BadInputTest, ACompilerThatFailsFailsTheRun) {
    Write("bin/chmcmd", "#!/bin/sh\necho out of paper\nexit 3\n");
    fs::permissions(Folder() / "bin/chmcmd", fs::perms::owner_all);
    searchPath = (Folder() / "bin").string() + ":/usr/bin:/bin";
    variables["TOVIMAR_HELP_COMPILER"] = "chmcmd";
    Run({"generate", kSample, "--output", "help", "--copy-to", "copy"})
        .ExpectExit(1)
        .ExpectErrorsHold("tovimar: error: the help compiler made no file:\n  out of paper\n");
    EXPECT_TRUE(fs::exists(Folder() / "help/main.htm"));
    EXPECT_FALSE(fs::exists(Folder() / "copy/orchard.chm"));
}

TEST_F(BadInputTest, FoldersWithBlanksAndParenthesesCompile) {
    Write("My (old) shop/forms/One.form", FormExport("One"));
    Run({"generate", "My (old) shop", "--output", "the help", "--copy-to", "copies"}).ExpectExit(0);
    EXPECT_TRUE(ReadWhole(Folder() / "copies/My (old) shop.chm").starts_with("ITSF"));
    for (const std::string& file : FilesBelow(Folder() / "the help"))
        EXPECT_FALSE(file.starts_with("~")) << "a working copy is left: " << file;
}

TEST_F(BadInputTest, AnotherApplicationsProjectIsLeftAlone) {
    Write("app/forms/One.form", FormExport("One"));
    Generate("app").ExpectExit(0);
    const auto files = FilesBelow(Folder() / "help");
    const std::string project = ReadWhole(Folder() / "help/app.tvp");
    Generate(kSample).ExpectExit(1).ExpectOutput("").ExpectErrors(
        "Reading <SOURCE>/samples/orchard\n"
        "tovimar: error: Target folder '<FOLDER>/help/'\n  already has Tovimar project 'app.tvp'.\n\n"
        "  Please select another target folder.\n");
    EXPECT_EQ(FilesBelow(Folder() / "help"), files);
    EXPECT_EQ(ReadWhole(Folder() / "help/app.tvp"), project);
}

} // namespace
} // namespace tovimar::test
