CREATE TABLE [Deliveries] (
  [DeliveryNo] AUTOINCREMENT,
  [OrderNo] LONG,
  [LeftAt] DATETIME,
  [Driver] VARCHAR (30),
  [Kilometres] DOUBLE,
  [Signed] BIT,
   CONSTRAINT [PrimaryKey] PRIMARY KEY ([DeliveryNo])
)
