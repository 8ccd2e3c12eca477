CREATE TABLE [Suppliers] (
  [SupplierNo] AUTOINCREMENT,
  [SupplierName] VARCHAR (80) NOT NULL,
  [Contact] VARCHAR (60),
  [Town] VARCHAR (50),
  [Phone] VARCHAR (30),
  [DaysToDeliver] SHORT,
  [Certified] BIT,
   CONSTRAINT [PrimaryKey] PRIMARY KEY ([SupplierNo])
)
