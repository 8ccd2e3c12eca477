PARAMETERS
  [Which category?] Text (30),
  [By how many percent?] Double;
UPDATE
  Products
SET
  Products.UnitPrice = Round([UnitPrice] * (1 + [By how many percent?] / 100), 2)
WHERE
  Products.Category = [Which category?];
