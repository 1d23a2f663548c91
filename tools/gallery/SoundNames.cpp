#include "tools/gallery/SoundNames.h"
#include "dialogs/Utf8.h"
#include "host/XMLLib.h"
#include "text/SearchedForm.h"
#include "tools/gallery/LabelText.h"
#include <algorithm>
#include <iterator>
#include <numeric>

namespace {

char const *const kMoods[] = {"Airy",  "Bright",  "Broken", "Close",   "Cold",  "Crisp", "Dark",
                              "Dirty", "Distant", "Dry",    "Dusty",   "Fat",   "Felt",  "Glass",
                              "Heavy", "Hollow",  "Muted",  "Round",   "Sharp", "Soft",  "Tape",
                              "Tight", "Warm",    "Wide",   "Worn-out"};
char const *const kSources[] = {"Bass",           "Bassoon",  "Bell",         "Bongo",   "Bow",
                                "Brass Section",  "Cello",    "Choir",        "Clap",    "Clavinet",
                                "Conga",          "Cowbell",  "Crash Cymbal", "Drone",   "Flute",
                                "Grand Piano",    "Guitar",   "Harp",         "Hi-hat",  "Kick",
                                "Lead Synth",     "Marimba",  "Organ",        "Pad",     "Pipe Organ",
                                "Pluck",          "Rim Shot", "Saxophone",    "Shaker",  "Snare",
                                "String Section", "Strings",  "Tambourine",   "Timpani", "Tom",
                                "Trombone",       "Trumpet",  "Vibraphone",   "Viola",   "Whistle"};
int const kMoodCount = static_cast<int>(std::size(kMoods)),
          kSourceCount = static_cast<int>(std::size(kSources));
int const kScatter =
    61803; // shares no factor with the number of sounds: each comes once, without visible order
int const kSecondsInMinute = 60, kLongest = 149;

UString NameOf(int sound) {
    long long const place = static_cast<long long>(sound) * kScatter % SoundNames::kCount;
    int const number = static_cast<int>(place);
    UString name = Utf8::ToUString(kMoods[number % kMoodCount]);
    name += Utf8::ToUString(" ");
    name += Utf8::ToUString(kSources[number / kMoodCount % kSourceCount]);
    name += Utf8::ToUString(" ");
    name += LabelText::OfNumber(number / (kMoodCount * kSourceCount) + 1);
    return name;
}

typedef std::vector<UString> UStrings;

// Made once for the program.
UStrings const &AllNames() {
    static UStrings const names = [] {
        UStrings made(SoundNames::kCount);
        for (int i = 0; i < SoundNames::kCount; ++i)
            made[static_cast<std::size_t>(i)] = NameOf(i);
        return made;
    }();
    return names;
}

UStrings FormsOfNames() {
    UStrings forms(AllNames().size());
    std::transform(AllNames().begin(), AllNames().end(), forms.begin(), SearchedForm::OfText);
    return forms;
}

// What searches look at. They are made again only for a desktop in another language, which may compare other
// forms.
UStrings const &FormsInSystemLanguage() {
    static unsigned int language = 0; // no language
    static UStrings forms;
    if (language != XMLLib::GetSystemLanguageCode()) {
        language = XMLLib::GetSystemLanguageCode();
        forms = FormsOfNames();
    }
    return forms;
}

} // namespace

SoundNames::SoundNames() { Search(UString()); }

// What a longer search finds is among what a shorter one has found.
void SoundNames::Search(UString const &search) {
    UString const form = SearchedForm::OfSearch(search);
    bool const narrows = !sought.empty() && !found.empty() && form.find(sought, 0) == 0;
    if (!narrows) {
        found.resize(kCount);
        std::iota(found.begin(), found.end(), 0);
    }
    sought = form;
    UStrings const &forms = FormsInSystemLanguage(); // made with the page, not at its first letter
    if (search.empty())
        return;
    auto const fails = [&](int sound) {
        return forms[static_cast<std::size_t>(sound)].find(form, 0) == UString::npos;
    };
    found.erase(std::remove_if(found.begin(), found.end(), fails), found.end());
}

UString const &SoundNames::Name(int row) const { return AllNames()[static_cast<std::size_t>(Sound(row))]; }

UString SoundNames::Length(int row) const {
    int const seconds = 1 + Sound(row) % kScatter * 97 % kLongest, rest = seconds % kSecondsInMinute;
    UString length = LabelText::OfNumber(seconds / kSecondsInMinute);
    length += Utf8::ToUString(rest < 10 ? ":0" : ":");
    length += LabelText::OfNumber(rest);
    return length;
}
