#pragma once
#include "host/Geometry.h"
#include "host/UString.h"

class PageFormat {
public:
    static PageFormat *GetCurrentFormat(bool);
    Rect GetPageRect() const;
};

struct PrintMessageRec {
    int kind;
    int page;
    UString header[3];
};
