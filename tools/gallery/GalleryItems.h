// The item types that the gallery's pages use beside those of the library.
#pragma once

namespace GalleryItems {

// Adds them to the registry. They keep to keys of the library's own types, so that the schema holds for the
// pages as it stands.
//
// Choice      a button that stands for one of several choices (ChoiceButtonPane.h)
// Backdrop    a picture behind other items (BackdropPane.h)
// Stepper     steps a number up and down (StepperPane.h)
// HoldButton  counts while it is held down (HoldButtonPane.h)
// TrackList   rows of live panes in a scrolled grid (TrackListPane.h)
// Well        the frame round a view and its two scroll bars (WellPane.h)
// Panner      a point in a cube with its coordinates (PannerPane.h)
// Envelope    a graph whose points are dragged (EnvelopePane.h)
// WaveView    a recording that is zoomed and scrolled (WaveViewPane.h)
// BadgeButton an icon button, with all keys of one, that draws a badge over its upper right corner
void Add();

} // namespace GalleryItems
