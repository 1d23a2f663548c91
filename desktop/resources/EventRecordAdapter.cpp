#include "host/EventRecordAdapter.h"
#include "desktop/windows/KeyCodes.h"

namespace {

bool HasKey(EventRecordAdapter const *event, KeyCodes::Code key) {
    constexpr unsigned long long kCharacterMask = 0xFF;
    return event && (event->message & kCharacterMask) == static_cast<unsigned long long>(key);
}

} // namespace

bool ShiftEvent(EventRecordAdapter const *event) {
    return event && (event->modifiers & Modifiers::kShift) != 0;
}

bool EscapeKey(EventRecordAdapter const *event) { return HasKey(event, KeyCodes::kEscape); }

bool UpArrowKey(EventRecordAdapter const *event) { return HasKey(event, KeyCodes::kUp); }

bool DownArrowKey(EventRecordAdapter const *event) { return HasKey(event, KeyCodes::kDown); }
