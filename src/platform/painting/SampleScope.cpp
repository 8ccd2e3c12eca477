#include "platform/painting/SampleScope.h"

#include "platform/painting/FieldName.h"
#include "platform/painting/SampleText.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Datum;
using access::Records;

namespace {

constexpr int kSampleRows = 4;

/// The records of a table or query that fulfil a condition, for a function that looks into it.
class DomainScope : public access::ExpressionScope {
public:
    DomainScope(const Records& records, const std::string& condition) : records_(records) {
        const auto asked = access::Expression::Parse(condition);
        for (std::size_t row = 0; row < records.rows.size(); ++row) {
            rows_.push_back(row);
            if (asked && !asked->Admits(*this, Rows() - 1))
                rows_.pop_back();
        }
    }
    std::optional<Datum> Value(const access::NamePath& name, int row) const override {
        const int column = records_.ColumnIndex(name.back());
        if (column < 0)
            return std::nullopt;
        const auto at = static_cast<std::size_t>(column);
        const auto& cells = records_.rows[rows_[static_cast<std::size_t>(row)]];
        return at < cells.size() ? access::DatumOf(cells[at], records_.columns[at].type) : Datum{};
    }
    int Rows() const override { return static_cast<int>(rows_.size()); }

private:
    const Records& records_;
    std::vector<std::size_t> rows_;
};

} // namespace

std::optional<Datum> SampleData::Scope::Value(const access::NamePath& name, int row) const {
    if (name.size() == 1)
        return Named(name[0], row);
    if (const auto value = InSubform(name))
        return value;
    if (name.size() > 2 && text::EqualsIgnoringCase(name[name.size() - 2], "Column"))
        return InList(name[name.size() - 3], name.back(), row);
    const bool own = text::EqualsIgnoringCase(name[0], "Me") ||
                     (name.size() > 2 && text::EqualsIgnoringCase(name[name.size() - 2], data_.design_.name));
    return own || name.size() == 2 ? Named(name.back(), row) : data_.Guess(control_, name.back(), row);
}

int SampleData::Scope::Rows() const {
    const int known = data_.RecordCount();
    return known < 0 ? kSampleRows : data_.added_ > 0 ? std::min(data_.added_, known) : known;
}

std::optional<Datum> SampleData::Scope::Named(const std::string& name, int row) const {
    if (auto value = data_.FieldValue(name, row))
        return value;
    if (text::EqualsIgnoringCase(name, "Page") || text::EqualsIgnoringCase(name, "Pages"))
        return Datum::Number(1);
    const auto* control = data_.FindControl(name);
    if (control != nullptr && control != &control_ && data_.asked_ < kDeepestSample) {
        ++data_.asked_;
        auto value = data_.ValueOf(*control, row);
        --data_.asked_;
        return value;
    }
    return data_.Guess(control_, name, row);
}

std::optional<Datum> SampleData::Scope::InSubform(const access::NamePath& name) const {
    const auto* subform = data_.FindControl(name[name.size() > 2 ? name.size() - 3 : 0]);
    if (subform == nullptr || !subform->Is("Subform") || data_.application_ == nullptr ||
        data_.depth_ >= kDeepestSample)
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

std::optional<Datum> SampleData::Scope::InList(const std::string& combo, const std::string& column,
                                               int row) const {
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

std::optional<Datum> SampleData::Scope::LookUp(const std::string& function, const std::string& expression,
                                               const std::string& domain,
                                               const std::string& condition) const {
    const auto* records =
        data_.application_ == nullptr ? nullptr : data_.application_->FindRecords(domain, kMostRecords);
    const auto field = FieldName(expression);
    const bool single = function == "dlookup";
    if (records != nullptr && !records->rows.empty()) {
        const auto asked =
            access::Expression::Parse(single ? expression : function.substr(1) + "(" + expression + ")");
        const DomainScope found(*records, condition);
        if (found.Rows() == 0)
            return function == "dcount" ? Datum::Number(0) : Datum{};
        if (const auto value = asked ? asked->Evaluate(found, 0) : std::nullopt)
            return value;
    }
    if (!single || KindOf({}, field) != SampleKind::Text || HasSampleWords(field))
        return data_.Guess(control_, field, 0);
    return Datum::Text(SpacedName(field));
}

} // namespace tovimar::platform::painting
