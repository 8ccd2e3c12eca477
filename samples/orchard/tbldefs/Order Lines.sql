CREATE TABLE [Order Lines] (
  [OrderNo] LONG,
  [LineNo] SHORT,
  [ProductNo] LONG,
  [Quantity] DOUBLE,
  [UnitPrice] CURRENCY,
   CONSTRAINT [PrimaryKey] PRIMARY KEY ([OrderNo], [LineNo])
)
