#include "platform/access/database/PropertyCodes.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <unordered_map>
#include <utility>

namespace tovimar::platform::access {

namespace {

constexpr std::array<std::pair<std::uint16_t, std::string_view>, 37> kObjectTypes{{
    {100, "Label"},
    {101, "Rectangle"},
    {102, "Line"},
    {103, "Image"},
    {104, "CommandButton"},
    {105, "OptionButton"},
    {106, "CheckBox"},
    {107, "OptionGroup"},
    {108, "BoundObjectFrame"},
    {109, "TextBox"},
    {110, "ListBox"},
    {111, "ComboBox"},
    {112, "Subform"},
    {113, "Chart"},
    {114, "UnboundObjectFrame"},
    {118, "PageBreak"},
    {119, "CustomControl"},
    {122, "ToggleButton"},
    {123, "Tab"},
    {124, "Page"},
    {126, "Attachment"},
    {127, "EmptyCell"},
    {128, "WebBrowser"},
    {129, "NavigationControl"},
    {130, "NavigationButton"},
    {133, "Chart"},
    {134, "EdgeBrowser"},
    {150, "Form"},
    {151, "Report"},
    {152, "Section"},
    {153, "FormHeader"},
    {154, "FormFooter"},
    {155, "PageHeader"},
    {156, "PageFooter"},
    {157, "BreakHeader"},
    {158, "BreakFooter"},
    {159, "BreakLevel"},
}};

/// Kinds of values: B flag, y byte, i integer, l long or colour, f float, d double, g GUID, t text,
/// m long text, x bytes, k macro, - not met yet.
struct Property {
    std::uint16_t code;
    char type;
    std::string_view name;
};

// clang-format off
constexpr auto kProperties = std::to_array<Property>({
    {2, 'y', "AccessKey"}, {3, 'B', "AddColon"}, {4, 'y', "SpecialEffect"}, {5, '-', "AutoRepeat"},
    {6, 'B', "AutoResize"}, {7, 't', "Picture"}, {8, 'l', "BorderColor"}, {9, 'y', "BorderStyle"},
    {10, 'y', "BorderWidth"}, {11, 'y', "BorderLineStyle"}, {12, 'i', "Bottom"}, {13, '-', "BoundColumn"},
    {14, 'B', "CanGrow"}, {15, 'B', "RepeatSection"}, {16, 'B', "CanShrink"}, {17, 'm', "Caption"},
    {18, 't', "ColumnWidths"}, {19, 'B', "RecordSelectors"}, {20, 't', "Name"},
    {22, 't', "EventProcPrefix"}, {23, 'm', "DefaultValue"}, {25, 'B', "Enabled"},
    {27, 'm', "ControlSource"}, {28, 'l', "BackColor"}, {29, 'y', "BackStyle"}, {30, 'B', "AllowFilters"},
    {31, 'B', "ShortcutMenu"}, {33, 'B', "FontItalic"}, {34, 't', "FontName"}, {35, 'i', "FontSize"},
    {36, 'B', "FontUnderline"}, {37, 'i', "FontWeight"}, {38, 't', "Format"}, {40, 'y', "PageFooter"},
    {41, 'i', "GridX"}, {42, 'i', "GridY"}, {43, 'y', "PageHeader"}, {44, 'i', "Height"},
    {46, '-', "Transparent"}, {49, 't', "LinkChildFields"}, {50, 't', "LinkMasterFields"},
    {51, 'y', "LabelAlign"}, {52, 'i', "LabelX"}, {53, 'i', "LabelY"}, {54, 'i', "Left"},
    {55, 'B', "LineSlant"}, {56, 'B', "Locked"}, {57, 'B', "AutoLabel"}, {58, 'l', "OptionValue"},
    {61, '-', "ValidationText"}, {62, 'B', "Modal"}, {67, 'B', "LimitToList"}, {68, 'B', "AutoExpand"},
    {70, 'i', "ColumnCount"}, {71, 'y', "DecimalPlaces"}, {72, 't', "InputMask"},
    {74, 'B', "EnterKeyBehavior"}, {75, 'B', "KeepTogether"}, {76, 't', "OLEClass"}, {77, 'm', "OnOpen"},
    {78, 'm', "OnClose"}, {79, 'm', "OnDelete"}, {80, 'm', "OnFormat"}, {82, 'm', "OnPrint"},
    {83, 'm', "OnPage"}, {84, 'm', "OnRetreat"}, {85, 'm', "BeforeUpdate"}, {86, 'm', "AfterUpdate"},
    {87, 'm', "OnCurrent"}, {89, 'y', "SizeMode"}, {90, 'B', "PopUp"}, {91, 'm', "RowSource"},
    {92, 'y', "RowSourceTypeInt"}, {93, 't', "RowSourceType"}, {94, 'B', "MaxButton"},
    {95, 'B', "MinButton"}, {97, 'B', "ControlBox"}, {99, 'x', "ObjectPalette"},
    {100, 'x', "PaintPalette"}, {104, 'm', "OnKeyDown"}, {105, 'm', "OnKeyUp"}, {106, 'm', "OnKeyPress"},
    {107, 'm', "OnMouseDown"}, {108, 'm', "OnMouseUp"}, {109, 'm', "OnMouseMove"}, {110, 'm', "OnTimer"},
    {111, 'l', "TimerInterval"}, {112, 'm', "OnActivate"}, {113, 'm', "OnDeactivate"},
    {114, 'm', "OnChange"}, {115, 'm', "OnGotFocus"}, {116, 'm', "OnLostFocus"}, {117, 'm', "OnResize"},
    {119, 'm', "OnError"}, {120, 'm', "OnNotInList"}, {121, 'm', "OnNoData"}, {122, 'm', "BeforeInsert"},
    {123, 'm', "AfterInsert"}, {124, 'm', "BeforeDelConfirm"}, {125, 'm', "AfterDelConfirm"},
    {126, 'm', "OnClick"}, {127, 'm', "OnLoad"}, {128, 'm', "OnUnload"}, {129, 'i', "Right"},
    {130, 'y', "RunningSum"}, {131, 'B', "ColumnHeads"}, {132, 't', "SourceObject"},
    {135, 't', "StatusBarText"}, {136, 'y', "TextAlign"}, {141, 'i', "Top"}, {143, 'B', "LayoutForPrint"},
    {145, '-', "ValidationRule"}, {146, 'y', "ViewsAllowed"}, {147, 'y', "DefaultView"},
    {148, 'B', "Visible"}, {149, 'y', "DisplayWhen"}, {150, 'i', "Width"}, {151, 'y', "ForceNewPage"},
    {152, 'y', "ScrollBars"}, {153, 'i', "ListRows"}, {154, 'i', "ListWidth"}, {156, 'm', "RecordSource"},
    {157, 'i', "BreakLevel"}, {158, 'i', "ItemSuffix"}, {159, 'y', "OverlapFlags"},
    {160, 't', "DatasheetFontName"}, {161, 'i', "DatasheetFontHeight"}, {165, 'i', "ColumnOrder"},
    {166, 'i', "ColumnWidth"}, {168, 'i', "RowHeight"}, {171, 'x', "OleData"}, {174, 'B', "SortOrder"},
    {175, 'B', "GroupHeader"}, {176, 'B', "GroupFooter"}, {177, 'i', "GroupOn"},
    {178, 'l', "GroupInterval"}, {188, 'x', "PictureData"}, {189, 'x', "PrtMip"}, {190, 'x', "PrtDevMode"},
    {191, 'x', "PrtDevNames"}, {193, 'y', "TextFontCharSet"}, {194, 'y', "TabularCharSet"},
    {204, 'l', "ForeColor"}, {219, '-', "HelpContextId"}, {220, 'B', "Default"}, {221, 'B', "Cancel"},
    {222, '-', "OnEnter"}, {223, '-', "OnExit"}, {224, 'm', "OnDblClick"}, {231, 'y', "NewRowOrCol"},
    {243, 'y', "TextFontFamily"}, {244, 'y', "TabularFamily"}, {245, 'm', "Filter"},
    {261, 'i', "TabIndex"}, {262, 'B', "TabStop"}, {266, 'm', "Tag"}, {274, 't', "Class"},
    {278, 'B', "AutoCenter"}, {279, 'B', "NavigationButtons"}, {282, 'y', "DateGrouping"},
    {283, 'y', "GrpKeepTogether"}, {292, 'B', "AllowDeletions"}, {293, 'y', "MultiSelect"},
    {294, '-', "TripleState"}, {304, '-', "ShortcutMenuBar"}, {305, '-', "FilterLookup"},
    {309, 'y', "PictureAlignment"}, {312, 'y', "PictureSizeMode"}, {313, 'B', "PictureTiling"},
    {314, 'B', "DividingLines"}, {317, 't', "ControlTipText"}, {318, 'y', "DatasheetGridlinesBehavior"},
    {319, 'l', "DatasheetGridlinesColor"}, {326, 'B', "AllowAdditions"}, {329, 'y', "OldBorderStyle"},
    {330, 'y', "Cycle"}, {331, 'm', "OrderBy"}, {332, 'B', "FilterOn"}, {333, 'm', "OnFilter"},
    {334, 'm', "OnApplyFilter"}, {336, 'B', "OrderByOn"}, {339, 'B', "AllowEdits"},
    {340, 'B', "AllowAutoCorrect"}, {341, 'y', "PictureType"}, {343, '-', "HyperlinkAddress"},
    {345, 'm', "BaseInfo"}, {346, 'm', "ColumnInfo"}, {347, 'm', "HyperlinkSubAddress"},
    {354, 'x', "ConditionalFormat"}, {356, 'y', "IMEMode"}, {358, 'B', "FELineBreak"},
    {364, 'd', "RecSrcDt"}, {367, '-', "ReadingOrder"}, {368, '-', "KeyboardLanguage"},
    {371, '-', "ScrollBarAlign"}, {372, '-', "NumeralShapes"}, {373, 'B', "AllowDesignChanges"},
    {375, 'm', "OnDirty"}, {376, 'g', "GUID"}, {377, 'x', "NameMap"}, {379, 'y', "IMESentenceMode"},
    {384, 'i', "LeftMargin"}, {385, 'i', "TopMargin"}, {386, '-', "LineSpacing"},
    {388, 'i', "RightMargin"}, {389, 'i', "BottomMargin"}, {396, 'B', "IsHyperlink"}, {404, 'm', "OnUndo"},
    {405, 'm', "OnRecordExit"}, {421, 'B', "AllowFormView"}, {422, 'B', "AllowDatasheetView"},
    {423, 'B', "AllowPivotTableView"}, {424, 'B', "AllowPivotChartView"}, {425, 'm', "OnConnect"},
    {426, 'm', "OnDisconnect"}, {427, '-', "PivotTableChange"}, {428, 'm', "OnQuery"},
    {429, 'm', "BeforeQuery"}, {430, 'm', "OnSelectionChange"}, {431, 'm', "CommandBeforeExecute"},
    {432, 'm', "CommandChecked"}, {433, 'm', "CommandEnabled"}, {434, 'm', "CommandExecute"},
    {435, 'm', "OnDataSetChange"}, {436, 'm', "OnDataChange"}, {437, 'm', "AfterFinalRender"},
    {438, 'm', "AfterRender"}, {439, 'm', "AfterLayout"}, {440, 'm', "BeforeRender"},
    {441, 'm', "OnMouseWheel"}, {442, 'm', "OnViewChange"}, {443, 'm', "BeforeScreenTip"},
    {446, 'B', "AsianLineBreak"}, {447, 'm', "SmartTags"}, {450, 'i', "GroupTable"},
    {452, 'B', "FilterOnLoad"}, {453, 'B', "OrderByOnLoad"}, {454, 'i', "LeftPadding"},
    {455, 'i', "TopPadding"}, {456, 'i', "RightPadding"}, {457, 'i', "BottomPadding"},
    {458, 'y', "GridlineStyleLeft"}, {459, 'y', "GridlineStyleTop"}, {460, 'y', "GridlineStyleRight"},
    {461, 'y', "GridlineStyleBottom"}, {462, 'l', "GridlineColor"}, {463, 'y', "GridlineWidthLeft"},
    {464, 'y', "GridlineWidthTop"}, {465, 'y', "GridlineWidthRight"}, {466, 'y', "GridlineWidthBottom"},
    {475, 'B', "AutoHeight"}, {476, 'y', "TextFormat"}, {477, 'i', "VerticalAnchor"},
    {478, 'i', "HorizontalAnchor"}, {486, 'i', "ShowDatePicker"}, {490, 'k', "OnClickEmMacro"},
    {491, 'k', "OnDblClickEmMacro"}, {502, 'k', "OnNotInListEmMacro"}, {510, 'k', "OnOpenEmMacro"},
    {556, 'B', "AllowValueListEdits"}, {557, 'm', "ListItemsEditForm"}, {559, 'B', "ShowPageMargins"},
    {560, 'B', "FitToPage"}, {561, 'y', "DisplayOnSharePointSite"}, {563, 'B', "AllowLayoutView"},
    {565, 'l', "AggregateType"}, {567, 'k', "OnCurrentEmMacro"}, {568, 'B', "InheritValueList"},
    {569, 'm', "OnPaint"}, {571, 'l', "AlternateBackColor"}, {572, 'l', "DatasheetAlternateBackColor"},
    {574, 'x', "ImageData"}, {580, 'l', "DatasheetBackColor12"}, {581, 'l', "DatasheetForeColor12"},
    {582, 'l', "DatasheetGridlinesColor12"}, {584, '-', "CursorOnHover"}, {585, 't', "RibbonName"},
    {586, 'i', "LayoutCachedLeft"}, {587, 'i', "LayoutCachedTop"}, {588, 'i', "LayoutCachedWidth"},
    {589, 'i', "LayoutCachedHeight"}, {591, '-', "DisplayAsHyperlink"}, {592, 'B', "FitToScreen"},
    {593, '-', "PictureCaptionArrangement"}, {594, '-', "Alignment"}, {595, 'i', "RowStart"},
    {596, 'i', "RowEnd"}, {597, 'i', "ColumnStart"}, {598, 'i', "ColumnEnd"}, {599, 'i', "LayoutGroup"},
    {603, '-', "ScrollTop"}, {604, '-', "ScrollLeft"}, {608, '-', "OnDocumentComplete"},
    {610, '-', "OnNavigateError"}, {615, 'l', "ThemeFontIndex"}, {616, 'l', "BackThemeColorIndex"},
    {617, 'f', "BackTint"}, {618, 'f', "BackShade"}, {619, 'l', "BorderThemeColorIndex"},
    {620, 'f', "BorderTint"}, {621, 'f', "BorderShade"}, {622, 'l', "ForeThemeColorIndex"},
    {623, 'f', "ForeTint"}, {624, 'f', "ForeShade"}, {625, 'l', "GridlineThemeColorIndex"},
    {627, 'f', "GridlineShade"}, {628, 'l', "AlternateBackThemeColorIndex"},
    {630, 'f', "AlternateBackShade"}, {633, 'x', "ConditionalFormat14"},
    {639, 'm', "NavigationSubformName"}, {642, 'm', "NavigationTargetName"}, {645, 'i', "Span"},
    {648, 'B', "UseTheme"}, {649, 'l', "Shape"}, {650, 'l', "Bevel"}, {651, '-', "Glow"},
    {652, 'l', "HoverColor"}, {653, 'l', "HoverThemeColorIndex"}, {654, 'f', "HoverTint"},
    {655, '-', "HoverShade"}, {656, 'l', "PressedColor"}, {657, 'l', "PressedThemeColorIndex"},
    {658, 'f', "PressedTint"}, {659, 'f', "PressedShade"}, {660, 'l', "HoverForeColor"},
    {661, 'l', "HoverForeThemeColorIndex"}, {662, 'f', "HoverForeTint"}, {663, '-', "HoverForeShade"},
    {664, 'l', "PressedForeColor"}, {665, 'l', "PressedForeThemeColorIndex"},
    {666, 'f', "PressedForeTint"}, {667, '-', "PressedForeShade"}, {668, '-', "Shadow"},
    {669, '-', "SoftEdges"}, {678, 'x', "PrtDevModeW"}, {679, 'x', "PrtDevNamesW"},
    {689, '-', "QuickStyle"}, {690, '-', "QuickStyleMask"}, {692, 'l', "Gradient"},
    {697, 'B', "ShowPageHeaderAndPageFooter"}, {699, 'l', "WebImagePaddingTop"},
    {700, 'l', "WebImagePaddingLeft"}, {701, 'l', "WebImagePaddingRight"},
    {702, 'l', "WebImagePaddingBottom"}, {703, 'l', "DatasheetBackThemeColorIndex"},
    {736, 'B', "Overlaps"},
});

/// "slot:code" of each kind; G stands for the place and size that most kinds keep in the same slots.
struct Slots {
    std::uint16_t objectType;
    std::string_view codes;
};
constexpr auto kSlots = std::to_array<Slots>({
    {100, "G 0:148 1:33 2:36 48:149 49:4 50:29 51:329 52:10 53:159 54:193 55:136 56:243 57:11 58:367 "
         "59:372 100:35 101:37 103:384 104:385 105:386 106:388 107:389 156:28 157:8 158:204 221:17 "
         "222:34 223:126 228:266 229:22 230:304 231:317 234:376"},
    {101, "G 0:148 48:149 49:4 50:29 51:329 52:10 53:159 54:11 156:28 157:8 221:126 223:107 225:109 "
         "226:266 228:376"},
    {102, "G 0:148 1:55 48:149 50:10 51:159 52:11 53:4 156:8 221:266 223:376"},
    {103, "G 0:148 1:313 48:149 50:29 51:329 52:10 53:11 54:89 55:309 56:341 157:8 221:126 223:188 "
         "227:99 228:266 230:304 231:317 232:7 235:376"},
    {104, "G 0:46 1:5 2:220 3:221 4:148 7:3 8:33 9:36 10:262 48:149 49:159 50:2 52:193 53:243 54:367 "
         "55:341 103:35 104:37 105:261 156:219 157:204 221:17 222:135 223:126 227:188 228:34 237:99 "
         "238:266 239:22 240:304 241:317 243:343 244:347 245:376"},
    {105, "G 0:148 1:25 2:56 6:3 7:262 8:294 48:149 49:4 50:159 53:329 54:10 55:11 56:367 101:166 "
         "103:52 104:53 105:261 156:58 158:8 221:27 222:135 223:145 224:61 230:23 239:126 240:266 "
         "242:304 243:317 244:376"},
    {106, "G 0:148 1:25 2:56 6:3 7:262 8:294 48:149 49:4 50:159 53:329 54:10 55:11 56:367 101:166 "
         "103:52 104:53 105:261 156:58 158:8 221:27 222:135 223:145 224:61 230:23 239:126 240:266 "
         "242:304 243:317 244:376"},
    {107, "G 0:148 1:25 2:56 5:57 7:262 48:149 49:4 50:29 51:329 52:10 53:159 54:2 56:11 105:261 156:28"
         " 157:8 221:27 222:135 223:145 224:61 226:86 230:23 239:126 240:266 242:304 243:317 244:376"},
    {108, "G 0:148 1:25 2:56 4:57 5:3 7:262 48:89 49:149 50:4 51:329 52:10 53:159 55:51 56:11 58:29 "
         "101:166 103:52 105:261 156:8 221:27 222:135 234:126 239:266 243:304 244:317 245:376"},
    {109, "G 0:148 1:25 2:56 4:14 5:16 7:57 8:3 9:33 10:36 12:262 13:74 16:340 17:358 18:396 48:71 "
         "49:149 50:152 51:130 52:4 53:329 54:10 55:159 56:2 57:51 58:193 59:136 60:243 61:11 62:356 "
         "63:367 64:368 66:371 67:29 68:305 69:372 70:379 101:166 102:165 103:52 105:35 106:37 107:261"
         " 109:384 110:385 111:386 112:388 113:389 156:28 157:8 159:204 221:27 222:38 223:135 224:145 "
         "225:61 226:85 227:86 230:224 231:23 232:34 233:72 242:126 244:266 245:22 247:304 248:317 "
         "249:354 250:376"},
    {110, "0:131 1:148 2:25 3:56 7:3 8:33 9:36 10:262 48:92 49:149 50:4 51:159 54:193 55:243 56:293 "
         "57:356 58:367 59:371 61:329 62:10 63:11 64:372 65:379 96:70 97:54 98:141 99:150 100:44 "
         "102:166 104:52 106:35 107:37 108:261 156:13 157:28 159:204 160:8 221:27 222:93 223:91 224:18"
         " 225:135 226:145 227:61 228:85 229:86 232:224 233:23 234:34 243:126 244:266 246:304 247:317 "
         "248:376"},
    {111, "0:131 1:67 2:148 3:25 4:56 8:3 10:36 11:68 12:262 14:340 48:92 49:149 50:4 51:329 52:10 "
         "53:159 54:2 56:193 57:136 58:243 59:11 60:356 61:367 62:368 64:371 65:29 66:71 67:372 68:379"
         " 96:70 97:153 98:154 99:54 100:141 101:150 102:44 104:166 105:165 106:52 108:35 110:261 "
         "156:13 157:28 158:8 160:204 188:346 190:376 221:27 222:93 223:91 224:18 225:135 226:145 "
         "227:61 228:85 229:86 233:23 234:34 243:126 245:266 246:120 247:22 248:304 249:317 250:38 "
         "252:345"},
    {112, "G 0:148 1:25 2:56 4:16 6:3 7:262 48:149 51:159 52:329 53:4 54:10 55:11 100:261 156:8 221:132"
         " 222:49 223:50 224:135 227:266 228:22 229:376"},
    {113, "1:131 50:92 51:4 53:329 55:159 97:54 98:141 99:150 100:44 103:261 157:8 159:204 221:171 "
         "222:93 223:91 224:49 225:50 227:274 239:266 240:76 245:376"},
    {114, "1:131 50:92 51:4 53:329 55:159 97:54 98:141 99:150 100:44 103:261 157:8 159:204 221:171 "
         "222:93 223:91 224:49 225:50 227:274 239:266 240:76 245:376"},
    {118, "97:141 98:150 221:266 223:376"},
    {119, "G 0:148 1:25 4:262 48:89 50:4 52:329 54:159 100:101 101:261 157:8 221:171 233:76 239:274 "
         "240:376"},
    {122, "G 0:148 1:25 2:56 6:3 7:33 8:36 9:262 10:294 48:149 49:159 50:2 52:193 105:35 106:37 156:58 "
         "158:204 222:135 223:145 224:61 230:23 231:17 233:34 242:126 244:266 246:304 247:317 249:376"},
    {123, "G 0:148 1:25 2:33 3:36 4:262 48:149 49:159 50:193 52:243 53:29 100:35 101:37 102:261 221:135"
         " 222:224 223:34 230:126 231:114 232:266 234:304 235:376"},
    {124, "G 49:159 156:8 227:266 228:22 232:17 234:376"},
    {126, "G 50:29 51:329 53:11 54:309 55:312 157:8 221:27 240:22 243:376"},
    {127, "G 232:376"},
    {128, "52:329 98:150 99:44"},
    {129, "G 50:329 51:10 52:159 57:11 157:8 159:204 239:376"},
    {130, "G 49:159 53:341 157:204 221:17 240:317 242:376"},
    {150, "1:30 2:143 3:6 4:90 5:62 6:19 7:163 11:94 12:95 13:97 14:31 15:278 16:279 17:292 19:313 "
         "20:314 21:326 24:332 25:336 26:339 28:373 48:147 50:152 51:146 52:43 53:40 55:194 56:244 "
         "57:9 58:282 60:283 61:309 63:312 66:318 67:330 68:341 97:41 98:42 99:150 100:168 101:161 "
         "103:158 104:54 105:141 106:129 107:12 156:219 157:111 160:319 188:100 189:128 190:123 "
         "191:124 192:125 193:266 194:121 195:245 198:83 199:188 200:331 201:333 202:334 203:7 206:364"
         " 207:375 208:376 209:377 220:156 221:17 222:87 223:122 224:79 225:85 226:86 227:77 228:78 "
         "231:160 234:189 235:190 236:191 237:104 238:105 239:106 240:107 241:108 242:109 243:110 "
         "244:112 245:113 246:115 247:116 248:117 249:126 250:224 251:127 252:119"},
    {151, "1:30 2:143 3:6 4:90 5:62 6:19 7:163 11:94 12:95 13:97 14:31 15:278 16:279 17:292 19:313 "
         "20:314 21:326 24:332 25:336 26:339 28:373 48:147 50:152 51:146 52:43 53:40 55:194 56:244 "
         "57:9 58:282 60:283 61:309 63:312 66:318 67:330 68:341 97:41 98:42 99:150 100:168 101:161 "
         "103:158 104:54 105:141 106:129 107:12 156:219 157:111 160:319 188:100 189:128 190:123 "
         "191:124 192:125 193:266 194:121 195:245 198:83 199:188 200:331 201:333 202:334 203:7 206:364"
         " 207:375 208:376 209:377 220:156 221:17 222:87 223:122 224:79 225:85 226:86 227:77 228:78 "
         "231:160 234:189 235:190 236:191 237:104 238:105 239:106 240:107 241:108 242:109 243:110 "
         "244:112 245:113 246:115 247:116 248:117 249:126 250:224 251:127 252:119"},
    {152, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {153, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {154, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {155, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {156, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {157, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {158, "0:75 1:148 2:14 3:16 4:15 48:151 49:231 50:149 51:4 96:44 97:157 156:28 220:80 221:82 222:84"
         " 223:20 224:266 227:107 228:108 229:109 231:376"},
    {159, "0:174 1:175 2:176 48:75 96:177 156:178 220:27"},
});
// clang-format on
constexpr std::string_view kGeometrySlots = "96:54 97:141 98:150 99:44";
constexpr std::pair<std::uint32_t, std::uint16_t> kNameSlot{220, 20};

const Property* FindProperty(std::uint16_t code) {
    const auto found =
        std::lower_bound(kProperties.begin(), kProperties.end(), code,
                         [](const Property& left, std::uint16_t right) { return left.code < right; });
    return found != kProperties.end() && found->code == code ? &*found : nullptr;
}

using SlotTable = std::unordered_map<std::uint32_t, std::uint16_t>;

void AddSlots(SlotTable& table, std::string_view codes) {
    while (!codes.empty()) {
        const auto end = std::min(codes.find(' '), codes.size());
        const auto pair = codes.substr(0, end);
        if (const auto colon = pair.find(':'); colon != std::string_view::npos) {
            std::uint32_t slot = 0;
            std::uint16_t code = 0;
            std::from_chars(pair.data(), pair.data() + colon, slot);
            std::from_chars(pair.data() + colon + 1, pair.data() + pair.size(), code);
            table[slot] = code;
        }
        codes.remove_prefix(std::min(end + 1, codes.size()));
    }
}

const SlotTable& SlotsOf(std::uint16_t objectType) {
    static const auto kTables = [] {
        std::unordered_map<std::uint16_t, SlotTable> tables;
        for (const auto& [type, codes] : kSlots) {
            auto& table = tables[type];
            table[kNameSlot.first] = kNameSlot.second;
            if (codes.starts_with('G'))
                AddSlots(table, kGeometrySlots);
            AddSlots(table, codes);
        }
        return tables;
    }();
    static const SlotTable kNone;
    const auto found = kTables.find(objectType);
    return found == kTables.end() ? kNone : found->second;
}

} // namespace

std::string ObjectTypeName(std::uint16_t type) {
    for (const auto& [number, name] : kObjectTypes)
        if (number == type)
            return std::string(name);
    return "Object" + std::to_string(type);
}

std::uint16_t ObjectTypeNumber(std::string_view name) {
    for (const auto& [number, known] : kObjectTypes)
        if (known == name)
            return number;
    return 0xFFFF;
}

bool IsKnownProperty(std::uint16_t code) {
    return FindProperty(code) != nullptr;
}

std::string PropertyName(std::uint16_t code) {
    const auto* property = FindProperty(code);
    return property ? std::string(property->name) : "Unknown" + std::to_string(code);
}

ValueKind TypeOfCode(std::uint16_t code) {
    const auto* property = FindProperty(code);
    switch (property ? property->type : '-') {
    case 't':
        return ValueKind::Text;
    case 'm':
        return ValueKind::LongText;
    case 'g':
        return ValueKind::Guid;
    case 'd':
        return ValueKind::Double;
    case 'k':
        return ValueKind::Macro;
    default:
        return ValueKind::Binary;
    }
}

std::uint16_t CodeOfSlot(std::uint16_t objectType, std::uint32_t slot) {
    const auto& slots = SlotsOf(objectType);
    const auto found = slots.find(slot);
    return found == slots.end() ? kUnknownCode : found->second;
}

} // namespace tovimar::platform::access
