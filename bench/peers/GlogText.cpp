// The text in our panes: a TextEditPane.
#include "bench/peers/GlogToolkit.h"
#include "bench/peers/PeerText.h"
#include "desktop/Desktop.h"
#include "host/EventRecordAdapter.h"
#include "host/OSFont.h"
#include "host/glogRec.h"
#include "text/TextEditPane.h"
#include "text/TextFieldFlags.h"

namespace {

unsigned short const kKeyDown = 3; // the kind of event
int const kDialogFont = 0;         // in the font table

class GlogText : public PeerText {
public:
    GlogText()
        : desktop(DesktopOptions().Scale(1)) {}

    void Show() override {
        glog = desktop.NewGlog(GlogOptions().Title("Text").Size(kWidth, kHeight));
        TextEditPane *const pane = new TextEditPane(glog, 0, TextFieldFlags::Of(false, true, false, true));
        pane->SetFractionalBounds(OS::RectBase<OS::RectTag>(0, 0, kWidth, kHeight));
        edit = &pane->GetTextEdit();
        fontSaveRec const *const font = GetIndVelaFont(kDialogFont);
        OS::TextStyle style;
        style.family = font->family;
        style.face = font->face;
        style.size = font->size;
        edit->SetStyle(TextStyleMask::kFont, style);
        edit->SetText(UString(Lines().c_str(), UString::kByteEncoding1));
        Rect place = {0, 0, kHeight, kWidth};
        PositionGlog(glog, &place, false);
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        Settle();
        pane->BeginEditing();
        edit->SetSelection(kMiddle, kMiddle);
        edit->VScrollToCharacterPosition(kMiddle);
        FinishDrawing(glog);
    }
    void Type() override {
        EventRecordAdapter key;
        key.what = kKeyDown;
        key.message = static_cast<unsigned char>(kTyped);
        edit->HandleEvent(&key);
        FinishDrawing(glog);
    }
    void Delete() override {
        OS::TextEditActions::DeleteBackward(*edit, OS::TextEditActions::kCharacter);
        FinishDrawing(glog);
    }
    void Settle() override { desktop.ProcessEvents(0); }

private:
    Desktop desktop;
    glogRec *glog = nullptr;
    OSTextEdit *edit = nullptr; // the pane's
};

} // namespace

PeerText *NewPeerText(int &, char **) { return new GlogText; }
