#include "tools/gallery/Takes.h"
#include "dialogs/Utf8.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include <algorithm>
#include <numeric>

namespace {

Phrase const kParts[] = {Phrase::kIntro,  Phrase::kVerse, Phrase::kChorus, Phrase::kVerse,
                         Phrase::kBridge, Phrase::kSolo,  Phrase::kChorus, Phrase::kOutro};
unsigned const kPartCount = sizeof kParts / sizeof *kParts;
unsigned const kSecondsInMinute = 60, kShortest = 12, kSpread = 260; // seconds
unsigned const kKeptOneIn = 5;

// Numbers without a pattern, the same every time.
unsigned Scattered(int take) {
    unsigned const mixed = static_cast<unsigned>(take) * 2654435761u;
    return (mixed ^ (mixed >> 15)) * 2246822519u >> 12;
}

} // namespace

Takes::Takes(int count)
    : order(static_cast<std::size_t>(count))
    , kept(static_cast<std::size_t>(count)) {
    std::iota(order.begin(), order.end(), 0);
    for (int take = 0; take < count; ++take)
        kept[static_cast<std::size_t>(take)] = Scattered(take) % kKeptOneIn == 0;
}

UString Takes::Number(int row) const { return LabelText::OfNumber(Take(row) + 1); }

UString Takes::Name(int row) const {
    int const take = Take(row);
    UString const part = Phrases::Get(kParts[Scattered(take) % kPartCount]);
    return Phrases::Fill(Phrase::kTakeName, {part, LabelText::OfNumber(take % 24 + 1)});
}

UString Takes::Length(int row) const {
    unsigned const seconds = kShortest + Scattered(Take(row)) % kSpread;
    unsigned const rest = seconds % kSecondsInMinute;
    UString length = LabelText::OfNumber(static_cast<int>(seconds / kSecondsInMinute));
    length += Utf8::ToUString(rest < 10 ? ":0" : ":");
    length += LabelText::OfNumber(static_cast<int>(rest));
    return length;
}

void Takes::Move(int from, int to) {
    auto const begin = order.begin();
    if (from < to)
        std::rotate(begin + from, begin + from + 1, begin + to + 1);
    else
        std::rotate(begin + to, begin + from, begin + from + 1);
}
