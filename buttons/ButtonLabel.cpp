#include "buttons/ButtonLabel.h"
#include "buttons/GlogButtonPane.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"

namespace {

int const kCentredVertically = 1;
int const kOneLine = 0;
int const kUpright = 0;
int const kReserved = 0; // the host takes no other value
float const kNoExtraSpacing = 0.0f;
float const kNaturalScale = 1.0f;
float const kNoEffect = 1.0f;

} // namespace

void ButtonLabel::Update(OS::TextLayout &layout, UString const &text, int font) {
    UpdateTextLayout(layout, text, font, TextSettings::kAlignCenter, TextSettings::kTruncateNone,
                     kCentredVertically, kOneLine, kUpright, kReserved, kNoExtraSpacing, kNaturalScale,
                     kNoEffect);
}

void ButtonLabel::SetColor(unsigned char mode) {
    VelaDrawing::RGBForeColor(mode == GlogButtonPane::kDisabled ? kDialogButtonInactiveTextColor
                                                                : kDialogButtonActiveTextColor);
}

void ButtonLabel::Draw(OS::TextLayout &layout, UString const &text, Rect const &rect, int font) {
    DrawTextLayoutInRect(layout, text, rect, font, TextSettings::kAlignCenter, TextSettings::kTruncateNone,
                         kCentredVertically, kOneLine, kUpright, kReserved, kNoExtraSpacing, kNaturalScale,
                         kNoEffect);
}
