Public Class Customers
    Inherits System.Windows.Forms.Form

    Private Sub InitializeComponent()
        Me.lblName.Text = "Name"
        Me.Name = "frmCustomers"
        Me.Text = "Customers"
    End Sub
End Class
