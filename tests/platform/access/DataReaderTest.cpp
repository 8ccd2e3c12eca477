#include "platform/access/Fixtures.h"
#include "platform/access/QueryReader.h"
#include "platform/access/TableReader.h"
#include "platform/text/Text.h"

#include <map>

namespace tovimar::platform::access {
namespace {

/// "name<-table.field" of each field, joined by blanks; calculated ones are the name alone.
std::string Describe(const std::vector<FieldDefinition>& fields) {
    std::string text;
    for (const auto& field : fields)
        text += (text.empty() ? "" : " ") + field.name +
                (field.sourceField.empty() ? "" : "<-" + field.sourceTable + "." + field.sourceField);
    return text;
}

class QueryFields : public ::testing::Test {
protected:
    QueryFields() {
        for (const auto& [name, fields] :
             {std::pair("Orders", "ID,Customer,Total"), std::pair("Customers", "ID,Name")}) {
            auto& table = tables[name];
            table.name = name;
            for (const auto& field : text::Split(fields, ",")) {
                table.fields.emplace_back();
                table.fields.back().name = field;
            }
        }
    }
    std::string Fields(const std::string& sql) {
        return Describe(ResolveQueryFields(ParseQuerySql(sql), sources));
    }

    template <typename T> static const T* Find(const std::map<std::string, T>& map, const std::string& name) {
        const auto found = map.find(name);
        return found == map.end() ? nullptr : &found->second;
    }

