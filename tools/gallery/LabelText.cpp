#include "tools/gallery/LabelText.h"
#include "dialogs/Utf8.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"
#include <string>

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

UString LabelText::WithMinus(char const *ascii) {
    std::string text;
    for (; *ascii; ++ascii) {
        if (*ascii == '-')
            text += "\u2212";
        else
            text += *ascii;
    }
    return Utf8::ToUString(text);
}
