#include "cli/Program.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <map>

namespace tovimar::test {
namespace {

class ScreenshotCommandTest : public ProgramTest {
protected:
    std::map<std::string, std::string> Files(const std::string& folder) const {
        std::map<std::string, std::string> files;
        for (const std::string& file : FilesBelow(Folder() / folder))
            files[file] = ReadWhole(Folder() / folder / file);
        return files;
    }
    /// A form with an option group and a report, both called "One", a table, and a form in another.
    void WriteApplication() const {
        const std::string group = ControlExport("OptionGroup", "Kind", "Width =2000\r\nHeight =900\r\n");
        const std::string subform = ControlExport("Subform", "Part", "SourceObject =\"Form.Inner\"\r\n");
        Write("app/forms/One.form", FormExport("The first", group + subform));
        Write("app/forms/Inner.form", FormExport("Inside"));
        Write("app/reports/One.report",
              text::ReplaceAll(FormExport("The report"), "Begin Form", "Begin Report"));
        Write("app/tbldefs/Two.sql", "CREATE TABLE [Two] (\r\n  [A] LONG\r\n)\r\n");
    }
    void Generate() {
        Run({"generate", "app", "--no-compile", "--option", "CompileHTMLHelp=false"}).ExpectExit(0);
    }
};

TEST_F(ScreenshotCommandTest, TakesTheSamePicturesAndTopicAsTheRun) {
    Run({"generate", kSample, "--output", "help", "--no-compile"}).ExpectExit(0);
    const auto first = Files("help");
    for (const char* name :
         {"help/images/orchard_Form_Customers.jpg", "help/images/orchard_Form_Customers_tabCustomer_1.jpg",
          "help/orchard_Form_Customers.htm"})
        fs::remove(Folder() / name);
    Run({"screenshot", "help/orchard.tvp", "customers", "--topic"})
        .ExpectExit(0)
        .ExpectErrors("Reading <SOURCE>/samples/orchard\nTaking pictures of the form 'Customers'\n")
        .ExpectOutput("Picture: <FOLDER>/help/images/orchard_Form_Customers.jpg\n"
                      "Topic:   <FOLDER>/help/orchard_Form_Customers.htm\n");
    EXPECT_TRUE(Files("help") == first);
}

TEST_F(ScreenshotCommandTest, KeepsTheOldTopicAndFollowsTheApplication) {
    WriteApplication();
    Generate();
    const auto first = Files("app-help");
    Write("app/forms/One.form", FormExport("Renamed"));
    Run({"screenshot", "app-help", "One", "--form", "--topic"}).ExpectExit(0);
    auto second = Files("app-help");
    const auto backup = std::find_if(second.begin(), second.end(),
                                     [&](const auto& file) { return !first.contains(file.first); });
    ASSERT_NE(backup, second.end());
    EXPECT_EQ(backup->second, first.at("app_Form_One.htm"));
    EXPECT_NE(second["app_Form_One.htm"].find("Renamed"), std::string::npos);
    EXPECT_NE(second["images/app_Form_One.jpg"], first.at("images/app_Form_One.jpg"));
    EXPECT_EQ(second["app.tvp"], first.at("app.tvp"));
}

TEST_F(ScreenshotCommandTest, WhatCanNotBeTaken) {
    WriteApplication();
    Generate();
    const auto refuses = [&](std::vector<std::string> arguments, const std::string& text) {
        arguments.insert(arguments.begin(), "screenshot");
        const auto outcome = Run(arguments).ExpectExit(1).ExpectOutput("");
        EXPECT_TRUE(outcome.errors.ends_with("tovimar: error: " + text + "\n")) << outcome.errors;
    };
    const std::string file = "'<FOLDER>/app-help/app.tvp'";
    refuses({"app-help", "One"}, "there are a form and a report 'One'\n  --form or --report says which one.");
    refuses({"app-help", "Three"}, file + " documents no form or report 'Three'");
    refuses({"app-help", "Inner", "--report"}, file + " documents no report 'Inner'");
    refuses({"app-help", "Two"}, "the table 'Two' has no picture");
    refuses({"app-help", "Inner"}, "the form 'Inner' has no topic of its own in the help, and so no picture");
    refuses({"app/", "One"}, "there is no help project (.tvp) in '<FOLDER>/app'");
    refuses({"app/forms/One.form", "One"}, "'<FOLDER>/app/forms/One.form' is no help project: Text stands in "
                                           "front of the root element");

    Write("app-help/zz.tvp", "<x/>");
    refuses({"app-help", "One"},
            "'<FOLDER>/app-help' holds several help projects: app.tvp, zz.tvp\n  Name one of these files.");
    refuses({"app-help/zz.tvp", "One"}, "'<FOLDER>/app-help/zz.tvp' is no help project");
    fs::rename(Folder() / "app-help/app.tvp", Folder() / "app-help/moved.tvp");
    refuses({"app-help/moved.tvp", "One"},
            "it isn't known which application '<FOLDER>/app-help/moved.tvp' was made "
            "from\n  --source names its exports or its database.");
    Run({"screenshot", "app-help/moved.tvp", "One", "--form", "--source", "app"}).ExpectExit(0);
    fs::rename(Folder() / "app-help/moved.tvp", Folder() / "app-help/app.tvp");
    fs::remove(Folder() / "app/reports/One.report");
    refuses({"app-help/app.tvp", "One", "--report"}, "the application '<FOLDER>/app' has no report 'One'");
    fs::rename(Folder() / "app", Folder() / "gone");
    refuses({"app-help/app.tvp", "One", "--form"},
            "the application of the project isn't at '<FOLDER>/app/app.accdb' any more\n  --source names its "
            "place.");
}

TEST_F(ScreenshotCommandTest, LinesThatAreNotUnderstood) {
    const std::string hint =
        "Run \"tovimar --help\" for the commands and \"tovimar COMMAND --help\" for their arguments.\n";
    const auto refuses = [&](const std::vector<std::string>& arguments, const std::string& text) {
        Run(arguments).ExpectExit(2).ExpectOutput("").ExpectErrors("tovimar: error: " + text + "\n" + hint);
    };
    refuses({"screenshot", "."}, "OBJECT is required");
    refuses({"screenshot", ".", "One", "--form", "--report"}, "--form excludes --report");
}

} // namespace
} // namespace tovimar::test
