#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarActions.h"
#include "generation/CTovimarCompiler.h"
#include "generation/CTovimarParameters.h"
#include "generation/RunProgress.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "host/server/CXmlCommand.h"
#include "platform/access/AccessApplication.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "support/FakeEnvironment.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <map>
#include <random>
#include <set>

/// A help project that lives on while its application grows and its pages are edited; the application is read
/// from its exports.
namespace tovimar::test {
namespace {

namespace fs = std::filesystem;
using ::testing::HasSubstr;
using ::testing::Not;

class RegenerateTest : public EnvironmentTest {
protected:
    RegenerateTest() {
        SetInstallation(environment->folders.program);
        WriteFile("tools\\ss.exe", "");
        environment->folders.program = Path("");
        for (const char* kind : {"forms", "reports", "queries"})
            environment->files->MakeFolders(Path("app\\" + std::string(kind)));
    }

    std::string Export(const std::string& name) const {
        return NativeFolder() + "/app/" + (name.starts_with("R") ? "reports/" : "forms/") + name +
               (name.starts_with("R") ? ".report" : ".form");
    }
    /// A report where the name begins with R.
    void AddObject(const std::string& name, const std::string& application = "app") {
        const std::string kind = name.starts_with("R") ? "Report" : "Form";
        WriteFile(application + "\\" + text::ToLower(kind) + "s\\" + name + "." + text::ToLower(kind),
                  "Version =20\r\nVersionRequired =20\r\nBegin " + kind +
                      "\r\n    Width =1000\r\n    Caption =\"" + name +
                      "\"\r\n    Begin\r\n        Begin Section\r\n            Height =500\r\n"
                      "            Name =\"Detail\"\r\n        End\r\n    End\r\nEnd\r\n");
    }
    void RemoveObject(const std::string& name) const { fs::remove(Export(name)); }

    virtual void Connect(CTovimarClient& client) {
        RegisterSettingsLoader();
        EXPECT_EQ(client.Connect(platform::access::OpenAccessApplication(NativeFolder() + "/app")), kSuccess);
        RunData().LoadSettings();
    }
    void Generate() {
        CTovimarClient client;
        Connect(client);
        auto& parameters = RunData().Generator().Parameters();
        parameters.CompileHTMLHelp = false;
        parameters.UseProjectGroupAsSource = group_;
        auto& actions = TheServer().Actions();
        ASSERT_TRUE(actions.PrepareProject({Path("help\\"), "App", {}, {}}));
        ASSERT_EQ(actions.GenerateFromOptions(), CTovimarActions::Outcome::Completed);
        ForgetBoxes();
    }
    /// In a fresh process as far as the system can see.
    RegenerationReport Regenerate() {
        CTovimarClient client;
        Connect(client);
        EXPECT_EQ(TheServer().ReloadTovimarProject(Path("help\\App.tvp")), kSuccess);
        RunData().Generator().Parameters().CompileHTMLHelp = true;
        made_.clear();
        RunData().Generator().NodeStarted = [this](const NodeProgress& node) { made_.insert(node.name); };
        CTovimarCompiler compiler;
        EXPECT_EQ(compiler.RegenerateHelpProject(), kSuccess);
        reloaded_ = CurrentOutline();
        sources_ = Sources();
        return compiler.Report();
    }
    void ForgetBoxes() { boxes->shown.clear(); }
    std::string LastBox() const { return boxes->shown.empty() ? std::string() : boxes->shown.back().text; }
    std::string Page(const std::string& name) { return ReadFile(Path("help\\" + name)); }
    bool Exists(const std::string& name) { return environment->files->FileExists(Path("help\\" + name)); }
    /// Bytes of all pages.
    std::map<std::string, std::string> Pages() {
        std::map<std::string, std::string> pages;
        for (const auto& name : environment->files->ListFiles(Path("help\\"), "*.htm"))
            pages[name] = Page(name);
        return pages;
    }
    /// Bytes of all pictures and definitions, by their place in the help folder.
    std::map<std::string, std::string> PicturesAndDefinitions() {
        std::map<std::string, std::string> files;
        for (const std::string folder : {"images\\", "xml\\"})
            for (const auto& name : environment->files->ListFiles(Path("help\\" + folder), "*"))
                files[folder + name] = Page(folder + name);
        return files;
    }
    static std::string Names(const std::vector<RegenerationReport::Object>& objects) {
        std::string names;
        for (const auto& object : objects)
            names += object.kind + " " + object.name + ";";
        return names;
    }
    static std::string CurrentOutline() {
        std::string out;
        for (const auto* node : Session::HelpProjectTree()->MapItems())
            if (node->IsObjectNode())
                out += node->Parent->Tag + "/" + node->Name() + ";";
        return out;
    }
    static std::string Sources() {
        std::string out;
        for (const auto* node : Session::HelpProjectTree()->MapItems())
            if (node->IsObjectNode())
                out += node->SourceProjectName() + ":" + node->Name() + "=" + node->GeneratedHTMLFile() + ";";
        return out;
    }
    /// Every id of the include file.
    std::multiset<std::string> ContextIds() {
        std::multiset<std::string> ids;
        for (const auto& line : text::Split(Page("App.h"), "\r\n"))
            if (const auto at = line.rfind(' '); line.starts_with("#define") && at != std::string::npos)
                ids.insert(line.substr(at + 1));
        return ids;
    }

