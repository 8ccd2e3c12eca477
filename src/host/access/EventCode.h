#pragma once

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// The code of an event's procedure as single statements. It is read for the commands in it, not run:
/// whatever a branch or a loop holds counts as a statement like any other.
namespace tovimar {

/// Trimmed, in the order of the source: lines that go on with "_" joined, comments dropped, several
/// statements of a line apart, the commands of a one-line If without their condition, "Call x(a)" as "x a".
std::vector<std::string> EventStatements(std::string_view code);

/// Names that stand for a text: variables and constants that a quoted text is assigned to.
class TextNames {
public:
    /// Takes the name if the statement is such an assignment: `stDocName = "Orders"`,
    /// `Private Const Detail As String = "Order Details"`. The last assignment of a name counts.
    void Take(std::string_view statement);
    /// Null for another name.
    const std::string* Find(std::string_view name) const;

private:
    std::unordered_map<std::string, std::string> texts_; ///< by folded name
};

/// Where `sought` stands in the code outside quoted texts, npos when it doesn't; without regard to case.
std::size_t FindOutsideQuotes(std::string_view code, std::string_view sought, std::size_t from = 0);

} // namespace tovimar
