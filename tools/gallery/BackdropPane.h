// A picture behind other panes. It takes no clicks.
#pragma once
#include "host/GlogPane.h"
#include "host/TarnImage.h"

class GlogStyleSheet;

class BackdropPane : public GlogPane {
public:
    // Makes a pane and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. From "BoundsRect" and "Num", the number of the picture, which is stretched to the pane.
    static BackdropPane *NewBackdropPane(glogRec *, GlogStyleSheet *);

protected:
    void DrawGuts(OSRgn *updateRegion) override;
    int HandleClick(EventRecordAdapter *) override { return 0; }

private:
    explicit BackdropPane(short picture)
        : image(picture) {}

    PngImage image;
};
