#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

struct Source : IRunContext {
    std::string CurrentSourceProjectFullPath() override { return path; }
    ResultCode SaveTree(const std::string& file, const std::string& attributes,
                        const std::string& pictures) override {
        saved.push_back(file + "|" + attributes + "|" + pictures);
        return treeResult;
    }
    std::string path = "C:\\Shop.mdb";
    std::vector<std::string> saved;
    ResultCode treeResult = kSuccess;
};

class CatalogueTest : public test::EnvironmentTest {
protected:
    CatalogueTest() { Session::SetContext(&source); }

    std::unique_ptr<CAddInProject> Make(const std::string& name, bool withFile = true) {
        auto project = std::make_unique<CAddInProject>();
        project->Name = project->FileName = name;
        project->Folder = Path("Help " + name);
        project->SourceProjectFullPath = "C:\\Shop.mdb";
        if (withFile)
            WriteFile(
                "Help " + name + "\\" + name + ".tvp",
                "<TovimarProject><Settings><Options><Option Name=\"SubFolderForScreenshots\" Value=\"pics\"/>"
                "</Options></Settings><Project title=\"A title\"/></TovimarProject>");
        return project;
    }

    std::string Catalogue() const { return Path("app\\vasmoraProjects.xml"); }

    Source source;
    CAddInProjects projects;
};

TEST_F(CatalogueTest, MakesAnEmptyOne) {
    EXPECT_EQ(projects.Init(Catalogue()), 0);
    EXPECT_EQ(projects.Count(), 0);
    EXPECT_EQ(ReadFile(Catalogue()),
              "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\r\n<Projects>\r\n</Projects>");
    EXPECT_EQ(CAddInProjects().Init(""), 0);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text, "Projects definitions XML file is not defined.");
    EXPECT_EQ(boxes->shown[0].flags, 16U);
}

TEST_F(CatalogueTest, SavesAndReadsBack) {
    projects.Init(Catalogue());
    projects.Add(Make("A & B"));
    projects.Add(Make("Second"));
    projects.Add(Make("Gone", false));
    projects.SetCurrentProject(projects.Project(Path("help second\\SECOND.tvp")));
    ASSERT_NE(projects.CurrentProject(), nullptr);
    EXPECT_EQ(projects.SaveCurrentProject(), 0);
    EXPECT_EQ(source.saved, std::vector<std::string>{projects.CurrentProject()->TvpFullPath() +
                                                     "|Name = \"Second\" SUID = \"{00000000-0000-0000-0000-"
                                                     "000000000002}\" HUID = \"{00000000-0000-0000-0000-"
                                                     "000000000003}\" |"});
    EXPECT_NE(ReadFile(Catalogue())
                  .find("\r\n    <Project Name = \"A &#38; B\" FileName = \"A &#38; B\" Folder = \""),
              std::string::npos);

    CAddInProjects again;
    EXPECT_EQ(again.Init(Catalogue()), 0);
    EXPECT_EQ(again.Count(), 2);
    CAddInProject* first = again.Project(Path("Help A & B\\A & B.tvp"));
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(first->Title(), "A title");
    EXPECT_EQ(first->PicsSubfolderName, "pics");
    EXPECT_FALSE(first->IsNew);
    EXPECT_EQ(again.ProjectExists("A & B"), nullptr);
    EXPECT_TRUE(boxes->shown.empty());
}

TEST_F(CatalogueTest, IdentifiersAreSharedBySource) {
    projects.Init(Catalogue());
    const CAddInProject& first = projects.Add(Make("One"));
    const CAddInProject& second = projects.Add(Make("Two"));
    EXPECT_EQ(first.SUID, second.SUID);
    EXPECT_NE(first.HUID, second.HUID);
    EXPECT_EQ(&projects.Add(Make("ONE")), &projects.Add(Make("one")));
    EXPECT_EQ(projects.ExistingSUIDForGivenSourceProject("c:\\SHOP.MDB"), first.SUID);
    EXPECT_EQ(projects.ExistingSUIDForGivenSourceProject("C:\\Other.mdb"), "");
}

TEST_F(CatalogueTest, RepairsItselfFromTheBackup) {
    projects.Init(Catalogue());
    projects.Add(Make("One"));
    projects.Save();
    projects.Save();
    environment->files->WriteFile(Catalogue(), "<Projects><Proj");
    CAddInProjects repaired;
    EXPECT_EQ(repaired.Init(Catalogue()), 0);
    EXPECT_EQ(repaired.Count(), 1);
    environment->files->DeleteFile(Catalogue() + ".bak");
    environment->files->WriteFile(Catalogue(), "<Projects><Proj");
    EXPECT_EQ(CAddInProjects().Init(Catalogue()), kFailure2);
    environment->files->WriteFile(Catalogue(), "<Other/>");
    EXPECT_EQ(CAddInProjects().Init(Catalogue()), kFailure1);
}

TEST_F(CatalogueTest, ABrokenProjectCostsItsEntryOnly) {
    projects.Init(Catalogue());
    projects.Add(Make("One"));
    projects.Add(Make("Two"));
    projects.Save();
    WriteFile("Help One\\One.tvp", "<broken");
    CAddInProjects again;
    EXPECT_EQ(again.Init(Catalogue()), 0);
    EXPECT_EQ(again.Count(), 1);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text, "XML project file parse error [" + NativeFolder() +
                                        "/Help One/One.tvp]\r\nThis project will be removed from the list of "
                                        "available projects.");
}

