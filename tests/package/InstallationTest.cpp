#include "cli/Program.h"
#include "platform/text/Text.h"

#include <gmock/gmock.h>

namespace tovimar::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;

class InstallationTest : public ProgramTest {
protected:
    void Install(const std::string& surroundings, const std::string& prefix) const {
        const std::string log = (Folder() / "install.log").string();
        const std::string command = surroundings +
                                    " '" TOVIMAR_CMAKE "' --install '" TOVIMAR_BUILD_DIR "' --prefix '" +
                                    prefix + "' >'" + log + "' 2>&1";
        ASSERT_EQ(std::system(command.c_str()), 0) << ReadWhole(log);
    }
    void RunFrom(const fs::path& prefix) {
        program = (prefix / "bin/tovimar").string();
        variables["TOVIMAR_INSTALL"] = "";
        searchPath = "/usr/bin:/bin";
    }
};

TEST_F(InstallationTest, RunsFromWhereverItsPrefixIsMoved) {
    Install("", (Folder() / "first").string());
    fs::rename(Folder() / "first", Folder() / "moved here");
    const fs::path prefix = Folder() / "moved here";
    RunFrom(prefix);
    const auto before = FilesBelow(prefix);
    const std::string sample = (prefix / "share/tovimar/samples/orchard").string();
    Run({"generate", sample, "--output", "help", "--copy-to", "copy"}).ExpectExit(0);
    EXPECT_TRUE(fs::exists(Folder() / "copy/orchard.chm"));
    EXPECT_THAT(ReadWhole(Folder() / "help/ss.html"), HasSubstr("<title>"));
    EXPECT_TRUE(fs::exists(Folder() / "help/orchard_Form_Customers.htm"));
    EXPECT_EQ(FilesBelow(prefix), before) << "an installation isn't written to";
}

TEST_F(InstallationTest, ATraceGoesToTheUsersFolder) {
    Install("", (Folder() / "prefix").string());
    RunFrom(Folder() / "prefix");
    Run({"new", kSample, "--output", "help"}).ExpectExit(0);
    const fs::path catalogue = Folder() / "user/tovimar/drive_c/Application Data/Tovimar";
    ASSERT_TRUE(fs::exists(catalogue / "vasmoraProjects.xml"));
    Write("user/tovimar/drive_c/Application Data/Tovimar/trace.txt", "");
    Run({"generate", "help/orchard.tvp", "--no-compile"}).ExpectExit(0);
    EXPECT_TRUE(fs::exists(catalogue / "trace.xml"));
}

TEST_F(InstallationTest, PutsEverythingWhereTheSystemLooksForIt) {
    Install("DESTDIR='" + (Folder() / "root").string() + "'", "/usr");
    std::vector<std::string> others;
    for (const std::string& file : FilesBelow(Folder() / "root"))
        if (!file.starts_with("usr/share/tovimar/"))
            others.push_back(file);
    EXPECT_THAT(others,
                ElementsAre("usr/bin/tovimar", "usr/lib/tovimar/hhc.exe", "usr/lib/tovimar/ss.exe",
                            "usr/share/bash-completion/completions/tovimar",
                            "usr/share/doc/tovimar/README.md", "usr/share/doc/tovimar/changelog.gz",
                            "usr/share/doc/tovimar/copyright", "usr/share/doc/tovimar/docs/architecture.md",
                            "usr/share/doc/tovimar/docs/guide.md", "usr/share/doc/tovimar/docs/topic.png",
                            "usr/share/fish/vendor_completions.d/tovimar.fish",
                            "usr/share/man/man1/tovimar.1.gz", "usr/share/zsh/vendor-completions/_tovimar"));
    const fs::path shared = Folder() / "root/usr/share/tovimar";
    EXPECT_EQ(FilesBelow(shared / "Templates"), FilesBelow(TOVIMAR_SOURCE_DIR "/install/Templates"));
    EXPECT_EQ(FilesBelow(shared / "Settings"), FilesBelow(TOVIMAR_SOURCE_DIR "/install/Settings"));
    EXPECT_EQ(FilesBelow(shared / "samples/orchard"), FilesBelow(kSample));
    EXPECT_FALSE(fs::exists(shared / "samples/.gitattributes"));
}

} // namespace
} // namespace tovimar::test
