#include "platform/painting/SampleData.h"

#include "platform/painting/FieldName.h"
#include "platform/painting/SampleText.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>
#include <numeric>

namespace tovimar::platform::painting {

using access::Datum;
using access::DesignObject;
using access::Records;

namespace {

constexpr std::size_t kMostColumns = 64;
constexpr std::size_t kMostListed = 200;

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

/// What expressions of an object's controls find around them.
class SampleData::Scope : public access::ExpressionScope {
public:
    Scope(const SampleData& data, const DesignObject& control) : data_(data), control_(control) {}

    std::optional<Datum> Value(const access::NamePath& name, int row) const override {
        if (name.size() == 1)
            return Named(name[0], row);
        if (const auto value = InSubform(name))
            return value;
        if (name.size() > 2 && text::EqualsIgnoringCase(name[name.size() - 2], "Column"))
            return InList(name[name.size() - 3], name.back(), row);
        const bool own =
            text::EqualsIgnoringCase(name[0], "Me") ||
            (name.size() > 2 && text::EqualsIgnoringCase(name[name.size() - 2], data_.design_.name));
        return own || name.size() == 2 ? Named(name.back(), row) : data_.Guess(control_, name.back(), row);
    }
    int Rows() const override {
        const int known = data_.RecordCount();
        return known < 0 ? kSampleRows : data_.added_ > 0 ? std::min(data_.added_, known) : known;
    }
    int FirstRow() const override { return data_.firstAdded_; }
    std::optional<Datum> LookUp(const std::string& function, const std::string& expression,
                                const std::string& domain) const override;

private:
    static constexpr int kSampleRows = 4;
    static constexpr int kDeepest = 4;

    std::optional<Datum> Named(const std::string& name, int row) const {
        if (auto value = data_.FieldValue(name, row))
            return value;
        if (text::EqualsIgnoringCase(name, "Page") || text::EqualsIgnoringCase(name, "Pages"))
            return Datum::Number(1);
        const auto* control = data_.FindControl(name);
        if (control != nullptr && control != &control_ && data_.asked_ < kDeepest) {
            ++data_.asked_;
            auto value = data_.ValueOf(*control, row);
            --data_.asked_;
            return value;
        }
        return data_.Guess(control_, name, row);
    }

    /// "[Lines].[Form]![Total]": a control of the object that a subform shows.
    std::optional<Datum> InSubform(const access::NamePath& name) const {
        const auto* subform = data_.FindControl(name[name.size() > 2 ? name.size() - 3 : 0]);
        if (subform == nullptr || !subform->Is("Subform") || data_.application_ == nullptr ||
            data_.depth_ >= kDeepest)
            return std::nullopt;
        const auto source = subform->Text("SourceObject");
        const auto* design =
            data_.application_->FindDesign(data_.design_.kind, source.substr(source.find('.') + 1));
        if (design == nullptr || !design->root)
            return std::nullopt;
        const SampleData inner(*design, data_.application_, data_.LinksOf(*subform, 0), data_.depth_ + 1);
        const auto* control = inner.FindControl(name.back());
        return control == nullptr ? inner.FieldValue(name.back(), 0)
                                  : std::optional<Datum>(inner.ValueOf(*control, 0));
    }

    /// A column, counted from 0, of the row that a combo box shows.
    std::optional<Datum> InList(const std::string& combo, const std::string& column, int row) const {
        const auto* control = data_.FindControl(combo);
        const auto at = Datum::Text(column).AsNumber();
        const auto* cells =
            control == nullptr ? nullptr : data_.ListRow(*control, data_.ValueOf(*control, row).AsText());
        if (cells == nullptr || !at || *at < 0 || *at >= static_cast<double>(cells->size()))
            return std::nullopt;
        const auto& cell = (*cells)[static_cast<std::size_t>(*at)];
        const auto number = Datum::Text(cell).AsNumber();
        return number ? Datum::Number(*number) : cell.empty() ? Datum{} : Datum::Text(cell);
    }

