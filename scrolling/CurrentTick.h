// The time that scrolling repeats by.
#pragma once

// The time of now in ticks of 1/60 second.
long long CurrentTick();
