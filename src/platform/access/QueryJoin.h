#pragma once

#include "platform/access/Expression.h"
#include "platform/access/QueryRunner.h"

#include <map>
#include <set>
#include <string>
#include <vector>

/// The sources of a query, joined on equal fields.
namespace tovimar::platform::access {

/// A field of one of the sources; -1 where there is none.
struct FieldPlace {
    int input = -1;
    int column = -1;
};

class QueryJoin {
public:
    /// One row number per source, -1 for no partner.
    using Tuple = std::vector<int>;

    QueryJoin(const QueryDefinition& query, const RecordSource& source);

    /// Is every source at hand, and at least one?
    bool Complete() const;
    /// Makes the tuples; at most 20,000 of them, so that joins that multiply come to an end.
    void Run();
    /// "Field" in the first source that has it, or "Table.Field".
    FieldPlace Resolve(const NamePath& name) const;

    int InputCount() const { return static_cast<int>(inputs_.size()); }
    const std::string& Alias(int input) const { return inputs_[static_cast<std::size_t>(input)].alias; }
    const Records& RecordsOf(int input) const { return *inputs_[static_cast<std::size_t>(input)].records; }
    Records::Type TypeOf(const FieldPlace& place) const;
    /// Text of a cell; null without a partner.
    const std::string* TextOf(const FieldPlace& place, int tuple) const;
    Datum CellOf(const FieldPlace& place, int tuple) const;

    std::vector<Tuple> tuples;

private:
    struct Input {
        std::string alias;
        const Records* records = nullptr;
    };
    struct Link {
        FieldPlace known, fresh;
        bool outer = false;
    };

    std::vector<Link> LinksOf(int input, const std::set<int>& joined) const;
    void Add(int input, const std::vector<Link>& links);
    const std::string* TextOf(const FieldPlace& place, const Tuple& tuple) const;
    std::string KeyOf(const std::vector<Link>& links, const Tuple& tuple, bool fresh) const;

    const QueryDefinition& query_;
    std::vector<Input> inputs_;
    mutable std::map<NamePath, FieldPlace> places_;
};

} // namespace tovimar::platform::access
