#include "foundation/Session.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CXmlCommand.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

namespace tovimar {
namespace {

class CommandTest : public test::EnvironmentTest {};

TEST_F(CommandTest, TextForm) {
    EXPECT_EQ(CXmlCommand().Build("Doevents").Serialize(), "<cmd name=\"Doevents\"><params /></cmd>");
    CXmlCommand command;
    command.Build("SaveMakeRun", {{"SaveAppChanges", true}, {"MakeApp", false}, {"Count", 7}, {"S", "a-b"}});
    command.Text = "<A/>";
    EXPECT_EQ(command.Serialize(),
              "<cmd name=\"SaveMakeRun\"><params SaveAppChanges=\"True\" MakeApp=\"False\" Count=\"7\" "
              "S=\"a&#45;b\" /><text><A/></text></cmd>");
}

TEST_F(CommandTest, ValuesComeThroughUnchanged) {
    // The last two hold characters that no XML parser takes: the scanner reads them.
    const std::vector<std::string> values{"a\"b<c>&d",
                                          "line\r\nnext\ttab",
                                          "Größe Ωμέγα 漢字 😀",
                                          "&amp; &#65;",
                                          "  both ends  ",
                                          "x=\"y\" z='q' />",
                                          "",
                                          "bell\x07 end",
                                          "both \x01\" = \"</params>"};
    for (const std::string& value : values) {
        CXmlCommand sent;
        sent.Build("Echo", {{"First", value}, {"Second", "2"}});
        const CXmlCommand read = CXmlCommand().Deserialize(sent.Serialize());
        EXPECT_EQ(read.Name(), "Echo");
        EXPECT_EQ(read.GetParamValue("first"), value);
        EXPECT_EQ(read.GetParamValue(2), "2");
    }
}

TEST_F(CommandTest, TextThatNoParserTakes) {
    const CXmlCommand read =
        CXmlCommand().Deserialize("<cmd name=\"ProcessComponent\"><params A=\"1\" B=\"x&#38;y\" /><text><F "
                                  "Name = \"a\">&bad</F></text></cmd>");
    EXPECT_EQ(read.Name(), "ProcessComponent");
    EXPECT_EQ(read.ParamCount(), 2U);
    EXPECT_EQ(read.GetParamValue("B"), "x&y");
    EXPECT_EQ(read.Text, "<F Name = \"a\">&bad</F>");

    const CXmlCommand markup =
        CXmlCommand().Deserialize("<cmd name=\"c\"><params /><text><F N=\"a\"><G /></F></text></cmd>");
    EXPECT_EQ(text::ReplaceAll(markup.Text, " />", "/>"), "<F N=\"a\"><G/></F>");
}

TEST_F(CommandTest, HostileTextsEnd) {
    for (const char* text : {"", "<cmd name=\"", "<cmd name=\"a\"><params ", "<cmd name=\"a\"><params A=",
                             "<cmd name=\"a\"><params A=\"", "<cmd name=\"a\"><params A=\"1\" B",
                             "<cmd name=\"a\"><params = = = =", "<text>", "<a><b></a>"})
        CXmlCommand().Deserialize(text).Serialize();
}

TEST_F(CommandTest, WhatNoNameHoldsEndsTheParameters) {
    const CXmlCommand read = CXmlCommand().Deserialize(
        "<cmd name=\"a\"><params P=\"&#60;\" torn Q=\"1<2\" ./><text><F Name=\"x\"/></text></cmd>");
    EXPECT_EQ(read.ParamCount(), 2U);
    EXPECT_EQ(read.GetParamValue("P") + read.GetParamValue("Q"), "<1<2");
    EXPECT_EQ(CXmlCommand().Deserialize(read.Serialize()).ParamCount(), 2U);
}

TEST_F(CommandTest, ParametersKeepTheirOrder) {
    CXmlCommand command;
    command.Build("c", {{"A", 1}, {"B", 2}, {"C", 3}});
    command.AddParamValue("b", "x");
    command.AddParamValue("C", "y");
    command.AddParamValue("RetValue", "z");
    EXPECT_EQ(command.Serialize(), "<cmd name=\"c\"><params A=\"1\" B=\"x\" C=\"y\" RetValue=\"z\" /></cmd>");
    EXPECT_TRUE(command.ParamDefined("retvalue"));
    EXPECT_FALSE(command.ParamDefined("none"));
    EXPECT_EQ(command.GetParamName(2), "B");
    EXPECT_THROW(command.GetParamValue("none"), RaisedError);
    Session::Run().generationInterrupted = true;
    EXPECT_EQ(command.GetParamValue("A"), "");
}

TEST_F(CommandTest, TypedAnswers) {
    CTovimarServer server;
    std::string answer;
    server.TovimarClientCallBack = [&answer](const std::string& text) {
        CXmlCommand command;
        command.Deserialize(text);
        if (answer != "unset")
            command.AddParamValue("RetValue", answer);
        return command.Serialize();
    };
    CTovimarServerAgent agent(server);
    for (const char* blank : {"unset", "", "  ", "0", "False"}) {
        answer = blank;
        EXPECT_FALSE(agent.AreThereAnySourceProjectsOpened()) << blank;
    }
    answer = "True";
    EXPECT_TRUE(agent.IDEDisplayModelIsMDI());
    answer = " 42 ";
    EXPECT_EQ(agent.CurrentObjectType(), 42);
    answer = CXmlCommand::EncodeValue("A|B") + "|" + CXmlCommand::EncodeValue("C&D");
    const KeyedList<std::string> names = agent.GetSourceFormsList();
    ASSERT_EQ(names.Count(), 2U);
    EXPECT_EQ(names.At(1), "A|B");
    EXPECT_EQ(names.At(2), "C&D");
}

TEST_F(CommandTest, StoppedRunDoesNotReachTheHost) {
    CTovimarServer server;
    int asked = 0;
    server.TovimarClientCallBack = [&asked](const std::string& text) {
        ++asked;
        return text;
    };
    // The fiftieth error stops the run, but only the command behind the one that notices it stays away.
    Session::Run().runErrorCount = kErrorLimit;
    server.SendCommand("<cmd name=\"a\"><params /></cmd>");
    EXPECT_EQ(asked, 1);
    EXPECT_TRUE(Session::Run().generationInterrupted);
    EXPECT_EQ(server.SendCommand("<cmd name=\"a\"><params /></cmd>"),
              "<cmd name=\"a\"><params RetValue=\"0\" /></cmd>");
    EXPECT_EQ(asked, 1);
}

} // namespace
} // namespace tovimar
