Attribute VB_Name = "Orchard"
Option Compare Database
Option Explicit

' What several windows of the shop need.

' Orders from this sum on are delivered free of charge.
Public Const FreeDeliveryFrom As Currency = 60

Private Const WhatCustomers As Long = 1
Private Const WhatOrders As Long = 2

' Called when the database is opened; the result is only there so that a macro can call it.
Public Function PrepareOrchard() As Boolean
    DoCmd.SetWarnings False
    Application.SetOption "Behavior Entering Field", 0
    PrepareOrchard = True
End Function

' A text in quotes, for use in a condition.
Public Function Quoted(ByVal value As Variant) As String
    Quoted = """" & Replace(Nz(value), """", """""") & """"
End Function

' Name and address in lines, as they stand on the parcel.
Public Function CustomerAddress(ByVal customerNo As Long) As String
    With CurrentDb.OpenRecordset("SELECT * FROM Customers WHERE CustomerNo = " & customerNo)
        If Not .EOF Then
            CustomerAddress = !CustomerName & vbCrLf & !Street & vbCrLf & !PostCode & " " & !Town
        End If
        .Close
    End With
End Function

Public Function OpenOrdersText() As String
    Dim openOrders As Long
    openOrders = DCount("*", "Orders", "Status = 'open'")
    Select Case openOrders
        Case 0: OpenOrdersText = "All orders are packed."
        Case 1: OpenOrdersText = "One order is waiting."
        Case Else: OpenOrdersText = openOrders & " orders are waiting."
    End Select
End Function

' Takes the products of an order from the stock.
Public Sub TakeFromStock(ByVal orderNo As Long)
    CurrentDb.Execute "UPDATE Products INNER JOIN [Order Lines] " & _
        "ON Products.ProductNo = [Order Lines].ProductNo " & _
        "SET Products.Stock = Products.Stock - [Order Lines].Quantity " & _
        "WHERE [Order Lines].OrderNo = " & orderNo, dbFailOnError
End Sub

' The statement behind the list of the Search window.
Public Function SearchSql(ByVal what As Long, ByVal text As String, ByVal wholeWords As Boolean) As String
    Dim pattern As String
    pattern = Quoted(IIf(wholeWords, text, "*" & text & "*"))
    Select Case what
        Case WhatCustomers
            SearchSql = "SELECT CustomerNo, CustomerName, Town FROM Customers WHERE CustomerName Like " & pattern
        Case WhatOrders
            SearchSql = "SELECT OrderNo, OrderDate, Status FROM Orders WHERE Remark Like " & pattern
        Case Else
            SearchSql = "SELECT ProductNo, ProductName, UnitPrice FROM Products WHERE ProductName Like " & pattern
    End Select
End Function
