#include "desktop/resources/Utf.h"
#include "tests/window/WindowTest.h"

namespace {
class Keyboard : public WindowTest {};
} // namespace

static std::string Text(InputEvent const &event) { return Utf::ToUtf8(event.text); }

TEST_F(Keyboard, AKeyIsAPressWithItsTextAndARelease) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key a");
    InputEvent press = Await(InputEvent::kKeyDown);
    EXPECT_EQ(press.window, window.get());
    EXPECT_EQ(press.key, 'a');
    EXPECT_EQ(Text(press), "a");
    EXPECT_FALSE(press.repeat);
    EXPECT_TRUE(System().IsKeyPressed('a'));
    EXPECT_EQ(Await(InputEvent::kKeyUp).key, 'a');
    EXPECT_FALSE(System().IsKeyPressed('a'));
}

TEST_F(Keyboard, ShiftMakesACapitalOfTheSameKey) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key shift+a");
    EXPECT_EQ(Await(InputEvent::kKeyDown).key, KeyCodes::kShiftKey);
    InputEvent press = Await(InputEvent::kKeyDown);
    EXPECT_EQ(press.key, 'a');
    EXPECT_EQ(Text(press), "A");
    EXPECT_EQ(press.modifiers, Modifiers::kShift);
    EXPECT_EQ(System().CurrentModifiers(), Modifiers::kShift);
    Drain();
    EXPECT_EQ(System().CurrentModifiers(), 0);
}

TEST_F(Keyboard, AShortcutIsItsKeyWithCommandAndTypesNothing) {
    Window window = Open(At(200, 150, 300, 200));
    for (bool typing : {false, true}) {
        if (typing)
            window->StartTextInput({0, 0, 20, 1});
        for (char const *keys : {"ctrl+c", "ctrl+1"}) {
            Do(std::string("key ") + keys);
            EXPECT_EQ(Await(InputEvent::kKeyDown).key, KeyCodes::kCommandKey);
            InputEvent press = Await(InputEvent::kKeyDown);
            EXPECT_EQ(press.key, keys[5]);
            EXPECT_EQ(press.modifiers, Modifiers::kCommand);
            EXPECT_EQ(Text(press), "");
            EXPECT_TRUE(Drain(InputEvent::kTextInput).empty());
        }
    }
}

TEST_F(Keyboard, AltIsOptionAndTheLogoKeyIsControl) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key alt+x");
    EXPECT_EQ(Await(InputEvent::kKeyDown).key, KeyCodes::kOptionKey);
    EXPECT_EQ(Await(InputEvent::kKeyDown).modifiers, Modifiers::kOption);
    Drain();
    Do("key super+x");
    EXPECT_EQ(Await(InputEvent::kKeyDown).key, KeyCodes::kControlKey);
    EXPECT_EQ(Await(InputEvent::kKeyDown).modifiers, Modifiers::kControl);
}

TEST_F(Keyboard, NamedKeysHaveTheirCodesAndNoText) {
    struct {
        char const *name;
        int code;
    } const keys[] = {
        {"Return", KeyCodes::kReturn}, {"KP_Enter", KeyCodes::kEnter},      {"Escape", KeyCodes::kEscape},
        {"Tab", KeyCodes::kTab},       {"BackSpace", KeyCodes::kBackspace}, {"Delete", KeyCodes::kDelete},
        {"Left", KeyCodes::kLeft},     {"Right", KeyCodes::kRight},         {"Up", KeyCodes::kUp},
        {"Down", KeyCodes::kDown},     {"Home", KeyCodes::kHome},           {"End", KeyCodes::kEnd},
        {"Prior", KeyCodes::kPageUp},  {"Next", KeyCodes::kPageDown},       {"F1", KeyCodes::kF1},
        {"F12", KeyCodes::kF1 + 11}};
    Window window = Open(At(200, 150, 300, 200));
    for (bool typing : {false, true}) {
        if (typing)
            window->StartTextInput({0, 0, 20, 1});
        for (auto const &key : keys) {
            Do(std::string("key ") + key.name);
            InputEvent press = Await(InputEvent::kKeyDown);
            EXPECT_EQ(press.key, key.code) << key.name;
            EXPECT_EQ(Text(press), "") << key.name;
        }
    }
}

TEST_F(Keyboard, TheSpaceBarTypesASpace) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key space");
    InputEvent press = Await(InputEvent::kKeyDown);
    EXPECT_EQ(press.key, KeyCodes::kSpace);
    EXPECT_EQ(Text(press), " ");
}

TEST_F(Keyboard, WhileTextInputIsOnTheLayoutSaysWhatAKeyTypes) {
    Window window = Open(At(200, 150, 300, 200));
    window->StartTextInput({0, 0, 20, 1});
    Do("key shift+1");
    Await(InputEvent::kKeyDown);
    InputEvent press = Await(InputEvent::kKeyDown);
    EXPECT_EQ(press.key, '1');
    EXPECT_EQ(Text(press), "!");
    EXPECT_TRUE(Drain(InputEvent::kTextInput).empty());
}

TEST_F(Keyboard, WhileTextInputIsOffAShiftedDigitTypesNothing) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key shift+1");
    Await(InputEvent::kKeyDown);
    InputEvent press = Await(InputEvent::kKeyDown);
    EXPECT_EQ(press.key, '1');
    EXPECT_EQ(Text(press), "");
}

TEST_F(Keyboard, TextInputStopsWithItsWindow) {
    Window other = Open(At(600, 150, 200, 200));
    Window window = Open(At(200, 150, 300, 200));
    window->StartTextInput({0, 0, 20, 1});
    other->StopTextInput(); // it has none
    Do("key shift+1");
    Await(InputEvent::kKeyDown);
    EXPECT_EQ(Text(Await(InputEvent::kKeyDown)), "!");
    window.reset();
    Drain();
    Do("key shift+1");
    Await(InputEvent::kKeyDown);
    EXPECT_EQ(Text(Await(InputEvent::kKeyDown)), "");
}

TEST_F(Keyboard, AHeldKeyRepeats) {
    Window window = Open(At(200, 150, 300, 200));
    Do("keydown b");
    EXPECT_FALSE(Await(InputEvent::kKeyDown).repeat);
    EXPECT_TRUE(Await(InputEvent::kKeyDown).repeat);
    EXPECT_TRUE(System().IsKeyPressed('b'));
    Do("keyup b");
    Await(InputEvent::kKeyUp);
    EXPECT_FALSE(System().IsKeyPressed('b'));
}

TEST_F(Keyboard, KeysHeldWhenTheActivationIsLostAreReleased) {
    Window other = Open(At(600, 150, 200, 200));
    Window window = Open(At(200, 150, 300, 200));
    Do("keydown Control_L");
    Await(InputEvent::kKeyDown);
    EXPECT_EQ(System().CurrentModifiers(), Modifiers::kCommand);
    window.reset();
    Do("keyup Control_L");
    Drain();
    EXPECT_FALSE(System().IsKeyPressed(KeyCodes::kCommandKey));
    EXPECT_EQ(System().CurrentModifiers(), 0);
}
