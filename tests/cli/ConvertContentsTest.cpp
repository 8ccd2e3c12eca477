#include "cli/Program.h"

#include <gmock/gmock.h>

namespace tovimar::test {
namespace {

using ::testing::HasSubstr;

std::string ContentsFile(const std::string& entries) {
    return "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n<HTML>\r\n<BODY>\r\n<UL>\r\n" + entries +
           "</UL>\r\n</BODY></HTML>\r\n";
}

std::string ContentsEntry(const std::string& name, const std::string& page) {
    return "\t<LI> <OBJECT type=\"text/sitemap\">\r\n\t\t<param name=\"Name\" value=\"" + name +
           "\">\r\n\t\t<param name=\"Local\" value=\"" + page + "\">\r\n\t\t</OBJECT>\r\n";
}

class ConvertContentsTest : public ProgramTest {};

TEST_F(ConvertContentsTest, ToStandardOutputOrIntoAFile) {
    Write("old.hhc", ContentsFile(ContentsEntry("Manual", "start.htm") + "<UL>\r\n" +
                                  ContentsEntry("First steps", "first.htm") + "</UL>\r\n"));
    const std::string text = Run({"convert-contents", "old.hhc"}).ExpectExit(0).ExpectErrors("").output;
    EXPECT_THAT(text, ::testing::StartsWith("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\r\n<Project "));
    EXPECT_THAT(text, HasSubstr("caption=\"First steps\" GeneratedHtmlFile=\"first.htm\""));
    Run({"convert-contents", "old.hhc", "--output", "new.tvp"})
        .ExpectExit(0)
        .ExpectErrors("")
        .ExpectOutput("Contents: <FOLDER>/new.tvp\n");
    EXPECT_THAT(ReadWhole(Folder() / "new.tvp"), HasSubstr(text.substr(text.find("<Project"))));
}

TEST_F(ConvertContentsTest, WhatIsRefused) {
    Write("empty.hhc", ContentsFile({}));
    Run({"convert-contents", "empty.hhc"})
        .ExpectExit(1)
        .ExpectOutput("")
        .ExpectErrors("tovimar: error: '<FOLDER>/empty.hhc' holds no contents entries\n");
    Write("picture.hhc", std::string("GIF89a\0\1\2", 9));
    Run({"convert-contents", "picture.hhc", "--output", "new.tvp"})
        .ExpectExit(1)
        .ExpectErrorsHold("tovimar: error: '<FOLDER>/picture.hhc' ");
    EXPECT_FALSE(fs::exists(Folder() / "new.tvp"));
    Run({"convert-contents", "nowhere.hhc"})
        .ExpectExit(2)
        .ExpectErrorsHold("FILE: File does not exist: nowhere.hhc");
}

} // namespace
} // namespace tovimar::test