    bool group_ = false;
    std::set<std::string> made_;
    std::string reloaded_;
    std::string sources_;
};

TEST_F(RegenerateTest, NewObjectsComeInAndNothingElseMoves) {
    AddObject("Orders");
    AddObject("Rsales");
    Generate();
    WriteFile("help\\App_Form_Orders.htm",
              text::ReplaceAll(Page("App_Form_Orders.htm"), "</body>", "<p>Mine &amp; <b>bold</P></body>"));
    WriteFile("help\\Forms.htm", text::ReplaceAll(Page("Forms.htm"), "</body>", "<P align=left>Ours</body>"));
    auto before = Pages();
    const auto ids = ContextIds();
    AddObject("Customers");
    AddObject("Rstock");
    RemoveObject("Rsales");
    const auto report = Regenerate();
    EXPECT_TRUE(report.complete) << LastBox();
    EXPECT_EQ(Names(report.added), "Form Customers;Report Rstock;");
    EXPECT_EQ(Names(report.gone), "Report Rsales;");
    EXPECT_EQ(report.kept, 1U);
    EXPECT_EQ(report.added[0].page, "App_Form_Customers.htm");
    EXPECT_EQ(made_, (std::set<std::string>{"Customers", "Rstock"}));
    EXPECT_EQ(reloaded_, "Forms/Orders;Forms/Customers;Reports/Rsales;Reports/Rstock;");
    // Only the added lines.
    for (const char* list : {"Forms.htm", "Reports.htm"}) {
        auto page = Page(list);
        const auto line = page.find("<li><a href=\"App_");
        const auto added = page.rfind("<li><a href=\"App_");
        ASSERT_NE(added, std::string::npos) << page;
        page.erase(added, page.find("</li>", added) + 5 - added);
        const auto joined = [](std::string text) {
            std::erase_if(text, [](char c) { return c == '\r' || c == '\n'; });
            return text;
        };
        EXPECT_EQ(joined(page), joined(before[list]));
        EXPECT_LE(line, added);
        before.erase(list);
    }
    before.erase("AppTOC.htm");
    before.erase("main.htm");
    for (const auto& [name, bytes] : before)
        EXPECT_EQ(Page(name), bytes) << name;
    EXPECT_TRUE(Exists("App_Form_Customers.htm") && Exists("images\\App_Form_Customers.jpg") &&
                Exists("xml\\App_Form_Customers.xml"));
    EXPECT_THAT(Page("App.hhc"), HasSubstr("App_Report_Rstock.htm"));
    EXPECT_THAT(Page("App.hhk"), HasSubstr("Customers"));
    // The lists as they were stay beside the new ones, and out of the help.
    const auto backups = environment->files->ListFiles(Path("help\\"), "Forms_*.htm");
    ASSERT_EQ(backups.size(), 1U);
    EXPECT_THAT(Page("App.hhp"), AllOf(HasSubstr("Forms.htm"), Not(HasSubstr(backups[0]))));
    EXPECT_THAT(processes->commandLines.back(), HasSubstr(" -i" + backups[0] + " "));
    auto now = ContextIds();
    EXPECT_EQ(now.size(), ids.size() + 2);
    EXPECT_EQ(std::set<std::string>(now.begin(), now.end()).size(), now.size());
    for (const auto& id : ids)
        EXPECT_EQ(now.count(id), 1U) << id;
    EXPECT_TRUE(processes->commandLines.empty() ||
                processes->commandLines.back().find("hhc") == std::string::npos);
}

TEST_F(RegenerateTest, NothingNewTouchesNoFile) {
    AddObject("Orders");
    Generate();
    Regenerate();
    const auto times = [&] {
        std::map<std::string, fs::file_time_type> all;
        for (const auto& entry : fs::recursive_directory_iterator(NativeFolder()))
            all[entry.path()] = entry.last_write_time();
        return all;
    };
    const auto before = times();
    ForgetBoxes();
    const auto report = Regenerate();
    EXPECT_EQ(LastBox(), "There are no new objects in the source project");
    EXPECT_TRUE(report.added.empty() && report.gone.empty());
    EXPECT_EQ(times(), before);
    EXPECT_TRUE(made_.empty());
}

TEST_F(RegenerateTest, ListsThatTheWriterTookOut) {
    AddObject("Orders");
    AddObject("Rsales");
    Generate();
    const auto edit = [&](const std::string& key) {
        CTovimarClient client;
        Connect(client);
        TheServer().ReloadTovimarProject(Path("help\\App.tvp"));
        Session::HelpProjectTree()->MapItem(key)->Terminate();
        Session::Projects()->SaveCurrentProject();
    };
    edit("Reports");
    AddObject("Rstock");
    EXPECT_TRUE(Regenerate().complete);
    // An object whose node went with its list is a new one.
    EXPECT_EQ(reloaded_, "Forms/Orders;Forms/Rsales;Forms/Rstock;");
    EXPECT_THAT(Page("Forms.htm"), HasSubstr("App_Report_Rstock.htm"));
    WriteFile("help\\App_Form_Orders.htm",
              text::ReplaceAll(Page("App_Form_Orders.htm"), "</body>", "<p>Mine</p></body>"));
    edit("Forms");
    EXPECT_EQ(Names(Regenerate().added), "Form Orders;Report Rsales;Report Rstock;");
    EXPECT_EQ(reloaded_, "Project/Orders;Project/Rsales;Project/Rstock;");
    // The page that stood there may be a writer's.
    std::string kept;
    for (const auto& name : environment->files->ListFiles(Path("help\\"), "App_Form_Orders_*.htm"))
        kept += Page(name);
    EXPECT_THAT(kept, HasSubstr("Mine"));
    EXPECT_THAT(Page("App_Form_Orders.htm"), Not(HasSubstr("Mine")));
    EXPECT_THAT(Page("Welcome.htm"), HasSubstr("App_Report_Rstock.htm"));
}

TEST_F(RegenerateTest, WhatTheWriterLeftOutStaysOut) {
    AddObject("Orders");
    AddObject("Hidden");
    AddObject("Rsales");
    Generate();
    {
        CTovimarClient client;
        Connect(client);
        TheServer().ReloadTovimarProject(Path("help\\App.tvp"));
        for (auto* node : Session::HelpProjectTree()->MapItems())
            if (node->Tag == "Reports" || node->Name() == "Hidden")
                node->SetSkipped(true);
        Session::Projects()->SaveCurrentProject();
    }
    AddObject("Rstock");
    RemoveObject("Rsales");
    ForgetBoxes();
    // Reports aren't asked for: none is new, and none counts as gone.
    auto report = Regenerate();
    EXPECT_EQ(Names(report.added) + Names(report.gone), "");
    AddObject("Customers");
    report = Regenerate();
    EXPECT_EQ(Names(report.added) + Names(report.gone), "Form Customers;");
    EXPECT_EQ(report.kept, 3U);
}

/// A host with two applications open at a time.
class ProjectGroupTest : public RegenerateTest {
protected:
    ProjectGroupTest() {
        group_ = true;
        for (const char* kind : {"forms", "reports", "queries"})
            environment->files->MakeFolders(Path("depot\\" + std::string(kind)));
    }
    void Connect(CTovimarClient& client) override {
        RegenerateTest::Connect(client);
        EXPECT_EQ(depot_.Connect(platform::access::OpenAccessApplication(NativeFolder() + "/depot")),
                  kSuccess);
        inDepot_ = false;
        auto& callBack = TheServer().TovimarClientCallBack;
        callBack = [this, app = callBack](const std::string& text) {
            CXmlCommand command;
            command.Deserialize(text);
            if (command.Name() == "SetCurrentSourceProject")
                inDepot_ = command.GetParamValue("ProjectName") == "depot";
            if (command.Name() != "GetSourceProjectsList")
                return inDepot_ ? depot_.ProcessCallBack(text) : app(text);
            command.AddParamValue("RetValue", "app|depot");
            return command.Serialize();
        };
    }

