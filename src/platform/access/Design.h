#pragma once

#include "platform/text/Caseless.h"

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// The design of one form, report or macro as it was read from a text export or a database: a tree of
/// typed objects with properties, the prototypes of the object's control kinds, and its code. Everything
/// above answers from this, whatever it was read from.
namespace tovimar::platform::access {

/// Numbers are the host's: tables 0, queries 1, forms 2, reports 3, macros 4, modules 5.
enum class ObjectKind { Table = 0, Query = 1, Form = 2, Report = 3, Macro = 4, Module = 5 };

/// "form", "query", ... as messages say it.
const char* KindWord(ObjectKind kind);

/// A property as it stands in the source: text in quotes decoded, numbers as they are written, flags as
/// "NotDefault", blobs ("Begin ... End" of hexadecimal) as bytes.
struct PropertyValue {
    enum class Form { Number, Text, NotDefault, Bytes };
    Form form = Form::Number;
    std::string text; ///< number's text, decoded text, or bytes
};

/// Types as the export writes them: "Form", "Report", "Section", "FormHeader", "FormFooter",
/// "PageHeader", "PageFooter", "BreakHeader", "BreakFooter", "BreakLevel", and the control kinds "Label",
/// "TextBox", "CommandButton", "OptionButton", "CheckBox", "OptionGroup", "BoundObjectFrame", "ListBox",
/// "ComboBox", "Subform", "UnboundObjectFrame", "PageBreak", "CustomControl", "ToggleButton", "Tab",
/// "Page", "Image", "Line", "Rectangle", "Attachment", "WebBrowser", "NavigationControl",
/// "NavigationButton", "EmptyCell", "Chart", "EdgeBrowser". Other words are carried.
class DesignObject {
public:
    std::string type;
    /// Property "Name"; made up as the type and a number where the source has none.
    std::string name;
    DesignObject* parent = nullptr;                      ///< not owned; null for the root
    const DesignObject* prototype = nullptr;             ///< not owned; defaults of the kind within this form
    std::vector<std::unique_ptr<DesignObject>> children; ///< in the order of the source, which is z-order

    /// Own properties, in the order of the source. Names ignore case; the first of a name counts.
    std::vector<std::pair<std::string, PropertyValue>> properties;

    /// The property here, else in the prototype; null when neither has it.
    const PropertyValue* Find(std::string_view property) const;
    /// The property here; the prototype isn't asked.
    const PropertyValue* FindOwn(std::string_view property) const;

    /// The effective value: own, prototype, built-in default of the kind (`BuiltInDefault`), `absent`.
    std::int32_t Integer(std::string_view property, std::int32_t absent = 0) const;
    std::string Text(std::string_view property, std::string_view absent = {}) const;
    /// "NotDefault" is the opposite of what would be inherited: of the prototype's value, else of the
    /// built-in default.
    bool Flag(std::string_view property) const;

    bool Is(std::string_view typeName) const; ///< ignoring case

private:
    /// Index of `properties` by name, filled at the first look-up.
    mutable std::unordered_map<std::string, std::size_t, text::CaselessHash, text::CaselessEqual> index_;
    mutable std::size_t indexed_ = 0;
};

/// The host's default of a property for a kind of object; none when there is none.
/// The text lives as long as the program.
std::optional<std::string_view> BuiltInDefault(std::string_view type, std::string_view property);

/// Sections by the host's numbers: 0 detail, 1 form or report header, 2 its footer, 3 page header,
/// 4 page footer, 5 and up group headers and footers by turns (level 1 header 5, footer 6, ...).
struct SectionRef {
    int number = 0;
    const DesignObject* object = nullptr;
};

/// Shared by the application and the windows that show it; the application may let it go and read it again.
struct Design : std::enable_shared_from_this<Design> {
    ObjectKind kind = ObjectKind::Form;
    std::string name;                   ///< of the object in the application
    std::unique_ptr<DesignObject> root; ///< null for a name without a design
    std::vector<std::unique_ptr<DesignObject>> prototypes;
    std::string code;       ///< source of the module behind it, CRLF or LF; empty without one
    std::string sourceFile; ///< native path it was read from, for messages

    /// In the order of the numbers.
    std::vector<SectionRef> Sections() const;
    const DesignObject* Section(int number) const;
};

} // namespace tovimar::platform::access
