#include "platform/painting/SampleData.h"

#include "platform/painting/SampleExpression.h"
#include "platform/painting/SampleText.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>

namespace tovimar::platform::painting {

using access::DesignObject;
using access::Records;

namespace {

constexpr std::size_t kMostColumns = 64;

bool IsValueList(const DesignObject& control) {
    return text::EqualsIgnoringCase(control.Text("RowSourceType"), "Value List");
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

std::string WithoutQuotes(std::string text) {
    if (text.starts_with('='))
        text.erase(0, 1);
    if (text.size() >= 2 && text.front() == '"' && text.back() == '"')
        text = text.substr(1, text.size() - 2);
    return text;
}

bool IsTrueWord(const std::string& word) {
    return text::EqualsIgnoringCase(word, "True") || text::EqualsIgnoringCase(word, "Yes") || word == "-1" ||
           word == "1";
}

bool IsCheck(const DesignObject& control) {
    return control.Is("CheckBox") || control.Is("OptionButton") || control.Is("ToggleButton");
}

} // namespace

SampleData::SampleData(const access::Design& design, access::ApplicationSource* application)
    : application_(application) {
    if (application_ == nullptr || !design.root)
        return;
    const auto source = design.root->Text("RecordSource");
    if (!source.empty())
        records_ = application_->FindRecords(source, kMostRecords);
}

int SampleData::RecordCount() const {
    if (records_ == nullptr || records_->rows.empty())
        return -1;
    return static_cast<int>(std::min<std::size_t>(records_->rows.size(), kMostRecords));
}

std::string SampleData::FieldText(const DesignObject& control, std::string_view field, int row) const {
    const auto name = FieldName(field);
    const auto format = control.Text("Format");
    const int column = records_ == nullptr ? -1 : records_->ColumnIndex(name);
    if (column >= 0 && !records_->rows.empty()) {
        const auto& cells =
            records_->rows[static_cast<std::size_t>(std::max(0, row)) % records_->rows.size()];
        const auto at = static_cast<std::size_t>(column);
        return at < cells.size() ? Formatted(cells[at], format) : std::string();
    }
    auto kind = KindOf(format, name);
    if (column >= 0) {
        switch (records_->columns[static_cast<std::size_t>(column)].type) {
        case Records::Type::Number:
            kind = SampleKind::Number;
            break;
        case Records::Type::Currency:
            kind = SampleKind::Money;
            break;
        case Records::Type::DateTime:
            kind = SampleKind::Date;
            break;
        case Records::Type::Boolean:
            kind = SampleKind::Boolean;
            break;
        default:
            break;
        }
    }
    // Words don't fit into a box made for a figure or two.
    constexpr int kNarrowBox = 850;
    if (kind == SampleKind::Text && !HasSampleWords(name) && control.Integer("Width", 0) < kNarrowBox)
        return std::to_string(row % 4 + 1);
    return SampleText(kind, format, name, row);
}

std::string SampleData::Expression(const DesignObject& control, std::string_view expression, int row) const {
    const auto format = control.Text("Format");
    const auto joined =
        JoinExpression(expression, [&](std::string_view field) { return FieldText(control, field, row); });
    if (joined)
        return Formatted(*joined, format);
    if (IsAggregate(expression))
        return SampleText(SampleKind::Number, format, "", row);
    const auto field = LookedUpField(expression);
    if (!field.empty() && KindOf(format, field) == SampleKind::Text && !HasSampleWords(field))
        return SpacedName(field);
    const auto& name = field.empty() ? control.name : field;
    return SampleText(KindOf(format, name), format, name, row);
}

std::string SampleData::Text(const DesignObject& control, int row) const {
    const auto source = control.Text("ControlSource");
    if (source == "=1" && control.Integer("RunningSum", 0) != 0)
        return std::to_string(row + 1);
    if (source.empty()) {
        const auto standard = control.Text("DefaultValue");
        if (standard.find('(') != std::string::npos || standard.find('[') != std::string::npos)
            return {};
        const auto value = WithoutQuotes(standard);
        return control.Is("ComboBox") && !value.empty() ? LookedUp(control, value, row) : value;
    }
    if (source.starts_with('='))
        return Expression(control, std::string_view(source).substr(1), row);
    const auto value = FieldText(control, source, row);
    return control.Is("ComboBox") ? LookedUp(control, value, row) : value;
}

const Records* SampleData::RowSource(const DesignObject& control) const {
    const auto source = control.Text("RowSource");
    if (application_ == nullptr || source.empty() ||
        !text::EqualsIgnoringCase(control.Text("RowSourceType", "Table/Query"), "Table/Query"))
        return nullptr;
    return application_->FindRecords(source, kMostRecords);
}

/// What a combo box shows for a value: the column shown of the row whose bound column holds the value.
std::string SampleData::LookedUp(const DesignObject& combo, const std::string& value, int row) const {
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
    const auto* records = RowSource(combo);
    if (records != nullptr && !records->rows.empty()) {
        for (const auto& cells : records->rows)
            if (bound < cells.size() && shown < cells.size() && cells[bound] == value)
                return cells[shown];
        const auto& cells = records->rows[static_cast<std::size_t>(std::max(0, row)) % records->rows.size()];
        return shown < cells.size() ? cells[shown] : std::string();
    }
    const auto* name =
        records != nullptr && shown < records->columns.size() ? &records->columns[shown].name : &combo.name;
    return SampleText(SampleKind::Text, {}, *name, row);
}

bool SampleData::Checked(const DesignObject& control, int row) const {
    const auto source = control.Text("ControlSource");
    if (source.empty())
        return IsTrueWord(WithoutQuotes(control.Text("DefaultValue")));
    const int column = records_ == nullptr ? -1 : records_->ColumnIndex(FieldName(source));
    if (column >= 0 && !records_->rows.empty())
        return IsTrueWord(FieldText(control, source, row));
    return row % 2 == 0;
}

std::string SampleData::GroupValue(const DesignObject& group, int row) const {
    const auto source = group.Text("ControlSource");
    if (!source.empty() && !source.starts_with('=') && records_ != nullptr &&
        records_->ColumnIndex(FieldName(source)) >= 0 && !records_->rows.empty())
        return FieldText(group, source, row);
    return WithoutQuotes(group.Text("DefaultValue", source.empty() ? "" : "1"));
}

bool SampleData::AlignsRight(const DesignObject& control) const {
    if (IsCheck(control))
        return false;
    const auto source = control.Text("ControlSource");
    if (source.empty() || control.Is("ComboBox"))
        return false;
    const int column =
        records_ == nullptr || source.starts_with('=') ? -1 : records_->ColumnIndex(FieldName(source));
    if (column >= 0) {
        const auto type = records_->columns[static_cast<std::size_t>(column)].type;
        return type == Records::Type::Number || type == Records::Type::Currency ||
               type == Records::Type::DateTime;
    }
    const auto kind = KindOf(control.Text("Format"),
                             source.starts_with('=') ? std::string_view() : std::string_view(source));
    return kind == SampleKind::Number || kind == SampleKind::Money || kind == SampleKind::Date;
}

SampleData::List SampleData::ListRows(const DesignObject& control) const {
    List list;
    const auto columns = ColumnCount(control);
    list.widths = ColumnWidths(control, columns);
    list.heads = control.Flag("ColumnHeads");
    if (IsValueList(control)) {
        const auto values = SplitValues(control.Text("RowSource"));
        for (std::size_t at = 0; at < values.size() && list.rows.size() < kMostRecords; at += columns) {
            const auto end = std::min(values.size(), at + columns);
            list.rows.emplace_back(values.begin() + static_cast<std::ptrdiff_t>(at),
                                   values.begin() + static_cast<std::ptrdiff_t>(end));
        }
        return list;
    }
    const auto* records = RowSource(control);
    if (records == nullptr || records->columns.empty()) {
        list.heads = false;
        if (!control.Text("RowSource").empty())
            for (int row = 0; row < 4; ++row)
                list.rows.emplace_back(columns, SampleText(SampleKind::Text, {}, control.name, row));
        return list;
    }
    if (list.heads) {
        auto& heads = list.rows.emplace_back();
        for (std::size_t i = 0; i < columns && i < records->columns.size(); ++i)
            heads.push_back(records->columns[i].name);
    }
    for (const auto& cells : records->rows)
        list.rows.emplace_back(cells.begin(),
                               cells.begin() + static_cast<std::ptrdiff_t>(std::min(columns, cells.size())));
    if (records->rows.empty())
        for (int row = 0; row < 4; ++row) {
            auto& cells = list.rows.emplace_back();
            for (std::size_t i = 0; i < columns && i < records->columns.size(); ++i)
                cells.push_back(
                    SampleText(KindOf({}, records->columns[i].name), {}, records->columns[i].name, row));
        }
    return list;
}

} // namespace tovimar::platform::painting
