Public Class Main
End Class
