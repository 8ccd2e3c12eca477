partial class Form1 { }
