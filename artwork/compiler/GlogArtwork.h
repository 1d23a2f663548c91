#pragma once
#include <iosfwd>

// The artwork compiler as a call: takes a command line, writes reports to out and messages to err, and
// returns the exit status: 0, 1 when the artwork is at fault, 2 when the command line is.
int RunGlogArtwork(int argc, char const *const *argv, std::ostream &out, std::ostream &err);
