#include "cli/Program.h"
#include "platform/text/Text.h"
#include "support/Golden.h"

#include <gmock/gmock.h>

#include <map>
#include <regex>
#include <set>

namespace tovimar::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

/// Ids in the definitions, in the header and in the exports, over several runs of one project.
class ContextIdsRunTest : public ProgramTest {
protected:
    ContextIdsRunTest() { fs::copy(kSample, Folder() / "orchard", fs::copy_options::recursive); }

    Outcome Generate(std::vector<std::string> more = {}) {
        std::vector<std::string> arguments{"generate", "orchard", "--output", "help", "--no-compile"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        Outcome outcome = Run(arguments);
        outcome.ExpectExit(0);
        return outcome;
    }
    std::string Source(const std::string& file) const { return ReadWhole(Folder() / "orchard" / file); }
    std::string Copy(const std::string& file) const {
        return ReadWhole(Folder() / "help/application" / file);
    }
    /// Numbers by defined name.
    std::map<std::string, int> Header() const {
        std::map<std::string, int> ids;
        for (const std::string& line : text::Split(ReadWhole(Folder() / "help/orchard.h"), "\r\n"))
            if (std::smatch parts; std::regex_match(line, parts, std::regex(R"(#define IDH_(\w+) +(\d+) *)")))
                ids[parts[1]] = std::stoi(parts[2]);
        return ids;
    }
    /// Numbers of all objects and controls by file, place and name.
    std::multimap<int, std::string> AllIds() const {
        const std::regex element(R"re(<\w+ Name = "([^"]*)"[^>]*? HelpContextId = "(\d+)")re");
        std::multimap<int, std::string> ids;
        for (const std::string& file : FilesBelow(Folder() / "help/xml")) {
            const std::string text = ReadWhole(Folder() / "help/xml" / file);
            for (std::sregex_iterator found(text.begin(), text.end(), element), end; found != end; ++found)
                ids.emplace(std::stoi((*found)[2]), file + " " + (*found)[1].str());
        }
        return ids;
    }
    void Replace(const std::string& file, const std::string& from, const std::string& to) const {
        const std::string before = Source(file);
        ASSERT_NE(before.find(from), std::string::npos) << file;
        Write("orchard/" + file, text::ReplaceAll(before, from, to));
    }
    std::vector<std::string> Backups() const {
        auto files = FilesBelow(Folder() / "orchard");
        std::erase_if(files, [](const std::string& file) { return !file.ends_with(".bak"); });
        return files;
    }
};

TEST_F(ContextIdsRunTest, NewIdsGoIntoCopiesOfTheExportsThatChange) {
    const auto outcome = Generate({"--option", "SaveApplicationChanges=true"});
    EXPECT_THAT(outcome.output,
                ::testing::HasSubstr(
                    "Context ids:   4 exports to change, as copies in <FOLDER>/help/application/\n"));
    EXPECT_THAT(FilesBelow(Folder() / "help/application"),
                ElementsAre("README.copies", "forms/About Orchard.form", "forms/Products.form",
                            "reports/Customer Labels.report", "reports/Order Confirmation.report"));
    ExpectGolden("cli/context-ids/Products.form", Copy("forms/Products.form"));
    EXPECT_EQ(Source("forms/Products.form"), ReadWhole(kSample + "/forms/Products.form"));
    EXPECT_EQ(ReadWhole(Folder() / "help/orchard.hhp").find("application"), std::string::npos);

    // The copies put over the application are all that it takes.
    const auto header = Header();
    fs::copy(Folder() / "help/application", Folder() / "orchard",
             fs::copy_options::recursive | fs::copy_options::overwrite_existing);
    Generate({"--option", "SaveApplicationChanges=true"});
    EXPECT_EQ(Header(), header);
    EXPECT_THAT(FilesBelow(Folder() / "help/application"), IsEmpty()) << "nothing is left to copy";
}

TEST_F(ContextIdsRunTest, OriginalsChangeOnlyWhenAskedAndAreKept) {
    Generate();
    EXPECT_THAT(Backups(), IsEmpty());
    EXPECT_FALSE(fs::exists(Folder() / "help/application"));
    const auto outcome = Generate({"--write-back"});
    EXPECT_THAT(outcome.output, ::testing::HasSubstr("4 exports changed, the old texts beside them as .bak"));
    const std::vector<std::string> backups{"forms/About Orchard.form.bak", "forms/Products.form.bak",
                                           "reports/Customer Labels.report.bak",
                                           "reports/Order Confirmation.report.bak"};
    EXPECT_EQ(Backups(), backups);
    ExpectGolden("cli/context-ids/Products.form", Source("forms/Products.form"));
    EXPECT_EQ(Source("forms/Products.form.bak"), ReadWhole(kSample + "/forms/Products.form"));

    const auto header = Header();
    Generate({"--write-back"});
    EXPECT_EQ(Backups(), backups) << "a second run has nothing to write";
    EXPECT_EQ(Header(), header);
}

TEST_F(ContextIdsRunTest, AnExportThatCantBeWrittenStaysAndIsTold) {
    const fs::path locked = Folder() / "orchard/forms/Products.form";
    fs::permissions(locked, fs::perms::owner_read);
    Run({"generate", "orchard", "--output", "help", "--no-compile", "--write-back"})
        .ExpectExit(1)
        .ExpectErrorsHold("Context ids could not be written into 1 export, the file is read-only: "
                          "'<FOLDER>/orchard/forms/Products.form'");
    EXPECT_EQ(Source("forms/Products.form"), ReadWhole(kSample + "/forms/Products.form"));
    EXPECT_THAT(Backups(), ::testing::SizeIs(3)) << "the others are written";
}

TEST_F(ContextIdsRunTest, IdsOutliveAChangedApplication) {
    Generate();
    const auto before = Header();
    const auto all = AllIds();

    fs::remove(Folder() / "orchard/forms/About Orchard.form");
    fs::remove(Folder() / "orchard/forms/About Orchard.cls");
    Write("orchard/forms/A new one.form", FormExport("New", ControlExport("CommandButton", "first")));
    // The application takes a number that a report has by now, and one of a control's for another control.
    const int report = before.at("orchard_Report_Customer_Labels");
    Replace("forms/Search.form", "    HelpContextId =140", "    HelpContextId =" + std::to_string(report));
    Generate();

    auto expected = before;
    expected.erase("orchard_Form_About_Orchard");
    expected["orchard_Form_Search"] = report;
    auto after = Header();
    std::set<int> fresh;
    for (const char* name : {"orchard_Form_A_new_one", "orchard_Report_Customer_Labels"}) {
        EXPECT_TRUE(fresh.insert(after[name]).second);
        EXPECT_FALSE(all.contains(after[name])) << name << " has a number that was somebody's";
        after.erase(name);
        expected.erase(name);
    }
    EXPECT_EQ(after, expected);
    const auto now = AllIds();
    for (const auto& [id, owner] : now)
        if (owner.find("About_Orchard") == std::string::npos) {
            EXPECT_EQ(now.count(id), 1U) << id << " " << owner;
        }
    const auto again = AllIds();
    Generate();
    EXPECT_EQ(AllIds(), again);
}

TEST_F(ContextIdsRunTest, CopiesInsideTheApplicationAreNoObjectsOfIt) {
    const auto generate = [&] {
        Run({"generate", "orchard", "--output", "orchard/help", "--no-compile", "--option",
             "SaveApplicationChanges=true"})
            .ExpectExit(0);
        return ReadWhole(Folder() / "orchard/help/orchard.h");
    };
    const std::string header = generate();
    EXPECT_EQ(generate(), header);
    EXPECT_EQ(Source("help/application/forms/Products.form"),
              ReadWhole(TOVIMAR_SOURCE_DIR "/tests/golden/cli/context-ids/Products.form"));
}

TEST_F(ContextIdsRunTest, ADatabaseFileIsSaidToStayAsItIs) {
    const fs::path database = TOVIMAR_SOURCE_DIR "/../shared/corpus/databases/testV2003.mdb";
    if (!fs::exists(database))
        GTEST_SKIP() << "the corpus is absent: " << database;
    fs::copy(database, Folder() / "shop.mdb");
    Run({"generate", "shop.mdb", "--output", "help", "--no-compile", "--write-back"})
        .ExpectExit(0)
        .ExpectErrorsHold("context ids can't be written into a database file; "
                          "'<FOLDER>/help/shop.h' lists them");
    EXPECT_EQ(ReadWhole(Folder() / "shop.mdb"), ReadWhole(database));
}

} // namespace
} // namespace tovimar::test
