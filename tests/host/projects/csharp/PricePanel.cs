namespace Shop
{
    public class PricePanel : System.Windows.Forms.UserControl
    {
        private void InitializeComponent()
        {
		this.Name = "PricePanel";
        }
    }
}
