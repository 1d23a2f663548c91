// A key press with all that it types.
#pragma once
#include "desktop/windows/KeyCodes.h"
#include "host/EventRecordAdapter.h"
#include "host/UString.h"

namespace EventKinds {
// As in classic event records.
enum Kind : unsigned short { kNull = 0, kMouseDown = 1, kMouseUp = 2, kKeyDown = 3, kAutoKey = 5 };
} // namespace EventKinds

// What the desktop gives to panes for a key. Panes hand it on as the record that it is; copies that they make
// of the record have what the record says.
class KeyEvent : public EventRecordAdapter {
public:
    UString text; // empty for a key that types nothing
};

// Reads any key event, from wherever it comes.
namespace KeyReading {

// One of KeyCodes, or the character that the key types without modifiers.
inline int CodeOf(EventRecordAdapter const &event) {
    int const code = static_cast<int>((event.message >> 8) & 0xFFFF);
    return code != 0 ? code : static_cast<int>(event.message & 0xFF);
}
// What it types; empty for a shortcut.
UString TextOf(EventRecordAdapter const &);

} // namespace KeyReading
