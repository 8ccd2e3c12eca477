#include "foundation/CN_IniFile.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"

#include <sys/stat.h>

namespace tovimar {
namespace {

class IniFileTest : public test::EnvironmentTest {
protected:
    /// The file "a.ini" with these bytes.
    CN_IniFile& Load(const std::string& bytes) {
        ini.SetName(WriteFile("a.ini", bytes));
        return ini;
    }
    std::string Written() { return ReadFile(Path("a.ini")); }

    CN_IniFile ini;
};

TEST_F(IniFileTest, ReadsSectionsAndItems) {
    Load("stray=1\r\n; comment\r\n[First]\r\n a = 1 = 2 \r\n;x=1\r\n\r\nflag\nA=second\r\n [ Empty ]\n"
         "[first]\r\nlost=1\r\n[Last]\r\n=no name\rb=\xE9");
    EXPECT_EQ(ini.Count(), 3);
    EXPECT_EQ(ini.Value("FIRST", "A"), "1 = 2");
    EXPECT_TRUE(ini.ValueExists("First", "Flag"));
    EXPECT_EQ(ini.Value("First", "flag"), "");
    EXPECT_FALSE(ini.ValueExists("First", "lost"));
    EXPECT_FALSE(ini.ValueExists("none", "a"));
    EXPECT_EQ(ini.SectionContent("First"), "a=1 = 2\r\nflag=\r\n");
    EXPECT_EQ(ini.Item("Empty")->Count(), 0);
    EXPECT_EQ(ini.SectionContent("Last"), "=no name\r\nb=é\r\n");
    EXPECT_EQ(ini.ValueEx("Last", "c", "default"), "default");
    EXPECT_EQ(ini.Item("none"), nullptr);
    EXPECT_EQ(CN_IniFile::Split("a, b ,c"), (std::vector<std::string>{"a", "b", "c"}));
}

TEST_F(IniFileTest, WritesWholeSectionsAndLeavesTheRest) {
    Load("; head\r\n[A]\r\n; inner\r\nx=1\r\n\r\n[B]\r\ny=2");
    ini.SetValue("a", "X", "9");
    ini.AddLine("A", "z = 3");
    ini.Item("A")->Save();
    EXPECT_EQ(Written(), "; head\r\n[A]\r\nx=9\r\nz=3\r\n\r\n[B]\r\ny=2\r\n");
    ini.RemoveValue("A", "x");
    ini.SetValue("New", "né", "two\r\n[lines]");
    ini.Save();
    EXPECT_EQ(Written(), "; head\r\n[A]\r\nz=3\r\n\r\n[B]\r\ny=2\r\n[New]\r\nn\xE9=two\r\n");
    ini.DeleteSection("b");
    EXPECT_EQ(Written(), "; head\r\n[A]\r\nz=3\r\n\r\n[New]\r\nn\xE9=two\r\n");
    EXPECT_FALSE(ini.SectionExists("B"));
}

TEST_F(IniFileTest, AnItemSavesItselfAlone) {
    Load("\xEF\xBB\xBF[A]\r\n; Ж\r\nx=1\r\ny=2\r\n\r\n[B]\r\n");
    CN_IniFileSection& section = *ini.Item("A");
    section.Add("X", "Ж").Save();
    section.Add("n", "3").Save();
    section.Item("y")->Value = "unsaved";
    EXPECT_EQ(Written(), "\xEF\xBB\xBF[A]\r\n; Ж\r\nx=Ж\r\ny=2\r\nn=3\r\n\r\n[B]\r\n");
}

TEST_F(IniFileTest, FilesWithoutAFolderLieBesideTheProgram) {
    environment->folders.program = Path("program\\");
    environment->files->MakeFolders(Path("program"));
    for (const char* name : {"x.ini", "\\x.ini", "Q:\\none\\x.ini"}) {
        ini.SetName(name);
        EXPECT_EQ(ini.Name(), Path("program\\x.ini")) << name;
    }
    ini.SetName(Path("own.ini"));
    EXPECT_EQ(ini.Name(), Path("own.ini"));
    EXPECT_EQ(ini.Count(), 0);
}

TEST_F(IniFileTest, AFailureNamesTheSection) {
    Load("[A]\r\nx=1\r\n");
    chmod((NativeFolder() + "/a.ini").c_str(), 0444);
    try {
        ini.Save();
        FAIL();
    } catch (const RaisedError& error) {
        EXPECT_STREQ(error.what(), "Unable to save INI file section 'A'");
    }
    EXPECT_EQ(Written(), "[A]\r\nx=1\r\n");
}

} // namespace
} // namespace tovimar
