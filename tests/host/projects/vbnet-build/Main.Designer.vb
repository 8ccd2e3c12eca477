Partial Class Main
    Private Sub InitializeComponent()
        Me.Name = "Main"
        Me.Text = "Main window"
    End Sub
End Class
