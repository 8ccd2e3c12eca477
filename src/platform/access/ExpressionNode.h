#pragma once

#include "platform/access/Expression.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace tovimar::platform::access {

/// One operation of an expression with its operands.
struct ExpressionNode {
    enum class Kind { Literal, Name, Operator, Call };
    Kind kind = Kind::Literal;
    Datum literal;
    NamePath name;
    std::string word; ///< operator or function, folded: "+", "and", "left"
    std::vector<std::unique_ptr<ExpressionNode>> parts;
};

/// Value of an operator whose operands are known.
std::optional<Datum> Operate(const std::string& operation, const std::vector<Datum>& operands);
/// Value of a function; none for an unknown one.
std::optional<Datum> CallFunction(const std::string& function, const std::vector<Datum>& arguments);
bool IsAggregateFunction(const std::string& function);
/// "Yes", "Null", ... and the functions that need no argument.
std::optional<Datum> ConstantNamed(const std::string& folded);

} // namespace tovimar::platform::access
