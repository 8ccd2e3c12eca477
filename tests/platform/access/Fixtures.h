#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"
#include "platform/access/AccessApplication.h"
#include "support/FakeEnvironment.h"

#include <filesystem>
#include <functional>
#include <string>

namespace tovimar::platform::access {

/// A form with prototypes, sections, an attached label, an option group, tab pages and code.
inline const std::string kOrdersForm = R"(Version =20
VersionRequired =20
Checksum =-123
Begin Form
    NavigationButtons = NotDefault
    DefaultView =0
    Width =9000
    Caption ="Orders \"new\""
    OnOpen ="[Event Procedure]"
    PrtMip = Begin
        0xa2050000a105 ,
        0xff
    End
    Begin
        Begin Label
            FontItalic = NotDefault
            FontSize =11
        End
        Begin TextBox
            Width =1701
            FontName ="Calibri"
        End
        Begin FormHeader
            Height =600
            Name ="FormHeader"
            Begin
                Begin CommandButton
                    HelpContextId =7
                    Left =100
                    Top =60
                    Width =1500
                    Height =400
                    Name ="cmd Print"
                    Caption ="&Print"
                    OnClick ="[Event Procedure]"
                    StatusBarText ="Prints the or"
                        "der\015\012at once"
                End
            End
        End
        Begin Section
            Height =4000
            Name ="Detail"
            Begin
                Begin TextBox
                    Left =1200
                    Top =200
                    Height =300
                    TabIndex =1
                    Name ="txtCustomer"
                    ControlSource ="Customer"
                    Begin
                        Begin Label
                            FontItalic = NotDefault
                            Width =900
                            Name ="lblCustomer"
                            Caption ="Customer:"
                        End
                    End
                End
                Begin OptionGroup
                    Name ="grpState"
                    Begin
                        Begin OptionButton
                            OptionValue =1
                            Name ="optOpen"
                            Begin
                                Begin Label
                                    Name ="lblOpen"
                                    Caption ="Open"
                                End
                            End
                        End
                    End
                End
                Begin Tab
                    Name ="tabMain"
                    Begin
                        Begin Page
                            Name ="pagFirst"
                            Caption ="First"
                            Begin
                                Begin CheckBox
                                    Visible = NotDefault
                                    Name ="chkPaid"
                                End
                            End
                        End
                        Begin Page
                            Name ="pagSecond"
                        End
                    End
                End
                Begin Subform
                    Name ="subLines"
                    SourceObject ="Form.Lines"
                End
                Begin EmptyCell
                    Name ="EmptyCell9"
                End
            End
        End
        Begin FormFooter
            Visible = NotDefault
            Height =300
            Name ="FormFooter"
        End
    End
End
CodeBehindForm
Attribute VB_GlobalNameSpace = False
Option Compare Database

' Prints what is shown.
Private Sub cmd_Print_Click()
    DoCmd.OpenReport "Invoice", _
        acPreview
End Sub

Public Function Total(ByVal line As Long) As Currency
End Function
)";

/// A form of one section with the given lines inside its detail.
inline std::string SmallForm(const std::string& controls, const std::string& properties = {}) {
    return "Version =20\r\nBegin Form\r\n" + properties +
           "    Begin\r\n        Begin Section\r\n            Height =1000\r\n"
           "            Name =\"Detail\"\r\n            Begin\r\n" +
           controls + "            End\r\n        End\r\n    End\r\nEnd\r\n";
}

/// Number and text of what an operation raises, 0 for nothing.
struct Raised {
    ResultCode number = 0;
    std::string text;
};
inline Raised RaisedBy(const std::function<void()>& operation) {
    try {
        operation();
    } catch (const RaisedError& failure) {
        return {failure.Number(), failure.what()};
    }
    return {};
}

/// An application in a folder of its own.
class ApplicationTest : public test::EnvironmentTest {
protected:
    void Part(const std::string& name, std::string_view bytes) { WriteFile("App\\" + name, bytes); }
    std::string NativeApplication() const { return NativeFolder() + "/App"; }
    HostObject Open() { return OpenAccessApplication(NativeApplication()); }

    static HostObject Object(const HostObject& owner, std::string_view member,
                             const AutomationObject::Arguments& arguments = {}) {
        return owner->Get(member, arguments).AsObject();
    }
    static std::string Text(const HostObject& owner, std::string_view member) {
        return owner->Get(member).AsString();
    }
    /// Names of a collection's entries, joined by commas.
    static std::string Names(const HostObject& list) {
        std::string names;
        for (std::int32_t i = 0; i < list->Get("Count").AsInteger(); ++i)
            names += (i > 0 ? "," : "") + Text(Object(list, "Item", {i}), "Name");
        return names;
    }
};

/// Native path of the real applications that lie beside the project, empty where they are absent.
inline std::string CorpusFolder() {
    const std::filesystem::path folder = TOVIMAR_SOURCE_DIR "/../shared/corpus";
    return std::filesystem::exists(folder) ? std::filesystem::canonical(folder).string() : std::string();
}

} // namespace tovimar::platform::access
