#include "text/SearchedForm.h"
#include "host/XMLLib.h"
#include <cctype>

namespace {

unsigned int const kEnglish = 1701737843; // "enus"
UString::Unit const kBlank = 32;

bool ComparesWords() { return XMLLib::GetSystemLanguageCode() == kEnglish; }

void BlankAllButWords(UString &text) {
    for (std::size_t i = 0, length = text.length(); i < length; ++i)
        if (!tarn::IsASCII(text[i]) || !std::isalnum(text[i]))
            text[i] = kBlank;
}

UString WithBlankBefore(UString const &text) {
    UString blank(" ", UString::kByteEncoding1);
    return blank += text;
}

} // namespace

UString SearchedForm::OfText(UString const &text) {
    UString form = text;
    tarn::ToUpper(form);
    if (!ComparesWords())
        return form;
    BlankAllButWords(form);
    return WithBlankBefore(form);
}

UString SearchedForm::OfSearch(UString const &search) {
    UString form = search;
    bool const words = ComparesWords();
    if (words)
        BlankAllButWords(form);
    tarn::ToUpper(form);
    return words ? WithBlankBefore(form) : form;
}