    std::map<std::string, TableDefinition> tables;
    std::map<std::string, QueryDefinition> queries;
    FieldSources sources{[this](const std::string& name) { return Find(tables, name); },
                         [this](const std::string& name) { return Find(queries, name); }};
};

TEST_F(QueryFields, FollowNamesToTheirTables) {
    EXPECT_EQ(Fields("SELECT Orders.ID, [Customer], Total*2 AS Twice, Date() FROM Orders;"),
              "ID<-Orders.ID Customer<-Orders.Customer Twice Expr1000");
    EXPECT_EQ(Fields("SELECT o.[Total] AS Sum, c.Name FROM (Orders AS o INNER JOIN Customers c ON "
                     "(o.Customer = c.ID))"),
              "Sum<-Orders.Total Name<-Customers.Name");
    EXPECT_EQ(Fields("SELECT * FROM Customers"), "ID<-Customers.ID Name<-Customers.Name");
    EXPECT_EQ(Fields("SELECT Orders.*, Customers.ID FROM Orders, Customers"),
              "ID<-Orders.ID Customer<-Orders.Customer Total<-Orders.Total Customers.ID<-Customers.ID");
    EXPECT_EQ(Fields("SELECT DISTINCT TOP 5 Name FROM Customers WHERE ID IN (SELECT ID FROM Orders)"),
              "Name<-Customers.Name");
    EXPECT_EQ(Fields("SELECT IIf([a]=\"x, y\",1,(2)) AS b, 'FROM' AS c FROM Orders"), "b c");
    EXPECT_EQ(Fields("SELECT x.Any, Other FROM Unknown AS x"), "Any<-Unknown.Any Other<-Unknown.Other");
}

TEST_F(QueryFields, OfOtherStatements) {
    EXPECT_EQ(Fields("SELECT ID FROM Orders UNION SELECT ID FROM Customers"), "ID<-Orders.ID");
    EXPECT_EQ(Fields("(SELECT Name FROM Customers) UNION ALL (SELECT ID FROM Orders);"),
              "Name<-Customers.Name");
    EXPECT_EQ(Fields("TRANSFORM Sum(Total) SELECT Customer FROM Orders GROUP BY Customer PIVOT ID"),
              "Customer<-Orders.Customer");
    EXPECT_EQ(Fields("UPDATE Orders SET Orders.Total = (1=2), Customer = 5 WHERE ID=1"),
              "Total<-Orders.Total Customer<-Orders.Customer");
    EXPECT_EQ(Fields("INSERT INTO Log ( a, b ) SELECT ID, Total FROM Orders"),
              "ID<-Orders.ID Total<-Orders.Total");
    EXPECT_EQ(Fields("DELETE Orders.* FROM Orders WHERE Total=0"),
              "ID<-Orders.ID Customer<-Orders.Customer Total<-Orders.Total");
    EXPECT_EQ(Fields("PARAMETERS [a] Long; SELECT ID FROM Orders"), "ID<-Orders.ID");
    EXPECT_EQ(Fields("SELECT t.n FROM (SELECT Name AS n FROM Customers) AS t"), "n");
    for (const auto* odd :
         {"", ";", "SELECT", "SELECT FROM", "SELECT , , FROM ((((", "CREATE TABLE a (b INT)", "[", "'"})
        Fields(odd);
}

TEST_F(QueryFields, GoThroughOtherQueriesAndEndInCircles) {
    queries["Inner"] = ParseQuerySql("SELECT Orders.Total AS Amount, 1+1 AS Two FROM Orders");
    EXPECT_EQ(Fields("SELECT Inner.Amount, Two FROM [Inner]"), "Amount<-Orders.Total Two");
    queries["A"] = ParseQuerySql("SELECT B.* FROM B");
    queries["B"] = ParseQuerySql("SELECT A.*, A.x FROM A, A AS A2");
    EXPECT_EQ(Fields("SELECT * FROM A"), "x");
    // Each level doubles the one below: the whole must stay bounded.
    queries["L0"] = ParseQuerySql("SELECT * FROM Orders");
    for (int i = 1; i < 40; ++i) {
        const auto below = "L" + std::to_string(i - 1);
        queries["L" + std::to_string(i)] = ParseQuerySql("SELECT * FROM " + below + ", " + below + " AS b");
    }
    EXPECT_LE(ResolveQueryFields(queries["L39"], sources).size(), 4096U);
}

TEST_F(QueryFields, ComeFromTheGridOfAnExport) {
    const auto query = ReadQueryExport(
        "Operation =1\nOption =0\nBegin InputTables\nName =\"Orders\"\nAlias =\"o\"\n"
        "Name =\"Customers\"\nEnd\nBegin OutputColumns\nAlias =\"Sum\"\nExpression =\"o.Total\"\n"
        "Expression =\"Customers.Name\"\nEnd\ndbText \"Description\" =\"All\"\n",
        "/q.bas");
    EXPECT_EQ(Describe(ResolveQueryFields(query, sources)), "Sum<-Orders.Total Name<-Customers.Name");
    EXPECT_EQ(FindNamedText(query.properties, "description"), "All");
    const auto all =
        ReadQueryExport("Operation =1\nOption =1\nBegin InputTables\nName =\"Customers\"\nEnd\n", "/q.bas");
    EXPECT_EQ(ResolveQueryFields(all, sources).size(), 2U);
    const auto sql =
        ReadQueryExport("dbMemo \"SQL\" =\"SELECT ID\\015\\012FROM Ord\"\n    \"ers;\"\n", "/q.bas");
    EXPECT_EQ(Describe(ResolveQueryFields(sql, sources)), "ID<-Orders.ID");
}

TEST(TableReader, ReadsStatementsOfBothWriters) {
    const auto table = ReadTableSql(
        "CREATE TABLE [Old ''n'' new] (\n [ID] AUTOINCREMENT CONSTRAINT [PrimaryKey] PRIMARY KEY "
        "UNIQUE NOT NULL ,\n [Name] VARCHAR (50),\n [Price] CURRENCY,\n  CONSTRAINT \n)\n"
        "CREATE UNIQUE INDEX [ByName] ON [Old] ([Name] ASC)\n",
        "x");
    EXPECT_EQ(table.name, "Old 'n' new");
    ASSERT_EQ(table.fields.size(), 3U);
    EXPECT_TRUE(table.fields[0].inPrimaryKey && table.fields[0].autoNumber && table.fields[0].required);
    EXPECT_EQ(table.fields[1].size, 50);
    EXPECT_EQ(table.fields[2].type, FieldType::Currency);
    EXPECT_EQ(table.indexes.back().fields, std::vector<std::string>{"Name"});
    const auto keyed = ReadTableSql(
        "CREATE TABLE [t] ([a] LONG, [b] BIT, CONSTRAINT [PrimaryKey] PRIMARY KEY ([a], [b]))", "t");
    EXPECT_TRUE(keyed.fields[0].inPrimaryKey && keyed.fields[1].inPrimaryKey);
    for (const auto* odd :
         {"", "CREATE TABLE", "CREATE TABLE [t] (", "CREATE INDEX", "CREATE TABLE [t] ([a", ")))"})
        EXPECT_LE(ReadTableSql(odd, "t").fields.size(), 1U);
}

TEST(TableReader, MergesTheSchemaBesideAStatement) {
    auto table = ReadTableSql("CREATE TABLE [t] ([It's] VARCHAR (9))", "t");
    MergeTableSchema(
        R"(<?xml version="1.0"?><xsd:schema xmlns:xsd="x" xmlns:od="y"><xsd:element name="dataroot"/>
<xsd:element name="t"><xsd:annotation><xsd:appinfo><od:tableProperty name="Description" value="Things &amp; more"/></xsd:appinfo></xsd:annotation>
<xsd:complexType><xsd:sequence><xsd:element name="It_x0027_s" od:jetType="text"><xsd:annotation><xsd:appinfo>
<od:fieldProperty name="Description" value="What it is"/></xsd:appinfo></xsd:annotation></xsd:element>
<xsd:element name="New" od:jetType="datetime"/></xsd:sequence></xsd:complexType></xsd:element></xsd:schema>)",
        "/t.xml", table);
    EXPECT_EQ(FindNamedText(table.properties, "Description"), "Things & more");
    ASSERT_EQ(table.fields.size(), 2U);
    EXPECT_EQ(FindNamedText(table.fields[0].properties, "Description"), "What it is");
    EXPECT_EQ(table.fields[1].type, FieldType::Date);
    EXPECT_EQ(RaisedBy([&] { MergeTableSchema("<a><b></a>", "/t.xml", table); }).text.rfind("/t.xml: ", 0),
              0U);
}

TEST(TableReader, ReadsLinkedTablesAndRelations) {
    const auto linked =
        ReadLinkedTable(R"({"Items":{"Name":"L","Connect":";DATABASE=rel:x.accdb","SourceTableName":"S",
"Attributes":1073741824,"Properties":{"Description":{"Type":10,"Value":"far"}}}})",
                        "file", "/l.json");
    EXPECT_EQ(linked.name + linked.connect + linked.sourceTable, "L;DATABASE=rel:x.accdbS");
    EXPECT_EQ(FindNamedText(linked.properties, "Description"), "far");
    const auto relation = ReadRelation(R"({"Items":{"Name":"r","Attributes":1,"Table":"a","ForeignTable":"b",
"Fields":[{"Name":"x","ForeignName":"y"}]}})",
                                       "/r.json");
    EXPECT_EQ(relation.attributes, 1);
    ASSERT_EQ(relation.fields.size(), 1U);
    EXPECT_EQ(relation.fields[0].second, "y");
    const auto lined = ReadRelation("4096\r\nr\r\na\r\nb\r\nField = Begin\r\nx\r\ny\r\nEnd\r\n", "/r.txt");
    EXPECT_EQ(lined.foreignTable, "b");
    EXPECT_EQ(lined.fields, (std::vector<std::pair<std::string, std::string>>{{"x", "y"}}));
    EXPECT_EQ(RaisedBy([] { ReadRelation("{", "/r.json"); }).number, kFailure1);
    EXPECT_EQ(RaisedBy([] { ReadRelation("{\"a\":" + std::string(100000, '['), "/r.json"); }).text,
              "/r.json: the text is nested deeper than 100.");
}

TEST(TableReader, ReadsTheFirstRecords) {
    const auto records = ReadTableData("ID\tNote\r\n1\tone\\ntwo\\\\x\r\n2\r\n3\tthree\r\n", "/t.txt", 2);
    ASSERT_EQ(records.rows.size(), 2U);
    EXPECT_EQ(records.rows[0][1], "one\ntwo\\x");
    EXPECT_EQ(records.rows[1].size(), 2U);
    EXPECT_EQ(records.ColumnIndex("NOTE"), 1);
    EXPECT_EQ(records.ColumnIndex("none"), -1);
    const auto xml =
        ReadTableData("<dataroot><t><a_x0020_b>1</a_x0020_b></t><t><c>2</c></t></dataroot>", "/t.xml", 9);
    ASSERT_EQ(xml.columns.size(), 2U);
    EXPECT_EQ(xml.columns[0].name, "a b");
    EXPECT_EQ(xml.rows[0][1] + xml.rows[1][1], "2");
}

} // namespace
} // namespace tovimar::platform::access
