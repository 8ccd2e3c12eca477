partial class Timer { }
