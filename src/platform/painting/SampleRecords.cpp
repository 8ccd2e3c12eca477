#include "platform/painting/FieldName.h"
#include "platform/painting/SampleData.h"
#include "platform/text/Text.h"

#include <algorithm>
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
