Public Class Filter
    Inherits System.Windows.Forms.UserControl
End Class