TEST_F(CatalogueTest, ProcessesKeepEachOthersEntries) {
    projects.Init(Catalogue());
    projects.Add(Make("Old"));
    projects.Add(Make("Mine"));
    projects.Save();
    const auto forget = [&](const std::string& name) {
        CAddInProjects other;
        other.Init(Catalogue());
        EXPECT_TRUE(other.Forget(Path("help " + name + "\\" + name + ".tvp")));
        EXPECT_EQ(other.Save(), 0);
    };
    {
        CAddInProjects other;
        other.Init(Catalogue());
        other.Add(Make("Theirs"));
        projects.Add(Make("New"));
        EXPECT_EQ(other.Save(), 0);
    }
    projects.SetCurrentProject(projects.Project(Path("Help Mine\\Mine.tvp")));
    forget("Old");
    forget("Mine");
    EXPECT_EQ(projects.Save(), 0);

    // The current project is in use here, whoever forgot it elsewhere.
    CAddInProjects again;
    again.Init(Catalogue());
    EXPECT_EQ(again.Count(), 3);
    for (const char* name : {"Mine", "Theirs", "New"})
        EXPECT_NE(again.Project(Path(std::string("Help ") + name + "\\" + name + ".tvp")), nullptr) << name;
    EXPECT_EQ(projects.Count(), 3);
}

TEST_F(CatalogueTest, IdentifiersThatWouldBreakTheFileAreMadeAnew) {
    Make("One");
    environment->files->MakeFolders(Path("app"));
    environment->files->WriteFile(Catalogue(), "<Projects><Project Name='One' FileName='One' Folder='" +
                                                   Path("Help One") +
                                                   "' SUID='&quot;/>' HUID='{H}'/></Projects>");
    projects.Init(Catalogue());
    EXPECT_EQ(projects.Save(), 0);
    EXPECT_NE(ReadFile(Catalogue()).find("SUID = \"{00000000-0000-0000-0000-000000000001}\" HUID = \"{H}\""),
              std::string::npos);
}

TEST_F(CatalogueTest, TellsThatSavingFailed) {
    projects.Init(Catalogue());
    projects.SetCurrentProject(&projects.Add(Make("One")));
    source.treeResult = 61;
    EXPECT_EQ(projects.SaveCurrentProject(), 61);
    EXPECT_EQ(CAddInProjects().Init(Catalogue()), 0);
    EXPECT_NE(ReadFile(Catalogue()).find("Name = \"One\""), std::string::npos);
}

TEST_F(CatalogueTest, NamesAreUniqueAmongSavedProjects) {
    projects.Init(Catalogue());
    projects.Add(Make("Orders")).IsNew = false;
    projects.Add(Make("Orders1")).IsNew = false;
    projects.Add(Make("Orders2"));
    EXPECT_EQ(projects.GetUniqueProjectName("ORDERS"), "ORDERS2");
    EXPECT_EQ(projects.GetUniqueProjectName("Other"), "Other");
    projects.RemoveTempProjects();
    EXPECT_EQ(projects.Count(), 2);
}

TEST_F(CatalogueTest, ProjectsOfTheSourceAtHand) {
    projects.Init(Catalogue());
    projects.Add(Make("One"));
    projects.Add(Make("Missing", false));
    projects.Add(Make("Other")).SourceProjectFullPath = "C:\\Other.mdb";
    projects.Add(Make("Two"));
    EXPECT_EQ(projects.CurrentSourceProjectTvpProjects(),
              (std::vector<std::string>{Path("Help Two\\Two.tvp"), Path("Help One\\One.tvp")}));
    EXPECT_EQ(projects.Count(), 3);
    source.path.clear();
    EXPECT_TRUE(projects.CurrentSourceProjectTvpProjects().empty());
}

TEST_F(CatalogueTest, TheCurrentProjectNeedNotBeListed) {
    projects.Init(Catalogue());
    Session::SetProjects(&projects);
    EXPECT_EQ(Session::CurrentProject(), nullptr);
    projects.SetCurrentProject(Make("New"));
    EXPECT_EQ(projects.Count(), 0);
    EXPECT_TRUE(projects.ChangeCurrentProjectName("Renamed"));
    CAddInProject* listed = projects.ListCurrentProject();
    EXPECT_EQ(Session::CurrentProject(), listed);
    EXPECT_EQ(projects.Count(), 1);
    EXPECT_EQ(listed->Name, "Renamed");
    projects.RemoveTempProjects();
    EXPECT_EQ(Session::CurrentProject(), nullptr);
}

TEST_F(CatalogueTest, PathsOfAProject) {
    CAddInProject project;
    EXPECT_EQ(project.TvpFullPath(), "");
    project.FileName = "Shop";
    project.Folder = Path("x\\");
    EXPECT_EQ(project.HHCFullPath(), Path("x\\Shop.hhc"));
    EXPECT_EQ(project.XmlFormsFolder(), Path("x\\xml\\"));
    project.PicsSubfolderName = "pics";
    EXPECT_EQ(project.PicsSubfolderPath(), Path("x\\images\\"));
    EXPECT_EQ(project.PicsSubfolderName, "images");
    environment->files->MakeFolders(Path("x\\pics"));
    project.PicsSubfolderName = "pics\\";
    EXPECT_EQ(project.PicsSubfolderPath(), Path("x\\pics\\"));
}

} // namespace
} // namespace tovimar
