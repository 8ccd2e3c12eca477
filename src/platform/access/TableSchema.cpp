#include "platform/Error.h"
#include "platform/access/TableReader.h"
#include "platform/text/Text.h"

#include <charconv>
#include <cstring>
#include <pugixml.hpp>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMaxXmlBytes = std::size_t{64} << 20;

struct JetType {
    std::string_view name;
    FieldType type;
};

constexpr JetType kJetTypes[] = {{"yesno", FieldType::Boolean},
                                 {"byte", FieldType::Byte},
                                 {"integer", FieldType::Integer},
                                 {"longinteger", FieldType::Long},
                                 {"autonumber", FieldType::Long},
                                 {"currency", FieldType::Currency},
                                 {"single", FieldType::Single},
                                 {"double", FieldType::Double},
                                 {"datetime", FieldType::Date},
                                 {"text", FieldType::Text},
                                 {"memo", FieldType::Memo},
                                 {"hyperlink", FieldType::Memo},
                                 {"oleobject", FieldType::LongBinary},
                                 {"replicationid", FieldType::Guid},
                                 {"decimal", FieldType::Decimal},
                                 {"binary", FieldType::Binary},
                                 {"complex", FieldType::Attachment}};

pugi::xml_document LoadXml(std::string_view xml, const std::string& nativePath) {
    pugi::xml_document document;
    if (xml.size() > kMaxXmlBytes)
        throw RaisedError(kFailure1, nativePath + ": the file is larger than 64 MiB.", "TableReader");
    const auto result =
        document.load_buffer(xml.data(), xml.size(), pugi::parse_default, pugi::encoding_utf8);
    if (!result)
        throw RaisedError(kFailure1, nativePath + ": " + result.description() + ".", "TableReader");
    return document;
}

/// The name without its prefix: schema writers differ in "xs" and "xsd".
std::string_view LocalName(const pugi::xml_node& node) {
    const std::string_view name = node.name();
    const auto colon = name.find(':');
    return colon == std::string_view::npos ? name : name.substr(colon + 1);
}

pugi::xml_node Child(const pugi::xml_node& parent, std::string_view localName) {
    for (const auto& child : parent.children())
        if (LocalName(child) == localName)
            return child;
    return {};
}

NamedTexts ReadProperties(const pugi::xml_node& element, std::string_view localName) {
    NamedTexts properties;
    for (const auto& entry : Child(Child(element, "annotation"), "appinfo").children())
        if (LocalName(entry) == localName)
            properties.emplace_back(entry.attribute("name").value(), entry.attribute("value").value());
    return properties;
}

FieldDefinition* FindField(TableDefinition& table, std::string_view name) {
    for (auto& field : table.fields)
        if (text::EqualsIgnoringCase(field.name, name))
            return &field;
    return nullptr;
}

void MergeField(const pugi::xml_node& element, TableDefinition& table) {
    const auto name = DecodeXmlName(element.attribute("name").value());
    auto* field = FindField(table, name);
    const bool added = field == nullptr;
    if (added) {
        table.fields.emplace_back();
        field = &table.fields.back();
        field->name = name;
    }
    const std::string_view jetType = element.attribute("od:jetType").value();
    for (const auto& type : kJetTypes)
        if (type.name == jetType)
            field->type = type.type;
    field->autoNumber = field->autoNumber || jetType == "autonumber";
    field->required = field->required || std::strcmp(element.attribute("od:nonNullable").value(), "yes") == 0;
    for (auto& property : ReadProperties(element, "fieldProperty"))
        field->properties.push_back(std::move(property));
}

/// The element that describes a record: the one that the root element refers to, else the first other one.
pugi::xml_node RecordElement(const pugi::xml_node& schema) {
    for (const auto& child : schema.children())
        if (LocalName(child) == "element" && std::strcmp(child.attribute("name").value(), "dataroot") != 0)
            return child;
    return {};
}

