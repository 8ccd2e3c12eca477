VERSION 5.00
Begin VB.UserControl DatePicker 
   ClientHeight    =   300
   ScaleHeight     =   300
End
Attribute VB_Name = "DatePicker"
