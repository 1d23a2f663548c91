// Key codes and modifier bits.
#pragma once

// A key's code is the lower-case character it types without modifiers, or one of these. The low values are
// the character codes that panes compare with.
namespace KeyCodes {
enum Code {
    kNone = 0,
    kHome = 1,
    kEnter = 3, // on the keypad
    kEnd = 4,
    kHelp = 5,
    kBackspace = 8,
    kTab = 9,
    kPageUp = 11,
    kPageDown = 12,
    kReturn = 13,
    kEscape = 27,
    kLeft = 28,
    kRight = 29,
    kUp = 30,
    kDown = 31,
    kSpace = 32,
    kDelete = 127,
    kF1 = 0xF001, // kF1 + n - 1 for the others up to 12
    kShiftKey = 0xF101,
    kControlKey,
    kOptionKey,
    kCommandKey
};
}

namespace Modifiers {
enum Bit : unsigned short { kCommand = 0x0100, kShift = 0x0200, kOption = 0x0800, kControl = 0x1000 };
}
