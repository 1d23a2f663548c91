#include "tools/gallery/LabelText.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"

void LabelText::Show(glogRec *glog, int labelID, UString const &text) {
    Show(GetGlogItem(glog, static_cast<short>(labelID)), text);
}

void LabelText::Show(GlogPane *pane, UString const &text) {
    if (LabelPane *label = dynamic_cast<LabelPane *>(pane))
        label->SetTextWithInval(text);
}

UString LabelText::OfNumber(int number) {
    UString text;
    tarn::NumToUString(number, tarn::kPlainNumber, text);
    return text;
}
