#include "uimodel/CClientUIObjectRawXml.h"
#include "uimodel/CClientUIObjectXml.h"
#include "uimodel/CXmlForm.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"
#include "support/Golden.h"
#include "uimodel/FakeHost.h"

namespace tovimar {
namespace {

using test::FakeProcessor;
using test::MakeObject;

class CaptureTest : public test::EnvironmentTest {
protected:
    CaptureTest() { Session::SetParameters(&parameters); }

    static std::shared_ptr<test::FakeObject> Control(const char* type, const char* name, const char* caption,
                                                     std::int32_t left, std::int32_t top) {
        return MakeObject(type, {{"Name", name},
                                 {"Caption", caption},
                                 {"Left", left},
                                 {"Top", top},
                                 {"Width", 50},
                                 {"Height", 20}});
    }

    CTovimarParameters parameters;
    FakeProcessor processor;
};

TEST_F(CaptureTest, WalksAFormIntoRawXml) {
    auto form = MakeObject("Form_Orders", {{"Caption", ""}});
    auto box = Control("TextBox", "txtName", "Name \"x\"", 10, 20);
    box->Set("StatusBarText", "Who it is");
    box->Set("TabIndex", 3);
    auto frame = Control("OptionGroup", "grp", "Kind", 0, 0);
    frame->children = {Control("OptionButton", "opt", "A", 1, 1)};
    auto tab = Control("TabControl", "tab", "", 5, 100);
    tab->Set("Pages(0)", HostObject(Control("Page", "p0", "First", 5, 120)));
    tab->Set("Pages(1)", HostObject());
    tab->pages = {{Control("Label", "lbl", "L", 6, 130), Control("Label", "gone", "G", -1, 0)}, {}};
    auto bar = Control("Toolbar", "bar", "", 0, 0);
    bar->Set("Buttons(1)", HostObject(MakeObject("Button", {{"Caption", "Go"}})));
    form->children = {box, Control("menu", "sep", "-", 0, 0), frame, tab, bar};
    processor.open = form;
    processor.sectionsXml = "<Section Name=\"Detail\"/>\r\n";

    const std::string raw =
        CClientUIObjectRawXml().Get_(processor, 2, MakeObject("AccessObject", {{"Name", "Orders"}}), 7,
                                     "MS ACCESS", "", /*vfKeepOpen=*/false);
    test::ExpectGolden("uimodel/orders_raw.xml", raw);
    EXPECT_EQ("open events type size offset x offset y window help id caption caption border sections events "
              "first pages page 0 page 0 page 1 menus close",
              text::Join(processor.calls, " "));
}

TEST_F(CaptureTest, WhatCantBeOpenedIsEmptyAndASelfShowingFormEnds) {
    EXPECT_EQ("", CClientUIObjectRawXml().Get_(processor, 3, MakeObject("AccessObject", {{"Name", "R"}}), 0));
    auto form = MakeObject("Form_F", {{"Caption", "F"}});
    auto subform = Control("Subform", "sub", "", 0, 0);
    subform->children = {subform};
    form->children = {subform};
    processor.open = form;
    EXPECT_FALSE(
        CClientUIObjectRawXml().Get_(processor, 2, MakeObject("AccessObject", {{"Name", "F"}}), 0).empty());
    subform->children.clear();
}

TEST_F(CaptureTest, FieldsOfATableAreItsControls) {
    processor.fields = {MakeObject(
        "Field", {{"Name", "ID"}, {"Caption", "ID"}, {"Description", "Key & more"}, {"TabIndex", 0}})};
    const std::string raw = CClientUIObjectRawXml().Get_(
        processor, 0, MakeObject("AccessObject", {{"Name", "tblA"}}), 0, "MS ACCESS");
    EXPECT_EQ(
        "<Table Name = \"tblA\" Text = \"tblA\" Caption = \"tblA\" WindowSize = \"0, 0\" BorderStyle = \"0\" "
        "NamePrefix = \"\" ClientAreaOffset = \"0, 0\" OriginalClassName = \"\" HelpContextId = \"-1\" "
        "SourceProjectType = \"MS ACCESS\" >\r\n\r\n<Sections>\r\n</Sections>\r\n<Controls>\r\n"
        "  <Field Name = \"ID\" Text = \"ID\" Caption = \"ID\" Location = \"0, 0\" Size = \"0, 0\" TabIndex "
        "= \"0\" "
        "Description = \"Key &#38; more\" OriginalClassName = \"Field\" Level = \"1\" "
        "/>\r\n</Controls>\r\n</Table>\r\n",
        raw);
    CXmlForm table;
    ASSERT_EQ(kSuccess, table.LoadXml(raw));
    EXPECT_EQ("Key & more", table.Controls.At(1)->Description);
}

TEST_F(CaptureTest, EveryKindOfContainerIsWalked) {
    auto form = MakeObject("Report_R", {{"Caption", "R"}});
    for (const char* kind : {"Subform", "subreport", "GroupBox", "Frame", "PictureBox", "Panel"}) {
        auto container = Control(kind, kind, "", 0, 0);
        container->children = {Control("TextBox", "inner", "I", 1, 1)};
        form->children.push_back(container);
    }
    auto tabs = Control("SSTab", "tabs", "", 0, 0);
    tabs->Set("Pages(0)", HostObject(Control("Page", "p", "P", 0, 0)));
    tabs->pages = {{}};
    form->children.push_back(tabs);
    form->children.push_back(Control("ComboBox", "R&amp;D", "C", 0, 0));
    processor.open = form;
    const std::string raw =
        CClientUIObjectRawXml().Get_(processor, 3, MakeObject("AccessObject", {{"Name", "R&amp;D"}}), 0);
    test::ExpectGolden("uimodel/containers_raw.xml", raw);
    CXmlForm report;
    ASSERT_EQ(kSuccess, report.LoadXml(raw));
    EXPECT_EQ("R&amp;D", report.Name);
    EXPECT_EQ("R&amp;D", report.Controls.At(8)->Name);
}

TEST_F(CaptureTest, ObjectsWithoutAWindowAreTheirFields) {
    for (const auto& [type, tag] : std::vector<std::pair<std::int32_t, std::string>>{
             {1, "Query"}, {4, "Macro"}, {81, "Worksheet"}, {82, "Chart"}}) {
        processor.calls.clear();
        const std::string raw =
            CClientUIObjectRawXml().Get_(processor, type, MakeObject("AccessObject", {{"Name", "o"}}), 0);
        EXPECT_EQ(0U, raw.find("<" + tag + " Name = \"o\" Text = \"o\" Caption = \"o\" ")) << raw;
        EXPECT_NE(std::string::npos, raw.find("</" + tag + ">\r\n"));
        EXPECT_EQ("events help id fields o " + tag + " menus", text::Join(processor.calls, " "));
    }
}

std::string Raw(const std::string& kind, const std::string& controls, const std::string& more = {}) {
    return "<Form Name='Orders' Text='O' BorderStyle='2' SourceProjectType='" + kind +
           "' ><Sections>"
           "<Section Name='Header' Height='20' DesignTimeHeaderHeight='18'/><Section Name='Detail' "
           "Height='200' "
           "DesignTimeHeaderHeight='18'/></Sections>" +
           more + "<Controls>" + controls + "</Controls></Form>";
}

std::unique_ptr<CXmlForm> Adjusted(const std::string& raw, bool designView, bool absolute,
                                   std::int32_t picType = 2) {
    const std::string xml = CClientUIObjectXml().Adjust(
        raw, 2, designView, picType, "C:\\h\\images\\Orders.jpg", "C:\\h\\Orders.htm", "images\\", absolute);
    auto form = std::make_unique<CXmlForm>();
    EXPECT_EQ(kSuccess, form->LoadXml(xml));
    return form;
}

TEST_F(CaptureTest, AdjustStacksSectionsAndMakesSubformControlsAbsolute) {
    auto form = Adjusted(
        Raw("MS ACCESS", "<Subform Name='s' Location='10, 20' Size='90, 90'><Controls>"
                         "<Subform Name='t' Location='1, 2' Size='9, 9'><Controls>"
                         "<A Name='a' Text='seed' Caption='&amp;Close' Location='3, 4'/></Controls></Subform>"
                         "</Controls></Subform>"),
        /*designView=*/true, /*absolute=*/true);
    EXPECT_TRUE(form->HasMap);
    EXPECT_EQ(0, form->ClientAreaOffsetX);
    EXPECT_EQ(38, form->ControlSectionOffsetY("Detail"));
    EXPECT_EQ(18, form->ControlSectionHeaderHeight("Detail"));
    EXPECT_EQ(0, form->ControlSectionOffsetY());
    const CXmlControl& control = *form->GetControl("a");
    EXPECT_EQ(14, control.Left);
    EXPECT_EQ(26, control.Top);
    EXPECT_EQ("&Close", control.Text());
    EXPECT_EQ("Close", control.Indexes);
    EXPECT_EQ("Orders_s.jpg", form->GetControl("s")->PicFullPath);
    EXPECT_EQ("", control.PicFullPath);
}

TEST_F(CaptureTest, AdjustAddsTheOffsetsOfContainersOnOtherHosts) {
    const std::string tab =
        "<TabControl Name='t' Location='10, 20' Size='200, 100'><Controls>"
        "<Page Name='t_0' Location='0, 0' TabPageTab='1,2,3,4'><Controls>"
        "<GroupBox Name='g' Location='5, 6'><Controls><A Name='a' Location='1, 1'/></Controls>"
        "</GroupBox></Controls></Page></Controls></TabControl>";
    auto form = Adjusted(Raw("VB6", tab, "<Menu><MenuEntry Name='m' Text='M'/></Menu>"), false, false, 3);
    EXPECT_EQ(4, form->ClientAreaOffsetX);
    EXPECT_EQ(18 + 4 + 19, form->ClientAreaOffsetY);
    EXPECT_EQ(16, form->GetControl("a")->Left);
    EXPECT_EQ(27, form->GetControl("a")->Top);
    const CXmlControl& page = *form->GetControl("t_0");
    EXPECT_EQ(200, page.Width);
    EXPECT_EQ(1, page.TabLeft);
    EXPECT_EQ("Orders_t_0.bmp", page.PicFullPath);

    auto inFrame =
        Adjusted(Raw("VB6", "<Frame Name='f' Location='100, 50'><Controls>" + tab + "</Controls></Frame>"),
                 false, false);
    EXPECT_EQ(101, inFrame->GetControl("t_0")->TabLeft);
    EXPECT_EQ(52, inFrame->GetControl("t_0")->TabTop);
    EXPECT_EQ(116, inFrame->GetControl("a")->Left);
}

TEST_F(CaptureTest, PagesOfDotNetShiftWhatStandsOnThem) {
    auto form = Adjusted(
        Raw("C#", "<TabControl Name='t' Location='10, 20' Size='200, 100'><Controls>"
                  "<Page Name='p' Location='4, 22' Size='1, 1'><Controls><A Name='a' Location='1, 1'/>"
                  "</Controls></Page></Controls></TabControl>"),
        false, /*absolute=*/true);
    EXPECT_EQ(10, form->GetControl("p")->Left);
    EXPECT_EQ(5, form->GetControl("a")->Left);
    EXPECT_EQ(23, form->GetControl("a")->Top);
    EXPECT_EQ("", CClientUIObjectXml().Adjust("<Form", 2, true, 1, "", "", "", true));
}

} // namespace
} // namespace tovimar
