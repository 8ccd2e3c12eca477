TRANSFORM Sum([Quantity] * [Order Lines].[UnitPrice]) AS Sales
SELECT
  Products.Category
FROM
  Products
  INNER JOIN (
    Orders
    INNER JOIN [Order Lines] ON Orders.OrderNo = [Order Lines].OrderNo
  ) ON Products.ProductNo = [Order Lines].ProductNo
GROUP BY
  Products.Category
PIVOT
  Format([OrderDate], "yyyy-mm");
