#pragma once

struct CommandSpecifier {
    short classID;
    short commandID;
    CommandSpecifier() : classID(0), commandID(0) {}
    CommandSpecifier(short c, short i) : classID(c), commandID(i) {}
};
