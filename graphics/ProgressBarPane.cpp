#include "graphics/ProgressBarPane.h"
#include "graphics/ProgressBarDrawing.h"
#include <algorithm>

ProgressBarPane::ProgressBarPane(glogRec *owner, short id)
    : fraction(0.0)
    , active(false) {
    GlogPaneInit(owner, id);
}

ProgressBarPane::~ProgressBarPane() {}

void ProgressBarPane::SetProgress(long long value, long long maximum) {
    bool const newActive = maximum != 0;
    double newFraction = 0.0;
    if (newActive)
        newFraction = std::clamp(static_cast<double>(value) / static_cast<double>(maximum), 0.0, 1.0);
    if (newFraction == fraction && newActive == active)
        return;
    Rect const bounds = GetBounds();
    bool const looksDifferent = newActive != active || !ProgressLooksAlike(bounds, newFraction, fraction);
    fraction = newFraction;
    active = newActive;
    if (looksDifferent)
        Inval();
}

void ProgressBarPane::Resize(Point) {}

void ProgressBarPane::DrawGuts(OSRgn *) { DrawProgressBarInRect(GetBounds(), fraction, active); }
