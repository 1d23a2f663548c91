// What LSTGetBox is asked and answers.
#pragma once
#include "host/Geometry.h"

struct GLGetBoxRec {
    int line; // from 0
    Rect box; // receives the row's box
};
