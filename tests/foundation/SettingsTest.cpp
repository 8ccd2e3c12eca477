#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Session.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

/// Remembers what it was asked and writes one option.
class RecordingLoader : public ISettingsLoadSave {
public:
    explicit RecordingLoader(std::vector<std::string>& calls) : calls_(calls) {}
    void Load(ISettings& settings, bool fromProject) override {
        calls_.push_back("load " + settings.OptionValue("Author").AsString() +
                         (fromProject ? " project" : ""));
    }
    void Save(ISettings& settings) override {
        calls_.push_back("save");
        settings.SetOptionValue("Version", "9");
    }

private:
    std::vector<std::string>& calls_;
};

struct Tags : IRunContext {
    std::string ReplaceTags(const std::string& text) override {
        return text::ReplaceAll(text, "{Author}", "Ann");
    }
};

class SettingsTest : public test::EnvironmentTest {
protected:
    SettingsTest() {
        SetSettingsLoaderFactory([this] { return std::make_unique<RecordingLoader>(calls); });
    }
    ~SettingsTest() override { SetSettingsLoaderFactory(nullptr); }

    std::string SettingsFile(const std::string& options) {
        return WriteFile("s.xml", "<Settings><Options>" + options + "</Options></Settings>");
    }

    std::vector<std::string> calls;
    CAddInSettingsXmlFile settings;
};

TEST_F(SettingsTest, ReadsItsForms) {
    ASSERT_EQ(settings.Load(
                  SettingsFile("<!-- c --><Option Name='Author' value='Bob'/><Option Name='A' Value='TRUE' "
                               "value='x'/><Option Name='B' Value='' value='False'/><Option Value='lost'/>"),
                  false),
              0);
    EXPECT_EQ(settings.OptionValue("AUTHOR"), Value("Bob"));
    EXPECT_EQ(settings.OptionValue("A"), Value(true));
    EXPECT_EQ(settings.OptionValue("b"), Value(false));
    EXPECT_EQ(settings.OptionValue("none"), Value(""));
    EXPECT_EQ(calls, std::vector<std::string>{"load Bob"});
    EXPECT_EQ(settings.XMLSTr(),
              "<Settings>\r\n<Options>\r\n    <Option Name = \"Author\" Value = \"Bob\" />\r\n"
              "    <Option Name = \"A\" Value = \"TRUE\" />\r\n"
              "    <Option Name = \"B\" Value = \"False\" />\r\n</Options>\r\n</Settings>\r\n");
}

TEST_F(SettingsTest, FailuresLeaveTheParametersAlone) {
    EXPECT_NE(settings.Load(WriteFile("s.xml", "<Settings>"), false), 0);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(boxes->shown[0].text.find(" in '" + NativeFolder() + "/s.xml'"), std::string::npos);
    EXPECT_NE(settings.XmlParseError.errorCode, 0);
    EXPECT_EQ(settings.Load(WriteFile("s.xml", "<Settings/>"), false), kFailure1);
    EXPECT_EQ(settings.Load(SettingsFile(""), true), kFailure1);
    EXPECT_EQ(settings.Load(SettingsFile("<Option Name='A' Value='1'/><Option Name='a' Value='2'/>"), false),
              457);
    EXPECT_TRUE(calls.empty());
}

TEST_F(SettingsTest, ReadsAProjectFile) {
    const auto path =
        WriteFile("p.tvp", "<TovimarProject><Settings><Options><Option Name='Author' Value='P'/>"
                           "</Options></Settings></TovimarProject>");
    EXPECT_EQ(settings.Load(path, true), 0);
    EXPECT_EQ(calls, std::vector<std::string>{"load P project"});
}

TEST_F(SettingsTest, SavesWhatParses) {
    Tags tags;
    Session::SetContext(&tags);
    ASSERT_EQ(settings.Load(SettingsFile("<Option Name='Application' Value='Shop'/>"
                                         "<Option Name='FolderForGeneratedHelp' Value='C:\\x'/>"
                                         "<Option Name='Copyright' Value='&quot;{Author}&quot; &lt;Ж>'/>"),
                            false),
              0);
    settings.SetOptionValue("CompileHTMLHelp", true);
    const std::string target = Path("out\\Settings.xml");
    EXPECT_EQ(settings.Save(target), 76);
    environment->files->MakeFolders(Path("out"));
    ASSERT_EQ(settings.Save(target), 0);
    const std::string expected =
        "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\r\n<Settings>\r\n<Options>\r\n"
        "    <Option Name = \"Application\" Value = \"{Application}\" />\r\n"
        "    <Option Name = \"FolderForGeneratedHelp\" Value = \"{Project Location}CHM\" />\r\n"
        "    <Option Name = \"Copyright\" Value = \"&#34;Ann&#34; &#60;Ж&#62;\" />\r\n"
        "    <Option Name = \"CompileHTMLHelp\" Value = \"true\" />\r\n"
        "    <Option Name = \"Version\" Value = \"9\" />\r\n"
        "</Options>\r\n</Settings>\r\n";
    EXPECT_EQ(ReadFile(target), expected);
    EXPECT_FALSE(environment->files->FileExists(environment->folders.temporary + "~Settings.xml"));
    ASSERT_EQ(settings.Load(target, false), 0);
    ASSERT_EQ(settings.Save(target), 0);
    EXPECT_EQ(ReadFile(target), expected);
}

TEST_F(SettingsTest, AnIllFormedTextReplacesNothing) {
    const std::string target = WriteFile("Settings.xml", "old");
    settings.SetOptionValue("a\"b", "x");
    EXPECT_EQ(settings.Save(target), kFailure1);
    EXPECT_EQ(ReadFile(target), "old");
    EXPECT_TRUE(environment->files->FileExists(environment->folders.temporary + "~Settings.xml"));
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(boxes->shown[0].text.find("Xml parse error on line 4 position "), std::string::npos);
}

TEST_F(SettingsTest, SkipsAndFixesOptions) {
    settings.SetOptionValue("One", "1");
    settings.SetOptionValue("Two", "2");
    KeyedList<std::string> fixed;
    fixed.Add("<3>", "two");
    const std::string text = settings.XMLSTr({"ONE"}, &fixed);
    EXPECT_EQ(text.find("One"), std::string::npos);
    EXPECT_NE(text.find("\"Two\" Value = \"&#60;3&#62;\""), std::string::npos);
}

} // namespace
} // namespace tovimar
