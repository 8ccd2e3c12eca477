#include "platform/access/QueryRunner.h"

#include "platform/access/QueryJoin.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <map>
#include <numeric>
#include <set>

namespace tovimar::platform::access {

namespace {

constexpr int kDeepestAlias = 8;
constexpr int kSelect = 1, kUnion = 9;

class Runner : public ExpressionScope {
public:
    Runner(const QueryDefinition& query, const RecordSource& source) : query_(query), join_(query, source) {}

    std::optional<Records> Run(int rows) {
        if (!join_.Complete() || (query_.operation != kSelect && query_.operation != kUnion))
            return std::nullopt;
        join_.Run();
        Filter();
        PlanColumns();
        MakeGroups();
        Sort();
        return Collect(query_.top > 0 ? std::min(rows, query_.top) : rows);
    }

    std::optional<Datum> Value(const NamePath& name, int row) const override {
        const auto place = join_.Resolve(name);
        if (place.input >= 0)
            return join_.CellOf(place, (*view_)[static_cast<std::size_t>(row)]);
        return name.size() == 1 ? AliasValue(name[0], row) : std::nullopt;
    }
    int Rows() const override { return static_cast<int>(view_->size()); }

private:
    struct Column {
        std::string name;
        FieldPlace place; ///< of a plain field
        std::optional<Expression> expression;
        Records::Type type = Records::Type::Unknown;
    };
    using Group = std::vector<int>; ///< numbers of tuples

    /// A column may build on another one by its name.
    std::optional<Datum> AliasValue(const std::string& name, int row) const {
        if (aliasDepth_ >= kDeepestAlias)
            return std::nullopt;
        for (const auto& column : columns_) {
            if (!column.expression || !text::EqualsIgnoringCase(column.name, name))
                continue;
            ++aliasDepth_;
            auto value = column.expression->Evaluate(*this, row);
            --aliasDepth_;
            return value;
        }
        return std::nullopt;
    }

    void Filter() {
        Group all(join_.tuples.size());
        std::iota(all.begin(), all.end(), 0);
        view_ = &all;
        std::vector<QueryJoin::Tuple> kept;
        const auto condition = query_.where.empty() ? std::nullopt : Expression::Parse(query_.where);
        if (!condition)
            return;
        for (std::size_t i = 0; i < join_.tuples.size(); ++i)
            if (condition->Admits(*this, static_cast<int>(i)))
                kept.push_back(join_.tuples[i]);
        join_.tuples = std::move(kept);
    }

    void PlanColumns() {
        int unnamed = 0;
        for (const auto& column : query_.columns) {
            const auto point = column.expression.rfind('*');
            const bool all = point != std::string::npos && point + 1 == column.expression.size() &&
                             (point == 0 || column.expression[point - 1] == '.');
            if (all) {
                AddAll(point == 0 ? "" : column.expression.substr(0, point - 1));
                continue;
            }
            Column planned;
            planned.expression = Expression::Parse(column.expression);
            const auto* name = planned.expression ? planned.expression->AsName() : nullptr;
            if (name != nullptr)
                planned.place = join_.Resolve(*name);
            planned.name = !column.alias.empty() ? column.alias
                           : name != nullptr     ? name->back()
                                                 : "Expr" + std::to_string(1000 + unnamed++);
            Add(std::move(planned), name != nullptr && name->size() > 1 ? (*name)[0] : std::string());
        }
        if (query_.allFields)
            AddAll({});
    }

    void AddAll(std::string alias) {
        std::erase_if(alias, [](char letter) { return letter == '[' || letter == ']'; });
        for (int input = 0; input < join_.InputCount(); ++input) {
            if (!alias.empty() && !text::EqualsIgnoringCase(join_.Alias(input), alias))
                continue;
            const auto& columns = join_.RecordsOf(input).columns;
            for (std::size_t at = 0; at < columns.size(); ++at)
                Add({columns[at].name, {input, static_cast<int>(at)}, std::nullopt, {}}, join_.Alias(input));
        }
    }

    /// A second field of a name is told from the first by its table.
    void Add(Column column, const std::string& qualifier) {
        const bool taken = std::any_of(columns_.begin(), columns_.end(), [&](const Column& other) {
            return text::EqualsIgnoringCase(other.name, column.name);
        });
        if (taken && !qualifier.empty())
            column.name = qualifier + "." + column.name;
        if (column.place.input >= 0)
            column.type = join_.TypeOf(column.place);
        columns_.push_back(std::move(column));
    }

