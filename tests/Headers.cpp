// Stands for the headers that are compiled once for all test programs: those have to belong to a program.
