// What btnGetOneBox is asked for, and answers.
#pragma once
#include "host/Geometry.h"

struct btnOneBoxRec {
    short index; // of the box, from 0
    Rect box;    // receives its rectangle
};
