namespace Store.Views
{
    public partial class Grid : System.Windows.Forms.UserControl
    {
        private void Load()
        {
            this.Text = "Grid of goods";
        }
    }
}
