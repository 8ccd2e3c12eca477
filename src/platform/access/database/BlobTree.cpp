#include "platform/access/database/BlobTree.h"

#include "platform/Error.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/database/Bytes.h"
#include "platform/access/database/MacroGrid.h"
#include "platform/access/database/PropertyCodes.h"
#include "platform/text/Text.h"

#include <array>
#include <bit>
#include <charconv>
#include <cmath>

namespace tovimar::platform::access {

namespace {

using Form = PropertyValue::Form;
constexpr std::uint32_t kFirstLateSlot = 256;
/// An embedded macro stands as deep as the deepest control of most forms; the depth is but its looks.
constexpr int kMacroDepth = 7;

/// Little-endian, with the sign of its last byte.
std::int64_t SignedNumber(std::string_view bytes) {
    std::uint64_t number = 0;
    for (std::size_t i = bytes.size(); i-- > 0;)
        number = number << 8U | static_cast<std::uint8_t>(bytes[i]);
    const auto unusedBits = 64 - 8 * bytes.size();
    return bytes.empty() ? 0 : static_cast<std::int64_t>(number << unusedBits) >> unusedBits;
}

PropertyValue Number(std::int64_t number) {
    return {Form::Number, std::to_string(number)};
}

/// "95.0": the fewest digits that give the number back, at least one behind the point.
std::string FloatText(std::string_view bytes) {
    const auto number = std::bit_cast<float>(static_cast<std::uint32_t>(SignedNumber(bytes)));
    if (!std::isfinite(number))
        return "0.0";
    std::array<char, 64> buffer{};
    const auto end =
        std::to_chars(buffer.data(), buffer.data() + buffer.size(), number, std::chars_format::fixed);
    std::string text(buffer.data(), end.ptr);
    return text.find('.') == std::string::npos ? text + ".0" : text;
}

} // namespace

std::string RecordName(const DesignRecord& record) {
    return record.code == kUnknownCode ? "UnknownSlot" + std::to_string(record.slot)
                                       : PropertyName(record.code);
}

PropertyValue RecordValue(const DesignRecord& record) {
    const auto& bytes = record.bytes;
    switch (record.type) {
    case ValueKind::Flag:
        if (bytes.empty() && record.slot < kFirstLateSlot)
            return {Form::NotDefault, {}};
        return Number(bytes.empty() ? 0 : static_cast<std::uint8_t>(bytes[0]));
    case ValueKind::Byte:
        return Number(bytes.empty() ? 0 : static_cast<std::uint8_t>(bytes[0]));
    case ValueKind::Integer:
    case ValueKind::Long:
        if (bytes.size() <= 4)
            return Number(SignedNumber(bytes));
        break;
    case ValueKind::Float:
        if (bytes.size() == 4)
            return {Form::Number, FloatText(bytes)};
        break;
    case ValueKind::Text:
    case ValueKind::LongText:
        return {Form::Text, FromUtf16Bytes(bytes)};
    default:
        break;
    }
    return {Form::Bytes, std::string(bytes)};
}

namespace {

/// Names of the events as properties by the codes of their macros; others tell it in the macro itself.
std::string MacroProperty(const DesignRecord& record, const MacroGrid& grid) {
    if (IsKnownProperty(record.code))
        return PropertyName(record.code);
    const auto event = MacroEvent(grid);
    return (event.empty() ? RecordName(record) : event) + "EmMacro";
}

void AddMacro(DesignObject& object, const DesignRecord& record) {
    try {
        const auto grid = ReadMacroGrid(record.bytes);
        const auto name = MacroProperty(record, grid);
        const auto blocks = MacroBlocks(grid);
        // The event itself says only that its macro is kept with it.
        constexpr std::size_t kSuffix = 7;
        object.properties.emplace_back(name.substr(0, name.size() - kSuffix),
                                       PropertyValue{Form::Text, "[Embedded Macro]"});
        object.properties.emplace_back(name, PropertyValue{Form::Text, BlockLines(*blocks, kMacroDepth)});
    } catch (const RaisedError&) {
        object.properties.emplace_back("Unknown" + std::to_string(record.code),
                                       PropertyValue{Form::Bytes, std::string(record.bytes)});
    }
}

/// The host writes a line without a name for it; it says that a picture isn't a shared one.
bool IsNoPicture(const DesignRecord& record) {
    return record.code == 0 && SignedNumber(record.bytes.substr(0, 8)) == -1;
}

/// The number of the help file was met in no design at hand, but nothing else of a form is the name of one.
bool IsHelpFile(const BlobObject& object, const DesignRecord& record, const PropertyValue& value) {
    static const auto kForm = ObjectTypeNumber("Form");
    static const auto kReport = ObjectTypeNumber("Report");
    const bool isRoot = object.type == kForm || object.type == kReport;
    return isRoot && value.form == Form::Text && !IsKnownProperty(record.code) &&
           (text::EndsWithIgnoringCase(value.text, ".chm") || text::EndsWithIgnoringCase(value.text, ".hlp"));
}

std::unique_ptr<DesignObject> Convert(const BlobObject& source) {
    auto object = std::make_unique<DesignObject>();
    object->type = ObjectTypeName(source.type);
    for (const auto& record : source.records) {
        if (IsNoPicture(record))
            continue;
        if (record.type == ValueKind::Macro)
            AddMacro(*object, record);
        else if (auto value = RecordValue(record); value.form != Form::Bytes || !value.text.empty())
            object->properties.emplace_back(
                IsHelpFile(source, record, value) ? "HelpFile" : RecordName(record), value);
    }
    for (const auto& child : source.children) {
        object->children.push_back(Convert(*child));
        object->children.back()->parent = object.get();
    }
    return object;
}

} // namespace

std::unique_ptr<DesignObject> BlobBlocks(const DesignBlob& design) {
    auto root = std::make_unique<DesignObject>();
    root->properties.emplace_back("Version", Number(design.version));
    root->properties.emplace_back("VersionRequired", Number(20));
    root->children.push_back(Convert(*design.root));
    root->children.back()->parent = root.get();
    return root;
}

} // namespace tovimar::platform::access
