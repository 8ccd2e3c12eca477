#pragma once

#include "platform/access/Datum.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// The host's expressions as controls, queries and conditions hold them: operators, the common functions
/// and aggregates over the records at hand. What can't be known gives no value; nothing is raised.
namespace tovimar::platform::access {

/// "[Orders].[Total]", "Forms!Main!Total": its parts without brackets.
using NamePath = std::vector<std::string>;

/// What an expression asks of the place where it stands.
class ExpressionScope {
public:
    virtual ~ExpressionScope() = default;
    /// Of a field or control in a record; none when the name isn't known there.
    virtual std::optional<Datum> Value(const NamePath& name, int row) const = 0;
    /// Records that an aggregate goes over, and the first of them.
    virtual int Rows() const { return 0; }
    virtual int FirstRow() const { return 0; }
    /// Of the records of a table or query that fulfil a condition, all with an empty one: DLookUp and its
    /// like. `function` is folded.
    virtual std::optional<Datum> LookUp(const std::string& /*function*/, const std::string& /*expression*/,
                                        const std::string& /*domain*/,
                                        const std::string& /*condition*/) const {
        return std::nullopt;
    }
};

struct ExpressionNode;

class Expression {
public:
    /// None for a text that is no expression or too long for one.
    static std::optional<Expression> Parse(std::string_view text);

    std::optional<Datum> Evaluate(const ExpressionScope& scope, int row) const;
    /// Only the conditions that aren't known to fail count: what can't be worked out is taken for true.
    bool Admits(const ExpressionScope& scope, int row) const;

    bool HasAggregate() const;
    /// The name, if the expression is nothing else.
    const NamePath* AsName() const;
    /// Names that must be equal for the condition to hold.
    std::vector<std::pair<NamePath, NamePath>> Equalities() const;

private:
    explicit Expression(std::shared_ptr<const ExpressionNode> root) : root_(std::move(root)) {}
    std::shared_ptr<const ExpressionNode> root_;
};

/// Date() and Now() of every picture, so that the same design gives the same one: 14 March 2024, 9:30.
inline constexpr double kSampleToday = 45365;
inline constexpr double kSampleNow = kSampleToday + 9.5 / 24;

} // namespace tovimar::platform::access
