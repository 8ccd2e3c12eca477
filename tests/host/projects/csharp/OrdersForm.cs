using System.Windows.Forms;

namespace Shop
{
    /// <summary>The list of orders. Its other.this.Name = "never" isn't a name.</summary>
    public class OrdersForm : Form
    {
        private void InitializeComponent()
        {
            this.button.Name = "button";
            this.ClientSize = new System.Drawing.Size(292, 273);this.Name = "frmOrders";
            this.Text = "Orders & more – “today”";
        }
    }
}
