#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/LateBound.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CXmlCommand.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/Environment.h"
#include "platform/access/AccessApplication.h"
#include "platform/xml/XmlDocument.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <tuple>

namespace tovimar {
namespace {

/// Every object of a real application is read through the commands, as a run does.
class CorpusTest : public test::EnvironmentTest, public ::testing::WithParamInterface<const char*> {};

std::string Describe(std::int32_t type, const std::string& name) {
    const std::string answer =
        TheServer().SendCommand(CXmlCommand()
                                    .Build("ProcessComponent", {{"ObjectType", type},
                                                                {"ComponentName", name},
                                                                {"HostAppIDEHwnd", 0},
                                                                {"CaptureRptPreviewAreaOnly", false},
                                                                {"SourceProjectTypeName", "MS ACCESS"},
                                                                {"KeepSourceObjectOpened", false}})
                                    .Serialize());
    return CXmlCommand().Deserialize(answer).Text;
}

TEST_P(CorpusTest, EveryObjectIsDescribed) {
    const std::string folder = std::string(TOVIMAR_SOURCE_DIR "/../shared/corpus/") + GetParam();
    if (!std::filesystem::exists(folder))
        GTEST_SKIP() << "the corpus is absent: " << folder;
    CTovimarClient client;
    ASSERT_EQ(client.Connect(platform::access::OpenAccessApplication(folder)), kSuccess);
    const auto project = Session::ServerAgent()->ParseSourceProject();
    ASSERT_NE(project, nullptr);
    for (const SourceItems* items : {&project->Forms(), &project->Reports(), &project->Tables(),
                                     &project->Queries(), &project->Macros()})
        for (const auto& item : *items) {
            XmlDocument document;
            EXPECT_TRUE(document.loadXML(Describe(item->ObjType(), item->FormName)))
                << item->SubType << " " << item->FormName;
        }
    EXPECT_FALSE(project->Forms().Empty());
    for (const auto& box : boxes->shown)
        ADD_FAILURE() << box.text;
}

/// The sample that the program comes with: its buttons say what they do.
class SampleButtonsTest : public test::EnvironmentTest {};

TEST_F(SampleButtonsTest, SayWhatTheyDo) {
    CXmlMessages messages;
    messages.Load(
        environment->files->FromNative(SourceFolder() + "install/Templates/Localized/EN/Messages.xml"));
    Session::SetMessages(&messages);
    CTovimarClient client;
    const HostObject app = platform::access::OpenAccessApplication(SourceFolder() + "samples/orchard");
    ASSERT_EQ(client.Connect(app), kSuccess);
    const std::tuple<const char*, const char*, const char*> buttons[] = {
        {"Main Menu", "cmdOrders", "Opens the form Orders."},
        {"Main Menu", "cmdPriceList", "Opens the report Price List."},
        {"Main Menu", "cmdMorning", "Runs the macro Morning Routine."},
        {"Main Menu", "cmdClose", "Closes this form."},
        {"Customers", "cmdNewOrder", "Opens the form Orders."},
        {"Product Details", "cmdReorder", "Opens the query Products to Reorder."},
        {"Product Details", "cmdClose", "Closes this window."},
        {"Search", "cmdShow",
         "Opens the form Customers.<BR>\r\nOpens the form Orders.<BR>\r\nOpens the form Product Details."},
    };
    CN_IDEAccFormProcessor processor;
    processor.SetIdeAppInstance(app);
    for (const auto& [formName, name, sentence] : buttons) {
        const HostObject entry =
            late::Object(late::Object(app, "CurrentProject"), "AllForms", {Value(formName)});
        const HostObject form = processor.FindActualFormOfComponent(entry);
        const HostObject button = late::Object(form, "Controls", {Value(name)});
        EXPECT_EQ(processor.GetOnClickActionDescription(app, form, button), sentence)
            << formName << "." << name;
        processor.ActualFormClose(entry, form);
    }
    client.Disconnect();
    Session::SetMessages(nullptr);
}

INSTANTIATE_TEST_SUITE_P(Applications, CorpusTest, ::testing::Values("vcs-testing", "sports-admin"));

} // namespace
} // namespace tovimar
