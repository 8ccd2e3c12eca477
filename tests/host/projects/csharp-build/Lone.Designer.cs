partial class Lone
{
    void InitializeComponent()
    {
        this.Text = "Alone";
    }
}
