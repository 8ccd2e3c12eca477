#pragma once

#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "support/FakeEnvironment.h"
#include "uimodel/CXmlForm.h"

#include <memory>
#include <string>

namespace tovimar::test {

/// Topics with bullets, everything shown, objects by caption, an empty message table.
class TopicTest : public EnvironmentTest {
protected:
    TopicTest() {
        parameters.BulletMenusControls = true;
        Session::SetParameters(&parameters);
    }

    static std::unique_ptr<CXmlForm> Loaded(const std::string& xml) {
        auto form = std::make_unique<CXmlForm>();
        EXPECT_EQ(kSuccess, form->LoadXml(xml));
        return form;
    }

    /// A menu entry, a text box, a tab control with two pages, a subform with a picture of its own.
    std::unique_ptr<CXmlForm> Orders() {
        auto form = Loaded(
            "<Form Name='Orders' Text='&amp;Orders' ClientAreaOffset='8, 29' HasMap='True' Charset='utf-8' "
            "SourceProjectType='MS ACCESS' Stylesheet='Office10.css'>"
            "<Menu><MenuEntry Name='mnuFile' Caption='&amp;File'/></Menu><Controls>"
            "<TextBox Name='First Name' Text='First name:' Location='10, 20' Size='100, 19' Description='Who "
            "&lt;b&gt;pays&lt;/b&gt;.'/>"
            "<Label Name='lbl' Text='L' Location='1, 1' Size='5, 5'/>"
            "<TabControl Name='tab' Location='0, 50' Size='200, 100'><Controls>"
            "<Page Name='p0' Text='One' Location='0, 50' Size='200, 100' TabPageTab='0,50,40,19'><Controls>"
            "<TextBox Name='a' Text='A' Location='5, 75' Size='50, 19'/><Label Name='la' "
            "Text='LA'/></Controls></Page>"
            "<Page Name='p1' Text='Two' Location='0, 50' Size='200, 100' TabPageTab='40,50,40,19'><Controls>"
            "<TextBox Name='b' Text='B' Location='5, 75' Size='50, "
            "19'/></Controls></Page></Controls></TabControl>"
            "<Subform Name='sub' Text='Lines' Location='10, 160' Size='180, 90' "
            "PicFullPath='C:\\h\\images\\Orders_sub.jpg'><Controls>"
            "<TextBox Name='q' Text='Qty' Location='20, 170' Size='30, 19'/></Controls></Subform>"
            "</Controls></Form>");
        form->SetPicFullPath(WriteFile("images\\Orders.jpg", "x"));
        form->SetHtmlFullPath(Path("Orders.htm"));
        return form;
    }

    CTovimarParameters parameters;
};

} // namespace tovimar::test
