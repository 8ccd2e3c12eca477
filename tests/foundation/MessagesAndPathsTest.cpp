#include "foundation/CXmlMessages.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "platform/files/Paths.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

struct LanguageContext : IRunContext {
    std::string Language() override { return name; }
    std::string LanguageCode() override { return code; }
    std::string name, code;
};

class MessagesFileTest : public test::EnvironmentTest {
protected:
    CXmlMessages messages;

    void Load(const std::string& body) {
        ASSERT_EQ(messages.Reload(WriteFile("m.xml", "<Messages>" + body + "</Messages>")), 0);
    }
};

class PathsTest : public test::EnvironmentTest {};

TEST_F(MessagesFileTest, TextsByCode) {
    Load("<!-- c --><Message Code='A' Text='{2} after {1}, {3}{x}{'/><Message Code='' Text='x'/>"
         "<Message Code='B' Text=''/><Message Code='a' Text='second'/>");
    EXPECT_EQ(messages.Messages().Count(), 1U);
    EXPECT_EQ(messages.GetMessage("a"), "{2} after {1}, {3}{x}{");
    EXPECT_EQ(messages.GetMessage("none"), "");
    EXPECT_EQ(messages.GetMessageWithParams("A", {"{2}", "two"}), "two after {2}, {3}{x}{");
    EXPECT_EQ(messages.GetMessageWithParams("A", {}), "{2} after {1}, {3}{x}{");
    EXPECT_NE(messages.Load(WriteFile("broken.xml", "<Messages>")), 0);
    EXPECT_EQ(Session::Run().runErrorCount, 1);
}

TEST_F(MessagesFileTest, ParametersInPages) {
    Load("<Message Code='{{One}}' Text='1 {{Two}} {{One}}' T='1'/><Message Code='{{Two}}' Text='2 {{One}}' "
         "T='1'/>"
         "<Message Code='plain' Text='x'/>");
    EXPECT_EQ(messages.ReplaceParameters("<{{ONE}}|{{two}}|plain|{{Three}}{{"),
              "<1 2 {{One}} {{One}}|2 {{One}}|plain|{{Three}}{{");
    EXPECT_EQ(messages.ReplaceParameters(""), "");
}

TEST_F(MessagesFileTest, CopyrightGoesFirst) {
    Load("<Message Code='{{CopyrightCaption}}' Text='caption' T='1'/><Message Code='Copyright' Text='(c)' "
         "T='1'/>");
    EXPECT_EQ(messages.ReplaceParameters("copyright {{CopyrightCaption}}"), "(c) {{(c)Caption}}");
}

TEST_F(MessagesFileTest, InstalledMessagesLoad) {
    EXPECT_EQ(messages.Load(MessageFile()), 0);
    EXPECT_EQ(messages.ReplaceParameters("<h1>{{formscaption}}</h1>"), "<h1>Forms</h1>");
}

TEST_F(PathsTest, LieBelowTheProgramWithoutARegistry) {
    const std::string program = environment->folders.program;
    EXPECT_TRUE(program.ends_with("\\install\\")) << program;
    EXPECT_EQ(InstallationFolder(), program);
    EXPECT_EQ(GlobalSettingsFile(), program + "Settings\\vasmoraSettings.xml");
    environment->files->MakeFolders(platform::FolderOf(UserSettingsFile()));
    environment->files->WriteFile(UserSettingsFile(), "<Settings/>");
    EXPECT_EQ(GlobalSettingsFile(), platform::FolderOf(CataloguePath()) + "vasmoraSettings.xml");
    EXPECT_EQ(WizardDefinitionFile(), program + "Settings\\vasmoraWizardDef.xml");
    EXPECT_EQ(LogFolder(), program);
    EXPECT_EQ(CataloguePath(), "C:\\Application Data\\Tovimar\\vasmoraProjects.xml");
}

TEST_F(PathsTest, RegistryAndRedirectsMoveThem) {
    environment->registry->Write("HKEY_LOCAL_MACHINE\\SOFTWARE\\NEROV\\HTML Tovimar\\Microsoft Access",
                                 "InstallPath", Path("old"));
    EXPECT_EQ(InstallationFolder(), Path("old\\"));
    SetInstallation(Path("new"));
    EXPECT_EQ(SettingsFolder(), Path("new\\Settings\\"));
    WriteFile("new\\Redirect\\Settings.rdt", "  " + Path("set") + " \r\nsecond line");
    WriteFile("new\\Redirect\\Templates.rdt", Path("tpl\\"));
    WriteFile("new\\Redirect\\Log.rdt", "\r\n" + Path("log"));
    EXPECT_EQ(SettingsFolder(), Path("set\\"));
    EXPECT_EQ(TemplatesFolder(), Path("tpl\\"));
    EXPECT_EQ(LogFolder(), environment->folders.program);
}

TEST_F(PathsTest, TemplatesAreFoundInOrder) {
    SetInstallation(Folder());
    LanguageContext language;
    Session::SetContext(&language);
    EXPECT_EQ(FindTemplate("sub\\a.htm"), Path("Templates\\Common\\a.htm"));
    WriteFile("Templates\\Localized\\EN\\a.htm", "");
    EXPECT_EQ(FindTemplate("a.htm"), Path("Templates\\Localized\\EN\\a.htm"));
    WriteFile("Templates\\Parameterized\\A.htm", "");
    EXPECT_EQ(FindTemplate("a.htm"), Path("Templates\\Parameterized\\a.htm"));

    language.name = "FR";
    WriteFile("Templates\\Localized\\FR\\Messages.xml", "");
    EXPECT_EQ(MessageFile(), Path("Templates\\Localized\\EN\\Messages.xml"));
    WriteFile("Templates\\Localized\\FR\\Welcome.htm", "");
    EXPECT_EQ(MessageFile(), Path("Templates\\Localized\\FR\\Messages.xml"));
    language.code = "FR";
    language.name = "French";
    EXPECT_EQ(LocalizedTemplatesFolder(), Path("Templates\\Localized\\FR\\"));
}

} // namespace
} // namespace tovimar
