#include "platform/access/QueryJoin.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>

namespace tovimar::platform::access {

namespace {

constexpr std::size_t kMostTuples = 20000;

} // namespace

QueryJoin::QueryJoin(const QueryDefinition& query, const RecordSource& source) : query_(query) {
    for (const auto& input : query.inputs)
        inputs_.push_back({input.alias, input.table.empty() ? nullptr : source(input.table)});
}

bool QueryJoin::Complete() const {
    return !inputs_.empty() && std::none_of(inputs_.begin(), inputs_.end(),
                                            [](const Input& input) { return input.records == nullptr; });
}

FieldPlace QueryJoin::Resolve(const NamePath& name) const {
    if (const auto known = places_.find(name); known != places_.end())
        return known->second;
    FieldPlace place;
    for (std::size_t i = 0; i < inputs_.size() && place.input < 0 && name.size() <= 2; ++i) {
        if (name.size() == 2 && !text::EqualsIgnoringCase(inputs_[i].alias, name[0]))
            continue;
        const int column = inputs_[i].records->ColumnIndex(name.back());
        if (column >= 0)
            place = {static_cast<int>(i), column};
    }
    return places_[name] = place;
}

Records::Type QueryJoin::TypeOf(const FieldPlace& place) const {
    return RecordsOf(place.input).columns[static_cast<std::size_t>(place.column)].type;
}

const std::string* QueryJoin::TextOf(const FieldPlace& place, const Tuple& tuple) const {
    const int row = tuple[static_cast<std::size_t>(place.input)];
    if (row < 0)
        return nullptr;
    const auto& cells = RecordsOf(place.input).rows[static_cast<std::size_t>(row)];
    const auto column = static_cast<std::size_t>(place.column);
    return column < cells.size() ? &cells[column] : nullptr;
}

const std::string* QueryJoin::TextOf(const FieldPlace& place, int tuple) const {
    return TextOf(place, tuples[static_cast<std::size_t>(tuple)]);
}

Datum QueryJoin::CellOf(const FieldPlace& place, int tuple) const {
    const auto* text = TextOf(place, tuple);
    return text == nullptr ? Datum{} : DatumOf(*text, TypeOf(place));
}

/// Equalities between an input and those already joined.
std::vector<QueryJoin::Link> QueryJoin::LinksOf(int input, const std::set<int>& joined) const {
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

void QueryJoin::Run() {
    std::set<int> joined{0};
    for (int row = 0; row < static_cast<int>(RecordsOf(0).rows.size()); ++row) {
        Tuple tuple(inputs_.size(), -1);
        tuple[0] = row;
        tuples.push_back(std::move(tuple));
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
        Add(next, links);
        joined.insert(next);
    }
}

/// What the linked fields hold together; empty when one of them is null.
std::string QueryJoin::KeyOf(const std::vector<Link>& links, const Tuple& tuple, bool fresh) const {
    std::string key;
    for (const auto& link : links) {
        const auto* text = TextOf(fresh ? link.fresh : link.known, tuple);
        if (text == nullptr || text->empty())
            return {};
        key += text::FoldCase(*text) + '\n';
    }
    return key;
}

void QueryJoin::Add(int input, const std::vector<Link>& links) {
    std::unordered_map<std::string, std::vector<int>> byKey;
    const auto at = static_cast<std::size_t>(input);
    Tuple probe(inputs_.size(), -1);
    const int rows = static_cast<int>(RecordsOf(input).rows.size());
    for (int row = 0; row < rows; ++row) {
        probe[at] = row;
        byKey[KeyOf(links, probe, true)].push_back(row);
    }
    const bool outer = std::any_of(links.begin(), links.end(), [](const Link& link) { return link.outer; });
    std::vector<Tuple> joined;
    for (auto& tuple : tuples) {
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
    tuples = std::move(joined);
}

} // namespace tovimar::platform::access
