#include "foundation/CMailToProtocol.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "platform/Interrupt.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "support/FakeEnvironment.h"

namespace tovimar {
namespace {

const std::string kHead = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n"
                          "<dataroot xmlns:od=\"urn:schemas-microsoft-com:officedata\" started=\"2026-01-02 "
                          "03:04:05\">\r\n";

struct Unattended : IRunContext {
    bool AutomatedTestModeOn() override { return on; }
    bool on = true;
};

class TraceTest : public test::EnvironmentTest {
protected:
    CTraceLog log{Folder()};
    platform::FileSystem& files = *environment->files;
};

using MessagesTest = TraceTest;
using ErrorTrapTest = TraceTest;

TEST_F(TraceTest, IsSilentWithoutItsMarker) {
    log.addMessage("nothing", true);
    EXPECT_FALSE(log.IsOn());
    EXPECT_TRUE(files.ListFiles(Folder(), "*.*").empty());
    CTraceLog("Q:\\none\\").addMessage("nowhere");
}

TEST_F(TraceTest, IsWellFormedAfterEveryMessage) {
    WriteFile("trace.txt", "");
    log.addMessage("a < b & \"c\" > Ж");
    EXPECT_EQ(ReadFile(Path("trace.xml")),
              kHead + "<msg>03:04:05 - a &lt; b &amp; &quot;c&quot; &gt; Ж</msg>\r\n</dataroot>");
    EXPECT_EQ(ReadFile(Path("tracedErrors.xml")), kHead + "</dataroot>");
    clock->Advance(61);
    log.addMessage("second\x01\xFF", true);
    XmlDocument document;
    ASSERT_TRUE(document.load(Path("trace.xml")));
    EXPECT_EQ(document.selectNodes("//msg").size(), 2U);
    EXPECT_EQ(document.selectNodes("//msg")[0].text(), "03:04:05 - a < b & \"c\" > Ж");
    EXPECT_EQ(ReadFile(Path("tracedErrors.xml")),
              kHead + "<msg>03:05:06 - second?\xEF\xBF\xBD</msg>\r\n</dataroot>");
    EXPECT_EQ(ReadFile(Path("trace.xml.txt")), "<msg>03:04:05 - a &lt; b &amp; &quot;c&quot; &gt; ?</msg>\r\n"
                                               "<msg>03:05:06 - second\?\?</msg>\r\n");
}

TEST_F(TraceTest, RollsOverWhenItIsLarge) {
    const auto fill = [&](std::size_t position) {
        WriteFile("trace.xml", kHead + std::string(position - kHead.size(), ' ') + "</dataroot>");
    };
    WriteFile("trace.txt", "");
    fill(262144);
    log.addMessage("fits");
    EXPECT_FALSE(files.FileExists(Path("trace_back.xml")));

    Unattended context;
    Session::SetContext(&context);
    log.addMessage("unattended");
    EXPECT_FALSE(files.FileExists(Path("trace_back.xml")));
    context.on = false;
    fill(262145);
    log.addMessage("rolls");
    EXPECT_EQ(files.FileLength(Path("trace_back.xml")), 262145U + 11);
    EXPECT_EQ(ReadFile(Path("trace.xml")), kHead + "<msg>03:04:05 - rolls</msg>\r\n</dataroot>");
}

TEST_F(MessagesTest, BoxesShowNativePaths) {
    boxes->answers = {7};
    EXPECT_EQ(ShowMessage("Lost: " + Path("a b.htm"), kMsgYesNo, "T"), platform::kAnswerNo);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text, "Lost: " + NativeFolder() + "/a b.htm");
    EXPECT_EQ(boxes->shown[0].title, "T");
    EXPECT_EQ(NativePathsInText("in '" + Path("a") + "' and [" + Path("b\\") + "] abc:\\d D:\\e\r\n" +
                                Path("c") + "\r\nx"),
              "in '" + NativeFolder() + "/a' and [" + NativeFolder() + "/b/] abc:\\d D:\\e\r\n" +
                  NativeFolder() + "/c\r\nx");
    EXPECT_EQ(NativePathsInText("copy " + Path("a (1)\\b") + " to " + Path("c") + ": no"),
              "copy " + NativeFolder() + "/a (1)/b to " + NativeFolder() + "/c: no");
    EXPECT_EQ(NativePathsInText("'" + Path("Bob's\\x (1)\\a") + "' (" + Path("x (1)\\b") + ")."),
              "'" + NativeFolder() + "/Bob's/x (1)/a' (" + NativeFolder() + "/x (1)/b).");
}

TEST_F(MessagesTest, UnattendedAnswersAreTraced) {
    WriteFile("trace.txt", "");
    SetUnattendedMessages(true, &log);
    EXPECT_EQ(ShowMessage("Go on?", 547, "T", {}, 0, "CX.Op"), platform::kAnswerCancel);
    EXPECT_EQ(ShowMessage("Sure?", 36, "T"), platform::kAnswerYes);
    EXPECT_TRUE(boxes->shown.empty());
    const std::string trace = ReadFile(Path("trace.xml"));
    EXPECT_NE(trace.find(" - Go on?, source = CX.Op =&gt; vbCancel</msg>"), std::string::npos);
    EXPECT_NE(trace.find(" - Sure?, source =  =&gt; vbYes</msg>"), std::string::npos);
}

TEST_F(MessagesTest, WarningsAreCountedAndTraced) {
    WriteFile("trace.txt", "");
    Session::SetTraceLog(&log);
    UserWarningMessage("Careful");
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].flags, 48U);
    EXPECT_EQ(boxes->shown[0].title, "Tovimar Add-In v." + VersionText());
    EXPECT_EQ(Session::Run().warningCount, 1);
    EXPECT_NE(ReadFile(Path("trace.xml")).find("UserWarningMessage: Careful"), std::string::npos);
    ShowMessage("Question", kMsgYesNo | kMsgExclamation, "T");
    EXPECT_EQ(Session::Run().warningCount, 1);
}

