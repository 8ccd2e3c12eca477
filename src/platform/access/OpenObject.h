#pragma once

#include "platform/access/Design.h"
#include "platform/access/FormLayout.h"
#include "platform/windowing/WindowSystem.h"

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace tovimar::platform::access {

/// First records of a table or query, for the sample text of bound controls.
struct Records {
    enum class Type { Text, Memo, Number, Currency, DateTime, Boolean, Binary, Unknown };
    struct Column {
        std::string name;
        Type type = Type::Unknown;
    };
    std::vector<Column> columns;
    /// Text of each cell as a person reads it; empty for null.
    std::vector<std::vector<std::string>> rows;
    /// Index of a column ignoring case, -1 when absent.
    int ColumnIndex(std::string_view name) const;
};

/// What an open object needs of its application: the designs of its subforms and the data behind it.
class ApplicationSource {
public:
    virtual ~ApplicationSource() = default;
    /// Null when there is no such object or its design isn't known. Names ignore case.
    virtual const Design* FindDesign(ObjectKind kind, const std::string& name) = 0;
    /// Columns and at most `rows` records of a table, a query or a simple SELECT; null when they can't be
    /// had. Columns without rows when only the definition is at hand. Kept for the whole run.
    virtual const Records* FindRecords(const std::string& recordSource, int rows) = 0;
    /// Bytes of a shared picture of the application by its name; empty when absent.
    virtual std::string FindPicture(const std::string& name) = 0;
    /// The design library's theme colours, 0x00RRGGBB: text, background, text 2, background 2, accents 1 to 6
    /// in the order of the theme colour index.
    virtual const std::vector<std::uint32_t>& ThemeColors() = 0;
};

/// An open form or report: what its automation object and its window share.
struct OpenObject {
    const Design* design = nullptr;
    ApplicationSource* application = nullptr; ///< not owned
    View view = View::Form;
    bool hidden = false;
    WindowHandle window = 0;
    /// Client area in pixels; of the form within a subform, the whole subform control.
    int insideWidth = 0;
    int insideHeight = 0;
    /// Page shown by each tab control, from 0; absent means the first.
    std::map<const DesignObject*, int> currentPages;

    FrameInput FrameSettings() const;
    /// Heights of sections 0 to 4 as they are shown in this view: a hidden section, a page section in form
    /// view, and header and footer of a datasheet are absent. The detail of a continuous form counts all
    /// records shown, so that its footer's controls lie below the last of them.
    SectionHeights Sections(const SystemMetrics& metrics) const;
    /// Left and top of the first of each section that a preview prints, within the client area; of a report
    /// within a report from its frame. Empty in other views.
    std::map<int, std::pair<int, int>> PrintedSections(const SystemMetrics& metrics, bool nested) const;
    /// Records shown below each other: 1 but in the form view of a continuous form.
    int ShownRecords(const SystemMetrics& metrics) const;
};

/// The controls that are columns of a form's datasheet, from the left: rising `ColumnOrder`, equal ones as
/// they stand in the design.
std::vector<const DesignObject*> DatasheetColumns(const Design& design);
/// Width of a column in twips; an inch where the design leaves it to the host, 0 for a hidden column.
std::int32_t DatasheetColumnWidth(const DesignObject& control);

/// Client area that shows the whole object in its view, so that nothing is cut off: in form view the
/// sections with record selector, scroll bars and navigation buttons, in design view the design surface,
/// in preview a sheet of paper. A form's own window size counts where it is larger and the form doesn't
/// fit its window to its content (`AutoResize`).
void SetInitialSize(OpenObject& object, const SystemMetrics& metrics);

/// The window of an open object; it reads the object when it is captured, so the object must outlive it.
/// Class "OForm" or "OReport"; caption the object's caption, in design view name and kind.
std::unique_ptr<Window> MakeObjectWindow(const OpenObject& object, const SystemMetrics& metrics);

/// The page area of a report in preview, class "OPrtPrevPage": the window above without its frame. Open it
/// below the report's window, with its handle as `parent`. Reads the object as the window above does.
std::unique_ptr<Window> MakePreviewPageWindow(const OpenObject& object, const SystemMetrics& metrics);

/// The relationships of the database as a picture of table boxes joined by lines; class "OSysRel".
struct RelationshipTable {
    std::string name;
    std::vector<std::string> fields;
    std::vector<bool> inPrimaryKey;
};
struct RelationshipLine {
    std::string table, field, foreignTable, foreignField;
    bool oneToOne = false;
};
std::unique_ptr<Window> MakeRelationshipsWindow(const std::vector<RelationshipTable>& tables,
                                                const std::vector<RelationshipLine>& lines,
                                                const SystemMetrics& metrics);

} // namespace tovimar::platform::access
