VERSION 5.00
Begin VB.Form frmPlain 
   ClientHeight    =   3195
   Begin VB.Label lblTitle 
      Caption         =   "The label's, not the form's"
   End
End
Attribute VB_Name = "frmPlain"
