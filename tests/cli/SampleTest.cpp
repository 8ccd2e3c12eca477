#include "cli/HelpFolder.h"
#include "cli/Program.h"
#include "platform/text/Text.h"
#include "support/Golden.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <array>
#include <regex>
#include <set>

namespace tovimar::test {
namespace {

constexpr std::array kGolden{"Forms.htm",
                             "orchard.h",
                             "orchard.hhc",
                             "orchard.hhk",
                             "orchard.hhp",
                             "orchard.tvp",
                             "orchard_Form_Customers.htm",
                             "orchard_Query_Order_Totals.htm",
                             "orchard_Table_Products.htm"};

/// Fresh identifiers are all that may differ between two runs.
std::string WithoutGuids(const std::string& text) {
    static const std::regex guid(R"(\{[0-9A-F]{8}(-[0-9A-F]{4}){3}-[0-9A-F]{12}\})");
    return std::regex_replace(text, guid, "{GUID}");
}

/// What a validator says of texts that are as earlier versions wrote them, for the tools that read them.
constexpr std::array kKnownComplaints{"<area> proprietary attribute \"frame\"",
                                      "content occurs after end of body",
                                      "converting backslash in URI",
                                      "unescaped &",
                                      "trimming empty <p>",
                                      "trimming empty <ul>",
                                      "anchor \"",
                                      "missing <li>"};

class SampleTest : public ProgramTest {
protected:
    void Generate(const std::string& output) {
        Run({"generate", kSample, "--output", output, "--no-compile"}).ExpectExit(0);
    }
    std::map<std::string, std::string> Contents(const std::string& output) const {
        std::map<std::string, std::string> contents;
        for (const std::string& file : FilesBelow(Folder() / output))
            contents[file] = WithoutGuids(ReadWhole(Folder() / output / file));
        return contents;
    }
    /// Names of the files that aren't the same in both.
    static std::set<std::string> Differing(const std::map<std::string, std::string>& left,
                                           const std::map<std::string, std::string>& right) {
        std::set<std::string> names;
        for (const auto& [name, bytes] : left)
            if (!right.contains(name) || right.at(name) != bytes)
                names.insert(name);
        for (const auto& entry : right)
            if (!left.contains(entry.first))
                names.insert(entry.first);
        return names;
    }
};

TEST_F(SampleTest, PagesAndProjectFiles) {
    Generate("help");
    for (const char* name : kGolden)
        ExpectGolden(std::string("cli/orchard/") + name,
                     WithPlaceholders(WithoutGuids(ReadWhole(Folder() / "help" / name))));
    const std::set<std::string> used(kGolden.begin(), kGolden.end());
    for (const std::string& file : FilesBelow(TOVIMAR_SOURCE_DIR "/tests/golden/cli/orchard"))
        EXPECT_TRUE(used.contains(file)) << "no test uses " << file;
}

TEST_F(SampleTest, LinksAndAreasLeadSomewhere) {
    Generate("help");
    HelpFolder help(Folder() / "help");
    EXPECT_THAT(help.Faults(), ::testing::IsEmpty());
    EXPECT_GT(help.links, 800);
    EXPECT_GT(help.areas, 100);
}

TEST_F(SampleTest, AValidatorHasNothingNewToSay) {
    if (!IsInstalled("tidy"))
        GTEST_SKIP() << "tidy of the package tidy isn't installed";
    Generate("help");
    const std::string command = "cd '" + (Folder() / "help").string() +
                                "' && tidy -q -e -utf8 --gnu-emacs yes *.htm >../said.txt 2>&1";
    ASSERT_NE(std::system(command.c_str()), -1);
    const std::string said = ReadWhole(Folder() / "said.txt");
    EXPECT_NE(said.find("Warning: "), std::string::npos) << said;
    for (const std::string& line : text::Split(said, "\n"))
        EXPECT_TRUE(line.empty() ||
                    std::any_of(kKnownComplaints.begin(), kKnownComplaints.end(),
                                [&](const char* known) { return line.find(known) != std::string::npos; }))
            << line;
}

TEST_F(SampleTest, TheSameRunGivesTheSameBytes) {
    Generate("help");
    const auto first = Contents("help");
    Generate("elsewhere");
    EXPECT_THAT(Differing(first, Contents("elsewhere")), ::testing::IsEmpty());
    Generate("help");
    EXPECT_THAT(Differing(first, Contents("help")), ::testing::IsEmpty());
}

TEST_F(SampleTest, TheCompiledHelpHoldsEveryListedFile) {
    if (!IsInstalled("chmls"))
        GTEST_SKIP() << "chmls of the package fp-utils isn't installed";
    Run({"generate", kSample, "--output", "help", "--copy-to", "copy"})
        .ExpectExit(0)
        .ExpectErrors("Reading <SOURCE>/samples/orchard\nWriting help to <FOLDER>/help/\nCompiling help\n");
    EXPECT_EQ(ReadWhole(Folder() / "copy/orchard.chm"), ReadWhole(Folder() / "help/orchard.chm"));
    const std::string list = (Folder() / "list.txt").string();
    const std::string command =
        "chmls -n list '" + (Folder() / "help/orchard.chm").string() + "' >'" + list + "' 2>&1";
    ASSERT_EQ(std::system(command.c_str()), 0);
    std::set<std::string> held;
    for (const std::string& line : text::Split(ReadWhole(list), "\n"))
        held.insert(text::ToLower(text::TrimWhitespace(line)));
    const auto listed = HelpFolder(Folder() / "help").ListedFiles();
    EXPECT_GT(listed.size(), 30U);
    for (const std::string& file : listed)
        EXPECT_TRUE(held.contains("/" + text::ToLower(text::ReplaceAll(file, "\\", "/")))) << file;
}

/// Real applications that aren't part of the sources.
class CorpusRunTest : public ProgramTest, public ::testing::WithParamInterface<const char*> {};

TEST_P(CorpusRunTest, IsDocumentedWithoutAFault) {
    const std::string source = std::string(TOVIMAR_SOURCE_DIR "/../shared/corpus/") + GetParam();
    if (!fs::exists(source))
        GTEST_SKIP() << "the corpus is absent: " << source;
    Run({"generate", source, "--output", "help", "--no-compile"}).ExpectExit(0);
    HelpFolder help(Folder() / "help");
    EXPECT_THAT(help.Faults(), ::testing::IsEmpty());
    EXPECT_GT(help.links, 0);
}

INSTANTIATE_TEST_SUITE_P(Applications, CorpusRunTest,
                         ::testing::Values("sports-admin", "vcs-testing", "access-forms/Controls.accdb",
                                           "access-forms/FormExamples.accdb", "access-forms/Reports.accdb",
                                           "databases/queryTestV1997.mdb", "databases/testV2003.mdb",
                                           "databases/vbaV2007.accdb"));

} // namespace
} // namespace tovimar::test
