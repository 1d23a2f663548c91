// A stretch of text that looks alike.
#pragma once
#include "host/TextStyle.h"

struct StyleRunRec {
    unsigned int start, end; // in units of UTF-16; the end is outside
    OS::TextStyle style;     // family, face, size and colour all count
};
