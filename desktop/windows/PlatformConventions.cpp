#include "desktop/windows/PlatformConventions.h"

bool PlatformConventions::scrollArrowsTogetherAtEnd = false;
bool PlatformConventions::showsGrowBoxes = true;
double PlatformConventions::doubleClickSeconds = 0.5;
int PlatformConventions::doubleClickDistance = 4;
