SELECT
  Orders.OrderNo,
  Orders.CustomerNo,
  Orders.OrderDate,
  Orders.DeliveryDate,
  Orders.Status,
  Orders.Paid,
  Sum(
    [Quantity] * [UnitPrice] * (1 - Nz([Rebate], 0))
  ) AS OrderTotal,
  Count([Order Lines].LineNo) AS LineCount
FROM
  (
    Customers
    INNER JOIN Orders ON Customers.CustomerNo = Orders.CustomerNo
  )
  LEFT JOIN [Order Lines] ON Orders.OrderNo = [Order Lines].OrderNo
GROUP BY
  Orders.OrderNo,
  Orders.CustomerNo,
  Orders.OrderDate,
  Orders.DeliveryDate,
  Orders.Status,
  Orders.Paid
ORDER BY
  Orders.OrderDate DESC;