    CN_IDEAccContext depot_;
    bool inDepot_ = false;
};

TEST_F(ProjectGroupTest, EachApplicationIsJudgedByItsOwnObjects) {
    AddObject("Orders");
    AddObject("Orders", "depot");
    AddObject("Stock", "depot");
    Generate();
    const auto before = Pages();
    const auto ids = ContextIds();
    // A name that the other application has, and one that both get.
    AddObject("Stock");
    AddObject("Both");
    AddObject("Both", "depot");
    AddObject("Rdepot", "depot");
    RemoveObject("Orders");
    const auto report = Regenerate();
    EXPECT_TRUE(report.complete) << LastBox();
    EXPECT_EQ(Names(report.added), "Form Both;Form Stock;Form Both;Report Rdepot;");
    EXPECT_EQ(Names(report.gone), "Form Orders;");
    EXPECT_EQ(report.kept, 2U);
    EXPECT_EQ(
        sources_,
        "app:Orders=App_Form_Orders.htm;depot:Orders=depot_App_Form_Orders.htm;depot:Stock=App_Form_Stock."
        "htm;"
        "app:Both=App_Form_Both.htm;app:Stock=app_App_Form_Stock.htm;depot:Both=depot_App_Form_Both.htm;"
        "depot:Rdepot=App_Report_Rdepot.htm;");
    for (const auto& object : report.added)
        EXPECT_TRUE(Exists(object.page)) << object.page;
    for (const auto& [name, bytes] : before)
        if (name.find("Form_") != std::string::npos) {
            EXPECT_EQ(Page(name), bytes) << name;
        }
    const auto now = ContextIds();
    EXPECT_EQ(now.size(), ids.size() + 4);
    EXPECT_EQ(std::set<std::string>(now.begin(), now.end()).size(), now.size());
    for (const auto& id : ids)
        EXPECT_EQ(now.count(id), 1U) << id;
    ForgetBoxes();
    EXPECT_TRUE(Regenerate().added.empty());
    EXPECT_EQ(LastBox(), "There are no new objects in the source project");
}

/// What a writer and a developer do between two regenerations, drawn from a seed.
class RandomLives : public RegenerateTest, public ::testing::WithParamInterface<unsigned> {
protected:
    /// A paragraph of the writer's in a list page; the page itself is written again with each new line.
    void EditAList(const char* list, int number) {
        auto text = Page(list);
        paragraphs_.push_back("Ours &amp; " + std::to_string(number) + " <b>bold</b>");
        text.insert(text.find('>', text.find("<body")) + 1, "<p>" + paragraphs_.back() + "</p>");
        WriteFile("help\\" + std::string(list), text);
        lists_.emplace_back(list);
    }
    /// Edits that stand in no template, at places between tags.
    void EditAPage(std::mt19937& random, std::map<std::string, std::string>& pages) {
        auto page = pages.begin();
        std::advance(page, static_cast<std::ptrdiff_t>(random() % pages.size()));
        std::string text = page->second;
        const auto body = text.find("<body");
        const auto at = text.find('>', body + random() % (text.size() - body));
        if (body == std::string::npos || at == std::string::npos || text.find("</body>") < at)
            return;
        static const char* const kEdits[] = {
            "<p>Mine",       "\n <B>x</b>\r",        "&eacute;&amp; ",
            "<!-- note -->", "\xC3\xA9\xE2\x82\xAC", "<IMG src=a.png alt='>'>"};
        text.insert(at + 1, kEdits[random() % std::size(kEdits)]);
        WriteFile("help\\" + page->first, text);
        page->second = text;
    }
    void ChangeTheApplication(std::mt19937& random) {
        const auto change = random() % 3;
        const std::string name = std::string(random() % 2 == 0 ? "F" : "R") + std::to_string(++last_);
        if (change != 0 && objects_.size() > 1) {
            const auto victim = random() % objects_.size();
            RemoveObject(objects_[victim]);
            objects_.erase(objects_.begin() + static_cast<std::ptrdiff_t>(victim));
        }
        if (change == 2)
            return;
        AddObject(name);
        objects_.push_back(name);
        added_.insert(name);
    }

