#include "platform/access/QueryReader.h"
#include "platform/access/SqlTokens.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::access {

namespace {

/// Reads a statement over its tokens. Parentheses are counted, never entered by recursion.
class QueryParser {
public:
    explicit QueryParser(std::string_view sql) : sql_(sql), tokens_(TokenizeSql(sql)) {}

    QueryDefinition Run() {
        query_.sql = std::string(sql_);
        SkipParameters();
        query_.operation = FindOperation();
        if (query_.operation == 7 || query_.operation == 8)
            return std::move(query_);
        if (query_.operation == 4)
            ReadUpdate();
        else
            ReadSelect();
        return std::move(query_);
    }

private:
    bool AtEnd() const { return next_ >= tokens_.size(); }
    const SqlToken& Current() const { return tokens_[next_]; }
    bool At(std::string_view word) const { return !AtEnd() && Current().IsWord(word); }

    void SkipParameters() {
        if (!At("PARAMETERS"))
            return;
        while (!AtEnd() && !Current().IsSymbol(';'))
            ++next_;
        next_ += AtEnd() ? 0 : 1;
    }

    /// Position of a word outside of parentheses, the end when there is none.
    std::size_t FindOutside(std::initializer_list<std::string_view> words, std::size_t from) const {
        int depth = 0;
        for (auto i = from; i < tokens_.size(); ++i) {
            if (tokens_[i].IsSymbol('('))
                ++depth;
            else if (tokens_[i].IsSymbol(')'))
                --depth;
            else if (depth == 0 && IsAny(tokens_[i], words))
                return i;
        }
        return tokens_.size();
    }

    static bool IsAny(const SqlToken& token, std::initializer_list<std::string_view> words) {
        return std::any_of(words.begin(), words.end(), [&](auto word) { return token.IsWord(word); });
    }

    int FindOperation() const {
        if (AtEnd())
            return 1;
        if (FindOutside({"UNION"}, next_) < tokens_.size())
            return 9;
        if (At("TRANSFORM"))
            return 6;
        if (At("INSERT"))
            return 3;
        if (At("UPDATE"))
            return 4;
        if (At("DELETE"))
            return 5;
        if (IsAny(Current(), {"CREATE", "ALTER", "DROP"}))
            return 7;
        if (IsAny(Current(), {"EXEC", "EXECUTE"}))
            return 8;
        const auto from = FindOutside({"FROM"}, next_);
        return FindOutside({"INTO"}, next_) < from ? 2 : 1;
    }

    void ReadSelect() {
        const auto select = query_.operation == 5 ? next_ : FindFirstSelect();
        const auto end = FindOutside({"UNION"}, select);
        next_ = std::min(select + 1, tokens_.size());
        SkipModifiers();
        const auto listEnd =
            std::min(FindOutside({"FROM", "INTO", "WHERE", "ORDER", "GROUP", "UNION"}, next_), end);
        ReadColumns(next_, listEnd);
        const auto from = std::min(FindOutside({"FROM"}, listEnd), end);
        const auto clause = std::min(FindOutside({"WHERE", "GROUP", "HAVING", "ORDER", "PIVOT"}, from), end);
        ReadInputs(std::min(from + 1, clause), clause);
        ReadClauses(clause, end);
    }

    /// WHERE, GROUP BY and ORDER BY; what a group must fulfil is left out.
    void ReadClauses(std::size_t begin, std::size_t end) {
        while (begin < end) {
            const auto next =
                std::min(FindOutside({"WHERE", "GROUP", "HAVING", "ORDER", "PIVOT"}, begin + 1), end);
            auto last = next;
            while (last > begin + 1 && tokens_[last - 1].IsSymbol(';'))
                --last;
            const bool listed = begin + 2 < last && tokens_[begin + 1].IsWord("BY");
            if (tokens_[begin].IsWord("WHERE") && begin + 1 < last)
                query_.where = Source(begin + 1, last);
            else if (tokens_[begin].IsWord("GROUP") && listed)
                ForEachPart(begin + 2, last,
                            [&](auto from, auto to) { query_.groups.push_back(Source(from, to)); });
            else if (tokens_[begin].IsWord("ORDER") && listed)
                ForEachPart(begin + 2, last, [&](auto from, auto to) { AddSort(from, to); });
            begin = next;
        }
    }

    void AddSort(std::size_t begin, std::size_t end) {
        const bool told = end - begin > 1 && IsAny(tokens_[end - 1], {"ASC", "DESC"});
        query_.sorts.push_back({Source(begin, told ? end - 1 : end), tokens_[end - 1].IsWord("DESC")});
    }

    /// A statement may stand in parentheses as a whole: "(SELECT ...) UNION (SELECT ...)".
    std::size_t FindFirstSelect() const {
        for (auto i = next_; i < tokens_.size(); ++i)
            if (tokens_[i].IsWord("SELECT"))
                return i;
        return tokens_.size();
    }

    void SkipModifiers() {
        while (!AtEnd() && IsAny(Current(), {"ALL", "DISTINCT", "DISTINCTROW", "TOP", "PERCENT"})) {
            const bool top = At("TOP");
            query_.distinct = query_.distinct || At("DISTINCT");
            if (top && next_ + 1 < tokens_.size())
                query_.top = std::clamp(std::atoi(tokens_[next_ + 1].text.c_str()), 0, 1'000'000);
            next_ += top ? 2 : 1;
        }
        next_ = std::min(next_, tokens_.size());
    }

    void ReadColumns(std::size_t begin, std::size_t end) {
        ForEachPart(begin, end, [&](auto from, auto to) { AddColumn(from, to); });
    }

