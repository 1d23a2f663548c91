#include "tools/gallery/LabelText.h"
#include "dialogs/Utf8.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"
#include "tools/gallery/Phrases.h"
#include <cstdio>
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

UString LabelText::OfDecimal(double number, int decimals) {
    char digits[400]; // the greatest number has 309 before the mark
    std::snprintf(digits, sizeof digits, "%.*f", decimals, number);
    std::string text = Utf8::FromUString(WithMinus(digits));
    std::size_t const mark = text.find('.');
    if (mark != std::string::npos)
        text.replace(mark, 1, Utf8::FromUString(Phrases::Get(Phrase::kDecimalMark)));
    return Utf8::ToUString(text);
}

UString LabelText::OfThousands(int number) {
    int const kGroup = 1000;
    if (number < kGroup)
        return OfNumber(number);
    UString text = OfThousands(number / kGroup);
    UString const rest = OfNumber(kGroup + number % kGroup); // a digit more, for the noughts
    text += Phrases::Get(Phrase::kThousandsMark);
    return text += rest.substr(1, UString::npos);
}
