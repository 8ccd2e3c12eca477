namespace Store.Views
{
    partial class Grid
    {
    }
}
