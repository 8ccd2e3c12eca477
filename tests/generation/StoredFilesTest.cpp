#include "foundation/CAddInProjects.h"
#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/CTraceLog.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
#include "generation/CAddInSettings.h"
#include "generation/CTovimarParameters.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"
#include "support/Golden.h"

/// The files that outlive a run, byte for byte: other versions of the system read them too.
namespace tovimar::test {
namespace {

class StoredFilesTest : public EnvironmentTest {
protected:
    StoredFilesTest() { environment->files->MakeFolders("C:\\Help"); }
};

TEST_F(StoredFilesTest, Settings) {
    RegisterSettingsLoader();
    environment->folders.temporary = "C:\\Help\\";
    CTovimarParameters parameters;
    Session::SetParameters(&parameters);
    CAddInSettingsXmlFile settings;
    const std::string path = Path("vasmoraSettings.xml");
    WriteFile("vasmoraSettings.xml",
              ReadFile(environment->folders.program + "Settings\\vasmoraSettings.xml"));
    ASSERT_EQ(settings.Load(path, /*vfLoadFromProjectFile=*/false), kSuccess);
    parameters.Organization = "\"Ж\" & <Co>";
    parameters.MSWordTOCLowerHeadingLevel = 9;
    ASSERT_EQ(settings.Save(path), kSuccess);
    const std::string saved = ReadFile(path);
    ExpectGolden("foundation/vasmoraSettings.xml",
                 text::ReplaceAll(saved, EncodeSpecialChars(VersionText()), "{version}"));
    CAddInSettingsXmlFile again;
    ASSERT_EQ(again.Load(path, false), kSuccess);
    EXPECT_EQ(parameters.Organization, "\"Ж\" & <Co>");
    ASSERT_EQ(again.Save(path), kSuccess);
    EXPECT_EQ(ReadFile(path), saved);
    EXPECT_TRUE(boxes->shown.empty());
    Session::SetParameters(nullptr);
    SetSettingsLoaderFactory(nullptr);
}

TEST_F(StoredFilesTest, HeadingLevelsOutOfReach) {
    CTovimarParameters parameters;
    Session::SetParameters(&parameters);
    CAddInSettingsXmlFile settings;
    const auto levelOf = [&](const char* text) {
        parameters.MSWordTOCLowerHeadingLevel = 5;
        settings.SetOptionValue("MSWordTOCLowerHeadingLevel", text);
        CAddInSettings().Load(settings, false);
        return parameters.MSWordTOCLowerHeadingLevel;
    };
    EXPECT_EQ(levelOf("0"), 2);
    EXPECT_EQ(levelOf("1"), 1);
    EXPECT_EQ(levelOf("9"), 9);
    EXPECT_EQ(levelOf("10"), 2);
    EXPECT_EQ(levelOf("many"), 5) << "a bad value leaves the option as it was";
    Session::SetParameters(nullptr);
}

TEST_F(StoredFilesTest, Catalogue) {
    const std::string path = Path("vasmoraProjects.xml");
    CAddInProjects projects;
    projects.Init(path);
    for (const char* name : {"Shop", "R&D \"Ж\" <1>"}) {
        auto project = std::make_unique<CAddInProject>();
        project->Name = name;
        project->FileName = name[0] == 'S' ? "Shop" : "R-D";
        project->Folder = "C:\\Help";
        project->SourceProjectFullPath = "C:\\Apps\\It's.accdb";
        environment->files->WriteFile(project->TvpFullPath(), "<TovimarProject><Project/></TovimarProject>");
        projects.Add(std::move(project));
    }
    EXPECT_EQ(projects.Save(), kSuccess);
    const std::string saved = ReadFile(path);
    ExpectGolden("foundation/vasmoraProjects.xml", saved);
    CAddInProjects again;
    again.Init(path);
    ASSERT_EQ(again.Count(), 2);
    EXPECT_EQ(again.Project("C:\\Help\\R-D.tvp")->Name, "R&D \"Ж\" <1>");
    EXPECT_EQ(again.Save(), kSuccess);
    EXPECT_EQ(ReadFile(path), saved);
    EXPECT_EQ(ReadFile(path + ".bak"), saved);
}

TEST_F(StoredFilesTest, Trace) {
    WriteFile("trace.txt", "");
    CTraceLog log(Folder());
    log.addMessage("plain");
    clock->Advance(1);
    log.addMessage("\"Ж\" & <b>", /*vfIsErrMessage=*/true);
    for (const char* name : {"trace.xml", "tracedErrors.xml", "trace.xml.txt"})
        ExpectGolden(std::string("foundation/") + name, ReadFile(Path(name)));
}

} // namespace
} // namespace tovimar::test
