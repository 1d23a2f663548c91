#include "dialogs/TruncateWord.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"

TextSettings::TruncateCode TruncateWord::Of(GlogStyleSheet *sheet, TextSettings::TruncateCode otherwise) {
    UString const word = sheet->GetUStringItemValue(ResourceKey("Truncate"));
    if (word == ResourceKey("None"))
        return TextSettings::kTruncateNone;
    if (word == ResourceKey("End"))
        return TextSettings::kTruncateEnd;
    return word == ResourceKey("Middle") ? TextSettings::kTruncateMiddle : otherwise;
}
