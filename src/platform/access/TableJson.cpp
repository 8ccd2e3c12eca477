#include "platform/Error.h"
#include "platform/access/TableReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>
#include <nlohmann/json.hpp>

namespace tovimar::platform::access {

namespace {

using Json = nlohmann::json;

/// Nesting is checked first: the library's values are freed and copied by recursion.
void CheckDepth(std::string_view source, const std::string& nativePath) {
    constexpr int kMaxDepth = 100;
    int depth = 0;
    bool quoted = false;
    for (std::size_t i = 0; i < source.size(); ++i) {
        const char character = source[i];
        if (quoted && character == '\\')
            ++i;
        else if (character == '"')
            quoted = !quoted;
        else if (!quoted && (character == '{' || character == '['))
            ++depth;
        else if (!quoted && (character == '}' || character == ']'))
            --depth;
        if (depth > kMaxDepth)
            throw RaisedError(kFailure1, nativePath + ": the text is nested deeper than 100.", "TableReader");
    }
}

Json Parse(std::string_view source, const std::string& nativePath) {
    CheckDepth(source, nativePath);
    try {
        return Json::parse(source);
    } catch (const Json::exception& failure) {
        throw RaisedError(kFailure1, nativePath + ": " + failure.what(), "TableReader");
    }
}

const Json& At(const Json& value, const char* key) {
    static const Json kAbsent;
    const auto found = value.is_object() ? value.find(key) : value.end();
    return value.is_object() && found != value.end() ? *found : kAbsent;
}

std::string Text(const Json& value) {
    if (value.is_string())
        return value.get<std::string>();
    return value.is_primitive() && !value.is_null() ? value.dump() : std::string();
}

std::int32_t Number(const Json& value) {
    return value.is_number_integer() ? static_cast<std::int32_t>(value.get<std::int64_t>()) : 0;
}

void ReadProperties(const Json& properties, NamedTexts& texts) {
    if (!properties.is_object())
        return;
    for (const auto& [name, entry] : properties.items())
        if (!FindNamedText(texts, name))
            texts.emplace_back(name, Text(entry.is_object() ? At(entry, "Value") : entry));
}

RelationDefinition ReadJsonRelation(std::string_view source, const std::string& nativePath) {
    const auto json = Parse(source, nativePath);
    const auto& items = At(json, "Items");
    RelationDefinition relation;
    relation.name = Text(At(items, "Name"));
    relation.table = Text(At(items, "Table"));
    relation.foreignTable = Text(At(items, "ForeignTable"));
    relation.attributes = Number(At(items, "Attributes"));
    for (const auto& field : At(items, "Fields"))
        relation.fields.emplace_back(Text(At(field, "Name")), Text(At(field, "ForeignName")));
    return relation;
}

RelationDefinition ReadLinedRelation(std::string_view source) {
    std::vector<std::string> lines;
    for (const auto& line : text::Split(source, "\n"))
        lines.push_back(text::TrimWhitespace(line));
    lines.resize(std::max<std::size_t>(lines.size(), 4));
    RelationDefinition relation;
    std::from_chars(lines[0].data(), lines[0].data() + lines[0].size(), relation.attributes);
    relation.name = lines[1];
    relation.table = lines[2];
    relation.foreignTable = lines[3];
    for (std::size_t i = 4; i + 2 < lines.size(); ++i)
        if (text::StartsWithIgnoringCase(lines[i], "Field"))
            relation.fields.emplace_back(lines[i + 1], lines[i + 2]);
    return relation;
}

} // namespace

TableDefinition ReadLinkedTable(std::string_view source, const std::string& name,
                                const std::string& nativePath) {
    const auto json = Parse(source, nativePath);
    const auto& items = At(json, "Items");
    TableDefinition table;
    table.name = Text(At(items, "Name"));
    if (table.name.empty())
        table.name = name;
    table.connect = Text(At(items, "Connect"));
    table.sourceTable = Text(At(items, "SourceTableName"));
    table.attributes = Number(At(items, "Attributes"));
    ReadProperties(At(items, "Properties"), table.properties);
    ReadProperties(At(items, "TableProperties"), table.properties);
    return table;
}

NamedTexts ReadQueryInfo(std::string_view source, const std::string& nativePath) {
    const auto json = Parse(source, nativePath);
    const auto& items = At(json, "Items");
    NamedTexts properties;
    if (const auto description = Text(At(items, "Description")); !description.empty())
        properties.emplace_back("Description", description);
    ReadProperties(At(items, "Properties"), properties);
    return properties;
}

std::vector<DocumentInfo> ReadDocuments(std::string_view source, const std::string& nativePath) {
    std::vector<DocumentInfo> documents;
    const auto json = Parse(source, nativePath);
    const auto& containers = At(json, "Items");
    if (!containers.is_object())
        return documents;
    for (const auto& [container, objects] : containers.items()) {
        if (!objects.is_object())
            continue;
        for (const auto& [name, properties] : objects.items()) {
            documents.push_back({container, name, {}});
            ReadProperties(properties, documents.back().properties);
        }
    }
    return documents;
}

RelationDefinition ReadRelation(std::string_view source, const std::string& nativePath) {
    return source.starts_with('{') ? ReadJsonRelation(source, nativePath) : ReadLinedRelation(source);
}

std::string JsonText(std::string_view source, const std::string& nativePath,
                     std::initializer_list<const char*> keys) {
    const auto json = Parse(source, nativePath);
    const auto* value = &json;
    for (const auto* key : keys)
        value = &At(*value, key);
    return Text(*value);
}

} // namespace tovimar::platform::access
