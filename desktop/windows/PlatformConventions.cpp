#include "desktop/windows/PlatformConventions.h"

bool PlatformConventions::scrollArrowsTogetherAtEnd = false;
bool PlatformConventions::showsGrowBoxes = true;
