namespace Shop
{
    public class AboutBox : System.Windows.Forms.Form
    {
        public AboutBox()
        {
            this.Text = "Über den Laden";
        }
    }
}