    void MakeGroups() {
        const bool adds = std::any_of(columns_.begin(), columns_.end(), [](const Column& column) {
            return column.expression && column.expression->HasAggregate();
        });
        if (query_.groups.empty() && !adds) {
            for (int i = 0; i < static_cast<int>(join_.tuples.size()); ++i)
                groups_.push_back({i});
            return;
        }
        std::vector<Expression> keys;
        for (const auto& group : query_.groups)
            if (auto expression = Expression::Parse(group))
                keys.push_back(std::move(*expression));
        std::map<std::string, std::size_t> byKey;
        for (int i = 0; i < static_cast<int>(join_.tuples.size()); ++i) {
            const auto [at, fresh] = byKey.emplace(KeyOf(keys, i), groups_.size());
            if (fresh)
                groups_.emplace_back();
            groups_[at->second].push_back(i);
        }
    }

    std::string KeyOf(const std::vector<Expression>& keys, int tuple) {
        const Group own{tuple};
        view_ = &own;
        std::string key;
        for (const auto& expression : keys)
            key += text::FoldCase(expression.Evaluate(*this, 0).value_or(Datum{}).AsText()) + '\n';
        return key;
    }

    void Sort() {
        struct Sorted {
            Group group;
            std::vector<Datum> keys;
        };
        std::vector<std::pair<Expression, bool>> orders;
        for (const auto& sort : query_.sorts)
            if (auto expression = Expression::Parse(sort.expression))
                orders.emplace_back(std::move(*expression), sort.descending);
        if (orders.empty())
            return;
        std::vector<Sorted> sorted;
        for (auto& group : groups_) {
            sorted.push_back({std::move(group), {}});
            view_ = &sorted.back().group;
            for (const auto& order : orders)
                sorted.back().keys.push_back(order.first.Evaluate(*this, 0).value_or(Datum{}));
        }
        std::stable_sort(sorted.begin(), sorted.end(), [&](const Sorted& left, const Sorted& right) {
            for (std::size_t i = 0; i < orders.size(); ++i) {
                // Nulls come first.
                const int order = Compare(left.keys[i], right.keys[i])
                                      .value_or(static_cast<int>(right.keys[i].IsNull()) * -1 +
                                                static_cast<int>(left.keys[i].IsNull()));
                const int rank = left.keys[i].IsNull() != right.keys[i].IsNull()
                                     ? (left.keys[i].IsNull() ? -1 : 1)
                                     : order;
                if (rank != 0)
                    return orders[i].second ? rank > 0 : rank < 0;
            }
            return false;
        });
        groups_.clear();
        for (auto& entry : sorted)
            groups_.push_back(std::move(entry.group));
    }

    std::string CellOf(Column& column, const Group& group) {
        if (column.place.input >= 0) {
            const auto* text = join_.TextOf(column.place, group[0]);
            return text == nullptr ? std::string() : *text;
        }
        const auto value = column.expression ? column.expression->Evaluate(*this, 0) : std::nullopt;
        if (!value)
            return {};
        if (!value->IsNull() || column.type == Records::Type::Unknown)
            column.type = TypeOf(value->kind);
        return value->AsText();
    }

    static Records::Type TypeOf(Datum::Kind kind) {
        switch (kind) {
        case Datum::Kind::Number:
            return Records::Type::Number;
        case Datum::Kind::Boolean:
            return Records::Type::Boolean;
        case Datum::Kind::Date:
            return Records::Type::DateTime;
        default:
            return Records::Type::Text;
        }
    }

    Records Collect(int rows) {
        Records records;
        std::set<std::vector<std::string>> seen;
        for (const auto& group : groups_) {
            if (static_cast<int>(records.rows.size()) >= rows)
                break;
            view_ = &group;
            std::vector<std::string> cells;
            for (auto& column : columns_)
                cells.push_back(CellOf(column, group));
            if (!query_.distinct || seen.insert(cells).second)
                records.rows.push_back(std::move(cells));
        }
        for (const auto& column : columns_)
            records.columns.push_back({column.name, column.type});
        return records;
    }

    const QueryDefinition& query_;
    QueryJoin join_;
    std::vector<Group> groups_;
    std::vector<Column> columns_;
    const Group* view_ = nullptr; ///< tuples that expressions count as their records
    mutable int aliasDepth_ = 0;
};

} // namespace

std::optional<Records> RunQuery(const QueryDefinition& query, const RecordSource& source, int rows) {
    return Runner(query, source).Run(rows);
}

} // namespace tovimar::platform::access
