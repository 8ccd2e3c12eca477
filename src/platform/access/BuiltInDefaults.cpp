#include "platform/access/Design.h"
#include "platform/access/DesignValues.h"
#include "platform/text/Text.h"

#include <span>
#include <unordered_map>
#include <vector>

/// What the host takes for a property that neither the object nor its prototype has. An entry says as well
/// that the kind has the property at all. Flags stand as "True" and "False".
namespace tovimar::platform::access {

namespace {

struct Default {
    std::string_view property;
    std::string_view value;
};

constexpr Default kPlace[] = {{"Left", "0"},       {"Top", "0"}, {"Width", "1440"},   {"Height", "240"},
                              {"Visible", "True"}, {"Tag", ""},  {"DisplayWhen", "0"}};

constexpr Default kFrame[] = {{"BackColor", "16777215"},
                              {"BackStyle", "1"},
                              {"BorderColor", "0"},
                              {"OldBorderStyle", "1"},
                              {"BorderWidth", "0"},
                              {"BorderLineStyle", "1"},
                              {"SpecialEffect", "0"},
                              {"BackThemeColorIndex", "-1"},
                              {"BackTint", "100"},
                              {"BackShade", "100"},
                              {"BorderThemeColorIndex", "-1"},
                              {"BorderTint", "100"},
                              {"BorderShade", "100"}};

constexpr Default kFont[] = {
    {"FontName", "MS Sans Serif"}, {"FontSize", "8"},   {"FontWeight", "400"}, {"FontItalic", "False"},
    {"FontUnderline", "False"},    {"ForeColor", "0"},  {"TextAlign", "0"},    {"ThemeFontIndex", "-1"},
    {"ForeThemeColorIndex", "-1"}, {"ForeTint", "100"}, {"ForeShade", "100"}};

constexpr Default kHelp[] = {{"ControlTipText", ""}, {"HelpContextId", "0"}, {"OnClick", ""},
                             {"OnDblClick", ""},     {"OnMouseDown", ""},    {"OnMouseMove", ""},
                             {"OnMouseUp", ""}};

constexpr Default kFocus[] = {{"StatusBarText", ""}, {"TabIndex", "0"},  {"TabStop", "True"},
                              {"Enabled", "True"},   {"OnEnter", ""},    {"OnExit", ""},
                              {"OnGotFocus", ""},    {"OnLostFocus", ""}};

constexpr Default kData[] = {{"ControlSource", ""},  {"DefaultValue", ""}, {"ValidationRule", ""},
                             {"ValidationText", ""}, {"Locked", "False"},  {"BeforeUpdate", ""},
                             {"AfterUpdate", ""}};

constexpr Default kColumn[] = {{"ColumnWidth", "-1"}, {"ColumnOrder", "0"}, {"ColumnHidden", "False"}};

constexpr Default kTextEntry[] = {{"Format", ""},       {"InputMask", ""},      {"DecimalPlaces", "255"},
                                  {"CanGrow", "False"}, {"CanShrink", "False"}, {"ScrollBars", "0"},
                                  {"OnChange", ""},     {"OnKeyDown", ""},      {"OnKeyPress", ""},
                                  {"OnKeyUp", ""}};

constexpr Default kList[] = {
    {"RowSourceType", "Table/Query"}, {"RowSource", ""},   {"ColumnCount", "1"}, {"ColumnWidths", ""},
    {"ColumnHeads", "False"},         {"BoundColumn", "1"}};

constexpr Default kComboOwn[] = {{"ListRows", "8"},
                                 {"ListWidth", "0"},
                                 {"LimitToList", "False"},
                                 {"AutoExpand", "True"},
                                 {"OnNotInList", ""}};

constexpr Default kCaption[] = {{"Caption", ""}};

constexpr Default kPicture[] = {{"Picture", ""},
                                {"PictureType", "0"},
                                {"PictureAlignment", "2"},
                                {"SizeMode", "0"},
                                {"PictureTiling", "False"}};

constexpr Default kLabelOwn[] = {{"OldBorderStyle", "0"}};

constexpr Default kButtonOwn[] = {{"Height", "360"},       {"FontSize", "10"},  {"FontWeight", "700"},
                                  {"Default", "False"},    {"Cancel", "False"}, {"AutoRepeat", "False"},
                                  {"Transparent", "False"}};

constexpr Default kCheckOwn[] = {{"Width", "260"}, {"Height", "240"}, {"OptionValue", "0"}};
constexpr Default kToggleOwn[] = {
    {"Height", "360"}, {"FontSize", "10"}, {"FontWeight", "700"}, {"OptionValue", "0"}};
constexpr Default kLineOwn[] = {{"LineSlant", "False"}, {"Height", "0"}};

constexpr Default kSubformOwn[] = {{"SourceObject", ""}, {"LinkChildFields", ""}, {"LinkMasterFields", ""},
                                   {"Locked", "False"},  {"CanGrow", "False"},    {"CanShrink", "False"}};

constexpr Default kTabOwn[] = {
    {"TabFixedHeight", "0"}, {"TabFixedWidth", "0"}, {"MultiRow", "False"}, {"Style", "0"}, {"OnChange", ""}};
constexpr Default kPageOwn[] = {{"StatusBarText", ""}, {"Enabled", "True"}};
constexpr Default kObjectOwn[] = {{"Class", ""}, {"OLEClass", ""}};

constexpr Default kWindow[] = {{"Caption", ""},
                               {"RecordSource", ""},
                               {"Filter", ""},
                               {"OrderBy", ""},
                               {"Width", "5000"},
                               {"HelpFile", ""},
                               {"HelpContextId", "0"},
                               {"PopUp", "False"},
                               {"Modal", "False"},
                               {"BorderStyle", "2"},
                               {"AutoCenter", "False"},
                               {"AutoResize", "True"},
                               {"ControlBox", "True"},
                               {"MinButton", "True"},
                               {"MaxButton", "True"},
                               {"CloseButton", "True"},
                               {"ViewsAllowed", "0"},
                               {"GridX", "10"},
                               {"GridY", "12"},
                               {"Picture", ""},
                               {"PictureType", "0"},
                               {"PictureTiling", "False"},
                               {"PictureAlignment", "0"},
                               {"Tag", ""},
                               {"OnOpen", ""},
                               {"OnClose", ""},
                               {"OnLoad", ""},
                               {"OnUnload", ""},
                               {"OnActivate", ""},
                               {"OnDeactivate", ""},
                               {"OnError", ""},
                               {"OnResize", ""},
                               {"ShortcutMenu", "True"},
                               {"Toolbar", ""},
                               {"MenuBar", ""},
                               {"ShortcutMenuBar", ""},
                               {"Visible", "True"},
                               {"OnTimer", ""},
                               {"TimerInterval", "0"},
                               {"FilterOn", "False"},
                               {"OrderByOn", "False"},
                               {"FilterOnLoad", "False"},
                               {"OrderByOnLoad", "True"}};

constexpr Default kFormOwn[] = {{"DefaultView", "1"},
                                {"RecordSelectors", "True"},
                                {"NavigationButtons", "True"},
                                {"DividingLines", "True"},
                                {"ScrollBars", "3"},
                                {"AllowEdits", "True"},
                                {"AllowAdditions", "True"},
                                {"AllowDeletions", "True"},
                                {"AllowFilters", "True"},
                                {"DataEntry", "False"},
                                {"Cycle", "0"},
                                {"AllowFormView", "True"},
                                {"AllowDatasheetView", "True"},
                                {"AllowLayoutView", "True"},
                                {"DatasheetFontName", "MS Sans Serif"},
                                {"DatasheetFontHeight", "8"},
                                {"DatasheetBackColor", "16777215"},
                                {"OnCurrent", ""},
                                {"BeforeInsert", ""},
                                {"AfterInsert", ""},
                                {"BeforeUpdate", ""},
                                {"AfterUpdate", ""},
                                {"OnDelete", ""},
                                {"OnDirty", ""},
                                {"KeyPreview", "False"},
                                {"WhatsThisButton", "False"}};

constexpr Default kReportOwn[] = {{"DefaultView", "1"},  {"PageHeader", "0"},      {"PageFooter", "0"},
                                  {"DateGrouping", "1"}, {"GrpKeepTogether", "0"}, {"OnPage", ""},
                                  {"OnNoData", ""}};

constexpr Default kSection[] = {
    {"Height", "0"},        {"Visible", "True"},       {"BackColor", "16777215"},
    {"SpecialEffect", "0"}, {"KeepTogether", "False"}, {"CanGrow", "False"},
    {"CanShrink", "False"}, {"ForceNewPage", "0"},     {"RepeatSection", "False"},
    {"DisplayWhen", "0"},   {"BreakLevel", "0"},       {"BackThemeColorIndex", "-1"},
    {"BackTint", "100"},    {"BackShade", "100"},      {"AlternateBackThemeColorIndex", "-1"},
    {"OnClick", ""},        {"OnFormat", ""},          {"OnPrint", ""}};

constexpr Default kBreakLevel[] = {{"ControlSource", ""},    {"SortOrder", "False"}, {"GroupHeader", "False"},
                                   {"GroupFooter", "False"}, {"GroupOn", "0"},       {"GroupInterval", "1"},
                                   {"KeepTogether", "0"}};

using Groups = std::vector<std::span<const Default>>;

/// Groups of a kind; a later group wins over an earlier one. Words that are no known kind, of which a
/// foreign file may bring any number, share one table: `folded` becomes "*" for them.
Groups GroupsOf(std::string& folded) {
    if (folded == "label")
        return {kPlace, kFrame, kFont, kHelp, kCaption, kLabelOwn};
    if (folded == "textbox")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kData, kColumn, kTextEntry};
    if (folded == "combobox")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kData, kColumn, kTextEntry, kList, kComboOwn};
    if (folded == "listbox")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kData, kColumn, kList};
    if (folded == "commandbutton" || folded == "navigationbutton")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kCaption, kPicture, kButtonOwn};
    if (folded == "togglebutton")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kData, kCaption, kPicture, kToggleOwn};
    if (folded == "checkbox")
        return {kPlace, kFrame, kHelp, kFocus, kData, kColumn, kCheckOwn};
    if (folded == "optionbutton")
        return {kPlace, kFrame, kHelp, kFocus, kData, kCheckOwn};
    if (folded == "optiongroup")
        return {kPlace, kFrame, kHelp, kFocus, kData, kColumn};
    if (folded == "boundobjectframe" || folded == "attachment")
        return {kPlace, kFrame, kHelp, kFocus, kData, kColumn, kPicture, kObjectOwn};
    if (folded == "unboundobjectframe" || folded == "chart" || folded == "customcontrol")
        return {kPlace, kFrame, kHelp, kFocus, kPicture, kObjectOwn};
    if (folded == "subform")
        return {kPlace, kFrame, kFocus, kSubformOwn};
    if (folded == "tab" || folded == "navigationcontrol")
        return {kPlace, kFrame, kFont, kHelp, kFocus, kTabOwn};
    if (folded == "page")
        return {kPlace, kHelp, kCaption, kPicture, kPageOwn};
    if (folded == "image")
        return {kPlace, kFrame, kHelp, kPicture};
    if (folded == "line")
        return {kPlace, kFrame, kLineOwn};
    if (folded == "rectangle")
        return {kPlace, kFrame, kHelp};
    if (folded == "form")
        return {kWindow, kFormOwn};
    if (folded == "report")
        return {kWindow, kReportOwn};
    if (folded == "section" || folded == "formheader" || folded == "formfooter" || folded == "pageheader" ||
        folded == "pagefooter" || folded == "breakheader" || folded == "breakfooter")
        return {kSection};
    if (folded == "breaklevel")
        return {kBreakLevel};
    if (folded == "macro" || folded == "action" || folded.empty())
        return {};
    folded = "*";
    return {kPlace, kFrame, kHelp, kFocus};
}

/// Defaults of one kind, made at its first look-up.
const DefaultTable& TableOf(std::string_view type) {
    static std::unordered_map<std::string, DefaultTable, text::CaselessHash, text::CaselessEqual> tables;
    if (const auto found = tables.find(type); found != tables.end())
        return found->second;
    auto folded = text::FoldCase(type);
    const auto groups = GroupsOf(folded);
    auto& table = tables[folded];
    for (const auto& group : groups)
        for (const auto& entry : group)
            table[std::string(entry.property)] = {std::string(entry.property), std::string(entry.value)};
    return table;
}

} // namespace

const DefaultTable& BuiltInDefaults(std::string_view type) {
    return TableOf(type);
}

std::optional<std::string_view> BuiltInDefault(std::string_view type, std::string_view property) {
    const auto& table = TableOf(type);
    const auto found = table.find(property);
    if (found == table.end())
        return std::nullopt;
    return found->second.value;
}

} // namespace tovimar::platform::access
