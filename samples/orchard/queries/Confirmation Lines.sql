SELECT
  Orders.OrderNo,
  Orders.OrderDate,
  Orders.DeliveryDate,
  Orders.ShipTo,
  Orders.DeliveryFee,
  Orders.Remark,
  Customers.CustomerName,
  Customers.Rebate,
  [Order Lines].LineNo,
  Products.ProductName,
  Products.Unit,
  [Order Lines].Quantity,
  [Order Lines].UnitPrice,
  CCur([Quantity] * [Order Lines].[UnitPrice]) AS LineTotal,
  Choose(
    [Payment],
    "cash",
    "bank transfer",
    "monthly invoice"
  ) AS PaymentText
FROM
  Products
  INNER JOIN (
    (
      Customers
      INNER JOIN Orders ON Customers.CustomerNo = Orders.CustomerNo
    )
    INNER JOIN [Order Lines] ON Orders.OrderNo = [Order Lines].OrderNo
  ) ON Products.ProductNo = [Order Lines].ProductNo
ORDER BY
  Orders.OrderNo,
  [Order Lines].LineNo;
