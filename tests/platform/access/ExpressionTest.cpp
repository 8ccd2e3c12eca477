#include "platform/access/Expression.h"
#include "platform/access/QueryReader.h"
#include "platform/access/QueryRunner.h"
#include "platform/text/Text.h"

#include <gtest/gtest.h>

#include <map>

namespace tovimar::test {

using namespace platform::access;

namespace {

/// Two records of an order: names, amounts, a day and an empty remark.
class Orders : public ExpressionScope {
public:
    std::optional<Datum> Value(const NamePath& name, int row) const override {
        const auto at = static_cast<std::size_t>(row);
        if (name.back() == "Name")
            return Datum::Text(at == 0 ? "Miller" : "Brown");
        if (name.back() == "Price")
            return Datum::Number(at == 0 ? 2.5 : 4);
        if (name.back() == "Day")
            return Datum::Date(*ParseDate("3/14/2024"));
        if (name.back() == "Remark")
            return Datum{};
        return std::nullopt;
    }
    int Rows() const override { return 2; }
    std::optional<Datum> LookUp(const std::string& function, const std::string& field,
                                const std::string& domain, const std::string& condition) const override {
        return Datum::Text(function + " " + field + " " + domain +
                           (condition.empty() ? "" : " " + condition));
    }
};

std::string Result(const std::string& text) {
    const auto expression = Expression::Parse(text);
    if (!expression)
        return "no expression";
    const auto value = expression->Evaluate(Orders(), 0);
    return value ? value->AsText() : "unknown";
}

} // namespace

TEST(Expressions, AreWorkedOutAsTheHostDoes) {
    const std::map<std::string, std::string> cases = {
        {"1+2*3^2-4/2", "17"},
        {"-2+10 Mod 4", "0"},
        {"7\\2 & \"x\"", "3x"},
        {"[Price]*2 & \" \" & Orders.Name", "5 Miller"},
        {"[Forms]![Main]![Orders].[Form]![Name]", "Miller"},
        {"\"a\" & Null & [Remark]", "a"},
        {"[Remark]+1", ""},
        {"IIf([Name]='MILLER', \"yes\", Unknown(1))", "yes"},
        {"IIf(IsNull([Remark]),\"none\",[Remark])", "none"},
        {"Nz([Remark],\"-\") & Nz([Remark])", "-"},
        {"UCase(Left$([Name],2)) & Mid([Name],3) & Right([Name],1)", "MIllerr"},
        {"Sum([Price])", "6.5"},
        {"Count(*) & Avg([Price]) & Min([Name]) & Max([Price])", "23.25Brown4"},
        {"Format([Day],\"d-mmm-yyyy\") & Format(0.5,\"Percent\")", "14-Mar-202450.00%"},
        {"[Day]+1", "3/15/2024"},
        {"[Day]>#3/1/2024# And Not [Price] Between 3 And 5", "True"},
        {"[Name] Like \"m*r\" And [Name] In (\"x\",\"miller\") And [Remark] Is Null", "True"},
        {"[Unknown]=1 And 1=2", "False"},
        {"[Unknown]=1 Or 1=2", "unknown"},
        {"DLookUp(\"[Title]\",\"Settings\")", "dlookup [Title] Settings"},
        {"DSum(\"Fee\",\"Settings\",\"No=\" & 4)", "dsum Fee Settings No=4"},
        {"1/0", "unknown"},
        {"\"open", "open"},
        {"", "no expression"},
        {"1 +", "no expression"},
        {"(1", "no expression"},
        {"[Name] In (SELECT x FROM y)", "no expression"},
    };
    for (const auto& [text, expected] : cases)
        EXPECT_EQ(Result(text), expected) << text;
    EXPECT_EQ(Result(std::string(5000, '(')), "no expression");
    EXPECT_EQ(Result(std::string(5000, '-') + "1"), "no expression");
}

TEST(Expressions, ValuesShowInTheirFormats) {
    const auto day = Datum::Date(*ParseDate("2024-03-04 15:05:09"));
    const std::vector<std::tuple<Datum, std::string, std::string>> cases = {
        {day, "", "3/4/2024 3:05:09 PM"},
        {day, "Short Date", "3/4/2024"},
        {day, "Medium Date", "04-Mar-24"},
        {day, "Long Date", "Monday, March 4, 2024"},
        {day, "Short Time", "15:05"},
        {day, "d/mm/yy h:nn ampm", "4/03/24 3:05 PM"},
        {day, "h:mm \"Uhr\"", "15:05 Uhr"},
        {Datum::Date(0.5), "", "12:00:00 PM"},
        {Datum::Number(1234.5), "Currency", "$1,234.50"},
        {Datum::Number(-1234.5), "Currency", "($1,234.50)"},
        {Datum::Number(1234.5), "General Number", "1234.5"},
        {Datum::Number(1234567), "#,##0.00", "1,234,567.00"},
        {Datum::Number(-3), "0;(0);\"none\"", "(3)"},
        {Datum::Number(0.125), "0.#%", "12.5%"},
        {Datum::Number(7), "000", "007"},
        {Datum::Number(0), "0;(0);\"none\"", "none"},
        {Datum::Text("abc"), ">", "ABC"},
        {Datum::Text("abc"), "Currency", "abc"},
        {Datum::Boolean(true), "Yes/No", "Yes"},
        {Datum{}, "Currency", ""},
        {Datum::Number(1), "\\", "1"},
    };
    for (const auto& [value, format, expected] : cases)
        EXPECT_EQ(FormatDatum(value, format), expected) << format;
    EXPECT_FALSE(ParseDate("13/45/2024"));
    EXPECT_FALSE(ParseDate("soon"));
}

namespace {

/// Runs a statement over three small tables; each record's cells are joined.
std::vector<std::string> Rows(const std::string& sql, int rows = 10) {
    using Type = Records::Type;
    const std::map<std::string, Records> tables = {
        {"Customers",
         {{{"ID", Type::Number}, {"Name", Type::Text}}, {{"1", "Miller"}, {"2", "Brown"}, {"10", "Adams"}}}},
        {"Orders",
         {{{"Num", Type::Number},
           {"Customer", Type::Number},
           {"Total", Type::Currency},
           {"Day", Type::DateTime}},
          {{"7", "2", "10", "3/4/2024"},
           {"8", "1", "2.5", "12/1/2023"},
           {"9", "2", "30", ""},
           {"11", "", "5", "1/1/2024"}}}},
        {"Empty", {{{"ID", Type::Number}}, {}}}};
    const auto records = RunQuery(
        ParseQuerySql(sql),
        [&](const std::string& name) {
            const auto found = tables.find(name);
            return found == tables.end() ? nullptr : &found->second;
        },
        rows);
    if (!records)
        return {"none"};
    std::vector<std::string> lines;
    for (const auto& cells : records->rows) {
        lines.push_back(text::Join(cells, "|"));
    }
    return lines;
}

using Lines = std::vector<std::string>;

} // namespace

TEST(QueryRuns, JoinFilterGroupAndSort) {
    EXPECT_EQ(Rows("SELECT Name, Num FROM Customers INNER JOIN Orders ON Customers.ID = Orders.Customer "
                   "ORDER BY Num DESC;"),
              (Lines{"Brown|9", "Miller|8", "Brown|7"}));
    EXPECT_EQ(Rows("SELECT c.Name, o.Num FROM Customers AS c LEFT JOIN Orders AS o ON (c.ID = o.Customer) "
                   "ORDER BY c.ID"),
              (Lines{"Miller|8", "Brown|7", "Brown|9", "Adams|"}));
    EXPECT_EQ(Rows("SELECT Name, Total*2 AS Twice FROM Customers, Orders WHERE Customers.ID=Orders.Customer "
                   "AND Total>3"),
              (Lines{"Brown|20", "Brown|60"}));
    EXPECT_EQ(
        Rows("SELECT Customer, Sum(Total) AS S, Count(*) FROM Orders GROUP BY Customer ORDER BY Customer"),
        (Lines{"|5|1", "1|2.5|1", "2|40|2"}));
    EXPECT_EQ(Rows("SELECT TOP 2 * FROM Orders ORDER BY Day"), (Lines{"9|2|30|", "8|1|2.5|12/1/2023"}));
    EXPECT_EQ(Rows("SELECT DISTINCT Customer FROM Orders WHERE Customer Is Not Null"), (Lines{"2", "1"}));
    EXPECT_EQ(Rows("SELECT UCase([Name]) AS Big, [Big] & \"!\" AS Bigger FROM Customers", 1),
              (Lines{"MILLER|MILLER!"}));
    EXPECT_EQ(Rows("SELECT Name FROM Customers UNION SELECT Num FROM Orders", 2), (Lines{"Miller", "Brown"}));
}

TEST(QueryRuns, WhatCanNotBeKnownDoesNotHideRecords) {
    EXPECT_EQ(Rows("SELECT Name FROM Customers WHERE ID=[Forms]![Main]![ID] AND ID<10"),
              (Lines{"Miller", "Brown"}));
    EXPECT_EQ(Rows("SELECT OwnFunction(Name) AS X FROM Customers", 1), (Lines{""}));
    EXPECT_EQ(Rows("SELECT * FROM Customers INNER JOIN Empty ON Customers.ID = Empty.ID"), Lines{});
    EXPECT_EQ(Rows("SELECT a.ID FROM Customers AS a, Customers AS b, Customers AS c, Customers AS d", 1),
              (Lines{"1"}));
    EXPECT_EQ(Rows("SELECT [X] AS Y, [Y] AS X FROM Customers", 1), (Lines{"|"}));
    EXPECT_EQ(Rows("SELECT * FROM Missing"), (Lines{"none"}));
    EXPECT_EQ(Rows("DELETE * FROM Orders"), (Lines{"none"}));
    EXPECT_EQ(Rows("TRANSFORM Sum(Total) SELECT Num FROM Orders GROUP BY Num PIVOT Day"), (Lines{"none"}));
}

} // namespace tovimar::test
