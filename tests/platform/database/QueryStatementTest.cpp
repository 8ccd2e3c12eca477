#include "platform/access/QueryReader.h"

#include <gtest/gtest.h>

namespace tovimar::platform::access {
namespace {

QueryDefinition Select() {
    QueryDefinition query;
    query.inputs = {{"Orders", "Orders"}, {"Order Lines", "l"}, {"Items", "Items"}};
    query.columns = {{"Orders.ID", ""}, {"Sum(l.Price)", "Total Price"}};
    return query;
}

TEST(QueryStatement, JoinsTablesByTheirTies) {
    auto query = Select();
    query.joins = {{"Orders.ID = l.OrderID", true, "Orders", "l"},
                   {"l.ItemID = Items.ID", false, "l", "Items"},
                   {"l.Kind = Items.Kind", false, "l", "Items"}};
    query.where = "Orders.ID>5";
    query.groups = {"Orders.ID"};
    query.having = "Sum(l.Price)>1";
    query.sorts = {{"Orders.ID", true}};
    query.top = 10;
    query.topPercent = true;
    query.parameters = {{"From Date", 8}};
    EXPECT_EQ(QueryStatement(query),
              "PARAMETERS [From Date] DateTime;\r\n"
              "SELECT TOP 10 PERCENT Orders.ID, Sum(l.Price) AS [Total Price]\r\n"
              "FROM (Orders LEFT JOIN [Order Lines] AS l ON Orders.ID = l.OrderID) INNER JOIN Items ON "
              "(l.ItemID = Items.ID) AND (l.Kind = Items.Kind)\r\n"
              "WHERE Orders.ID>5\r\n"
              "GROUP BY Orders.ID\r\n"
              "HAVING Sum(l.Price)>1\r\n"
              "ORDER BY Orders.ID DESC;");
}

TEST(QueryStatement, KnowsTheKindsOfQueries) {
    auto query = Select();
    query.inputs = {{"Orders", "Orders"}, {"", "n", "SELECT 1 AS x;"}};
    query.columns = {{"*", ""}};
    query.operation = 2;
    query.target = "New Orders";
    EXPECT_EQ(QueryStatement(query), "SELECT * INTO [New Orders]\r\nFROM Orders, (SELECT 1 AS x) AS n;");
    query.operation = 3;
    query.columns = {{"Orders.ID", "", "Order ID"}};
    query.inputs.pop_back();
    EXPECT_EQ(QueryStatement(query),
              "INSERT INTO [New Orders] ( [Order ID] )\r\nSELECT Orders.ID\r\nFROM Orders;");
    query.operation = 4;
    query.columns = {{"Orders.Done", "", "True"}};
    EXPECT_EQ(QueryStatement(query), "UPDATE Orders SET Orders.Done = True;");
    query.operation = 5;
    query.columns = {{"Orders.*", ""}};
    EXPECT_EQ(QueryStatement(query), "DELETE Orders.*\r\nFROM Orders;");
    query.operation = 7;
    EXPECT_EQ(QueryStatement(query), "");
    EXPECT_EQ(QueryStatement({}), "");
}

} // namespace
} // namespace tovimar::platform::access
