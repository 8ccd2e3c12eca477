namespace Store.Views
{
    public class Splash : System.Windows.Forms.Form
    {
    }
}
