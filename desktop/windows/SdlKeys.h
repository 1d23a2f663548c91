// From SDL's keys to the desktop's.
#pragma once
#include "host/UString.h"

struct SDL_Keysym;

// The Control key is the command key: it is the one that shortcuts use on this platform, and "command" means
// just that to panes. What is left for "control" is the logo key; Alt is "option".
namespace SdlKeys {

// One of KeyCodes, or the character that the key types without modifiers. The keypad gives digits or
// movements by Num Lock, which Shift inverts. kNone for keys that panes have no use for.
int CodeOf(SDL_Keysym const &);
// Bits of Modifiers from SDL's.
unsigned short ModifiersOf(unsigned short sdlModifiers);
// Whether the code is that of a key that types a character, which the code then is.
bool IsCharacter(int keyCode);
// What the key types, as well as it can be known while text input is off: nothing with any modifier but
// Shift, and nothing for Shift with a key that is no letter, since that depends on the keyboard's layout.
UString TextOf(int keyCode, unsigned short sdlModifiers);

} // namespace SdlKeys
