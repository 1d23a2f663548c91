#include "bench/CountingListener.h"

CountingListener::~CountingListener() {}

void CountingListener::GlogButtonPressed(GlogButtonPane *) { ++heard; }
