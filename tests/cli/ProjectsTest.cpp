#include "cli/Program.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

namespace tovimar::test {
namespace {

using nlohmann::json;
using ::testing::ElementsAre;
using ::testing::HasSubstr;

/// Help projects of a small application: made, listed, found again, looked into.
class ProjectsTest : public ProgramTest {
protected:
    ProjectsTest() {
        const std::string subform =
            ControlExport("Subform", "Part", "                    SourceObject =\"Form.Inner\"\r\n");
        Write("shop/forms/Orders.form",
              FormExport("Order Entry", ControlExport("TextBox", "Town") + subform));
        Write("shop/forms/Inner.form", FormExport("Inside"));
        Write("shop/tbldefs/Goods.sql", "CREATE TABLE [Goods] (\r\n  [Id] LONG\r\n)\r\n");
    }
    void Make(const std::string& command, const std::string& folder = "help",
              std::vector<std::string> more = {}) {
        std::vector<std::string> arguments{command, "shop", "--output", folder};
        arguments.insert(arguments.end(), more.begin(), more.end());
        if (command == "generate")
            arguments.emplace_back("--no-compile");
        Run(arguments).ExpectExit(0);
    }
    void ExpectRefused(const std::vector<std::string>& arguments, const std::string& error, int code = 1) {
        Run(arguments).ExpectExit(code).ExpectOutput("").ExpectErrors("tovimar: error: " + error + "\n");
    }
    std::string Catalogue() const {
        return ReadWhole(Folder() / "user/tovimar/drive_c/Application Data/Tovimar/vasmoraProjects.xml");
    }
};

TEST_F(ProjectsTest, ANewOneHasItsTreeAndOptionsButNoPages) {
    Run({"new", "shop", "--output", "help", "--option", "Author=A. Smith", "--option",
         "HelpProjectTitle=Shop"})
        .ExpectExit(0)
        .ExpectErrors("Reading shop\n")
        .ExpectOutput("Project:       <FOLDER>/help/shop.tvp\n");
    EXPECT_THAT(FilesBelow(Folder() / "help"), ElementsAre("shop.tvp"));
    const std::string project = ReadWhole(Folder() / "help/shop.tvp");
    EXPECT_THAT(project, HasSubstr("<FORM level = \"3\"  name = \"Orders\""));
    EXPECT_THAT(project, HasSubstr("<TABLE level = \"3\"  name = \"Goods\""));
    EXPECT_THAT(project, HasSubstr("Name = \"Author\" Value = \"A. Smith\""));
    EXPECT_EQ(project.find("serializer"), std::string::npos);
    EXPECT_THAT(Catalogue(), HasSubstr("Name = \"shop\""));

    Run({"new", "shop", "--output", "help"})
        .ExpectExit(1)
        .ExpectErrors(
            "Reading shop\ntovimar: error: '<FOLDER>/help' already has the help project 'shop.tvp'\n"
            "  \"tovimar generate\" goes on with it; --output names another folder.\n");
    EXPECT_EQ(ReadWhole(Folder() / "help/shop.tvp"), project);
}

TEST_F(ProjectsTest, GenerateGoesOnWithANewOneAndItsOptions) {
    Make("new", "help", {"--option", "Copyright=Mine", "--option", "HelpProjectTitle=The Shop"});
    const auto identifiers = [&] {
        const std::string project = ReadWhole(Folder() / "help/shop.tvp");
        return project.substr(project.find("SUID"), 100);
    };
    const std::string made = identifiers();
    Run({"generate", "help/shop.tvp", "--no-compile"})
        .ExpectExit(0)
        .ExpectErrorsHold("Reading <FOLDER>/shop\n");
    EXPECT_EQ(identifiers(), made);
    EXPECT_THAT(ReadWhole(Folder() / "help/Welcome.htm"), HasSubstr("Mine"));
    EXPECT_THAT(ReadWhole(Folder() / "help/Welcome.htm"), HasSubstr("The Shop"));
    EXPECT_FALSE(fs::exists(Folder() / "shop-help"));
}

TEST_F(ProjectsTest, TheCatalogueListsAndForgetsThem) {
    Run({"projects"})
        .ExpectExit(0)
        .ExpectOutput("")
        .ExpectErrors("The catalogue has no help projects yet.\n");
    EXPECT_EQ(json::parse(Run({"projects", "--json"}).ExpectExit(0).output), json::array());
    Make("new", "help", {"--option", "HelpProjectTitle=The \"Shop\" & more"});
    Make("new", "old", {"--option", "HelpProjectName=old"});
    fs::remove(Folder() / "old/old.tvp");

    const auto listed = json::parse(Run({"projects", "--json"}).ExpectExit(0).output);
    ASSERT_EQ(listed.size(), 2U);
    EXPECT_EQ(listed[0]["name"], "shop");
    EXPECT_EQ(listed[0]["title"], "The \"Shop\" & more");
    EXPECT_EQ(listed[0]["project"], "<FOLDER>/help/shop.tvp");
    EXPECT_EQ(listed[0]["source"], "<FOLDER>/shop");
    EXPECT_EQ(listed[0]["missing"], false);
    EXPECT_EQ(listed[0]["written"].get<std::string>().size(), 19U);
    EXPECT_EQ(listed[1]["name"], "old");
    EXPECT_EQ(listed[1]["missing"], true);
    const std::string text = Run({"projects"}).ExpectExit(0).output;
    EXPECT_THAT(text,
                HasSubstr("shop  \"The \"Shop\" & more\"\n  Project: <FOLDER>/help/shop.tvp\n  Source:  "
                          "<FOLDER>/shop\n  Written: 20"));
    EXPECT_TRUE(text.ends_with("old\n  Project: <FOLDER>/old/old.tvp  (missing)\n  Source:  <FOLDER>/shop\n"))
        << text;

    ExpectRefused({"contents", "old"},
                  "the project 'old' isn't at '<FOLDER>/old/old.tvp' any more\n  \"tovimar "
                  "projects forget old\" takes it out of the catalogue.");
    Run({"projects", "forget", "old"}).ExpectExit(0).ExpectOutput("").ExpectErrors("");
    ExpectRefused({"projects", "forget", "old"}, "the catalogue has no project 'old'");
    Run({"projects", "forget", "help"}).ExpectExit(0);
    EXPECT_EQ(json::parse(Run({"projects", "list", "--json"}).output), json::array());
    EXPECT_TRUE(fs::exists(Folder() / "help/shop.tvp"));
}

TEST_F(ProjectsTest, AreFoundByFileFolderAndName) {
    Make("new");
    const std::string contents = Run({"contents", "help/shop.tvp"}).ExpectExit(0).output;
    EXPECT_EQ(Run({"contents", "help"}).output, contents);
    // A folder of that name stands here as well; it holds no project.
    EXPECT_EQ(Run({"contents", "Shop"}).output, contents);

    const std::string kinds = "\n  Name a project file (.tvp), a folder that holds one, or a name that "
                              "\"tovimar projects\" shows.";
    ExpectRefused({"contents", "nowhere"}, "there is no help project 'nowhere'" + kinds);
    ExpectRefused({"contents", "shop/"}, "there is no help project (.tvp) in '<FOLDER>/shop'");
    Make("new", "second");
    Write("empty/.keep", "");
    ExpectRefused({"contents", "shop"}, "the catalogue has several projects 'shop'; name the file of one:\n"
                                        "  shop  <FOLDER>/help/shop.tvp\n  shop  <FOLDER>/second/shop.tvp");
    ExpectRefused({"open"},
                  "there is no help project here; which one of the catalogue?\n"
                  "  shop  <FOLDER>/help/shop.tvp\n  shop  <FOLDER>/second/shop.tvp",
                  2);
    Write("help/another.tvp", "<x/>");
    ExpectRefused({"contents", "help"}, "'<FOLDER>/help' holds several help projects: another.tvp, shop.tvp\n"
                                        "  Name one of these files.");
    ExpectRefused({"contents", "help/another.tvp"}, "'<FOLDER>/help/another.tvp' is no help project");
    Write("cut.tvp", ReadWhole(Folder() / "help/shop.tvp").substr(0, 900));
    EXPECT_THAT(Run({"contents", "cut.tvp"}).ExpectExit(1).errors,
                HasSubstr("tovimar: error: '<FOLDER>/cut.tvp' is no help project: "));
    Write("Caf\xe9/shop.tvp", ReadWhole(Folder() / "second/shop.tvp"));
    EXPECT_EQ(Run({"contents", "Caf\xe9"}).ExpectExit(0).output, contents);
}

TEST_F(ProjectsTest, ContentsAsTextAndAsJson) {
    Make("generate");
    Run({"contents", "help"})
        .ExpectExit(0)
        .ExpectErrors("")
        .ExpectOutput("Welcome            Welcome.htm\n"
                      "  Forms            Forms.htm\n"
                      "    Orders         shop_Form_Orders.htm\n"
                      "  Reports          Reports.htm\n"
                      "  Tables           Tables.htm\n"
                      "    Goods          shop_Table_Goods.htm\n"
                      "  Queries          Queries.htm\n"
                      "  Macros           Macros.htm\n"
                      "  About this help  Copyright.htm\n");
    const std::string all = Run({"contents", "help", "--all"}).ExpectExit(0).output;
    EXPECT_THAT(all, HasSubstr("    Inner "));
    EXPECT_THAT(all, HasSubstr("shop_Form_Inner.htm  (left out)\n"));
    EXPECT_THAT(all, HasSubstr("shop_Form_Orders.htm#Orders_Town\n"));

    const auto root = json::parse(Run({"contents", "help", "--json"}).ExpectExit(0).output);
    EXPECT_EQ(root["kind"], "project");
    EXPECT_EQ(root["page"], "Welcome.htm");
    const json& forms = root["children"][0];
    EXPECT_EQ(forms["kind"], "group");
    ASSERT_EQ(forms["children"].size(), 1U);
    EXPECT_EQ(forms["children"][0], (json{{"number", "1.2"},
                                          {"caption", "Orders"},
                                          {"kind", "form"},
                                          {"name", "Orders"},
                                          {"page", "shop_Form_Orders.htm"},
                                          {"key", "shop.Form_Orders"},
                                          {"skipped", false},
                                          {"children", json::array()}}));
    const auto whole = json::parse(Run({"contents", "help", "--json", "--all"}).ExpectExit(0).output);
    const json& inner = whole["children"][0]["children"][0];
    EXPECT_EQ(inner["skipped"], true);
    EXPECT_EQ(whole["children"][0]["children"][1]["children"][0]["kind"], "control");
}

} // namespace
} // namespace tovimar::test
