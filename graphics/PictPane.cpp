#include "graphics/PictPane.h"
#include "buttons/NaturalSize.h"
#include "buttons/PartHelpTag.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"
#include "host/GlogStyleSheet.h"
#include "host/HelpTagHelper.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0;
short const kNoPicture = 0;
int const kNotTaken = 0, kClicked = 1;

int Width(Rect const &r) { return r.right - r.left; }
int Height(Rect const &r) { return r.bottom - r.top; }

// The box with its top left corner where it is, as large as the frame.
Rect WithSizeOf(Rect const &frame, Rect box) {
    box.bottom = Pixel16(box.top + Height(frame));
    box.right = Pixel16(box.left + Width(frame));
    return box;
}

} // namespace

PictPane::PictPane(glogRec *owner, short id, gpicResRec *record)
    : pictureID(kNoPicture)
    , image(nullptr)
    , allowClickThrough(false)
    , useImageSize(false) {
    if (!GlogPaneInit(owner, id))
        return;
    if (record->pictureID > kNoPicture)
        SetPngImageNoUpdate(record->pictureID);
    std::unique_ptr<tarn::image> owned(image); // until the destructor will run: memory may run out before
    useImageSize = record->useImageSize != 0;
    Rect box = record->bounds;
    if (useImageSize && image) {
        Rect const frame = image->GetFrameRect();
        box = WithSizeOf(frame, box);
        SetNaturalSize(*this, Width(frame), Height(frame));
    }
    GlogPane::SetBox(&box); // whatever a subclass makes of a change
    owned.release();
}

PictPane *PictPane::NewPictPane(glogRec *owner, GlogStyleSheet *sheet) {
    gpicResRec record;
    record.kind = gpicResRec::kKind;
    record.bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    record.useImageSize = sheet->GetSInt32ItemValue(ResourceKey("PicUseImageSize")) != 0;
    UString const name = sheet->GetUStringItemValue(ResourceKey("ResIDName"));
    record.pictureID = static_cast<short>(PictIDMapper::Instance().GetID(name));
    bool const goThrough = sheet->GetSInt32ItemValue(ResourceKey("PicAllowClickThrough")) != 0;

    std::unique_ptr<PictPane> pane(new (std::nothrow) PictPane(owner, kNoNumber, &record));
    if (!pane || !pane->GetGlog()) {
        FailMemFullError();
        return nullptr;
    }
    pane->allowClickThrough = goThrough;
    return pane.release();
}

PictPane::~PictPane() { delete image; }

// Image

void PictPane::TakeImage(tarn::image *newImage, short newPictureID) {
    pictureID = newPictureID;
    if (newImage == image)
        return;
    std::unique_ptr<tarn::image> const former(image);
    image = newImage;
}

void PictPane::SetImage(AutoPtr<tarn::image> newImage) {
    Prepare();
    SetImageNoUpdate(newImage);
    Inval();
}

void PictPane::SetImageNoUpdate(AutoPtr<tarn::image> newImage) { TakeImage(newImage.release(), kNoPicture); }

void PictPane::SetPngImage(short picture) {
    Prepare();
    SetPngImageNoUpdate(picture);
    Inval();
}

void PictPane::SetPngImageNoUpdate(short picture) {
    TakeImage(new (std::nothrow) PngImage(picture), picture);
    if (!useImageSize || !image)
        return;
    Rect box = BoxOfImage();
    if (IsInLayout())
        SetNaturalSize(*this, Width(box), Height(box));
    else
        SetBox(&box);
}

Rect PictPane::BoxOfImage() {
    Rect box;
    GetBox(&box);
    return WithSizeOf(image->GetFrameRect(), box);
}

void PictPane::ResizeToPic() {
    if (!image)
        return;
    Rect box = BoxOfImage();
    SetBox(&box);
}

void PictPane::SetClipRegion(OSRgn *region) { clipRegion.Copy(region); }

// Help tags

void PictPane::AttachHelpTag(LocalizedStrings::HelpTag const *tag, Rect const &rect,
                             OS::Help::Placement placement, double delay) {
    if (MultiHelpTagHelper *const parts = PartHelpTags(*this))
        parts->AddHelpTag(tag, rect, placement, delay);
}

void PictPane::ClearHelpTags() {
    if (MultiHelpTagHelper *const parts = PartHelpTags(*this))
        parts->ClearHelpTags();
}

// Drawing and clicks

void PictPane::DrawGuts(OSRgn *region) {
    Rect const r = GetDrawRectangle();
    if (!image)
        return;
    Prepare();
    VelaDrawing::NarrowClip(region);
    if (clipRegion.get())
        VelaDrawing::NarrowClip(clipRegion.get());
    image->Draw(r);
    GlogPane::ForceNextPrepare(); // the clip must not outlive the drawing
}

// Listeners may delete the pane.
int PictPane::HandleClick(EventRecordAdapter *event) {
    if (allowClickThrough)
        return kNotTaken;
    if (Provider<PictPane_Listener>::HasDependents())
        Provider<PictPane_Listener>::BroadcastChange(PictClickMsg(event), nullptr);
    return kClicked;
}
