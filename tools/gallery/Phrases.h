// What the gallery itself says, in the user's language; what stands on pages, those name.
#pragma once
#include "host/UString.h"
#include <initializer_list>

// The strings of one list in strings/ beside the gallery, by index.
enum class Phrase : short {
    kPressSomething = 1,
    kWasPressed,
    kCommandSent,
    kFrameButton,
    kBoxSelect,
    kTriangle,
    kCheckBoxes,
    kRadioButtons,
    kIconButton,
    kPopUpMenu,
    kPicture,
    kIcon,
    kButton,
    kNotOpened,
    kBounced,
    kCancelled,
    kFileIsThere,
    kBarNumber,
    kBlue,
    kTeal,
    kGreen,
    kAmber,
    kCoral,
    kRose,
    kViolet,
    kSlate,
    kNotes,
    kNotesShort,
    kModulation,
    kModulationShort,
    kAutomation,
    kAutomationShort,
    kEffects,
    kEffectsShort,
    kPixels,
    kFirstSection,
    kSecondSection,
    kThirdSection,
    kFourthSection,
    kSoundsFound,
    kNothingChosen,
    kNumberHeading,
    kTakeHeading,
    kLengthHeading,
    kKeepHeading,
    kRowMoved,
    kTakeIsKept,
    kTakeMayGo,
    kPageIn,
    kPagesIn,
    kSelected,
    kKept,
    kTakes,
    kTakeName,
    kIntro,
    kVerse,
    kChorus,
    kBridge,
    kSolo,
    kOutro,
    kNoTrack,
    kTrackRow,
    kClip,
    kClips,
    kDrums,
    kPercussion,
    kBass,
    kGuitar,
    kPiano,
    kStrings,
    kVoice,
    kStretch,
    kDecimalMark,
    kThousandsMark,
};

namespace Phrases {

UString Get(Phrase);
// The phrase with its ^0 replaced by the first text, ^1 by the second, and so on; a mark without a text
// stays.
UString Fill(Phrase, std::initializer_list<UString> texts);
UString Fill(Phrase, std::initializer_list<int> numbers); // in digits, thousands apart

} // namespace Phrases
