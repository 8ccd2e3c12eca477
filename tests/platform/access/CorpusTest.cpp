#include "platform/access/ApplicationModel.h"
#include "platform/access/Fixtures.h"
#include "platform/access/GuardedWork.h"

#include <csignal>
#include <fstream>
#include <iterator>
#include <map>
#include <unistd.h>

namespace tovimar::platform::access {
namespace {

class CorpusTest : public ApplicationTest {
protected:
    void SetUp() override {
        if (CorpusFolder().empty())
            GTEST_SKIP() << "The real applications beside the project are absent.";
    }
    static std::map<ObjectKind, int> CountSound(const ApplicationSummary& summary) {
        std::map<ObjectKind, int> counts;
        for (const auto& object : summary.objects) {
            EXPECT_EQ(object.error, "") << object.name;
            counts[object.kind] += object.error.empty() ? 1 : 0;
        }
        return counts;
    }
    static std::vector<std::string> Databases() {
        std::vector<std::string> paths;
        for (const auto* folder : {"/databases", "/access-forms"})
            for (const auto& entry : std::filesystem::directory_iterator(CorpusFolder() + folder))
                if (entry.path().extension() == ".accdb" || entry.path().extension() == ".mdb")
                    paths.push_back(entry.path().string());
        std::sort(paths.begin(), paths.end());
        return paths;
    }
};

TEST_F(CorpusTest, ReadsTheOlderLayout) {
    const auto counts = CountSound(SummarizeApplication(CorpusFolder() + "/sports-admin"));
    EXPECT_EQ(counts.at(ObjectKind::Form), 74);
    EXPECT_EQ(counts.at(ObjectKind::Report), 42);
    EXPECT_EQ(counts.at(ObjectKind::Query), 100);
    EXPECT_EQ(counts.at(ObjectKind::Macro), 24);
    // 60 tables of its own, the others from the database in its subfolder.
    EXPECT_GT(counts.at(ObjectKind::Table), 80);
    ApplicationModel model(CorpusFolder() + "/sports-admin");
    EXPECT_FALSE(model.FindRecords("Competitors", 3)->rows.empty());
    EXPECT_GT(model.Relations().size(), 10U);
}

TEST_F(CorpusTest, WalksEveryControlOfTheOlderLayout) {
    const auto application = OpenAccessApplication(CorpusFolder() + "/sports-admin");
    const auto forms = Object(Object(application, "CurrentProject"), "AllForms");
    std::int32_t controls = 0;
    for (std::int32_t i = 0; i < forms->Get("Count").AsInteger(); ++i) {
        const auto name = Text(Object(forms, "Item", {i}), "Name");
        Object(application, "DoCmd")->Call("OpenForm", {name, 1, {}, {}, {}, 1});
        const auto list = Object(Object(application, "Forms", {name}), "Controls");
        for (std::int32_t k = 0; k < list->Get("Count").AsInteger(); ++k, ++controls) {
            const auto control = Object(list, "Item", {k});
            EXPECT_NE(control->Get("ControlType"), Value(0)) << name << " " << control->ClassName();
            EXPECT_TRUE(Object(control, "Parent") != nullptr);
        }
        Object(application, "DoCmd")->Call("Close", {2, name, 2});
    }
    EXPECT_GT(controls, 1000);
}

TEST_F(CorpusTest, ReadsTheNewerLayout) {
    const auto counts = CountSound(SummarizeApplication(CorpusFolder() + "/vcs-testing"));
    EXPECT_EQ(counts.at(ObjectKind::Form), 5);
    EXPECT_EQ(counts.at(ObjectKind::Report), 3);
    EXPECT_EQ(counts.at(ObjectKind::Query), 4);
    EXPECT_EQ(counts.at(ObjectKind::Table), 9);
    ApplicationModel model(CorpusFolder() + "/vcs-testing");
    EXPECT_NE(model.OpenDesign(ObjectKind::Form, "frmMain").code.find("cmdRunTests_Click"),
              std::string::npos);
    EXPECT_EQ(model.ProjectName(), "VCS Testing");
    EXPECT_EQ(model.FindTable("tblSaveXML")->fields.back().name, "Please\"don't\"use");
    EXPECT_FALSE(model.FindPicture("button_ok").empty());
}

TEST_F(CorpusTest, ReadsEveryDatabase) {
    for (const auto& path : Databases()) {
        const auto summary = SummarizeApplication(path);
        EXPECT_FALSE(summary.objects.empty()) << path;
        for (const auto& object : summary.objects)
            EXPECT_EQ(object.error, "") << path << " " << object.name;
    }
    ApplicationModel queries(CorpusFolder() + "/databases/queryTestV1997.mdb");
    EXPECT_EQ(queries.QueryFields("SelectQuery").at(3).sourceTable, "Table2");
    EXPECT_EQ(queries.QueryFields("UnionQuery").size(), 2U);
    EXPECT_EQ(queries.FindQuery("UpdateQuery")->sql.substr(0, 55),
              "PARAMETERS [User Name] Text ( 255 );\r\nUPDATE Table1 SET");
}

/// Whatever is done to a file, reading it ends with an answer or with an error that names it.
TEST_F(CorpusTest, SurvivesDamagedDatabases) {
    std::ifstream source(CorpusFolder() + "/databases/indexTestV2010.accdb", std::ios::binary);
    const std::string sound((std::istreambuf_iterator<char>(source)), std::istreambuf_iterator<char>());
    unsigned state = 12345;
    for (int round = 0; round < 12; ++round) {
        auto bytes = round < 4 ? sound.substr(0, sound.size() / static_cast<std::size_t>(round + 2)) : sound;
        for (int hit = 0; round >= 4 && hit < 400; ++hit) {
            state = state * 1664525U + 1013904223U;
            bytes[4096 + state % (bytes.size() - 4096)] = static_cast<char>(state >> 24);
        }
        Part("x.accdb", bytes);
        const auto failure = RaisedBy([&] { SummarizeApplication(NativeApplication() + "/x.accdb"); });
        EXPECT_TRUE(failure.number == 0 || failure.text.find("x.accdb") != std::string::npos) << failure.text;
    }
}

TEST(GuardedWork, EndsInAnErrorWhateverHappens) {
    EXPECT_EQ(RunGuarded("/a", [] { return std::string("fine"); }), "fine");
    EXPECT_EQ(RunGuarded("/a", [] { return std::string(); }), "");
    const auto crash = [] {
        ::signal(SIGABRT, SIG_DFL);
        std::abort();
        return std::string();
    };
    EXPECT_EQ(RaisedBy([&] { RunGuarded("/a", crash); }).text, "/a: the file is damaged and can't be read.");
    EXPECT_EQ(RaisedBy([] { RunGuarded("/a", []() -> std::string { throw RaisedError(5, "why"); }); }).text,
              "why");
}

} // namespace
} // namespace tovimar::platform::access
