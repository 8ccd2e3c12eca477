public class _Default { }
