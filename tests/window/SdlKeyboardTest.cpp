#include "desktop/windows/SdlKeyboard.h"
#include "desktop/resources/Utf.h"
#include "tests/window/WindowTest.h"
#include <SDL.h>
#include <cstddef>
#include <cstdlib>

namespace {

// Text input of an input method, which no test can type.
class InputMethod : public WindowTest {
protected:
    InputMethod()
        : keyboard(queue) {}
    static PlatformWindow *Window() { // compared, never looked at
        static std::max_align_t place;
        return reinterpret_cast<PlatformWindow *>(&place);
    }
    static SDL_KeyboardEvent Key(SDL_Keycode sym, int modifiers = KMOD_NONE) {
        SDL_KeyboardEvent event = {};
        event.keysym.sym = sym;
        event.keysym.scancode = SDL_GetScancodeFromKey(sym);
        event.keysym.mod = static_cast<Uint16>(modifiers);
        return event;
    }
    InputEvent Next() {
        InputEvent event;
        EXPECT_TRUE(queue.Pop(event));
        return event;
    }
    InputQueue queue;
    SdlKeyboard keyboard;
};

std::string Text(InputEvent const &event) { return Utf::ToUtf8(event.text); }

} // namespace

TEST_F(InputMethod, TextWithoutAKeyIsAnEventOfItsOwn) {
    keyboard.CommitText(InputEvent(), Window(), "\xE6\x97\xA5\xE6\x9C\xAC");
    InputEvent event = Next();
    EXPECT_EQ(event.kind, InputEvent::kTextInput);
    EXPECT_EQ(event.window, Window());
    EXPECT_EQ(Text(event), "\xE6\x97\xA5\xE6\x9C\xAC");
}

TEST_F(InputMethod, TextAfterAKeyThatTypesNothingIsAnEventOfItsOwn) {
    keyboard.StartTextInput(Window());
    keyboard.Press(InputEvent(), Window(), Key(SDLK_LSHIFT));
    keyboard.CommitText(InputEvent(), Window(), "x");
    EXPECT_EQ(Text(Next()), "");
    EXPECT_EQ(Next().kind, InputEvent::kTextInput);
    keyboard.StopTextInput(Window());
}

TEST_F(InputMethod, OnlyTheFirstTextJoinsTheKey) {
    keyboard.StartTextInput(Window());
    keyboard.Press(InputEvent(), Window(), Key(SDLK_e));
    keyboard.CommitText(InputEvent(), Window(), "\xC2\xB4");
    keyboard.CommitText(InputEvent(), Window(), "e");
    EXPECT_EQ(Text(Next()), "\xC2\xB4");
    InputEvent second = Next();
    EXPECT_EQ(second.kind, InputEvent::kTextInput);
    EXPECT_EQ(Text(second), "e");
    keyboard.StopTextInput(Window());
}

TEST_F(InputMethod, OptionTypesWhatTheLayoutSays) {
    keyboard.StartTextInput(Window());
    keyboard.Press(InputEvent(), Window(), Key(SDLK_q, KMOD_RALT));
    keyboard.CommitText(InputEvent(), Window(), "@");
    EXPECT_EQ(Text(Next()), "@");
    keyboard.StopTextInput(Window());
}

TEST_F(InputMethod, AShortcutTakesItsTextWithIt) {
    keyboard.StartTextInput(Window());
    keyboard.Press(InputEvent(), Window(), Key(SDLK_1, KMOD_LCTRL));
    keyboard.CommitText(InputEvent(), Window(), "1");
    InputEvent press = Next();
    EXPECT_EQ(press.key, '1');
    EXPECT_EQ(Text(press), "");
    EXPECT_TRUE(queue.Empty());
    keyboard.StopTextInput(Window());
}

TEST_F(InputMethod, ACompositionTellsItsCaret) {
    keyboard.EditText(InputEvent(), Window(), "\xE3\x81\xAB\xE3\x81\xBB", 2);
    InputEvent event = Next();
    EXPECT_EQ(event.kind, InputEvent::kTextEditing);
    EXPECT_EQ(Text(event), "\xE3\x81\xAB\xE3\x81\xBB");
    EXPECT_EQ(event.compositionCaret, 2);
}

TEST_F(InputMethod, ACompositionThatEndsIsEmpty) {
    keyboard.EditText(InputEvent(), Window(), "", -1);
    InputEvent event = Next();
    EXPECT_EQ(event.kind, InputEvent::kTextEditing);
    EXPECT_EQ(Text(event), "");
    EXPECT_EQ(event.compositionCaret, 0);
}

TEST_F(InputMethod, TextForNoWindowGoesWhereTextInputIsOn) {
    keyboard.CommitText(InputEvent(), nullptr, "lost");
    EXPECT_TRUE(queue.Empty());
    keyboard.StartTextInput(Window());
    keyboard.CommitText(InputEvent(), nullptr, "x");
    EXPECT_EQ(Next().window, Window());
    keyboard.StopTextInput(Window());
}

TEST_F(InputMethod, AKeyIsReleasedWithTheCodeOfItsPress) {
    keyboard.Press(InputEvent(), Window(), Key(SDLK_KP_7, KMOD_NUM));
    keyboard.Release(InputEvent(), Window(), Key(SDLK_KP_7));
    EXPECT_EQ(Next().key, '7');
    EXPECT_EQ(Next().key, '7');
}

TEST_F(InputMethod, AReleaseWithoutPressIsNone) {
    keyboard.Release(InputEvent(), Window(), Key(SDLK_a));
    EXPECT_TRUE(queue.Empty());
}

TEST_F(InputMethod, IsAskedOnlyWhereTheSessionHasOneAndTextInputIsOn) {
    EXPECT_FALSE(keyboard.MustAskInputMethod());
    for (char const *setting : {"@im=none", "@im=", ""}) {
        setenv("XMODIFIERS", setting, 1);
        SdlKeyboard without(queue);
        without.StartTextInput(Window());
        EXPECT_FALSE(without.MustAskInputMethod()) << setting;
        without.StopTextInput(Window());
    }
    setenv("XMODIFIERS", "@im=ibus", 1);
    SdlKeyboard with(queue);
    unsetenv("XMODIFIERS");
    EXPECT_FALSE(with.MustAskInputMethod());
    with.StartTextInput(Window());
    EXPECT_TRUE(with.MustAskInputMethod());
    with.StopTextInput(Window());
    EXPECT_FALSE(with.MustAskInputMethod());
}
