#include "tools/gallery/Phrases.h"
#include "dialogs/Utf8.h"
#include "host/LocalizedStrings.h"
#include "tools/gallery/LabelText.h"
#include <string>

namespace {

short const kList = 9130;

template <class Value, class Shown>
UString Filled(Phrase phrase, std::initializer_list<Value> values, Shown shown) {
    std::string text = Utf8::FromUString(Phrases::Get(phrase));
    int index = 0;
    for (Value const &value : values) {
        std::string const mark = '^' + std::to_string(index++);
        std::size_t const place = text.find(mark);
        if (place != std::string::npos)
            text.replace(place, mark.size(), Utf8::FromUString(shown(value)));
    }
    return Utf8::ToUString(text);
}

} // namespace

UString Phrases::Get(Phrase phrase) { return LocalizedStrings::GetString(kList, static_cast<short>(phrase)); }

UString Phrases::Fill(Phrase phrase, std::initializer_list<UString> texts) {
    return Filled(phrase, texts, [](UString const &text) { return text; });
}

UString Phrases::Fill(Phrase phrase, std::initializer_list<int> numbers) {
    return Filled(phrase, numbers, LabelText::OfThousands);
}
