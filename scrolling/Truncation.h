// From numbers that a client calculated to whole pixels and positions.
#pragma once

// The whole part. A number beyond an int gives the end that it lies beyond, what is not a number gives 0.
int Truncated(double);

// The number, or the end of an int or of 16 bits that it lies beyond.
int Saturated(long long);
short Pixel16(long long);
