CREATE TABLE [Products] (
  [ProductNo] AUTOINCREMENT,
  [ProductName] VARCHAR (80) NOT NULL,
  [Category] VARCHAR (30),
  [SupplierNo] LONG,
  [Size] VARCHAR (30),
  [Unit] VARCHAR (15),
  [UnitPrice] CURRENCY,
  [Stock] LONG,
  [ReorderLevel] LONG,
  [Organic] BIT,
  [Seasonal] BIT,
  [Favourite] BIT,
  [OnPriceList] BIT,
  [Discontinued] BIT,
  [Description] LONGTEXT,
   CONSTRAINT [PrimaryKey] PRIMARY KEY ([ProductNo])
)