    std::vector<std::string> objects_;
    std::vector<std::string> lists_, paragraphs_; ///< in step
    std::set<std::string> added_;
    int last_ = 0;
};

/// The lists of links, and what is made from the tree each time.
bool IsMadeAgain(const std::string& page) {
    static const std::set<std::string> kMade = {"Forms.htm", "Reports.htm", "AppTOC.htm", "main.htm"};
    return kMade.contains(page);
}

TEST_P(RandomLives, EveryEditedCharacterIsFoundAgain) {
    std::mt19937 random(GetParam());
    objects_ = {"Orders", "Rsales"};
    for (const auto& name : objects_)
        AddObject(name);
    Generate();
    for (int life = 0; life < 50; ++life) {
        auto pages = Pages();
        std::erase_if(pages, [](const auto& page) { return IsMadeAgain(page.first); });
        for (auto edits = random() % 4; edits > 0; --edits)
            EditAPage(random, pages);
        if (random() % 8 == 0)
            EditAList(random() % 2 == 0 ? "Forms.htm" : "Reports.htm", life);
        const auto made = PicturesAndDefinitions();
        added_.clear();
        for (auto changes = random() % 3; changes > 0; --changes)
            ChangeTheApplication(random);
        std::erase_if(added_, [&](const auto& name) { return !fs::exists(Export(name)); });
        const auto report = Regenerate();
        ASSERT_EQ(report.added.size(), added_.size()) << "life " << life;
        for (const auto& [name, bytes] : pages)
            ASSERT_EQ(Page(name), bytes) << name << " in life " << life;
        for (const auto& [name, bytes] : made)
            ASSERT_EQ(Page(name), bytes) << name << " in life " << life;
        for (std::size_t i = 0; i < lists_.size(); ++i)
            ASSERT_THAT(Page(lists_[i]), HasSubstr(paragraphs_[i])) << "life " << life;
        for (const auto& object : report.added)
            ASSERT_TRUE(added_.contains(object.name) && Exists(object.page)) << object.page;
        const auto ids = ContextIds();
        ASSERT_EQ(std::set<std::string>(ids.begin(), ids.end()).size(), ids.size());
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomLives, ::testing::Range(1U, 11U));

} // namespace
} // namespace tovimar::test