    const SampleData& data_;
    const DesignObject& control_;
};

namespace {

/// All records of a table or query, for a function that looks into it.
class DomainScope : public access::ExpressionScope {
public:
    explicit DomainScope(const Records& records) : records_(records) {}
    std::optional<Datum> Value(const access::NamePath& name, int row) const override {
        const int column = records_.ColumnIndex(name.back());
        if (column < 0)
            return std::nullopt;
        const auto at = static_cast<std::size_t>(column);
        const auto& cells = records_.rows[static_cast<std::size_t>(row)];
        return at < cells.size() ? access::DatumOf(cells[at], records_.columns[at].type) : Datum{};
    }
    int Rows() const override { return static_cast<int>(records_.rows.size()); }

private:
    const Records& records_;
};

} // namespace

std::optional<Datum> SampleData::Scope::LookUp(const std::string& function, const std::string& expression,
                                               const std::string& domain) const {
    const auto* records =
        data_.application_ == nullptr ? nullptr : data_.application_->FindRecords(domain, kMostRecords);
    const auto field = FieldName(expression);
    if (records != nullptr && !records->rows.empty()) {
        const auto single = function == "dlookup";
        const auto asked =
            access::Expression::Parse(single ? expression : function.substr(1) + "(" + expression + ")");
        if (const auto value = asked ? asked->Evaluate(DomainScope(*records), 0) : std::nullopt)
            return value;
    }
    if (function != "dlookup" || KindOf({}, field) != SampleKind::Text || HasSampleWords(field))
        return data_.Guess(control_, field, 0);
    return Datum::Text(SpacedName(field));
}

SampleData::SampleData(const access::Design& design, access::ApplicationSource* application,
                       const std::vector<RecordLink>& links, int depth)
    : design_(design), application_(application), depth_(depth) {
    if (application_ == nullptr || !design.root)
        return;
    const auto source = design.root->Text("RecordSource");
    if (!source.empty())
        records_ = application_->FindRecords(source, kMostRecords);
    if (records_ == nullptr)
        return;
    KeepLinked(links);
    if (design.kind == access::ObjectKind::Report)
        SortByGroups();
}

void SampleData::KeepLinked(const std::vector<RecordLink>& links) {
    const auto fulfils = [&](const std::vector<std::string>& cells) {
        return std::all_of(links.begin(), links.end(), [&](const RecordLink& link) {
            const int column = records_->ColumnIndex(FieldName(link.field));
            return column < 0 ||
                   (static_cast<std::size_t>(column) < cells.size() &&
                    text::EqualsIgnoringCase(cells[static_cast<std::size_t>(column)], link.value));
        });
    };
    for (std::size_t row = 0; row < records_->rows.size(); ++row)
        if (fulfils(records_->rows[row]))
            rows_.push_back(static_cast<int>(row));
    for (std::size_t row = 0; rows_.empty() && row < records_->rows.size(); ++row)
        rows_.resize(records_->rows.size()), std::iota(rows_.begin(), rows_.end(), 0);
}

std::string SampleData::GroupKey(int level, int row) const {
    int at = 0;
    for (const auto& child : design_.root->children)
        if (child->Is("BreakLevel") && at++ == level)
            return FieldValue(child->Text("ControlSource"), row).value_or(Datum{}).AsText();
    return {};
}

/// A report prints its records in the order of its groups.
void SampleData::SortByGroups() {
    std::vector<std::pair<std::size_t, bool>> columns;
    for (const auto& child : design_.root->children) {
        const int column =
            child->Is("BreakLevel") ? records_->ColumnIndex(FieldName(child->Text("ControlSource"))) : -1;
        if (column >= 0)
            columns.emplace_back(static_cast<std::size_t>(column), child->Flag("SortOrder"));
    }
    if (columns.empty())
        return;
    std::vector<std::vector<Datum>> keys(records_->rows.size());
    for (const int row : rows_) {
        const auto at = static_cast<std::size_t>(row);
        for (const auto& [column, descending] : columns) {
            const auto& cells = records_->rows[at];
            const auto type = records_->columns[column].type;
            keys[at].push_back(column < cells.size() ? access::DatumOf(cells[column], type) : Datum{});
        }
    }
    std::stable_sort(rows_.begin(), rows_.end(), [&](int left, int right) {
        for (std::size_t i = 0; i < columns.size(); ++i) {
            const auto& a = keys[static_cast<std::size_t>(left)][i];
            const auto& b = keys[static_cast<std::size_t>(right)][i];
            // Nulls come first.
            const int order = a.IsNull() || b.IsNull()
                                  ? static_cast<int>(b.IsNull()) - static_cast<int>(a.IsNull())
                                  : access::Compare(a, b).value_or(0);
            if (order != 0)
                return columns[i].second ? order > 0 : order < 0;
        }
        return false;
    });
}

int SampleData::RecordCount() const {
    return rows_.empty() ? -1 : static_cast<int>(rows_.size());
}

void SampleData::LimitAggregates(int first, int count) {
    firstAdded_ = first;
    added_ = count;
}

std::vector<RecordLink> SampleData::LinksOf(const DesignObject& subform, int row) const {
    std::vector<RecordLink> links;
    const auto children = text::Split(subform.Text("LinkChildFields"), ";");
    const auto masters = text::Split(subform.Text("LinkMasterFields"), ";");
    for (std::size_t i = 0; i < children.size() && i < masters.size(); ++i) {
        const auto field = FieldName(masters[i]);
        auto value = FieldValue(field, row);
        const auto* control = value ? nullptr : FindControl(field);
        if (control != nullptr)
            value = FieldValue(control->Text("ControlSource"), row);
        if (value && !value->IsNull())
            links.push_back({children[i], value->AsText()});
    }
    return links;
}

const DesignObject* SampleData::FindControl(std::string_view name) const {
    std::vector<const DesignObject*> open;
    for (const auto& section : design_.Sections())
        open.push_back(section.object);
    while (!open.empty()) {
        const auto* object = open.back();
        open.pop_back();
        for (const auto& child : object->children) {
            if (text::EqualsIgnoringCase(child->name, name))
                return child.get();
            open.push_back(child.get());
        }
    }
    return nullptr;
}

std::optional<Datum> SampleData::FieldValue(std::string_view field, int row) const {
    const int column = rows_.empty() ? -1 : records_->ColumnIndex(FieldName(field));
    if (column < 0)
        return std::nullopt;
    const auto at = static_cast<std::size_t>(column);
    const auto type = records_->columns[at].type;
    if (type == Records::Type::Unknown)
        return std::nullopt;
    const int number = rows_[static_cast<std::size_t>(std::max(0, row)) % rows_.size()];
    const auto& cells = records_->rows[static_cast<std::size_t>(number)];
    return at < cells.size() ? access::DatumOf(cells[at], type) : Datum{};
}

Datum SampleData::Guess(const DesignObject& control, std::string_view field, int row) const {
    const auto name = FieldName(field);
    const auto format = control.Text("Format");
    const int column = records_ == nullptr ? -1 : records_->ColumnIndex(name);
    auto kind = KindOf(format, name);
    auto type =
        column < 0 ? Records::Type::Unknown : records_->columns[static_cast<std::size_t>(column)].type;
    if (type == Records::Type::Number)
        kind = SampleKind::Number;
    else if (type == Records::Type::Currency)
        kind = SampleKind::Money;
    else if (type == Records::Type::DateTime)
        kind = SampleKind::Date;
    else if (type == Records::Type::Boolean)
        kind = SampleKind::Boolean;
    // Words don't fit into a box made for a figure or two.
    constexpr int kNarrowBox = 850;
    if (kind == SampleKind::Text && !HasSampleWords(name) && control.Integer("Width", 0) < kNarrowBox)
        return Datum::Number(row % 4 + 1);
    const auto text = SampleText(kind, format, name, row);
    if (kind == SampleKind::Number || kind == SampleKind::Money)
        type = kind == SampleKind::Money ? Records::Type::Currency : Records::Type::Number;
    else
        type = kind == SampleKind::Date ? Records::Type::DateTime : Records::Type::Text;
    return access::DatumOf(text, type);
}

Datum SampleData::Calculated(const DesignObject& control, std::string_view expression, int row) const {
    const auto parsed = access::Expression::Parse(expression);
    if (auto value = parsed ? parsed->Evaluate(Scope(*this, control), row) : std::nullopt)
        return *value;
    return Guess(control, parsed && parsed->HasAggregate() ? "count" : control.name, row);
}

Datum SampleData::ValueOf(const DesignObject& control, int row) const {
    const auto source = control.Text("ControlSource");
    if (source == "=1" && control.Integer("RunningSum", 0) != 0)
        return Datum::Number(row + 1);
    if (source.starts_with('='))
        return Calculated(control, std::string_view(source).substr(1), row);
    if (!source.empty()) {
        auto value = FieldValue(source, row);
        return value ? std::move(*value) : Guess(control, source, row);
    }
    const auto standard = control.Text("DefaultValue");
    const auto parsed = access::Expression::Parse(standard.starts_with('=') ? standard.substr(1) : standard);
    // A default that asks around belongs to a new record.
    if (standard.empty() || standard.find('[') != std::string::npos || !parsed)
        return {};
    return parsed->Evaluate(Scope(*this, control), row).value_or(Datum{});
}

std::string SampleData::Text(const DesignObject& control, int row) const {
    const auto value = ValueOf(control, row);
    if (control.Is("ComboBox")) {
        const auto source = control.Text("ControlSource");
        const bool known = source.empty() || FieldValue(source, row).has_value();
        return value.IsNull()
                   ? std::string()
                   : LookedUp(control, access::FormatDatum(value, control.Text("Format")), row, known);
    }
    return access::FormatDatum(value, control.Text("Format"));
}

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
/// A value that is known and isn't in the list shows nothing.
std::string SampleData::LookedUp(const DesignObject& combo, const std::string& value, int row,
                                 bool known) const {
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
        if (const auto* cells = ListRow(combo, value))
            return shown < cells->size() ? (*cells)[shown] : std::string();
        if (known)
            return {};
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
    if (source.starts_with('='))
        return ValueOf(control, row).IsTrue();
    const auto value = FieldValue(source, row);
    return value ? value->IsTrue() : row % 2 == 0;
}

std::string SampleData::GroupValue(const DesignObject& group, int row) const {
    const auto source = group.Text("ControlSource");
    if (const auto value = source.empty() ? std::nullopt : FieldValue(source, row))
        return value->kind == Datum::Kind::Boolean ? (value->IsTrue() ? "-1" : "0") : value->AsText();
    return WithoutQuotes(group.Text("DefaultValue", source.empty() ? "" : "1"));
}

bool SampleData::AlignsRight(const DesignObject& control, int row) const {
    if (IsCheck(control) || control.Is("ComboBox") || control.Text("ControlSource").empty())
        return false;
    const auto kind = ValueOf(control, row).kind;
    return kind == Datum::Kind::Number || kind == Datum::Kind::Date;
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
        if (list.rows.size() < kMostListed)
            list.rows.emplace_back(
                cells.begin(), cells.begin() + static_cast<std::ptrdiff_t>(std::min(columns, cells.size())));
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
