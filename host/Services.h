#pragma once
#include "host/Geometry.h"
#include "host/MouseTask.h"

namespace OS { namespace Services {
bool StillDown();
void GetMouse(::Point *);
bool ScrollArrowsTogetherAtEnd();
bool ShowsGrowBoxes();
} }

bool MouseIsDragging(Point *where, double *when);

bool MouseIsDraggingWithTimeout(double seconds, Point *where, double *when, MouseTracking::Result *);

void Yield(double seconds);
void YieldUntilKeyUp(unsigned int key);

class KeybdMgr {
public:
    static KeybdMgr &Instance();
    bool IsKeyPressed(int key);
};

namespace TarnSystemTime { double GetCurrentEventTime(); }

void CrsrMain(short cursor);

bool CurrentlyDrawingForDragAndDrop();

void HelpResizeObject(Rect *oldBox, Rect *newBox);
