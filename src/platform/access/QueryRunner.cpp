#include "platform/access/QueryRunner.h"

#include "platform/access/Expression.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <map>
#include <numeric>
#include <set>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

/// Joins that multiply stop here.
constexpr std::size_t kMostTuples = 20000;
constexpr int kDeepestAlias = 8;
constexpr int kSelect = 1, kUnion = 9;

/// One row number per input, -1 for no partner.
using Tuple = std::vector<int>;

struct Place {
    int input = -1;
    int column = -1;
};

class Runner : public ExpressionScope {
public:
    Runner(const QueryDefinition& query, const RecordSource& source) : query_(query) {
        for (const auto& input : query.inputs)
            inputs_.push_back({input.alias, input.table.empty() ? nullptr : source(input.table)});
    }

    std::optional<Records> Run(int rows) {
        const bool missing = std::any_of(inputs_.begin(), inputs_.end(),
                                         [](const Input& input) { return input.records == nullptr; });
        if (inputs_.empty() || missing || (query_.operation != kSelect && query_.operation != kUnion))
            return std::nullopt;
        JoinInputs();
        Filter();
        PlanColumns();
        MakeGroups();
        Sort();
        return Collect(query_.top > 0 ? std::min(rows, query_.top) : rows);
    }

    std::optional<Datum> Value(const NamePath& name, int row) const override {
        const auto place = Resolve(name);
        if (place.input >= 0)
            return CellOf(place, (*view_)[static_cast<std::size_t>(row)]);
        return name.size() == 1 ? AliasValue(name[0], row) : std::nullopt;
    }
    int Rows() const override { return static_cast<int>(view_->size()); }

private:
    struct Input {
        std::string alias;
        const Records* records = nullptr;
    };
    struct Column {
        std::string name;
        Place place; ///< of a plain field
        std::optional<Expression> expression;
        Records::Type type = Records::Type::Unknown;
    };
    using Group = std::vector<int>; ///< numbers of tuples

    const Records& RecordsOf(int input) const { return *inputs_[static_cast<std::size_t>(input)].records; }

    const std::string* TextOf(const Place& place, const Tuple& tuple) const {
        const int row = tuple[static_cast<std::size_t>(place.input)];
        if (row < 0)
            return nullptr;
        const auto& cells = RecordsOf(place.input).rows[static_cast<std::size_t>(row)];
        const auto column = static_cast<std::size_t>(place.column);
        return column < cells.size() ? &cells[column] : nullptr;
    }

    Datum CellOf(const Place& place, int tuple) const {
        const auto* text = TextOf(place, tuples_[static_cast<std::size_t>(tuple)]);
        const auto column = static_cast<std::size_t>(place.column);
        return text == nullptr ? Datum{} : DatumOf(*text, RecordsOf(place.input).columns[column].type);
    }

    /// "Field" in the first input that has it, or "Table.Field".
    Place Resolve(const NamePath& name) const {
        if (const auto known = places_.find(name); known != places_.end())
            return known->second;
        Place place;
        for (std::size_t i = 0; i < inputs_.size() && place.input < 0 && name.size() <= 2; ++i) {
            if (name.size() == 2 && !text::EqualsIgnoringCase(inputs_[i].alias, name[0]))
                continue;
            const int column = inputs_[i].records->ColumnIndex(name.back());
            if (column >= 0)
                place = {static_cast<int>(i), column};
        }
        return places_[name] = place;
    }

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

    struct Link {
        Place known, fresh;
        bool outer = false;
    };

    /// Equalities between an input and those already joined.
    std::vector<Link> LinksOf(int input, const std::set<int>& joined) const {
        std::vector<Link> links;
        const auto collect = [&](const std::string& condition, bool outer) {
            const auto expression = Expression::Parse(condition);
            if (!expression)
                return;
            for (const auto& [left, right] : expression->Equalities()) {
                auto known = Resolve(left), fresh = Resolve(right);
                if (known.input == input)
                    std::swap(known, fresh);
                if (fresh.input == input && joined.count(known.input) > 0)
                    links.push_back({known, fresh, outer});
            }
        };
        for (const auto& join : query_.joins)
            collect(join.condition, join.outer);
        if (!query_.where.empty())
            collect(query_.where, false);
        return links;
    }

