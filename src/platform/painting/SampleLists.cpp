#include "platform/painting/SampleData.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>

/// What lists and combo boxes offer and show.
namespace tovimar::platform::painting {

using access::DesignObject;
using access::Records;

namespace {

constexpr std::size_t kMostColumns = 64;
constexpr std::size_t kMostListed = 200;

constexpr int kValueList = 1;

/// Exports spell the kind of a list out or number it.
bool IsValueList(const DesignObject& control) {
    return control.Integer("RowSourceTypeInt", 0) == kValueList ||
           text::EqualsIgnoringCase(control.Text("RowSourceType"), "Value List");
}

/// Entries between semicolons (or commas), quotes around them taken off.
std::vector<std::string> SplitValues(std::string_view list) {
    std::vector<std::string> values;
    std::string value;
    bool quoted = false;
    for (const char letter : list) {
        if (letter == '"')
            quoted = !quoted;
        else if (letter == ';' && !quoted) {
            values.push_back(text::Trim(value));
            value.clear();
        } else
            value += letter;
    }
    if (!text::Trim(value).empty() || !values.empty())
        values.push_back(text::Trim(value));
    return values;
}

/// Twips of each column; -1 for one that the design doesn't measure.
std::vector<int> ColumnWidths(const DesignObject& control, std::size_t columns) {
    std::vector<int> widths(columns, -1);
    const auto parts = text::Split(control.Text("ColumnWidths"), ";");
    for (std::size_t i = 0; i < columns && i < parts.size(); ++i) {
        int width = -1;
        const auto part = text::Trim(parts[i]);
        if (std::from_chars(part.data(), part.data() + part.size(), width).ec == std::errc())
            widths[i] = width;
    }
    return widths;
}

std::size_t ColumnCount(const DesignObject& control) {
    return static_cast<std::size_t>(
        std::clamp(control.Integer("ColumnCount", 1), 1, static_cast<int>(kMostColumns)));
}

/// The first column with a width of its own or of the host's choosing.
std::size_t ShownColumn(const std::vector<int>& widths) {
    const auto shown = std::find_if(widths.begin(), widths.end(), [](int width) { return width != 0; });
    return shown == widths.end() ? 0 : static_cast<std::size_t>(shown - widths.begin());
}

} // namespace

const Records* SampleData::RowSource(const DesignObject& control) const {
    const auto source = control.Text("RowSource");
    if (application_ == nullptr || source.empty() ||
        !text::EqualsIgnoringCase(control.Text("RowSourceType", "Table/Query"), "Table/Query"))
        return nullptr;
    return application_->FindRecords(source, kMostRecords);
}

/// The row of a list's source whose bound column holds a value; null when there is none.
const std::vector<std::string>* SampleData::ListRow(const DesignObject& list,
                                                    const std::string& value) const {
    const auto* records = RowSource(list);
    if (records == nullptr)
        return nullptr;
    const auto bound = static_cast<std::size_t>(std::max(1, list.Integer("BoundColumn", 1))) - 1;
    for (const auto& cells : records->rows)
        if (bound < cells.size() && text::EqualsIgnoringCase(cells[bound], value))
            return &cells;
    return nullptr;
}

/// What a combo box shows for a value: the column shown of the row whose bound column holds the value.
/// A value that isn't in the list shows nothing.
std::string SampleData::LookedUp(const DesignObject& combo, const std::string& value) const {
    const auto widths = ColumnWidths(combo, ColumnCount(combo));
    const auto shown = ShownColumn(widths);
    const auto bound = static_cast<std::size_t>(std::max(1, combo.Integer("BoundColumn", 1))) - 1;
    if (shown == bound)
        return value;
    if (IsValueList(combo)) {
        const auto values = SplitValues(combo.Text("RowSource"));
        for (std::size_t at = 0; at + widths.size() <= values.size(); at += widths.size())
            if (bound < widths.size() && values[at + bound] == value)
                return values[at + shown];
        return value;
    }
    const auto* cells = ListRow(combo, value);
    return cells != nullptr && shown < cells->size() ? (*cells)[shown] : std::string();
}

/// What a combo box may well show in a record of which nothing is known: an entry of its list.
std::optional<std::string> SampleData::Offered(const DesignObject& combo, int row) const {
    const auto widths = ColumnWidths(combo, ColumnCount(combo));
    const auto shown = ShownColumn(widths), number = static_cast<std::size_t>(std::max(0, row));
    if (IsValueList(combo)) {
        const auto values = SplitValues(combo.Text("RowSource"));
        const auto entries = values.size() / widths.size();
        return entries == 0 ? std::nullopt : std::optional(values[number % entries * widths.size() + shown]);
    }
    const auto* records = RowSource(combo);
    if (records == nullptr || records->rows.empty())
        return std::nullopt;
    const auto& cells = records->rows[number % records->rows.size()];
    return shown < cells.size() ? std::optional(cells[shown]) : std::nullopt;
}

SampleData::List SampleData::ListRows(const DesignObject& control) const {
    List list;
    const auto columns = ColumnCount(control);
    list.widths = ColumnWidths(control, columns);
    list.heads = control.Flag("ColumnHeads");
    if (IsValueList(control)) {
        const auto values = SplitValues(control.Text("RowSource"));
        for (std::size_t at = 0; at < values.size() && list.rows.size() < kMostListed; at += columns) {
            const auto end = std::min(values.size(), at + columns);
            list.rows.emplace_back(values.begin() + static_cast<std::ptrdiff_t>(at),
                                   values.begin() + static_cast<std::ptrdiff_t>(end));
        }
        return list;
    }
    const auto* records = RowSource(control);
    if (records == nullptr || records->columns.empty()) {
        list.heads = false;
        return list;
    }
    if (list.heads) {
        auto& heads = list.rows.emplace_back();
        for (std::size_t i = 0; i < columns && i < records->columns.size(); ++i)
            heads.push_back(records->columns[i].name);
    }
    for (const auto& cells : records->rows)
        if (list.rows.size() < kMostListed)
            list.rows.emplace_back(
                cells.begin(), cells.begin() + static_cast<std::ptrdiff_t>(std::min(columns, cells.size())));
    return list;
}

} // namespace tovimar::platform::painting
