// Names a command of the application.
#pragma once

// A command by the number of its class and its number in the class; class 0 is no command. Class 15 is
// editing: 1 select all, 11 cut, 12 copy, 13 paste, 15 clear. Two shorts and nothing else: its address stands
// for the command.
struct CommandSpecifier {
    short classID;
    short commandID;

    CommandSpecifier()
        : classID(0)
        , commandID(0) {}
    CommandSpecifier(short c, short i)
        : classID(c)
        , commandID(i) {}
};
