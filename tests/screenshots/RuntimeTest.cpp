#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CXmlCommand.h"
#include "screenshots/Screenshot.h"
#include "support/FakeEnvironment.h"
#include "uimodel/CXmlForm.h"

namespace tovimar::test {
namespace {

/// A form of a running application.
class RunningForm : public AutomationObject {
public:
    explicit RunningForm(std::string name) : name_(std::move(name)) {}
    std::string ClassName() const override { return "Form_" + name_; }
    Value Get(std::string_view member, const Arguments&) override {
        if (member == "Name")
            return name_;
        throw RaisedError(438, "Object doesn't support this property or method");
    }
    void Set(std::string_view, const Value&) override {}
    Value Call(std::string_view member, const Arguments& arguments) override {
        return Get(member, arguments);
    }

private:
    std::string name_;
};

/// A project file with the forms "Orders" and "Broken"; the host takes every picture that it is asked for.
class RuntimeTest : public EnvironmentTest {
protected:
    RuntimeTest() {
        server.Connect();
        server.TovimarClientCallBack = [this](const std::string& text) {
            CXmlCommand command;
            command.Deserialize(text);
            if (command.Name() == "TakeScreenshot")
                taken.push_back(command.GetParamValue("ObjType") + " " + command.GetParamValue("ObjName") +
                                " " + command.GetParamValue("PicFullPath") + " " +
                                command.GetParamValue("HTMLFullPath"));
            command.AddParamValue("RetValue", command.Name() == "GetWinFormNameByHWND" ? std::string()
                                                                                       : std::string("True"));
            return command.Serialize();
        };
    }
    ~RuntimeTest() override { server.Disconnect(); }

    std::string WriteProject() {
        CXmlForm form;
        form.Name = "Orders";
        form.SetPicFullPath("Shop_Orders.bmp");
        form.SetHtmlFullPath("Shop_Orders.htm");
        WriteFile("help\\xml\\Shop_Orders.xml", form.XMLSTr());
        WriteFile("help\\xml\\Shop_Broken.xml", "<Form");
        WriteFile("help\\images\\Shop_Orders.bmp", "");
        const auto node = [](const std::string& name) {
            return "<FORM level=\"2\" name=\"" + name + "\" type=\"2\" caption=\"" + name +
                   "\" GeneratedHtmlFile=\"Shop_" + name + ".htm\" key=\"" + name +
                   "\" pkey=\"Project\" ProcessCode=\"999\" />";
        };
        return WriteFile(
            "help\\Shop.tvp",
            "<TovimarProject><Project level=\"1\" Name=\"Shop\" title=\"The shop\" caption=\"Shop\" "
            "PicsSubfolderName=\"images\" key=\"Project\">" +
                node("Broken") + node("Orders") +
                "</Project><Settings><Options><Option Name=\"SnapshotFormat\" Value=\"Bitmap\" />"
                "</Options></Settings></TovimarProject>");
    }

    CTovimarServer server;
    Screenshot screenshot;
    HostObject orders = std::make_shared<RunningForm>("orders");
    std::vector<std::string> taken;
};

TEST_F(RuntimeTest, AProjectIsLoadedOnceWithTheFilesOfItsForms) {
    EXPECT_EQ(screenshot.LoadedProjectSnapshotFormat(), "Bitmap");
    EXPECT_NE(screenshot.LoadProject(Path("none.tvp")), kSuccess);
    EXPECT_NE(screenshot.LastErrStr(), "");
    const std::string file = WriteProject();
    ASSERT_EQ(screenshot.LoadProject(file), kSuccess) << screenshot.LastErrStr();
    EXPECT_EQ(screenshot.LastErrDscr().substr(0, 6), "Error ") << "of the definition that doesn't load";
    EXPECT_EQ(screenshot.LastErrStr(), "");
    EXPECT_EQ(screenshot.LoadedProjectHtmlFolder(), Path("help\\"));
    EXPECT_EQ(screenshot.LoadedProjectPicsFolder(), Path("help\\images\\"));
    ASSERT_NE(Session::CurrentProject(), nullptr);
    EXPECT_EQ(Session::CurrentProject()->Name + ", " + Session::CurrentProject()->Title(), "Shop, The shop");
    EXPECT_NE(Session::CurrentProject()->HUID, "");
    environment->files->DeleteFile(file);
    EXPECT_EQ(screenshot.LoadProject(Path("HELP\\shop.tvp")), kSuccess);
}

TEST_F(RuntimeTest, AFormOfTheLoadedProjectHasItsFiles) {
    EXPECT_EQ(screenshot.TakeVB6FormScreenshot(orders, -1, "", "", "", "", true),
              MakeResultCode(0x80040005U));
    EXPECT_EQ(screenshot.LastErrStr(), "-2147221499 - Source Tovimar project isn't loaded.");
    const std::string file = WriteProject();
    ASSERT_EQ(screenshot.LoadProject(file), kSuccess);
    EXPECT_EQ(
        screenshot.TakeVB6FormScreenshot(std::make_shared<RunningForm>("Lines"), -1, "", "", "", "", true),
        MakeResultCode(0x80040006U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Form [Lines] not found in generated project '" + file + "'");
    ASSERT_EQ(screenshot.TakeVB6FormScreenshot(orders, -1, "", "", "", "", true), kSuccess);
    ASSERT_EQ(screenshot.TakeVB6FormScreenshot(orders, -1, "", "", "", "", false), kSuccess);
    const std::string picture = Path("help\\images\\Shop_Orders.bmp");
    EXPECT_EQ(taken, (std::vector<std::string>{"2 orders " + picture + " " + Path("help\\Shop_Orders.htm"),
                                               "2 orders " + picture + " "}));
    EXPECT_EQ(screenshot.TakenImageFullPath(), picture);
}

TEST_F(RuntimeTest, ACallersOwnPlaceIsCheckedInOrder) {
    const auto take = [&](std::int32_t type, const std::string& folder, const std::string& name) {
        return screenshot.TakeVB6FormScreenshot(orders, type, folder, name, "{{formname}}.htm", "", true);
    };
    EXPECT_EQ(take(3, "", ""), MakeResultCode(0x80040001U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Pictype can be only equal to 1(Bitmap) or 2(Jpeg)");
    EXPECT_EQ(take(2, "", ""), MakeResultCode(0x80040002U));
    EXPECT_EQ(screenshot.LastErrDscr(), "TargetFolder isn't specified");
    EXPECT_EQ(take(2, Folder(), ""), MakeResultCode(0x80040003U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Picture file name isn't specified");
    ASSERT_EQ(take(2, Folder(), "{{FORMNAME}}.jpg"), kSuccess);
    EXPECT_EQ(taken, (std::vector<std::string>{"2 orders " + Path("orders.jpg") + " " + Path("orders.htm")}));
    EXPECT_EQ(screenshot.TakeWinFormScreenshot(7, -1, "", "", "", "", false), MakeResultCode(0x80040006U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Form not found for HWND = 7 and project ''");
}

TEST_F(RuntimeTest, AnObjectThatIsntThereIsReported) {
    server.TovimarClientCallBack = [](const std::string& text) {
        CXmlCommand command;
        command.Deserialize(text).AddParamValue("RetValue", "False");
        return command.Serialize();
    };
    EXPECT_EQ(screenshot.TakeScreenshot(2, "Gone", Path("a.jpg"), "", false), MakeResultCode(0x80040001U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Undefined object type and name (2Gone)");
    EXPECT_FALSE(boxes->shown.empty());
}

} // namespace
} // namespace tovimar::test
