SELECT
  Products.ProductName,
  Products.Stock,
  Products.ReorderLevel,
  [ReorderLevel] - [Stock] AS Missing,
  IIf(
    Suppliers.SupplierNo Is Null,
    "our own",
    [SupplierName] & " (" & [Phone] & ")"
  ) AS OrderFrom
FROM
  Suppliers
  RIGHT JOIN Products ON Suppliers.SupplierNo = Products.SupplierNo
WHERE
  Products.Stock <= [ReorderLevel]
  AND Products.Discontinued = False
ORDER BY
  Products.ProductName;
