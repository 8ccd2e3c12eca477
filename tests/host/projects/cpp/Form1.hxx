namespace Shop
{
    public __gc class Form1 : public System::Windows::Forms::Form
    {
        void InitializeComponent(void)
        {
            this->Name = S"NotThis";
            this->Text = S"Shop window";
        }
    };
}
