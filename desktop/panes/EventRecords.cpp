#include "desktop/panes/EventRecords.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/resources/Utf.h"
#include <algorithm>

namespace {

double const kTicksPerSecond = 60.0;

unsigned int Ticks(double seconds) { return static_cast<unsigned int>(seconds * kTicksPerSecond + 0.5); }

short Coordinate16(int value) { return static_cast<short>(std::clamp(value, -32768, 32767)); }

bool IsKey(InputEvent const &event) {
    return event.kind == InputEvent::kKeyDown || event.kind == InputEvent::kTextInput;
}

EventKinds::Kind KindOf(InputEvent const &event) {
    if (IsKey(event))
        return event.repeat ? EventKinds::kAutoKey : EventKinds::kKeyDown;
    return event.kind == InputEvent::kMouseDown ? EventKinds::kMouseDown
           : event.kind == InputEvent::kMouseUp ? EventKinds::kMouseUp
                                                : EventKinds::kNull;
}

// The low byte is the ASCII character where there is one, else a named key; the next sixteen bits are the
// key's code. Other characters leave the byte 0, since their low bytes would pass for keys.
unsigned long long KeyMessage(InputEvent const &event) {
    std::u16string_view const units = Utf::View(event.text);
    unsigned long long character = event.key < 0x80 ? static_cast<unsigned long long>(event.key) : 0;
    if (units.size() == 1 && units[0] < 0x80)
        character = units[0];
    return character | static_cast<unsigned long long>(event.key) << 8;
}

} // namespace

Point EventRecords::PlaceOf(InputEvent const &event) {
    return {Coordinate16(event.v), Coordinate16(event.h)};
}

void EventRecords::Fill(EventRecordAdapter &record, InputEvent const &event) {
    record.what = KindOf(event);
    record.when = Ticks(event.time);
    record.where = PlaceOf(event);
    record.modifiers = event.modifiers;
    if (IsKey(event))
        record.message = KeyMessage(event);
}

EventRecordAdapter EventRecords::Of(InputEvent const &event) {
    EventRecordAdapter record;
    Fill(record, event);
    return record;
}
