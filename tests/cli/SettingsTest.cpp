#include "cli/Program.h"
#include "platform/text/Text.h"

#include <fstream>
#include <gmock/gmock.h>
#include <nlohmann/json.hpp>
#include <unistd.h>

namespace tovimar::test {
namespace {

using nlohmann::json;
using ::testing::HasSubstr;

class SettingsTest : public ProgramTest {
protected:
    SettingsTest() : file_(OwnInstallation() / "Settings/vasmoraSettings.xml") {}
    std::string Get(const std::string& name) {
        return Run({"settings", "get", name}).ExpectExit(0).ExpectErrors("").output;
    }
    void Set(const std::string& name, const std::string& value) {
        Run({"settings", "set", name, value}).ExpectExit(0).ExpectErrors("").ExpectOutput("");
    }
    /// What was installed, and the user's own.
    fs::path file_;
    const fs::path own_ = Folder() / "user/tovimar/drive_c/Application Data/Tovimar/vasmoraSettings.xml";
};

TEST_F(SettingsTest, OneIsChangedAndAllElseStays) {
    const std::string before = ReadWhole(file_);
    Set("copyright", "A & B \"C\" <d> \xc3\xbc");
    EXPECT_EQ(Get("Copyright"), "A & B \"C\" <d> \xc3\xbc\n");
    Set("snapshotformat", "bitmap");
    EXPECT_EQ(Get("SnapshotFormat"), "Bitmap\n");
    Set("SnapshotFormat", "Jpeg");
    Set("Copyright", "");
    EXPECT_EQ(Get("Copyright"), "\n");
    EXPECT_EQ(ReadWhole(own_), before);
    EXPECT_EQ(ReadWhole(file_), before);
}

TEST_F(SettingsTest, OneThatTheFileLacksIsAdded) {
    std::string text = ReadWhole(file_);
    const auto line = text.find("    <Option Name = \"Author\"");
    text.erase(line, text.find('\n', line) + 1 - line);
    std::ofstream(file_, std::ios::binary) << text;
    Set("Author", "A. Smith");
    EXPECT_EQ(ReadWhole(own_),
              text::ReplaceAll(text, "</Options>",
                               "    <Option Name = \"Author\" Value = \"A. Smith\" />\n</Options>"));
}

TEST_F(SettingsTest, TheNextHelpStartsWithThem) {
    Write("app/forms/One.form", FormExport("One"));
    Set("Copyright", "Nobody");
    Run({"generate", "app", "--no-compile"}).ExpectExit(0);
    EXPECT_THAT(ReadWhole(Folder() / "app-help/Welcome.htm"), HasSubstr("Nobody"));

    Run({"settings", "set", "Copyright", "Somebody", "--project", "app-help"}).ExpectExit(0);
    EXPECT_EQ(Run({"settings", "get", "Copyright", "--project", "app-help"}).output, "Somebody\n");
    EXPECT_EQ(Get("Copyright"), "Nobody\n");
    EXPECT_THAT(ReadWhole(Folder() / "app-help/z1_app.tvp.bak"), HasSubstr("Nobody"));
    Run({"generate", "app-help/app.tvp", "--no-compile"}).ExpectExit(0);
    EXPECT_THAT(ReadWhole(Folder() / "app-help/Welcome.htm"), HasSubstr("Somebody"));
}

TEST_F(SettingsTest, AsTextAndAsJson) {
    const std::string list = Run({"settings"}).ExpectExit(0).output;
    EXPECT_THAT(list, HasSubstr("SnapshotFormat=Jpeg\n"));
    EXPECT_THAT(list, ::testing::Not(HasSubstr("HelpProjectTitle")));
    EXPECT_EQ(Run({"settings", "list"}).output, list);
    const auto all = json::parse(Run({"settings", "--json"}).ExpectExit(0).output);
    EXPECT_EQ(all["CompileHTMLHelp"], true);
    EXPECT_EQ(all["SnapshotFormat"], "Jpeg");
    EXPECT_EQ(json::parse(Run({"settings", "get", "openhtmlhelp", "--json"}).ExpectExit(0).output),
              (json{{"name", "OpenHTMLHelp"}, {"value", false}}));
}

TEST_F(SettingsTest, WhatIsRefused) {
    const std::string before = ReadWhole(file_);
    const auto refuses = [&](std::vector<std::string> arguments, const std::string& text, int code = 2) {
        arguments.insert(arguments.begin(), "settings");
        Run(arguments).ExpectExit(code).ExpectOutput("").ExpectErrors("tovimar: error: " + text + "\n");
    };
    const std::string all = "\n  Run \"tovimar options\" for all of them.";
    refuses({"get", "Autor"}, "there is no option 'Autor'; did you mean Author?" + all);
    refuses({"set", "Quux", "1"}, "there is no option 'Quux'" + all);
    refuses({"set", "SnapshotFormat", "png"},
            "'png' is no value of SnapshotFormat, which takes Bitmap or Jpeg");
    refuses({"set", "Author", "\xff"}, "the value of Author isn't UTF-8");
    refuses({"get", "HelpProjectTitle"}, "HelpProjectTitle belongs to a help project; --project names it");
    EXPECT_EQ(ReadWhole(file_), before);
    EXPECT_FALSE(fs::exists(own_));
    Set("Author", "A");
    if (geteuid() != 0) { // whom nothing is forbidden
        fs::permissions(own_, fs::perms::owner_read);
        refuses({"set", "Author", "x"},
                "no permission to change '<FOLDER>/user/tovimar/drive_c/Application "
                "Data/Tovimar/vasmoraSettings.xml'\n"
                "  --project changes the options of one help project.",
                1);
        fs::permissions(own_, fs::perms::owner_read | fs::perms::owner_write);
    }
    std::ofstream(own_, std::ios::binary) << "<dataroot/>";
    refuses({"get", "Author"},
            "'<FOLDER>/user/tovimar/drive_c/Application Data/Tovimar/vasmoraSettings.xml' has no options", 1);
    std::ofstream(own_, std::ios::binary) << "<Settings><Options>";
    EXPECT_THAT(Run({"settings", "set", "Author", "x"}).ExpectExit(1).errors, HasSubstr("can't be read: "));
}

} // namespace
} // namespace tovimar::test
