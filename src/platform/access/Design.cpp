#include "platform/access/Design.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace tovimar::platform::access {

namespace {

/// Whole number of a number's text; fractions ("95.0") round, what is no number gives none.
std::optional<std::int32_t> ParseInteger(std::string_view digits) {
    double number = 0;
    const auto* end = digits.data() + digits.size();
    const auto result = std::from_chars(digits.data(), end, number);
    if (digits.empty() || result.ec != std::errc() || result.ptr != end)
        return std::nullopt;
    // Colours may be written unsigned; they keep their bits.
    if (number > 2147483647.0 && number <= 4294967295.0)
        return static_cast<std::int32_t>(static_cast<std::uint32_t>(number));
    if (!(number >= -2147483648.0 && number <= 2147483647.0))
        return std::nullopt;
    return static_cast<std::int32_t>(std::nearbyint(number));
}

bool IsTrueText(std::string_view word) {
    if (text::EqualsIgnoringCase(word, "True") || text::EqualsIgnoringCase(word, "Yes"))
        return true;
    const auto number = ParseInteger(word);
    return number && *number != 0;
}

/// The host's number of a section by its kind, -1 for what is no section.
int SectionNumber(const DesignObject& object) {
    if (object.Is("Section"))
        return 0;
    if (object.Is("FormHeader"))
        return 1;
    if (object.Is("FormFooter"))
        return 2;
    if (object.Is("PageHeader"))
        return 3;
    if (object.Is("PageFooter"))
        return 4;
    const int level = std::clamp(object.Integer("BreakLevel"), 0, 255);
    if (object.Is("BreakHeader"))
        return 5 + 2 * level;
    if (object.Is("BreakFooter"))
        return 6 + 2 * level;
    return -1;
}

} // namespace

const char* KindWord(ObjectKind kind) {
    switch (kind) {
    case ObjectKind::Form:
        return "form";
    case ObjectKind::Report:
        return "report";
    case ObjectKind::Macro:
        return "macro";
    case ObjectKind::Query:
        return "query";
    case ObjectKind::Table:
        return "table";
    case ObjectKind::Module:
        return "module";
    }
    return "object";
}

bool DesignObject::Is(std::string_view typeName) const {
    return text::EqualsIgnoringCase(type, typeName);
}

const PropertyValue* DesignObject::FindOwn(std::string_view property) const {
    for (; indexed_ < properties.size(); ++indexed_)
        index_.try_emplace(properties[indexed_].first, indexed_);
    const auto found = index_.find(property);
    return found == index_.end() ? nullptr : &properties[found->second].second;
}

const PropertyValue* DesignObject::Find(std::string_view property) const {
    const auto* own = FindOwn(property);
    return own || !prototype ? own : prototype->FindOwn(property);
}

bool DesignObject::Flag(std::string_view property) const {
    bool flag = BuiltInDefault(type, property) == "True";
    for (const auto* source : {prototype, static_cast<const DesignObject*>(this)}) {
        const auto* value = source ? source->FindOwn(property) : nullptr;
        if (value)
            flag = value->form == PropertyValue::Form::NotDefault ? !flag : IsTrueText(value->text);
    }
    return flag;
}

std::int32_t DesignObject::Integer(std::string_view property, std::int32_t absent) const {
    const auto* value = Find(property);
    if (value && value->form == PropertyValue::Form::NotDefault)
        return Flag(property) ? -1 : 0;
    std::optional<std::int32_t> number;
    if (value)
        number = ParseInteger(value->text);
    else if (const auto inherited = BuiltInDefault(type, property))
        number = *inherited == "True" ? -1 : *inherited == "False" ? 0 : ParseInteger(*inherited);
    return number.value_or(absent);
}

std::string DesignObject::Text(std::string_view property, std::string_view absent) const {
    const auto* value = Find(property);
    if (value && value->form == PropertyValue::Form::NotDefault)
        return Flag(property) ? "True" : "False";
    if (value)
        return value->text;
    return std::string(BuiltInDefault(type, property).value_or(absent));
}

std::vector<SectionRef> Design::Sections() const {
    std::vector<SectionRef> sections;
    if (!root)
        return sections;
    for (const auto& child : root->children) {
        const int number = SectionNumber(*child);
        const bool known = std::any_of(sections.begin(), sections.end(),
                                       [&](const SectionRef& section) { return section.number == number; });
        if (number >= 0 && !known)
            sections.push_back({number, child.get()});
    }
    std::stable_sort(sections.begin(), sections.end(), [](const SectionRef& left, const SectionRef& right) {
        return left.number < right.number;
    });
    return sections;
}

const DesignObject* Design::Section(int number) const {
    for (const auto& section : Sections())
        if (section.number == number)
            return section.object;
    return nullptr;
}

} // namespace tovimar::platform::access
