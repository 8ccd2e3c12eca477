CREATE TABLE [Orders] (
  [OrderNo] AUTOINCREMENT,
  [CustomerNo] LONG,
  [OrderDate] DATETIME,
  [DeliveryDate] DATETIME,
  [Status] VARCHAR (15),
  [ShipTo] VARCHAR (255),
  [PickedBy] VARCHAR (30),
  [Payment] SHORT,
  [Paid] BIT,
  [DeliveryFee] CURRENCY,
  [Remark] VARCHAR (255),
   CONSTRAINT [PrimaryKey] PRIMARY KEY ([OrderNo])
)
