#include "desktop/windows/InputState.h"

static int const kPrimaryButton = 1;

static bool HasPlace(InputEvent::Kind kind) {
    return kind == InputEvent::kMouseDown || kind == InputEvent::kMouseUp || kind == InputEvent::kMouseMove ||
           kind == InputEvent::kMouseLeave || kind == InputEvent::kWheel;
}

static bool HasModifiers(InputEvent::Kind kind) {
    return HasPlace(kind) || kind == InputEvent::kKeyDown || kind == InputEvent::kKeyUp;
}

void InputState::Take(InputEvent const &event) {
    if (HasModifiers(event.kind))
        modifiers = event.modifiers;
    if (HasPlace(event.kind) && event.window != nullptr) {
        pointerWindow = event.window;
        pointerH = event.h;
        pointerV = event.v;
    }
    if (event.kind == InputEvent::kMouseDown || event.kind == InputEvent::kMouseUp) {
        if (event.button == kPrimaryButton)
            primaryDown = event.kind == InputEvent::kMouseDown;
    } else if (event.kind == InputEvent::kKeyDown) {
        keys.insert(event.key);
    } else if (event.kind == InputEvent::kKeyUp) {
        keys.erase(event.key);
    }
}

void InputState::Forget(PlatformWindow const *window) {
    if (pointerWindow != window)
        return;
    pointerWindow = nullptr;
    primaryDown = false; // a press in a window that is gone has no release to come
}
