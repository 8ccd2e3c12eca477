[assembly: System.Reflection.AssemblyTitle("Shop")]