    /// The parts between two tokens that commas outside of parentheses separate; none is empty.
    template <typename Take> void ForEachPart(std::size_t begin, std::size_t end, const Take& take) {
        int depth = 0;
        auto start = begin;
        for (auto i = begin; i < end; ++i) {
            if (tokens_[i].IsSymbol('('))
                ++depth;
            else if (tokens_[i].IsSymbol(')'))
                --depth;
            else if ((depth == 0 && tokens_[i].IsSymbol(',')) || tokens_[i].IsSymbol(';')) {
                if (start < i)
                    take(start, i);
                start = i + 1;
            }
        }
        if (start < end)
            take(start, end);
    }

    void AddColumn(std::size_t begin, std::size_t end) {
        QueryDefinition::Column column;
        auto last = end;
        if (end - begin > 2 && tokens_[end - 2].IsWord("AS") && tokens_[end - 1].IsName()) {
            column.alias = tokens_[end - 1].text;
            last = end - 2;
        }
        column.expression = Source(begin, last);
        query_.columns.push_back(std::move(column));
    }

    std::string Source(std::size_t begin, std::size_t end) const {
        const auto from = tokens_[begin].begin;
        return std::string(sql_.substr(from, tokens_[end - 1].end - from));
    }

    /// Tables of a FROM clause: names with an alias, joins and parentheses between them. Conditions of
    /// joins hold no tables.
    void ReadInputs(std::size_t begin, std::size_t end) {
        bool expectTable = true;
        for (auto i = begin; i < end; ++i) {
            const auto& token = tokens_[i];
            if (token.IsSymbol('(') && i + 1 < end && tokens_[i + 1].IsWord("SELECT")) {
                i = SkipNested(i, end);
                expectTable = AddInput({}, i, end);
            } else if (token.IsSymbol(',') || token.IsWord("JOIN") || (token.IsSymbol('(') && expectTable)) {
                expectTable = true;
            } else if (token.IsWord("ON")) {
                expectTable = false;
                AddJoin(i, end);
            } else if (expectTable && token.IsName() && !IsJoinWord(token)) {
                expectTable = AddInput(token.text, i, end);
            }
        }
    }

    /// The condition behind an ON, up to the next join or the parenthesis that closes this one.
    void AddJoin(std::size_t on, std::size_t end) {
        int depth = 0;
        auto last = on + 1;
        for (; last < end; ++last) {
            depth += tokens_[last].IsSymbol('(') ? 1 : tokens_[last].IsSymbol(')') ? -1 : 0;
            const bool over = tokens_[last].IsSymbol(',') || tokens_[last].IsSymbol(';') ||
                              IsAny(tokens_[last], {"INNER", "LEFT", "RIGHT", "ON"});
            if (depth < 0 || (depth == 0 && over))
                break;
        }
        bool outer = false;
        for (auto at = on; at > 0 && !outer && !IsAny(tokens_[at], {"INNER", "FROM"}); --at)
            outer = IsAny(tokens_[at], {"LEFT", "RIGHT"});
        if (last > on + 1)
            query_.joins.push_back({Source(on + 1, last), outer});
    }

    static bool IsJoinWord(const SqlToken& token) {
        return IsAny(token, {"INNER", "LEFT", "RIGHT", "OUTER", "AS", "IN"});
    }

    std::size_t SkipNested(std::size_t open, std::size_t end) const {
        int depth = 0;
        for (auto i = open; i < end; ++i) {
            depth += tokens_[i].IsSymbol('(') ? 1 : tokens_[i].IsSymbol(')') ? -1 : 0;
            if (depth == 0)
                return i;
        }
        return end - 1;
    }

    /// Adds the table that ends at token `last` with the alias behind it. Always false: none is expected now.
    bool AddInput(const std::string& table, std::size_t& last, std::size_t end) {
        QueryDefinition::Input input{table, table};
        auto next = last + 1;
        // "[SELECT ...]. AS a" is the older spelling of a nested statement.
        if (next < end && tokens_[next].IsSymbol('.')) {
            input.table.clear();
            last = next++;
        }
        if (next < end && tokens_[next].IsWord("AS"))
            ++next;
        const bool named = next < end && tokens_[next].IsName() && !IsJoinWord(tokens_[next]) &&
                           !IsAny(tokens_[next], {"ON", "JOIN", "SET"});
        if (named) {
            input.alias = tokens_[next].text;
            last = next;
        }
        query_.inputs.push_back(std::move(input));
        return false;
    }

    /// UPDATE tables SET field = value, ...: the changed fields are the columns.
    void ReadUpdate() {
        const auto set = FindOutside({"SET"}, next_);
        const auto end = FindOutside({"WHERE"}, set);
        ReadInputs(std::min(next_ + 1, set), set);
        int depth = 0;
        for (auto start = std::min(set + 1, end), i = start; i < end; ++i) {
            depth += tokens_[i].IsSymbol('(') ? 1 : tokens_[i].IsSymbol(')') ? -1 : 0;
            if (depth == 0 && start < i && tokens_[i].IsSymbol('=')) {
                query_.columns.push_back({Source(start, i), {}});
                start = end;
            } else if (depth == 0 && tokens_[i].IsSymbol(',')) {
                start = i + 1;
            }
        }
    }

    std::string_view sql_;
    std::vector<SqlToken> tokens_;
    QueryDefinition query_;
    std::size_t next_ = 0;
};

} // namespace

QueryDefinition ParseQuerySql(std::string_view sql) {
    return QueryParser(sql).Run();
}

} // namespace tovimar::platform::access
