#define IDH_ALL_FORMS   1
#define IDH_ALL_REPORTS 2 
#define IDH_Orders  10
#define IDH_Order_Items  30
#define MINE 5
