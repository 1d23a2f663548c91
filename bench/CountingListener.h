// A listener that does as little as a listener can.
#pragma once
#include "frame/GlogButtonPaneListener.h"

// Its operations stand in a file of their own, so that no compiler sees through the calls that are measured.
class CountingListener : public GlogButtonPaneListener {
public:
    ~CountingListener() override;
    void GlogButtonPressed(GlogButtonPane *source) override;

    long Heard() const { return heard; }

private:
    long heard = 0;
};
