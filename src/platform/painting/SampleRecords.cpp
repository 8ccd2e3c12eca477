#include "platform/painting/FieldName.h"
#include "platform/painting/SampleData.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <map>
#include <numeric>

/// Which records an object shows, and in what order.
namespace tovimar::platform::painting {

using access::Datum;
using access::DesignObject;
using access::Records;

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
    FindGroups();
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
    noneLinked_ = rows_.empty() && !records_->rows.empty() && design_.kind == access::ObjectKind::Report;
    if (rows_.empty() && !noneLinked_) {
        rows_.resize(records_->rows.size());
        std::iota(rows_.begin(), rows_.end(), 0);
    }
}

void SampleData::FindGroups() {
    for (const auto& child : design_.root->children)
        if (child->Is("BreakLevel"))
            groups_.push_back({records_->ColumnIndex(FieldName(child->Text("ControlSource"))),
                               child->Flag("SortOrder"),
                               child->Flag("GroupHeader") || child->Flag("GroupFooter")});
}

std::string SampleData::GroupKey(int level, int row) const {
    const auto at = static_cast<std::size_t>(level);
    if (at >= groups_.size() || groups_[at].column < 0 || rows_.empty())
        return {};
    const auto number = rows_[static_cast<std::size_t>(std::max(0, row)) % rows_.size()];
    const auto& cells = records_->rows[static_cast<std::size_t>(number)];
    const auto column = static_cast<std::size_t>(groups_[at].column);
    return column < cells.size() ? cells[column] : std::string();
}

/// The first record that shares all printed groups with this one.
int SampleData::FirstOfGroup(int row) const {
    const auto same = [&](int other) {
        for (std::size_t level = 0; level < groups_.size(); ++level)
            if (groups_[level].printed &&
                GroupKey(static_cast<int>(level), other) != GroupKey(static_cast<int>(level), row))
                return false;
        return true;
    };
    while (row > 0 && same(row - 1))
        --row;
    return row;
}

namespace {

/// Of each record its place among the values of a column; nulls come first.
std::vector<int> RanksOf(const Records& records, std::size_t column) {
    std::map<std::string_view, int> ranks;
    const auto text = [&](const std::vector<std::string>& cells) {
        return column < cells.size() ? std::string_view(cells[column]) : std::string_view();
    };
    for (const auto& cells : records.rows)
        ranks.emplace(text(cells), 0);
    std::vector<std::pair<Datum, int*>> values;
    for (auto& [value, rank] : ranks)
        values.emplace_back(access::DatumOf(std::string(value), records.columns[column].type), &rank);
    const auto before = [](const auto& left, const auto& right) {
        return left.first.IsNull() || right.first.IsNull()
                   ? left.first.IsNull() && !right.first.IsNull()
                   : access::Compare(left.first, right.first).value_or(0) < 0;
    };
    std::stable_sort(values.begin(), values.end(), before);
    for (std::size_t i = 0; i < values.size(); ++i)
        *values[i].second = i == 0 ? 0 : *values[i - 1].second + (before(values[i - 1], values[i]) ? 1 : 0);
    std::vector<int> found;
    for (const auto& cells : records.rows)
        found.push_back(ranks[text(cells)]);
    return found;
}

} // namespace

/// A report prints its records in the order of its groups.
void SampleData::SortByGroups() {
    std::vector<std::pair<std::vector<int>, bool>> keys;
    for (const auto& group : groups_)
        if (group.column >= 0)
            keys.emplace_back(RanksOf(*records_, static_cast<std::size_t>(group.column)), group.descending);
    std::stable_sort(rows_.begin(), rows_.end(), [&](int left, int right) {
        for (const auto& [ranks, descending] : keys) {
            const int a = ranks[static_cast<std::size_t>(left)], b = ranks[static_cast<std::size_t>(right)];
            if (a != b)
                return descending ? a > b : a < b;
        }
        return false;
    });
}

int SampleData::RecordCount() const {
    return noneLinked_ ? 0 : rows_.empty() ? -1 : static_cast<int>(rows_.size());
}

void SampleData::LimitAggregates(int first, int count) {
    firstAdded_ = first;
    added_ = count;
}

/// What a control tells a subform: its field, or what it works out without asking around.
std::optional<Datum> SampleData::LinkValue(const DesignObject& control, int row) const {
    const auto source = control.Text("ControlSource");
    const bool constant = source.starts_with('=') && source.find('[') == std::string::npos;
    return constant ? Calculated(control, source.substr(1), row) : FieldValue(source, row);
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
            value = LinkValue(*control, row);
        if (value && !value->IsNull())
            links.push_back({children[i], value->AsText()});
    }
    return links;
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

} // namespace tovimar::platform::painting
