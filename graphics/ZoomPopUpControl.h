// The slider that a zoom button pops up.
#pragma once
#include "host/GlogPane.h"
#include "host/PaneWatch.h"

class ZoomPopUpPaneClient;

// Alone in its window, whose place decides which level lies under the mouse.
class ZoomPopUpControl : public GlogPane {
public:
    static constexpr short kWidth = 55, kHeight = 34; // pixels, as all here
    static constexpr short kTrackLeft = 3;            // where the fraction 0.0 lies
    static constexpr int kTrackLength = 47;           // from there to 1.0

    // Attaches the slider to its window, at the client's level. The client is the owner's and is not used
    // once that is gone.
    ZoomPopUpControl(glogRec *, GlogPane &owner, ZoomPopUpPaneClient *);
    ~ZoomPopUpControl() override;

    // Follows the mouse from the point on, in the slider's coordinates, until the button is up.
    void Track(Point);
    // Gives the client the level under the point, and shows which one the client has taken.
    void Apply(Point);
    void ZoomIdle(); // lets the client do something

protected:
    void DrawGuts(OSRgn *updateRegion) override;

private:
    float fraction; // the level that shows
    ZoomPopUpPaneClient *const client;
    PaneWatch const owner; // the client lives as long
};
