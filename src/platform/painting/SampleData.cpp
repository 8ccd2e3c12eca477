#include "platform/painting/SampleData.h"

#include "platform/painting/FieldName.h"
#include "platform/painting/SampleScope.h"
#include "platform/painting/SampleText.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::Datum;
using access::DesignObject;
using access::Records;

namespace {

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

namespace {

/// What tells most about a field: its name, the caption beside its control, or the control's name.
std::string TellingName(const DesignObject& control, const std::string& field) {
    if (SaysItsKind(field))
        return field;
    for (const auto& child : control.children)
        if (const auto caption = text::ReplaceAll(child->Text("Caption"), "&", "");
            child->Is("Label") && SaysItsKind(caption))
            return caption;
    return SaysItsKind(control.name) ? control.name : field;
}

} // namespace

Datum SampleData::Guess(const DesignObject& control, std::string_view field, int row) const {
    const auto fieldName = FieldName(field);
    const auto name = TellingName(control, fieldName);
    const auto format = control.Text("Format");
    const int column = records_ == nullptr ? -1 : records_->ColumnIndex(fieldName);
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

/// The sum from the first record of the group, or of all, to this one.
Datum SampleData::RunningSum(const DesignObject& control, std::string_view source, int row) const {
    constexpr int kWithinGroup = 1;
    const int first = control.Integer("RunningSum", 0) == kWithinGroup ? FirstOfGroup(row) : 0;
    if (source == "=1")
        return Datum::Number(row - first + 1);
    const bool calculated = source.starts_with('=');
    double sum = 0;
    for (int at = first; at <= row; ++at) {
        const auto value = calculated ? Calculated(control, source.substr(1), at)
                                      : FieldValue(source, at).value_or(Guess(control, source, at));
        sum += value.AsNumber().value_or(0);
    }
    return Datum::Number(sum);
}

Datum SampleData::ValueOf(const DesignObject& control, int row) const {
    const auto source = control.Text("ControlSource");
    if (control.Integer("RunningSum", 0) != 0 && !source.empty())
        return RunningSum(control, source, row);
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
    const auto source = control.Text("ControlSource");
    const bool combo = control.Is("ComboBox");
    if (combo && !source.empty() && !source.starts_with('=') && !FieldValue(source, row))
        if (auto offered = Offered(control, row))
            return *offered;
    const auto value = ValueOf(control, row);
    const auto text = access::FormatDatum(value, control.Text("Format"));
    return combo && !value.IsNull() ? LookedUp(control, text) : text;
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

} // namespace tovimar::platform::painting