void AddDataRow(const pugi::xml_node& record, Records& records) {
    std::vector<std::string> row(records.columns.size());
    for (const auto& cell : record.children()) {
        const auto name = DecodeXmlName(cell.name());
        auto column = records.ColumnIndex(name);
        if (column < 0) {
            column = static_cast<int>(records.columns.size());
            records.columns.push_back({name, Records::Type::Unknown});
            row.emplace_back();
        }
        row[static_cast<std::size_t>(column)] = cell.text().get();
    }
    records.rows.push_back(std::move(row));
}

Records ReadXmlData(std::string_view xml, const std::string& nativePath, int rows) {
    Records records;
    const auto document = LoadXml(xml, nativePath);
    for (const auto& record : document.document_element().children()) {
        if (static_cast<int>(records.rows.size()) >= rows)
            break;
        if (record.type() == pugi::node_element)
            AddDataRow(record, records);
    }
    for (auto& row : records.rows)
        row.resize(records.columns.size());
    return records;
}

/// Cells between tabs; "\n", "\r", "\t" and "\\" in a cell stand for the characters.
std::string UnescapeCell(std::string_view cell) {
    std::string plain;
    for (std::size_t i = 0; i < cell.size(); ++i) {
        const char next = cell[i] == '\\' && i + 1 < cell.size() ? cell[i + 1] : '\0';
        const std::string_view codes = "nrt\\";
        const auto code = next == '\0' ? std::string_view::npos : codes.find(next);
        plain += code == std::string_view::npos ? cell[i] : "\n\r\t\\"[code];
        i += code == std::string_view::npos ? 0 : 1;
    }
    return plain;
}

std::vector<std::string> SplitCells(std::string_view line) {
    std::vector<std::string> cells;
    if (line.ends_with('\r'))
        line.remove_suffix(1);
    for (const auto& cell : text::Split(line, "\t"))
        cells.push_back(UnescapeCell(cell));
    return cells;
}

Records ReadTabbedData(std::string_view source, int rows) {
    Records records;
    for (std::size_t position = 0; position < source.size();) {
        const auto end = std::min(source.find('\n', position), source.size());
        auto cells = SplitCells(source.substr(position, end - position));
        position = end + 1;
        if (records.columns.empty()) {
            for (auto& name : cells)
                records.columns.push_back({std::move(name), Records::Type::Unknown});
        } else if (static_cast<int>(records.rows.size()) < rows) {
            cells.resize(records.columns.size());
            records.rows.push_back(std::move(cells));
        } else {
            break;
        }
    }
    return records;
}

} // namespace

std::string DecodeXmlName(std::string_view name) {
    std::string decoded;
    for (std::size_t i = 0; i < name.size(); ++i) {
        std::uint32_t code = 0;
        const bool escape = name.substr(i).starts_with("_x") && i + 6 < name.size() && name[i + 6] == '_';
        if (escape) {
            const auto result = std::from_chars(name.data() + i + 2, name.data() + i + 6, code, 16);
            if (result.ec == std::errc() && result.ptr == name.data() + i + 6) {
                decoded += text::FromCodePoint(static_cast<char32_t>(code));
                i += 6;
                continue;
            }
        }
        decoded += name[i];
    }
    return decoded;
}

void MergeTableSchema(std::string_view xml, const std::string& nativePath, TableDefinition& table) {
    const auto document = LoadXml(xml, nativePath);
    const auto record = RecordElement(document.document_element());
    if (!record)
        return;
    for (auto& property : ReadProperties(record, "tableProperty"))
        table.properties.push_back(std::move(property));
    for (const auto& element : Child(Child(record, "complexType"), "sequence").children())
        if (LocalName(element) == "element")
            MergeField(element, table);
}

Records ReadTableData(std::string_view source, const std::string& nativePath, int rows) {
    return source.starts_with('<') ? ReadXmlData(source, nativePath, rows) : ReadTabbedData(source, rows);
}

} // namespace tovimar::platform::access
