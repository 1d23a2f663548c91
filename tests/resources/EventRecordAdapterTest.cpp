#include "host/EventRecordAdapter.h"
#include <gtest/gtest.h>

namespace {

EventRecordAdapter KeyEvent(unsigned long long message) {
    EventRecordAdapter event;
    event.message = message;
    return event;
}

TEST(ShiftEvent, LooksAtTheShiftBitAlone) {
    EventRecordAdapter event;
    event.modifiers = 0x0200;
    EXPECT_TRUE(ShiftEvent(&event));
    event.modifiers = 0xFDFF;
    EXPECT_FALSE(ShiftEvent(&event));
}

TEST(KeyPredicates, TellTheirKeysByTheLowByte) {
    EventRecordAdapter const escape = KeyEvent(0x351B), up = KeyEvent(0x7E1E), down = KeyEvent(0x7D1F);
    EXPECT_TRUE(EscapeKey(&escape));
    EXPECT_TRUE(UpArrowKey(&up));
    EXPECT_TRUE(DownArrowKey(&down));
    EXPECT_FALSE(EscapeKey(&up));
    EXPECT_FALSE(UpArrowKey(&down));
    EXPECT_FALSE(DownArrowKey(&escape));
}

TEST(KeyPredicates, IgnoreWhatStandsAboveTheLowByte) {
    EventRecordAdapter const event = KeyEvent(0x1B00);
    EXPECT_FALSE(EscapeKey(&event));
}

TEST(KeyPredicates, AreFalseWithoutAnEvent) {
    EXPECT_FALSE(ShiftEvent(nullptr));
    EXPECT_FALSE(EscapeKey(nullptr));
    EXPECT_FALSE(UpArrowKey(nullptr));
    EXPECT_FALSE(DownArrowKey(nullptr));
}

} // namespace