TEST_F(ErrorTrapTest, ReportsAndGoesOn) {
    WriteFile("trace.txt", "");
    Session::SetTraceLog(&log);
    boxes->answers = {7};
    EXPECT_EQ(Trapped("CX", "Op", [] {}), 0);
    EXPECT_EQ(Trapped(
                  "CX", "Op", [] { throw RaisedError(75, "It broke", "src"); }, [] { return "Detail"; }),
              75);
    EXPECT_EQ(Session::Run().runErrorCount, 1);
    ASSERT_EQ(boxes->shown.size(), 1U);
    const auto& box = boxes->shown[0];
    EXPECT_EQ(box.flags, 20U);
    EXPECT_EQ(box.title, "Error: " + TitleAndVersion());
    EXPECT_TRUE(
        box.text.starts_with("Error 75: It broke \r\n in CX.Op line 0 \r\n\r\nDetail\r\nError 75: Path/File"))
        << box.text;
    EXPECT_TRUE(box.text.ends_with("\r\n\r\nDo you want to report the problem?"));
    EXPECT_NE(box.text.find("[Locale information]\r\n  English name of language: English\r\n"),
              std::string::npos);
    EXPECT_NE(ReadFile(Path("tracedErrors.xml")).find("Error 75: It broke"), std::string::npos);
    EXPECT_TRUE(processes->opened.empty());
}

TEST_F(ErrorTrapTest, KeepsEveryKindOfFailure) {
    const auto fail = [](auto failure) { return Trapped("C", "O", [&] { throw failure; }); };
    EXPECT_EQ(fail(std::bad_alloc()), 14);
    EXPECT_EQ(fail(std::runtime_error("x")), kGeneralFailure);
    EXPECT_EQ(fail(RaisedError(0, "no number")), kGeneralFailure);
    EXPECT_EQ(Session::Run().runErrorCount, 3);
    platform::RequestInterrupt();
    EXPECT_EQ(fail(RaisedError(kGeneralFailure, "stopped")), kGeneralFailure);
    EXPECT_EQ(Session::Run().runErrorCount, 3);
    EXPECT_TRUE(Session::Run().generationInterrupted);
}

TEST_F(ErrorTrapTest, UnattendedRunsDoNotReport) {
    Unattended context;
    Session::SetContext(&context);
    SetUnattendedMessages(true, nullptr);
    rErrorMessage(5, 0, "x", "", "C", "O", true);
    EXPECT_TRUE(processes->opened.empty());
}

TEST_F(ErrorTrapTest, ReportsGoByMailOrIntoAFile) {
    boxes->answers = {6, 6};
    rErrorMessage(5, 12, "A & B@cut", "", "C", "O", true);
    ASSERT_EQ(processes->opened.size(), 1U);
    EXPECT_TRUE(processes->opened[0].starts_with("mailto:support@tovimar.example?Subject=Runtime%20error%"
                                                 "20in%20Tovimar%20Add-In%20(Tovimar)&Body=Please%20"));
    EXPECT_TRUE(processes->opened[0].ends_with("%0d%0aError%205:%20A%20%20B")) << processes->opened[0];
    processes->canOpen = false;
    rErrorMessage(5, 0, "B", "", "C", "O", true);
    EXPECT_TRUE(
        ReadFile(environment->folders.temporary + "~20260102030405.txt")
            .starts_with("Please send the following error to support@tovimar.example\r\n---\r\n\r\nPlease"));
}

TEST(MailAddress, IsCutAtALine) {
    const auto body = [](std::size_t lines) {
        std::string text;
        for (std::size_t i = 0; i < lines; ++i)
            text += "line of text\r\n";
        return text;
    };
    EXPECT_EQ(CMailToProtocol::Address("a", "s b", "x\r\ny", "c", "b", true),
              "mailto:a?CC=c&BCC=b&Subject=s%20b&Body=x%0d%0ay");
    const std::string cut = CMailToProtocol::Address("a", "s", body(500), "", "", true);
    EXPECT_LE(cut.size(), 2003U);
    EXPECT_TRUE(cut.ends_with("text%0d%0a..."));
    EXPECT_GT(CMailToProtocol::Address("a", "s", body(500), "", "", false).size(), 5000U);
}

TEST_F(ErrorTrapTest, FiftyFailuresStopARun) {
    Session::Run().runErrorCount = 49;
    CheckErrorLimit();
    EXPECT_FALSE(Session::Run().generationInterrupted);
    Session::Run().runErrorCount = 50;
    CheckErrorLimit();
    EXPECT_TRUE(Session::Run().generationInterrupted);
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

} // namespace
} // namespace tovimar
