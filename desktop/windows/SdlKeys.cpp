#include "desktop/windows/SdlKeys.h"
#include "desktop/resources/Utf.h"
#include "desktop/windows/KeyCodes.h"
#include <SDL.h>
#include <string_view>

namespace {
struct KeyPair {
    SDL_Keycode sdl;
    int code;
};
struct KeypadKey {
    SDL_Keycode sdl;
    int digit, movement;
};
struct ModifierPair {
    unsigned short sdl, bit;
};
} // namespace

static KeyPair const kNamedKeys[] = {
    {SDLK_HOME, KeyCodes::kHome},
    {SDLK_END, KeyCodes::kEnd},
    {SDLK_PAGEUP, KeyCodes::kPageUp},
    {SDLK_PAGEDOWN, KeyCodes::kPageDown},
    {SDLK_LEFT, KeyCodes::kLeft},
    {SDLK_RIGHT, KeyCodes::kRight},
    {SDLK_UP, KeyCodes::kUp},
    {SDLK_DOWN, KeyCodes::kDown},
    {SDLK_HELP, KeyCodes::kHelp},
    {SDLK_DELETE, KeyCodes::kDelete},
    {SDLK_KP_ENTER, KeyCodes::kEnter},
    {SDLK_KP_DIVIDE, '/'},
    {SDLK_KP_MULTIPLY, '*'},
    {SDLK_KP_MINUS, '-'},
    {SDLK_KP_PLUS, '+'},
    {SDLK_KP_EQUALS, '='},
    {SDLK_LSHIFT, KeyCodes::kShiftKey},
    {SDLK_RSHIFT, KeyCodes::kShiftKey},
    {SDLK_LCTRL, KeyCodes::kCommandKey},
    {SDLK_RCTRL, KeyCodes::kCommandKey},
    {SDLK_LALT, KeyCodes::kOptionKey},
    {SDLK_RALT, KeyCodes::kOptionKey},
    {SDLK_LGUI, KeyCodes::kControlKey},
    {SDLK_RGUI, KeyCodes::kControlKey},
};

static KeypadKey const kKeypadKeys[] = {
    {SDLK_KP_0, '0', KeyCodes::kNone},        {SDLK_KP_1, '1', KeyCodes::kEnd},
    {SDLK_KP_2, '2', KeyCodes::kDown},        {SDLK_KP_3, '3', KeyCodes::kPageDown},
    {SDLK_KP_4, '4', KeyCodes::kLeft},        {SDLK_KP_5, '5', KeyCodes::kNone},
    {SDLK_KP_6, '6', KeyCodes::kRight},       {SDLK_KP_7, '7', KeyCodes::kHome},
    {SDLK_KP_8, '8', KeyCodes::kUp},          {SDLK_KP_9, '9', KeyCodes::kPageUp},
    {SDLK_KP_PERIOD, '.', KeyCodes::kDelete},
};

static ModifierPair const kModifiers[] = {
    {KMOD_SHIFT, Modifiers::kShift},
    {KMOD_CTRL, Modifiers::kCommand},
    {KMOD_ALT, Modifiers::kOption},
    {KMOD_GUI, Modifiers::kControl},
};

static int FunctionKey(SDL_Keycode key) {
    return key >= SDLK_F1 && key <= SDLK_F12 ? KeyCodes::kF1 + (key - SDLK_F1) : KeyCodes::kNone;
}

int SdlKeys::CodeOf(SDL_Keysym const &keysym) {
    bool shift = (keysym.mod & KMOD_SHIFT) != 0, numbers = (keysym.mod & KMOD_NUM) != 0;
    for (KeypadKey const &key : kKeypadKeys)
        if (key.sdl == keysym.sym)
            return numbers != shift ? key.digit : key.movement;
    for (KeyPair const &key : kNamedKeys)
        if (key.sdl == keysym.sym)
            return key.code;
    if ((keysym.sym & SDLK_SCANCODE_MASK) != 0)
        return FunctionKey(keysym.sym);
    return keysym.sym; // Return, Escape, Backspace and Tab are the same characters in both
}

unsigned short SdlKeys::ModifiersOf(unsigned short sdlModifiers) {
    unsigned short bits = 0;
    for (ModifierPair const &modifier : kModifiers)
        if ((sdlModifiers & modifier.sdl) != 0)
            bits = static_cast<unsigned short>(bits | modifier.bit);
    return bits;
}

bool SdlKeys::IsCharacter(int keyCode) {
    return keyCode >= KeyCodes::kSpace && keyCode < KeyCodes::kF1 && keyCode != KeyCodes::kDelete;
}

UString SdlKeys::TextOf(int keyCode, unsigned short sdlModifiers) {
    if (!IsCharacter(keyCode) || (sdlModifiers & (KMOD_CTRL | KMOD_ALT | KMOD_GUI)) != 0)
        return UString();
    char16_t unit = static_cast<char16_t>(keyCode);
    UString plain = Utf::FromUnits(std::u16string_view(&unit, 1));
    UString upper = plain;
    tarn::ToUpper(upper);
    // Some letters have no capital of one unit: they are shifted as digits are, by the layout.
    bool letter = upper.length() == 1 && !(upper == plain);
    bool shift = (sdlModifiers & KMOD_SHIFT) != 0;
    if (!letter)
        return shift && keyCode != KeyCodes::kSpace ? UString() : plain;
    bool capitals = (sdlModifiers & KMOD_CAPS) != 0;
    return shift != capitals ? upper : plain;
}
