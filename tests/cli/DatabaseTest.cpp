#include "cli/Program.h"

#include <gmock/gmock.h>

namespace tovimar::test {
namespace {

using ::testing::HasSubstr;

/// What the commands on database files show and write, on real files.
class DatabaseTest : public ProgramTest {
protected:
    void SetUp() override {
        if (!fs::exists(kCorpus))
            GTEST_SKIP() << "The real applications beside the project are absent.";
        fs::copy(kCorpus + "/databases/vbaV2007.accdb", Folder() / "code.accdb");
    }
    const std::string kCorpus = TOVIMAR_SOURCE_DIR "/../shared/corpus";
};

TEST_F(DatabaseTest, IsInspectedInShortAndInWhole) {
    Run({"inspect", "code.accdb"})
        .ExpectExit(0)
        .ExpectOutput("form   Form1  918 bytes, 2 objects\n"
                      "module Module1  438 bytes\n"
                      "module Class1  526 bytes\n");
    const auto form = Run({"inspect", "code.accdb", "form1"}).ExpectExit(0).output;
    EXPECT_THAT(form, HasSubstr("  Form\n    .DividingLines = NotDefault\n"));
    EXPECT_THAT(form, HasSubstr("    .OnLoad = [Event Procedure]\n"));
    EXPECT_THAT(Run({"inspect", "code.accdb", "Module1", "--json"}).ExpectExit(0).output,
                HasSubstr("Hello, World!"));
    Run({"inspect", "code.accdb", "Gone"})
        .ExpectExit(1)
        .ExpectErrors("tovimar: error: 'code.accdb' holds no design of 'Gone'\n");
}

TEST_F(DatabaseTest, IsWrittenAsTexts) {
    Run({"export", "code.accdb", "--output", "texts"})
        .ExpectExit(0)
        .ExpectErrors("")
        .ExpectOutput("4 files, 4 of them new or changed.\nExports:       <FOLDER>/texts\n");
    EXPECT_EQ(FilesBelow(Folder() / "texts"),
              (std::vector<std::string>{"forms/Form1.cls", "forms/Form1.form", "modules/Class1.cls",
                                        "modules/Module1.bas"}));
    EXPECT_EQ(ReadWhole(Folder() / "texts/modules/Class1.cls").substr(0, 70),
              "\xEF\xBB\xBFVERSION 1.0 CLASS\r\nBEGIN\r\n  MultiUse = -1  'True\r\nEND\r\nAttribute VB");
    Write("texts/forms/Earlier.form", "x");
    Write("texts/forms/Form1.form", "x");
    Run({"export", "code.accdb", "--output", "texts"})
        .ExpectExit(0)
        .ExpectErrors("tovimar: warning: not of this database: 'forms/Earlier.form'\n")
        .ExpectOutput("4 files, 1 of them new or changed.\nExports:       <FOLDER>/texts\n");
}

TEST_F(DatabaseTest, IsDocumentedAlone) {
    Run({"generate", "code.accdb", "--output", "help", "--no-compile"}).ExpectExit(0);
    EXPECT_TRUE(fs::exists(Folder() / "help/images/code_Form_Form1.jpg"));
    EXPECT_THAT(ReadWhole(Folder() / "help/code_Form_Form1.htm"), HasSubstr("code_Form_Form1.jpg"));
}

} // namespace
} // namespace tovimar::test
