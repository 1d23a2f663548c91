// The sounds that the gallery searches.
#include "tools/gallery/SoundNames.h"
#include "desktop/SimulatedDesktop.h"
#include "dialogs/Utf8.h"
#include <gtest/gtest.h>
#include <string>

namespace {

int CountFound(std::string const &language, char const *search) {
    SimulatedDesktop const desktop(DesktopOptions().Language(language));
    SoundNames sounds;
    sounds.Search(Utf8::ToUString(search));
    return sounds.CountFound();
}

} // namespace

TEST(SoundNames, AreFoundAsTheLanguageOfEachDesktopCompares) {
    int const kOfMood = SoundNames::kCount / 25, kOfSource = SoundNames::kCount / 40;
    EXPECT_EQ(CountFound("de", "warm"), kOfMood);
    EXPECT_EQ(CountFound("en", "warm"), kOfMood);
    EXPECT_EQ(CountFound("de", "axophone"), kOfSource);
    EXPECT_EQ(CountFound("en", "axophone"), 0); // no word begins so
}
