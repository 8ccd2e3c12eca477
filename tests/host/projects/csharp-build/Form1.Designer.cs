namespace Store
{
    partial class Form1
    {
        private void InitializeComponent()
        {
            // 
            // Form1
            // 
            this.Name = "MainForm";
            this.Text = "The store";
        }
    }
}
