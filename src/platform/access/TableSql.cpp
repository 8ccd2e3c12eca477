#include "platform/access/SqlTokens.h"
#include "platform/access/TableReader.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <charconv>

namespace tovimar::platform::access {

namespace {

struct SqlType {
    std::string_view word;
    FieldType type;
};

constexpr SqlType kTypes[] = {{"BIT", FieldType::Boolean},      {"YESNO", FieldType::Boolean},
                              {"BOOLEAN", FieldType::Boolean},  {"BYTE", FieldType::Byte},
                              {"SHORT", FieldType::Integer},    {"SMALLINT", FieldType::Integer},
                              {"INTEGER", FieldType::Long},     {"INT", FieldType::Long},
                              {"LONG", FieldType::Long},        {"AUTOINCREMENT", FieldType::Long},
                              {"COUNTER", FieldType::Long},     {"CURRENCY", FieldType::Currency},
                              {"MONEY", FieldType::Currency},   {"SINGLE", FieldType::Single},
                              {"REAL", FieldType::Single},      {"DOUBLE", FieldType::Double},
                              {"FLOAT", FieldType::Double},     {"DATETIME", FieldType::Date},
                              {"DATE", FieldType::Date},        {"BINARY", FieldType::Binary},
                              {"VARBINARY", FieldType::Binary}, {"LONGBINARY", FieldType::LongBinary},
                              {"LONGTEXT", FieldType::Memo},    {"MEMO", FieldType::Memo},
                              {"GUID", FieldType::Guid},        {"BIGINT", FieldType::BigInt},
                              {"DECIMAL", FieldType::Decimal},  {"NUMERIC", FieldType::Decimal}};

FieldType TypeOf(const SqlToken& token) {
    for (const auto& type : kTypes)
        if (token.IsWord(type.word))
            return type.type;
    return FieldType::Text;
}

/// The statement's writer doubles quotes inside of names.
std::string UndoubleQuotes(const std::string& name) {
    return text::ReplaceAll(text::ReplaceAll(name, "''", "'"), "\"\"", "\"");
}

class TableSqlReader {
public:
    TableSqlReader(std::string_view sql, const std::string& name) : tokens_(TokenizeSql(sql)) {
        table_.name = name;
    }

    TableDefinition Run() {
        while (next_ < tokens_.size()) {
            if (IsAt(0, "CREATE") && IsAt(1, "TABLE"))
                ReadTable();
            else if (IsAt(0, "CREATE") && (IsAt(1, "INDEX") || (IsAt(1, "UNIQUE") && IsAt(2, "INDEX"))))
                ReadIndex();
            else
                ++next_;
        }
        MarkPrimaryKey();
        return std::move(table_);
    }

private:
    bool IsAt(std::size_t offset, std::string_view word) const {
        return next_ + offset < tokens_.size() && tokens_[next_ + offset].IsWord(word);
    }
    bool IsSymbolAt(std::size_t offset, char symbol) const {
        return next_ + offset < tokens_.size() && tokens_[next_ + offset].IsSymbol(symbol);
    }

    void ReadTable() {
        next_ += 2;
        if (next_ < tokens_.size() && tokens_[next_].IsName())
            table_.name = UndoubleQuotes(tokens_[next_++].text);
        if (!IsSymbolAt(0, '('))
            return;
        ++next_;
        while (next_ < tokens_.size() && !IsSymbolAt(0, ')')) {
            const auto end = EndOfItem();
            if (IsAt(0, "CONSTRAINT") || IsAt(0, "PRIMARY") || IsAt(0, "UNIQUE"))
                ReadConstraint(end);
            else
                ReadField(end);
            next_ = end < tokens_.size() && tokens_[end].IsSymbol(',') ? end + 1 : end;
        }
    }

    /// The comma or parenthesis that ends a field or constraint.
    std::size_t EndOfItem() const {
        int depth = 0;
        for (auto i = next_; i < tokens_.size(); ++i) {
            if (depth == 0 && (tokens_[i].IsSymbol(',') || tokens_[i].IsSymbol(')')))
                return i;
            depth += tokens_[i].IsSymbol('(') ? 1 : tokens_[i].IsSymbol(')') ? -1 : 0;
        }
        return tokens_.size();
    }

