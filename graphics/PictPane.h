// One picture, stretched to the pane.
//
// A click tells the listeners and gives 1, or, where clicks go through, falls through to what is below.
#pragma once
#include "frame/PictPane_Listener.h"
#include "graphics/gpicResRec.h"
#include "host/AutoPtr.h"
#include "host/GlogPane.h"
#include "host/LocalizedStrings.h"
#include "host/OSRgn.h"
#include "host/TarnImage.h"

class GlogStyleSheet;
class OSRgn;

// The order of bases is fixed.
class PictPane : public Provider<PictPane_Listener>, public GlogPane {
public:
    // Attaches the pane to the glog under the number; the glog owns it. The record is only read and must not
    // be null. A pane that is as large as its picture takes the top left corner of the record's box, and
    // reports the picture's size as its natural one.
    PictPane(glogRec *, short id, gpicResRec *);
    // The same from the keys of gpicResRec and "PicAllowClickThrough", under the number 0. Calls
    // FailMemFullError when the pane cannot be made, and answers null if that returns.
    static PictPane *NewPictPane(glogRec *, GlogStyleSheet *);
    ~PictPane() override;

    // Takes the image over instead of the one before, which is deleted unless it is the same; null leaves the
    // pane empty. The pane is invalidated but for the second form, which a pane that is not shown yet wants.
    void SetImage(AutoPtr<tarn::image>);
    void SetImageNoUpdate(AutoPtr<tarn::image>);
    // The same with the picture of the number; one that does not exist shows nothing. A pane as large as its
    // picture takes that picture's size, in a layout as its natural size.
    void SetPngImage(short picture);
    void SetPngImageNoUpdate(short picture);
    short GetPictureID() const { return pictureID; } // 0 for an image that has none

    // Makes the box as large as the image; its top left corner stays. Without an image nothing.
    void ResizeToPic();
    // The part of the pane, in its coordinates, that the image shows in. Keeps a copy, null: everywhere. Only
    // stores.
    void SetClipRegion(OSRgn *);

    // Shows the tag for a rectangle, in pane coordinates, after a delay in seconds. The first one, and
    // ClearHelpTags, replace a tag of the pane as a whole; a helper of the program's own is left in charge.
    // The tag stays the host's; null is not added.
    void AttachHelpTag(LocalizedStrings::HelpTag const *, Rect const &, OS::Help::Placement, double delay);
    void ClearHelpTags();

protected:
    // Overridden operations of panes.
    int HandleClick(EventRecordAdapter *) override;
    // Nothing at all without an image. Leaves the clip narrowed.
    void DrawGuts(OSRgn *updateRegion) override;

private:
    void TakeImage(tarn::image *, short newPictureID);
    Rect BoxOfImage();

    short pictureID;
    tarn::image *image;       // owned, or null
    AutoRgnHandle clipRegion; // in pane coordinates; none: everywhere
    bool allowClickThrough;
    bool useImageSize;
};