    void JoinInputs() {
        std::set<int> joined{0};
        for (int row = 0; row < static_cast<int>(RecordsOf(0).rows.size()); ++row) {
            Tuple tuple(inputs_.size(), -1);
            tuple[0] = row;
            tuples_.push_back(std::move(tuple));
        }
        while (joined.size() < inputs_.size()) {
            int next = -1;
            std::vector<Link> links;
            for (int i = 0; i < static_cast<int>(inputs_.size()) && links.empty(); ++i) {
                if (joined.count(i) > 0)
                    continue;
                links = LinksOf(i, joined);
                next = next < 0 || !links.empty() ? i : next;
            }
            Join(next, links);
            joined.insert(next);
        }
    }

    /// What the linked fields hold together; empty when one of them is null.
    std::string KeyOf(const std::vector<Link>& links, const Tuple& tuple, bool fresh) const {
        std::string key;
        for (const auto& link : links) {
            const auto* text = TextOf(fresh ? link.fresh : link.known, tuple);
            if (text == nullptr || text->empty())
                return {};
            key += text::FoldCase(*text) + '\n';
        }
        return key;
    }

    void Join(int input, const std::vector<Link>& links) {
        std::unordered_map<std::string, std::vector<int>> byKey;
        const auto at = static_cast<std::size_t>(input);
        Tuple probe(inputs_.size(), -1);
        const int rows = static_cast<int>(RecordsOf(input).rows.size());
        for (int row = 0; row < rows; ++row) {
            probe[at] = row;
            byKey[KeyOf(links, probe, true)].push_back(row);
        }
        const bool outer =
            std::any_of(links.begin(), links.end(), [](const Link& link) { return link.outer; });
        std::vector<Tuple> joined;
        for (auto& tuple : tuples_) {
            const auto key = KeyOf(links, tuple, false);
            const auto found = key.empty() && !links.empty() ? byKey.end() : byKey.find(key);
            if (found == byKey.end() && outer)
                joined.push_back(tuple);
            if (found == byKey.end())
                continue;
            for (const int row : found->second) {
                if (joined.size() >= kMostTuples)
                    break;
                tuple[at] = row;
                joined.push_back(tuple);
            }
        }
        tuples_ = std::move(joined);
    }

    void Filter() {
        Group all(tuples_.size());
        std::iota(all.begin(), all.end(), 0);
        view_ = &all;
        std::vector<Tuple> kept;
        const auto condition = query_.where.empty() ? std::nullopt : Expression::Parse(query_.where);
        if (!condition)
            return;
        for (std::size_t i = 0; i < tuples_.size(); ++i)
            if (condition->Admits(*this, static_cast<int>(i)))
                kept.push_back(tuples_[i]);
        tuples_ = std::move(kept);
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
                planned.place = Resolve(*name);
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
        for (std::size_t i = 0; i < inputs_.size(); ++i) {
            if (!alias.empty() && !text::EqualsIgnoringCase(inputs_[i].alias, alias))
                continue;
            const auto& columns = inputs_[i].records->columns;
            for (std::size_t at = 0; at < columns.size(); ++at)
                Add({columns[at].name, {static_cast<int>(i), static_cast<int>(at)}, std::nullopt, {}},
                    inputs_[i].alias);
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
            column.type =
                RecordsOf(column.place.input).columns[static_cast<std::size_t>(column.place.column)].type;
        columns_.push_back(std::move(column));
    }

    void MakeGroups() {
        const bool adds = std::any_of(columns_.begin(), columns_.end(), [](const Column& column) {
            return column.expression && column.expression->HasAggregate();
        });
        if (query_.groups.empty() && !adds) {
            for (int i = 0; i < static_cast<int>(tuples_.size()); ++i)
                groups_.push_back({i});
            return;
        }
        std::vector<Expression> keys;
        for (const auto& group : query_.groups)
            if (auto expression = Expression::Parse(group))
                keys.push_back(std::move(*expression));
        std::map<std::string, std::size_t> byKey;
        for (int i = 0; i < static_cast<int>(tuples_.size()); ++i) {
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
            const auto* text = TextOf(column.place, tuples_[static_cast<std::size_t>(group[0])]);
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
    std::vector<Input> inputs_;
    std::vector<Tuple> tuples_;
    std::vector<Group> groups_;
    std::vector<Column> columns_;
    const Group* view_ = nullptr; ///< tuples that expressions count as their records
    mutable std::map<NamePath, Place> places_;
    mutable int aliasDepth_ = 0;
};

} // namespace

std::optional<Records> RunQuery(const QueryDefinition& query, const RecordSource& source, int rows) {
    return Runner(query, source).Run(rows);
}

} // namespace tovimar::platform::access
