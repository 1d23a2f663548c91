#include "tools/gallery/AskButtonPane.h"
#include "buttons/CheckBoxPane.h"
#include "frame/ModalGlogClass.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include <memory>
#include <new>

namespace {

// The windows, and their items beside those that confirm and cancel.
short const kBounceWindow = 600, kFormatWindow = 601;
short const kReplaceBox = 3, kComplaint = 4, kFormatButton = 5;

Phrase const kAnswers[] = {Phrase::kNotOpened, Phrase::kBounced, Phrase::kCancelled};

class FormatDialog : public ModalGlogClass {
public:
    void Ask() {
        int value = 0;
        if (ModalGlogInit(kFormatWindow))
            ModalLoop(&value, 0, 0, 0);
    }
};

// Bounces only when the box is checked, and says so.
class BounceDialog : public ModalGlogClass {
public:
    short Ask() {
        int value = 0;
        return ModalGlogInit(kBounceWindow) ? ModalLoop(&value, 0, 0, 0) : short(-1);
    }

protected:
    char HandleItem(short item, int value) override {
        if (item == kFormatButton)
            FormatDialog().Ask();
        return ModalGlogClass::HandleItem(item, value);
    }

private:
    char Read() override {
        CheckBoxPane *const box = dynamic_cast<CheckBoxPane *>(GetGlogItem(GlogP(), kReplaceBox));
        if (box && box->ReadOne(0))
            return true;
        LabelText::Show(GlogP(), kComplaint, Phrases::Get(Phrase::kFileIsThere));
        return false;
    }
};

} // namespace

AskButtonPane *AskButtonPane::NewAskButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    short const kNoText = 0, kEnabledMode = 0;
    Rect const box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    short const label = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("TextID")));
    std::unique_ptr<AskButtonPane> button(new (std::nothrow) AskButtonPane(label));
    if (!button ||
        !button->InitOvalButtonPane(owner, {box.top, box.left}, static_cast<short>(box.right - box.left),
                                    kNoText, kEnabledMode))
        return nullptr;
    button->SetButtonText(sheet->GetUStringItemValue(ResourceKey("ButtonText")));
    return button.release();
}

int AskButtonPane::HandleClick(EventRecordAdapter *event) {
    PaneWatch const watch(this);
    int const result = OvalButtonPane::HandleClick(event);
    if (result <= 0 || !watch.PaneExists())
        return result;
    short const answer = BounceDialog().Ask();
    if (watch.PaneExists())
        LabelText::Show(GetGlog(), labelID, Phrases::Get(kAnswers[answer < 0 ? 0 : answer]));
    return result;
}
