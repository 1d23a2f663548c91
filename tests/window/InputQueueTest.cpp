#include "desktop/windows/InputQueue.h"
#include <cstddef>
#include <gtest/gtest.h>
#include <vector>

// The queue compares windows and never looks at one.
static PlatformWindow *Window(std::size_t number) {
    static std::max_align_t places[4];
    return reinterpret_cast<PlatformWindow *>(&places[number]);
}

static InputEvent Event(InputEvent::Kind kind, std::size_t window, int h = 0) {
    InputEvent event;
    event.kind = kind;
    event.window = Window(window);
    event.h = h;
    return event;
}

static std::vector<InputEvent> TakeAll(InputQueue &queue) {
    std::vector<InputEvent> events;
    InputEvent event;
    while (queue.Pop(event))
        events.push_back(event);
    return events;
}

TEST(InputQueue, GivesEventsInTheirOrder) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kMouseDown, 1));
    queue.Push(Event(InputEvent::kMouseUp, 1));
    std::vector<InputEvent> events = TakeAll(queue);
    ASSERT_EQ(events.size(), 2U);
    EXPECT_EQ(events[0].kind, InputEvent::kMouseDown);
    EXPECT_EQ(events[1].kind, InputEvent::kMouseUp);
    EXPECT_TRUE(queue.Empty());
}

TEST(InputQueue, AMoveTakesThePlaceOfTheMoveBeforeIt) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kMouseMove, 1, 5));
    queue.Push(Event(InputEvent::kMouseMove, 1, 6));
    std::vector<InputEvent> events = TakeAll(queue);
    ASSERT_EQ(events.size(), 1U);
    EXPECT_EQ(events[0].h, 6);
}

TEST(InputQueue, MovesInTwoWindowsBothStay) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kMouseMove, 1));
    queue.Push(Event(InputEvent::kMouseMove, 2));
    EXPECT_EQ(TakeAll(queue).size(), 2U);
}

TEST(InputQueue, NoMoveTakesAPlaceBeforeAnotherInput) {
    for (InputEvent::Kind kind : {InputEvent::kMouseDown, InputEvent::kMouseUp, InputEvent::kWheel,
                                  InputEvent::kKeyDown, InputEvent::kKeyUp}) {
        InputQueue queue;
        queue.Push(Event(InputEvent::kMouseMove, 1, 5));
        queue.Push(Event(kind, 1));
        queue.Push(Event(InputEvent::kMouseMove, 1, 6));
        EXPECT_EQ(TakeAll(queue).size(), 3U);
    }
}

TEST(InputQueue, OnlyTheLatestResizeMoveAndExposureOfAWindowCount) {
    for (InputEvent::Kind kind : {InputEvent::kResized, InputEvent::kMoved, InputEvent::kExposed}) {
        InputQueue queue;
        queue.Push(Event(kind, 1, 5));
        queue.Push(Event(kind, 2, 6));
        queue.Push(Event(InputEvent::kMouseDown, 1));
        queue.Push(Event(kind, 1, 7));
        std::vector<InputEvent> events = TakeAll(queue);
        ASSERT_EQ(events.size(), 3U);
        EXPECT_EQ(events[0].h, 6);
        EXPECT_EQ(events[1].kind, InputEvent::kMouseDown);
        EXPECT_EQ(events[2].h, 7);
    }
}

TEST(InputQueue, EventsOfAForgottenWindowGo) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kMouseDown, 1));
    queue.Push(Event(InputEvent::kMouseDown, 2));
    queue.Push(Event(InputEvent::kExposed, 1));
    queue.Forget(Window(1));
    std::vector<InputEvent> events = TakeAll(queue);
    ASSERT_EQ(events.size(), 1U);
    EXPECT_EQ(events[0].window, Window(2));
}

TEST(InputQueue, ReleasesOfAForgottenWindowStayWithoutIt) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kKeyUp, 1));
    queue.Push(Event(InputEvent::kMouseUp, 1));
    queue.Forget(Window(1));
    std::vector<InputEvent> events = TakeAll(queue);
    ASSERT_EQ(events.size(), 2U);
    EXPECT_EQ(events[0].window, nullptr);
    EXPECT_EQ(events[1].window, nullptr);
}

TEST(InputQueue, TheLastEventIsThereUntilItIsTaken) {
    InputQueue queue;
    EXPECT_EQ(queue.Last(), nullptr);
    queue.Push(Event(InputEvent::kKeyDown, 1));
    ASSERT_NE(queue.Last(), nullptr);
    EXPECT_EQ(queue.Last()->kind, InputEvent::kKeyDown);
    TakeAll(queue);
    EXPECT_EQ(queue.Last(), nullptr);
}

TEST(InputQueue, AReleaseOfTheMouseWaitsForItsWindowAlone) {
    InputQueue queue;
    queue.Push(Event(InputEvent::kMouseDown, 1));
    queue.Push(Event(InputEvent::kKeyUp, 1));
    EXPECT_FALSE(queue.HasRelease(Window(1)));
    queue.Push(Event(InputEvent::kMouseUp, 1));
    EXPECT_TRUE(queue.HasRelease(Window(1)));
    EXPECT_FALSE(queue.HasRelease(Window(2)));
    TakeAll(queue);
    EXPECT_FALSE(queue.HasRelease(Window(1)));
}

TEST(InputQueue, WhatTheNextEventCouldReplaceIsNotLasting) {
    InputQueue queue;
    EXPECT_FALSE(queue.HasOnlyLasting());
    queue.Push(Event(InputEvent::kMouseUp, 1));
    EXPECT_TRUE(queue.HasOnlyLasting());
    for (InputEvent::Kind const kind :
         {InputEvent::kMouseMove, InputEvent::kResized, InputEvent::kMoved, InputEvent::kExposed}) {
        InputQueue replaceable;
        replaceable.Push(Event(kind, 1));
        replaceable.Push(Event(InputEvent::kKeyDown, 1));
        EXPECT_FALSE(replaceable.HasOnlyLasting()) << kind;
    }
}
