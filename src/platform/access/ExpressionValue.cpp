#include "platform/access/ExpressionNode.h"
#include "platform/text/Text.h"

#include <cmath>

/// What expressions come to.
namespace tovimar::platform::access {

namespace {

using Node = ExpressionNode;
using Value = std::optional<Datum>;

bool IsLookUp(const std::string& word) {
    for (const auto* name : {"dlookup", "dfirst", "dlast", "dcount", "dsum", "davg", "dmax", "dmin"})
        if (word == name)
            return true;
    return false;
}

/// Adds up an aggregate's values row by row; nulls don't count.
class Aggregate {
public:
    explicit Aggregate(const std::string& function) : function_(function) {}

    void Add(const Datum& value) {
        if (value.IsNull())
            return;
        ++count_;
        sum_ += value.AsNumber().value_or(0);
        if (count_ == 1)
            first_ = least_ = most_ = value;
        last_ = value;
        if (Compare(value, least_).value_or(0) < 0)
            least_ = value;
        if (Compare(value, most_).value_or(0) > 0)
            most_ = value;
    }

    Datum Result() const {
        if (function_ == "count")
            return Datum::Number(count_);
        if (count_ == 0)
            return {};
        if (function_ == "sum")
            return Datum::Number(sum_);
        if (function_ == "avg")
            return Datum::Number(sum_ / count_);
        if (function_ == "min")
            return least_;
        if (function_ == "max")
            return most_;
        return function_ == "last" ? last_ : first_;
    }

private:
    const std::string& function_;
    int count_ = 0;
    double sum_ = 0;
    Datum first_, last_, least_, most_;
};

class Evaluator {
public:
    Evaluator(const ExpressionScope& scope, int row) : scope_(scope), row_(row) {}

    Value Of(const Node& node) const {
        switch (node.kind) {
        case Node::Kind::Literal:
            return node.literal;
        case Node::Kind::Name:
            return scope_.Value(node.name, row_);
        case Node::Kind::Operator:
            return OperatorOf(node);
        case Node::Kind::Call:
            return CallOf(node);
        }
        return std::nullopt;
    }

private:
    Value OperatorOf(const Node& node) const {
        if (node.word == "and" || node.word == "or")
            return LogicOf(node);
        std::vector<Datum> operands;
        for (const auto& part : node.parts) {
            auto value = Of(*part);
            if (!value)
                return std::nullopt;
            operands.push_back(std::move(*value));
        }
        return Operate(node.word, operands);
    }

    /// One side may settle the answer though the other isn't known.
    Value LogicOf(const Node& node) const {
        const bool settling = node.word == "or";
        bool unknown = false;
        for (const auto& part : node.parts) {
            const auto value = Of(*part);
            if (value && value->IsTrue() == settling)
                return Datum::Boolean(settling);
            unknown = unknown || !value;
        }
        return unknown ? std::nullopt : Value(Datum::Boolean(!settling));
    }

    Value CallOf(const Node& node) const {
        if (IsAggregateFunction(node.word))
            return AggregateOf(node);
        if (IsLookUp(node.word))
            return LookUpOf(node);
        // Only the branch taken needs to be known.
        if (node.word == "iif" && node.parts.size() == 3) {
            const auto condition = Of(*node.parts[0]);
            return condition ? Of(*node.parts[condition->IsTrue() ? 1 : 2]) : std::nullopt;
        }
        std::vector<Datum> arguments;
        for (const auto& part : node.parts) {
            auto value = Of(*part);
            if (!value)
                return std::nullopt;
            arguments.push_back(std::move(*value));
        }
        return CallFunction(node.word, arguments);
    }

    Value AggregateOf(const Node& node) const {
        if (node.parts.size() != 1 || scope_.Rows() == 0)
            return std::nullopt;
        Aggregate aggregate(node.word);
        const int first = scope_.FirstRow();
        for (int row = first; row < first + scope_.Rows(); ++row) {
            const auto value = Evaluator(scope_, row).Of(*node.parts[0]);
            if (!value)
                return std::nullopt;
            aggregate.Add(*value);
        }
        return aggregate.Result();
    }

    Value LookUpOf(const Node& node) const {
        if (node.parts.size() < 2)
            return std::nullopt;
        const auto expression = Of(*node.parts[0]), domain = Of(*node.parts[1]);
        if (!expression || !domain)
            return std::nullopt;
        // A condition that asks for something unknown is left out of account.
        const auto condition = node.parts.size() > 2 ? Of(*node.parts[2]).value_or(Datum{}) : Datum{};
        return scope_.LookUp(node.word, expression->AsText(), domain->AsText(), condition.AsText());
    }

    const ExpressionScope& scope_;
    int row_;
};

} // namespace

std::optional<Datum> Expression::Evaluate(const ExpressionScope& scope, int row) const {
    return Evaluator(scope, row).Of(*root_);
}

bool Expression::Admits(const ExpressionScope& scope, int row) const {
    const auto value = Evaluate(scope, row);
    return !value || value->IsTrue();
}

} // namespace tovimar::platform::access
