#include "artwork/compiler/GlogArtwork.h"
#include <iostream>

int main(int argc, char **argv) { return RunGlogArtwork(argc, argv, std::cout, std::cerr); }
