VERSION 5.00
Begin VB.MDIForm frmMain 
   BackColor       =   &H8000000C&
   Caption         =   "Shop"
   ClientHeight    =   6000
   StartUpPosition =   3  'Windows Default
End
Attribute VB_Name = "frmMain"
