VERSION 5.00
Object = "{F9043C88-F6F2-101A-A3C9-08002B2F49FB}#1.2#0"; "comdlg32.ocx"
Begin VB.Form frmOrders 
   BorderStyle     =   1  'Fixed Single
   Caption         =   "Aufträge für ""heute"""
   ClientHeight    =   3195
   ClientLeft      =   60
   Begin VB.CommandButton cmdClose 
      Caption         =   "Close"
      Height          =   375
   End
End
Attribute VB_Name = "frmOrders"
Attribute VB_Exposed = False
Option Explicit
