#include "desktop/windows/SdlKeys.h"
#include "desktop/resources/Utf.h"
#include "desktop/windows/KeyCodes.h"
#include <SDL.h>
#include <gtest/gtest.h>

static SDL_Keysym Key(SDL_Keycode sym, int modifiers = KMOD_NONE) {
    SDL_Keysym keysym = {};
    keysym.sym = sym;
    keysym.mod = static_cast<Uint16>(modifiers);
    return keysym;
}

static std::string Typed(int code, int modifiers) {
    return Utf::ToUtf8(SdlKeys::TextOf(code, static_cast<unsigned short>(modifiers)));
}

TEST(SdlKeys, ACharacterIsItsOwnCode) {
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_a)), 'a');
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_a, KMOD_SHIFT)), 'a');
    EXPECT_EQ(SdlKeys::CodeOf(Key(0xE9)), 0xE9);
    EXPECT_EQ(SdlKeys::CodeOf(Key(0x44F)), 0x44F);
}

TEST(SdlKeys, TheKeypadGivesDigitsOnlyWithNumLock) {
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_7, KMOD_NUM)), '7');
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_7)), KeyCodes::kHome);
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_PERIOD, KMOD_NUM)), '.');
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_PERIOD)), KeyCodes::kDelete);
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_5)), KeyCodes::kNone);
}

TEST(SdlKeys, ShiftInvertsNumLock) {
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_7, KMOD_NUM | KMOD_LSHIFT)), KeyCodes::kHome);
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_KP_7, KMOD_LSHIFT)), '7');
}

TEST(SdlKeys, KeysWithoutUseHaveNoCode) {
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_UNKNOWN)), KeyCodes::kNone);
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_AUDIOPLAY)), KeyCodes::kNone);
    EXPECT_EQ(SdlKeys::CodeOf(Key(SDLK_F13)), KeyCodes::kNone);
}

TEST(SdlKeys, ModifiersOfBothSidesCount) {
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_LSHIFT), Modifiers::kShift);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_RSHIFT), Modifiers::kShift);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_RCTRL), Modifiers::kCommand);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_LALT), Modifiers::kOption);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_RGUI), Modifiers::kControl);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_NUM | KMOD_CAPS), 0);
    EXPECT_EQ(SdlKeys::ModifiersOf(KMOD_LCTRL | KMOD_RSHIFT), Modifiers::kCommand | Modifiers::kShift);
}

TEST(SdlKeys, ShiftAndCapsLockMakeCapitalsAndTogetherNone) {
    EXPECT_EQ(Typed('a', KMOD_NONE), "a");
    EXPECT_EQ(Typed('a', KMOD_SHIFT), "A");
    EXPECT_EQ(Typed('a', KMOD_CAPS), "A");
    EXPECT_EQ(Typed('a', KMOD_CAPS | KMOD_SHIFT), "a");
    EXPECT_EQ(Typed(0xE9, KMOD_SHIFT), "\xC3\x89");
    EXPECT_EQ(Typed(0x44F, KMOD_SHIFT), "\xD0\xAF");
}

TEST(SdlKeys, OfAShiftedKeyThatIsNoLetterNothingIsGuessed) {
    EXPECT_EQ(Typed('1', KMOD_NONE), "1");
    EXPECT_EQ(Typed('1', KMOD_SHIFT), "");
    EXPECT_EQ(Typed(0xDF, KMOD_SHIFT), "");
    EXPECT_EQ(Typed(KeyCodes::kSpace, KMOD_SHIFT), " ");
}

TEST(SdlKeys, NothingIsTypedWithAShortcutsModifiers) {
    EXPECT_EQ(Typed('a', KMOD_CTRL), "");
    EXPECT_EQ(Typed('a', KMOD_ALT), "");
    EXPECT_EQ(Typed('a', KMOD_GUI), "");
}

TEST(SdlKeys, KeysThatAreNoCharactersTypeNothing) {
    for (int code : {int(KeyCodes::kReturn), int(KeyCodes::kTab), int(KeyCodes::kDelete), int(KeyCodes::kF1),
                     int(KeyCodes::kLeft), int(KeyCodes::kShiftKey), int(KeyCodes::kNone)}) {
        EXPECT_FALSE(SdlKeys::IsCharacter(code)) << code;
        EXPECT_EQ(Typed(code, KMOD_NONE), "") << code;
    }
}
