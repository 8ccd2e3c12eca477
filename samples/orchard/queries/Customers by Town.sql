PARAMETERS
  [Which town?] Text (50),
  [Only active ones?] Bit;
SELECT
  Customers.CustomerNo,
  Customers.CustomerName,
  [Contact] & ", " & [Phone] AS WhomToCall,
  Customers.Town,
  Customers.District
FROM
  Customers
WHERE
  (
    Customers.Town Like [Which town?] & "*"
    AND (
      Customers.Active = True
      OR [Only active ones?] = False
    )
  )
ORDER BY
  Customers.Town,
  Customers.CustomerName;