    void ReadField(std::size_t end) {
        if (end - next_ < 2 || !tokens_[next_].IsName())
            return;
        FieldDefinition field;
        field.name = UndoubleQuotes(tokens_[next_].text);
        const auto& type = tokens_[next_ + 1];
        field.type = TypeOf(type);
        field.autoNumber = type.IsWord("AUTOINCREMENT") || type.IsWord("COUNTER");
        if (IsSymbolAt(2, '(') && next_ + 3 < end)
            field.size = ReadNumber(tokens_[next_ + 3].text);
        // A text without a length is how the statement's writer puts an attachment or a multi-value field.
        for (auto i = next_ + 2; i + 1 < end; ++i) {
            field.required = field.required || (tokens_[i].IsWord("NOT") && tokens_[i + 1].IsWord("NULL"));
            if (tokens_[i].IsWord("PRIMARY") && tokens_[i + 1].IsWord("KEY"))
                table_.indexes.push_back({"PrimaryKey", true, true, {field.name}});
        }
        table_.fields.push_back(std::move(field));
    }

    static std::int32_t ReadNumber(const std::string& digits) {
        std::int32_t number = 0;
        std::from_chars(digits.data(), digits.data() + digits.size(), number);
        return number;
    }

    void ReadConstraint(std::size_t end) {
        IndexDefinition index;
        for (auto i = next_; i < end; ++i) {
            if (tokens_[i].IsWord("CONSTRAINT") && i + 1 < end && tokens_[i + 1].IsName())
                index.name = tokens_[++i].text;
            else if (tokens_[i].IsWord("PRIMARY"))
                index.primary = index.unique = true;
            else if (tokens_[i].IsWord("UNIQUE"))
                index.unique = true;
            else if (tokens_[i].IsWord("FOREIGN"))
                return;
            else if (tokens_[i].IsSymbol('('))
                return AddIndex(std::move(index), i, end);
        }
    }

    /// Takes the names up to the closing parenthesis; order words between them are none of them.
    void AddIndex(IndexDefinition index, std::size_t open, std::size_t end) {
        for (auto i = open + 1; i < end && !tokens_[i].IsSymbol(')'); ++i)
            if (tokens_[i].IsName() && !tokens_[i].IsWord("ASC") && !tokens_[i].IsWord("DESC"))
                index.fields.push_back(UndoubleQuotes(tokens_[i].text));
        table_.indexes.push_back(std::move(index));
    }

    /// CREATE [UNIQUE] INDEX [name] ON [table] ([field], ...) WITH PRIMARY ...
    void ReadIndex() {
        IndexDefinition index;
        index.unique = IsAt(1, "UNIQUE");
        next_ += index.unique ? 3 : 2;
        if (next_ < tokens_.size() && tokens_[next_].IsName())
            index.name = tokens_[next_++].text;
        auto end = next_;
        while (end < tokens_.size() && !tokens_[end].IsWord("CREATE"))
            ++end;
        auto open = next_;
        while (open < end && !tokens_[open].IsSymbol('('))
            ++open;
        for (auto i = open; i < end; ++i)
            index.primary = index.primary || tokens_[i].IsWord("PRIMARY");
        index.unique = index.unique || index.primary;
        AddIndex(std::move(index), open, end);
        next_ = end;
    }

    void MarkPrimaryKey() {
        for (const auto& index : table_.indexes)
            for (auto& field : table_.fields)
                field.inPrimaryKey =
                    field.inPrimaryKey ||
                    (index.primary &&
                     std::any_of(index.fields.begin(), index.fields.end(), [&](const auto& name) {
                         return text::EqualsIgnoringCase(name, field.name);
                     }));
    }

    std::vector<SqlToken> tokens_;
    TableDefinition table_;
    std::size_t next_ = 0;
};

} // namespace

TableDefinition ReadTableSql(std::string_view text, const std::string& name) {
    return TableSqlReader(text, name).Run();
}

} // namespace tovimar::platform::access
