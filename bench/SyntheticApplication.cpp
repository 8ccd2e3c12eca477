#include "SyntheticApplication.h"

#include <fstream>
#include <sstream>
#include <string>

namespace tovimar::bench {
namespace {

void Write(const std::filesystem::path& path, const std::string& text) {
    std::filesystem::create_directories(path.parent_path());
    std::ofstream(path, std::ios::binary) << text;
}

std::string Place(int left, int top, int width, int height) {
    std::ostringstream out;
    out << "                    Left =" << left << "\r\n                    Top =" << top
        << "\r\n                    Width =" << width << "\r\n                    Height =" << height
        << "\r\n";
    return out.str();
}

/// A text or combo box with its attached label, as the host nests them.
std::string LabelledBox(int index, const std::string& kind = "TextBox", const std::string& suffix = {}) {
    const int top = 120 + index / 2 * 420;
    const int left = index % 2 * 5400 + 120;
    const std::string number = std::to_string(index);
    return "                Begin " + kind + "\r\n" + Place(left + 1800, top, 3000, 300) +
           "                    Name =\"txtField" + number +
           "\"\r\n                    ControlSource =\"Field" + number +
           "\"\r\n                    StatusBarText =\"What field " + number +
           " is for\"\r\n                    Begin\r\n                        Begin Label\r\n" +
           Place(left, top, 1700, 300) + "                            Name =\"lblField" + number +
           "\"\r\n                            Caption =\"Field &" + number + suffix +
           ":\"\r\n                        End\r\n                    End\r\n                End\r\n";
}

std::string Simple(const std::string& kind, int index, int left, int top, int width) {
    const std::string number = std::to_string(index);
    return "                Begin " + kind + "\r\n" + Place(left, top, width, 330) +
           "                    Name =\"" + kind + number + "\"\r\n" +
           (kind == "CommandButton" ? "                    Caption =\"Action &" + number + "\"\r\n" : "") +
           "                    StatusBarText =\"What number " + number +
           " does\"\r\n                End\r\n";
}

/// From the beginning of a form or report to where its detail section's controls go.
std::string DesignStart(const std::string& kind, int number, int height) {
    const std::string name = std::to_string(number);
    return "Version =21\r\nVersionRequired =20\r\nBegin " + kind + "\r\n    Width =11000\r\n" +
           "    RecordSource =\"tbl" + name + "\"\r\n    Caption =\"" + kind + " number " + name +
           "\"\r\n    Begin\r\n        Begin Label\r\n            FontSize =9\r\n            FontName "
           "=\"Calibri\"\r\n        End\r\n        Begin TextBox\r\n            FontSize =9\r\n       "
           "     FontName =\"Calibri\"\r\n        End\r\n        Begin Section\r\n            Height =" +
           std::to_string(height) + "\r\n            Name =\"Detail\"\r\n            Begin\r\n";
}

constexpr const char* kDesignEnd = "            End\r\n        End\r\n    End\r\nEnd\r\n";

std::string Design(const std::string& kind, int number) {
    std::string text = DesignStart(kind, number, 5400);
    for (int i = 0; i < 24; ++i)
        text += LabelledBox(i);
    return text + kDesignEnd;
}

std::string LargeForm(int number) {
    constexpr int kBoxes = 45;
    std::string text = DesignStart("Form", number, 11000);
    for (int i = 0; i < kBoxes; ++i)
        text += LabelledBox(i, i % 15 == 14 ? "ComboBox" : "TextBox", " of " + std::to_string(number));
    for (int i = 0; i < 4; ++i)
        text += Simple("CheckBox", i, 5520 + i * 1200, 9360, 300);
    for (int i = 0; i < 6; ++i)
        text += Simple("CommandButton", i, 120 + i * 1750, 10080, 1500);
    return text + kDesignEnd;
}

} // namespace

void WriteSyntheticApplication(const std::filesystem::path& folder, int objects) {
    for (int i = 0; i < objects; ++i) {
        const std::string name = std::to_string(i);
        switch (i % 10) {
        case 6:
        case 7:
            Write(folder / "reports" / ("rpt" + name + ".report"), Design("Report", i));
            break;
        case 8:
            Write(folder / "tbldefs" / ("tbl" + name + ".sql"),
                  "CREATE TABLE [tbl" + name +
                      "] (\r\n  [ID] AUTOINCREMENT CONSTRAINT [PrimaryKey] PRIMARY KEY,\r\n"
                      "  [Name] VARCHAR (50),\r\n  [Price] CURRENCY\r\n)\r\n");
            break;
        case 9:
            Write(folder / "queries" / ("qry" + name + ".sql"),
                  "SELECT ID, Name, Price * 2 AS Twice\r\nFROM tbl" + std::to_string(i - 1) + ";\r\n");
            break;
        default:
            Write(folder / "forms" / ("frm" + name + ".form"), Design("Form", i));
        }
    }
}

void WriteLargeForms(const std::filesystem::path& folder, int forms) {
    for (int i = 0; i < forms; ++i)
        Write(folder / "forms" / ("frm" + std::to_string(i) + ".form"), LargeForm(i));
}

} // namespace tovimar::bench
