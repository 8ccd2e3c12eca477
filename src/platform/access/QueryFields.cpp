#include "platform/access/QueryReader.h"
#include "platform/access/SqlTokens.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

namespace tovimar::platform::access {

std::optional<std::string> FindNamedText(const NamedTexts& texts, std::string_view name) {
    for (const auto& [key, value] : texts)
        if (text::EqualsIgnoringCase(key, name))
            return value;
    return std::nullopt;
}

namespace {

constexpr int kMaxDepth = 12;
/// A query that adds up others may double its fields at each step.
constexpr std::size_t kMaxFields = 4096;

using Fields = std::vector<FieldDefinition>;

/// A column that names one field, or all: "Orders.Total", "[Total]", "Orders.*", "*".
struct Reference {
    std::string qualifier;
    std::string field; ///< "*" for all
};

std::optional<Reference> ReadReference(const std::string& expression) {
    const auto tokens = TokenizeSql(expression);
    const auto named = [](const SqlToken& token) { return token.IsName() || token.IsSymbol('*'); };
    const bool number = !tokens.empty() && tokens[0].kind == SqlToken::Kind::Word &&
                        tokens[0].text.find_first_not_of("0123456789") == std::string::npos;
    if (number)
        return std::nullopt;
    if (tokens.size() == 1 && named(tokens[0]) && !tokens[0].IsWord("Null") && !tokens[0].IsWord("True") &&
        !tokens[0].IsWord("False"))
        return Reference{{}, tokens[0].text};
    if (tokens.size() == 3 && tokens[0].IsName() && tokens[1].IsSymbol('.') && named(tokens[2]))
        return Reference{tokens[0].text, tokens[2].text};
    return std::nullopt;
}

const FieldDefinition* FindField(const Fields& fields, std::string_view name) {
    const auto found = std::find_if(fields.begin(), fields.end(), [&](const FieldDefinition& field) {
        return text::EqualsIgnoringCase(field.name, name);
    });
    return found == fields.end() ? nullptr : &*found;
}

class FieldResolver {
public:
    explicit FieldResolver(const FieldSources& sources) : sources_(sources) {}

    Fields Resolve(const QueryDefinition& query, int depth) {
        std::vector<Input> inputs;
        for (const auto& input : query.inputs)
            inputs.push_back(Open(input, depth));
        Fields fields;
        for (const auto& column : query.columns)
            AddColumn(column, inputs, fields);
        if (query.allFields)
            AddAll({}, inputs, fields);
        return fields;
    }

private:
    struct Input {
        std::string alias;
        std::string table; ///< empty for a query or a nested statement
        bool known = false;
        Fields fields;
    };

    Input Open(const QueryDefinition::Input& input, int depth) {
        Input opened{input.alias, {}, false, {}};
        if (const auto* table = sources_.table(input.table)) {
            opened.table = table->name;
            opened.fields = table->fields;
            opened.known = !table->fields.empty();
            for (auto& field : opened.fields) {
                field.sourceField = field.name;
                field.sourceTable = table->name;
            }
            return opened;
        }
        const auto* query = sources_.query(input.table);
        if (!query) {
            opened.table = input.table;
            return opened;
        }
        const auto folded = text::FoldCase(input.table);
        // Each query is worked out once, however often others build on it.
        const auto known = resolved_.find(folded);
        if (known != resolved_.end()) {
            opened.fields = known->second;
        } else if (depth < kMaxDepth && open_.insert(folded).second) {
            opened.fields = Resolve(*query, depth + 1);
            open_.erase(folded);
            resolved_.emplace(folded, opened.fields);
        }
        opened.known = true;
        return opened;
    }

    void AddColumn(const QueryDefinition::Column& column, const std::vector<Input>& inputs, Fields& fields) {
        const auto reference = ReadReference(column.expression);
        if (reference && reference->field == "*") {
            AddAll(reference->qualifier, inputs, fields);
            return;
        }
        FieldDefinition field;
        if (reference)
            field = FieldFor(*reference, inputs);
        if (!column.alias.empty())
            field.name = column.alias;
        else if (reference)
            field.name = reference->field;
        else
            field.name = "Expr" + std::to_string(1000 + unnamed_++);
        Add(std::move(field), reference ? reference->qualifier : std::string(), fields);
    }

    /// A second field of a name is told from the first by its table, as the host does.
    static void Add(FieldDefinition field, const std::string& qualifier, Fields& fields) {
        if (fields.size() >= kMaxFields)
            return;
        if (!qualifier.empty() && FindField(fields, field.name))
            field.name = qualifier + "." + field.name;
        fields.push_back(std::move(field));
    }

    static void AddAll(const std::string& qualifier, const std::vector<Input>& inputs, Fields& fields) {
        for (const auto& input : inputs)
            if (qualifier.empty() || text::EqualsIgnoringCase(input.alias, qualifier))
                for (const auto& field : input.fields)
                    Add(field, input.alias, fields);
    }

    static FieldDefinition FieldFor(const Reference& reference, const std::vector<Input>& inputs) {
        for (const auto& input : inputs) {
            if (!reference.qualifier.empty() && !text::EqualsIgnoringCase(input.alias, reference.qualifier))
                continue;
            if (const auto* field = FindField(input.fields, reference.field))
                return *field;
        }
        return Guess(reference, inputs);
    }

    /// A table whose fields aren't at hand has the field that the query takes from it; a bare name needs
    /// such a table to be the only one.
    static FieldDefinition Guess(const Reference& reference, const std::vector<Input>& inputs) {
        FieldDefinition field;
        const Input* source = nullptr;
        for (const auto& input : inputs) {
            const bool asked = reference.qualifier.empty()
                                   ? inputs.size() == 1
                                   : text::EqualsIgnoringCase(input.alias, reference.qualifier);
            if (asked && !input.known && !input.table.empty())
                source = &input;
        }
        if (source) {
            field.sourceField = reference.field;
            field.sourceTable = source->table;
        }
        return field;
    }

    const FieldSources& sources_;
    std::unordered_set<std::string> open_;
    std::unordered_map<std::string, Fields> resolved_;
    int unnamed_ = 0;
};

} // namespace

std::vector<FieldDefinition> ResolveQueryFields(const QueryDefinition& query, const FieldSources& sources) {
    return FieldResolver(sources).Resolve(query, 0);
}

} // namespace tovimar::platform::access
