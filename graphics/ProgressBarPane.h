// A bar that fills up from the left.
//
// It takes no clicks. Until it is told of a maximum it shows that nothing is going on.
#pragma once
#include "host/GlogPane.h"

class ProgressBarPane : public GlogPane {
public:
    // Attaches the pane to the glog under the number; the glog owns it. It is not active at first.
    ProgressBarPane(glogRec *, short id);
    ~ProgressBarPane() override;

    // How far it is: the value out of the maximum, both in any unit. Values below 0 and beyond the maximum
    // count as the ends. A maximum of 0 makes the bar inactive. Invalidates the pane when it looks different
    // from before; steps that are less than a pixel only store.
    void SetProgress(long long value, long long maximum);
    bool ShowsProgress() const { return active; }   // whether there is a maximum
    double GetFraction() const { return fraction; } // 0.0 to 1.0; 0.0 while it is not active

    // Overridden operations of panes.
    void Resize(Point delta) override; // nothing: the bar keeps its place when the window grows

protected:
    void DrawGuts(OSRgn *updateRegion) override;

private:
    double fraction; // 0.0 to 1.0
    bool active;
};
