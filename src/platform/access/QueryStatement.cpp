#include "platform/access/QueryReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <vector>

/// Statements of queries of which a database keeps the grid.
namespace tovimar::platform::access {

namespace {

constexpr const char* kLineEnd = "\r\n";

/// Names that are words stand without brackets.
std::string Bracketed(const std::string& name) {
    const bool isWord = !name.empty() && std::all_of(name.begin(), name.end(), [](char c) {
        return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_' ||
               static_cast<unsigned char>(c) >= 0x80;
    });
    return isWord || name.starts_with('[') ? name : "[" + name + "]";
}

std::string InputText(const QueryDefinition::Input& input) {
    if (input.table.empty()) {
        auto nested = text::TrimWhitespace(input.statement);
        if (nested.ends_with(';'))
            nested.pop_back();
        return "(" + nested + ") AS " + Bracketed(input.alias);
    }
    std::string text = Bracketed(input.table);
    if (!input.alias.empty() && input.alias != input.table)
        text += " AS " + Bracketed(input.alias);
    return text;
}

/// Tables that joins tie together, as one expression.
struct Joined {
    std::string text;
    std::vector<std::string> aliases;
    bool Has(const std::string& alias) const {
        return std::any_of(aliases.begin(), aliases.end(),
                           [&](const std::string& own) { return text::EqualsIgnoringCase(own, alias); });
    }
};

/// All conditions between the same two tables belong to one join.
struct Tie {
    QueryDefinition::Join join;
    std::string condition;
};

std::vector<Tie> TiesOf(const QueryDefinition& query) {
    std::vector<Tie> ties;
    for (const auto& join : query.joins) {
        const auto same = std::find_if(ties.begin(), ties.end(), [&](const Tie& tie) {
            return tie.join.left == join.left && tie.join.right == join.right;
        });
        if (same != ties.end())
            same->condition += " AND " + ("(" + join.condition + ")");
        else
            ties.push_back({join, "(" + join.condition + ")"});
    }
    // One condition needs no brackets.
    for (auto& tie : ties)
        if (tie.condition == "(" + tie.join.condition + ")")
            tie.condition = tie.join.condition;
    return ties;
}

void Merge(std::vector<Joined>& parts, const Tie& tie) {
    const auto find = [&](const std::string& alias) {
        return std::find_if(parts.begin(), parts.end(), [&](const Joined& part) { return part.Has(alias); });
    };
    const auto left = find(tie.join.left);
    const auto right = find(tie.join.right);
    if (left == parts.end() || right == parts.end() || left == right)
        return;
    const auto side = [](const Joined& part) {
        return part.aliases.size() > 1 ? "(" + part.text + ")" : part.text;
    };
    const char* word = !tie.join.outer       ? " INNER JOIN "
                       : tie.join.keepsRight ? " RIGHT JOIN "
                                             : " LEFT JOIN ";
    left->text = side(*left) + word + side(*right) + " ON " + tie.condition;
    left->aliases.insert(left->aliases.end(), right->aliases.begin(), right->aliases.end());
    parts.erase(right);
}

std::string Sources(const QueryDefinition& query) {
    std::vector<Joined> parts;
    for (const auto& input : query.inputs)
        parts.push_back({InputText(input), {input.alias.empty() ? input.table : input.alias}});
    for (const auto& tie : TiesOf(query))
        Merge(parts, tie);
    std::vector<std::string> texts;
    for (const auto& part : parts)
        texts.push_back(part.text);
    return text::Join(texts, ", ");
}

/// Behind the columns, on a line of its own; a query of expressions alone has none.
std::string FromClause(const QueryDefinition& query) {
    return query.inputs.empty() ? std::string() : kLineEnd + ("FROM " + Sources(query));
}

std::string ColumnText(const QueryDefinition::Column& column) {
    return column.alias.empty() ? column.expression : column.expression + " AS " + Bracketed(column.alias);
}

std::string Columns(const QueryDefinition& query, int role, bool anyRole) {
    std::vector<std::string> texts;
    for (const auto& column : query.columns)
        if (anyRole || column.role == role)
            texts.push_back(ColumnText(column));
    if (query.allFields)
        texts.emplace_back("*");
    return text::Join(texts, ", ");
}

std::string Predicate(const QueryDefinition& query) {
    std::string text = query.distinct ? "DISTINCT " : query.distinctRow ? "DISTINCTROW " : "";
    if (query.top > 0)
        text += "TOP " + std::to_string(query.top) + (query.topPercent ? " PERCENT " : " ");
    return text;
}

std::string Tail(const QueryDefinition& query) {
    std::string text;
    if (!query.where.empty())
        text += kLineEnd + ("WHERE " + query.where);
    if (!query.groups.empty())
        text += kLineEnd + ("GROUP BY " + text::Join(query.groups, ", "));
    if (!query.having.empty())
        text += kLineEnd + ("HAVING " + query.having);
    std::vector<std::string> sorts;
    for (const auto& sort : query.sorts)
        sorts.push_back(sort.expression + (sort.descending ? " DESC" : ""));
    if (!sorts.empty())
        text += kLineEnd + ("ORDER BY " + text::Join(sorts, ", "));
    return text;
}

std::string Target(const QueryDefinition& query) {
    return Bracketed(query.target) + (query.targetFile.empty() ? "" : " IN '" + query.targetFile + "'");
}

std::string TargetColumns(const QueryDefinition& query) {
    std::vector<std::string> names;
    for (const auto& column : query.columns)
        if (!column.target.empty())
            names.push_back(Bracketed(column.target));
    return names.empty() ? std::string() : " ( " + text::Join(names, ", ") + " )";
}

std::string Assignments(const QueryDefinition& query) {
    std::vector<std::string> texts;
    for (const auto& column : query.columns)
        texts.push_back(column.expression + " = " + column.target);
    return text::Join(texts, ", ");
}

std::string Crosstab(const QueryDefinition& query) {
    constexpr int kValue = 0;
    constexpr int kColumnHeading = 1;
    constexpr int kRowHeading = 2;
    QueryDefinition rows = query;
    const auto pivot = Columns(query, kColumnHeading, false);
    std::erase(rows.groups, pivot);
    return "TRANSFORM " + Columns(query, kValue, false) + kLineEnd + "SELECT " +
           Columns(query, kRowHeading, false) + FromClause(query) + Tail(rows) + kLineEnd + "PIVOT " + pivot;
}

/// Without the parameters in front and the semicolon behind; empty for a query without a grid.
std::string Body(const QueryDefinition& query) {
    const auto select = [&](const std::string& into) {
        return "SELECT " + Predicate(query) + Columns(query, 0, true) + into + FromClause(query) +
               Tail(query);
    };
    switch (query.operation) {
    case 1:
        return select({});
    case 2:
        return select(" INTO " + Target(query));
    case 3:
        return "INSERT INTO " + Target(query) + TargetColumns(query) + kLineEnd + select({});
    case 4:
        return "UPDATE " + Sources(query) + " SET " + Assignments(query) + Tail(query);
    case 5:
        return "DELETE " + Columns(query, 0, true) + FromClause(query) + Tail(query);
    case 6:
        return Crosstab(query);
    default:
        return {};
    }
}

/// As the host names them in a statement.
const char* ParameterType(int type) {
    switch (type) {
    case 1:
        return "Bit";
    case 2:
        return "Byte";
    case 3:
        return "Short";
    case 4:
        return "Long";
    case 5:
        return "Currency";
    case 6:
        return "IEEESingle";
    case 7:
        return "IEEEDouble";
    case 8:
        return "DateTime";
    case 10:
        return "Text ( 255 )";
    case 12:
        return "LongText";
    case 15:
        return "Guid";
    default:
        return "Value";
    }
}

} // namespace

std::string QueryStatement(const QueryDefinition& query) {
    const auto body = query.inputs.empty() && query.columns.empty() ? std::string() : Body(query);
    if (body.empty())
        return {};
    std::vector<std::string> parameters;
    for (const auto& parameter : query.parameters)
        parameters.push_back(Bracketed(parameter.name) + " " + ParameterType(parameter.type));
    const std::string head =
        parameters.empty() ? "" : "PARAMETERS " + text::Join(parameters, ", ") + ";" + kLineEnd;
    return head + body + ";";
}

} // namespace tovimar::platform::access
