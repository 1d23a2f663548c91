#include "desktop/windows/InputQueue.h"
#include <algorithm>

// Whether only the latest event of the kind counts.
static bool IsOfLatestOnly(InputEvent::Kind kind) {
    return kind == InputEvent::kResized || kind == InputEvent::kMoved || kind == InputEvent::kExposed;
}

void InputQueue::Push(InputEvent const &event) {
    if (event.kind == InputEvent::kMouseMove && !events.empty() && events.back().kind == event.kind &&
        events.back().window == event.window) {
        events.back() = event;
        return;
    }
    if (IsOfLatestOnly(event.kind))
        events.erase(std::remove_if(events.begin(), events.end(),
                                    [&](InputEvent const &earlier) {
                                        return earlier.kind == event.kind && earlier.window == event.window;
                                    }),
                     events.end());
    events.push_back(event);
}

bool InputQueue::Pop(InputEvent &event) {
    if (events.empty())
        return false;
    event = events.front();
    events.pop_front();
    return true;
}

bool InputQueue::HasOnlyLasting() const {
    return !events.empty() && std::none_of(events.begin(), events.end(), [](InputEvent const &event) {
        return event.kind == InputEvent::kMouseMove || IsOfLatestOnly(event.kind);
    });
}

bool InputQueue::HasRelease(PlatformWindow const *window) const {
    return std::any_of(events.begin(), events.end(), [window](InputEvent const &event) {
        return event.kind == InputEvent::kMouseUp && event.window == window;
    });
}

InputEvent *InputQueue::Last() { return events.empty() ? nullptr : &events.back(); }

static bool IsRelease(InputEvent::Kind kind) {
    return kind == InputEvent::kKeyUp || kind == InputEvent::kMouseUp;
}

void InputQueue::Forget(PlatformWindow const *window) {
    events.erase(std::remove_if(events.begin(), events.end(),
                                [window](InputEvent &event) {
                                    if (event.window != window)
                                        return false;
                                    event.window = nullptr;
                                    return !IsRelease(event.kind);
                                }),
                 events.end());
}
