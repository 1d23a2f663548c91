// From calculated coordinates to whole ones.
#pragma once

// The number without its fraction. One that does not fit, and what is not a number, give the smallest int.
int WholeNumber(double);
