#include "desktop/windows/SdlKeyboard.h"
#include "desktop/resources/Utf.h"
#include "desktop/windows/SdlKeys.h"
#include <SDL.h>
#include <algorithm>
#include <cstdlib>
#include <cstring>

static bool SessionHasInputMethod() {
    char const *setting = std::getenv("XMODIFIERS");
    char const *method = setting != nullptr ? std::strstr(setting, "@im=") : nullptr;
    return method != nullptr && std::strcmp(method, "@im=none") != 0 && std::strcmp(method, "@im=") != 0;
}

SdlKeyboard::SdlKeyboard(InputQueue &queue_)
    : queue(queue_)
    , inputMethod(SessionHasInputMethod()) {}

void SdlKeyboard::Press(InputEvent event, PlatformWindow *window, SDL_KeyboardEvent const &press) {
    modifiers = SdlKeys::ModifiersOf(press.keysym.mod);
    int code = SdlKeys::CodeOf(press.keysym);
    if (code == KeyCodes::kNone || window == nullptr)
        return;
    pressed[press.keysym.scancode] = code;
    event.kind = InputEvent::kKeyDown;
    event.window = window;
    event.modifiers = modifiers;
    event.key = code;
    event.repeat = press.repeat != 0;
    if (textWindow == nullptr)
        event.text = SdlKeys::TextOf(code, press.keysym.mod);
    queue.Push(event);
}

void SdlKeyboard::Release(InputEvent event, PlatformWindow *window, SDL_KeyboardEvent const &release) {
    modifiers = SdlKeys::ModifiersOf(release.keysym.mod);
    auto found = pressed.find(release.keysym.scancode);
    if (found == pressed.end())
        return;
    event.kind = InputEvent::kKeyUp;
    event.window = window;
    event.modifiers = modifiers;
    event.key = found->second;
    pressed.erase(found);
    queue.Push(event);
}

PlatformWindow *SdlKeyboard::WindowForText(PlatformWindow *window) const {
    return window != nullptr ? window : textWindow;
}

void SdlKeyboard::CommitText(InputEvent event, PlatformWindow *window, std::string const &utf8) {
    event.window = WindowForText(window);
    if (event.window == nullptr || utf8.empty())
        return;
    event.text = Utf::FromUtf8(utf8);
    InputEvent *last = queue.Last();
    if (last != nullptr && last->kind == InputEvent::kKeyDown && last->window == event.window &&
        SdlKeys::IsCharacter(last->key) && last->text.empty()) {
        // A shortcut types nothing, whatever the layout makes of it.
        if ((last->modifiers & (Modifiers::kCommand | Modifiers::kControl)) == 0)
            last->text = event.text;
        return;
    }
    event.kind = InputEvent::kTextInput;
    queue.Push(event);
}

void SdlKeyboard::EditText(InputEvent event, PlatformWindow *window, std::string const &utf8, int caret) {
    event.window = WindowForText(window);
    if (event.window == nullptr)
        return;
    event.kind = InputEvent::kTextEditing;
    event.text = Utf::FromUtf8(utf8);
    event.compositionCaret = std::max(caret, 0);
    queue.Push(event);
}

void SdlKeyboard::StartTextInput(PlatformWindow *window) {
    if (textWindow == nullptr)
        SDL_StartTextInput();
    textWindow = window;
}

void SdlKeyboard::StopTextInput(PlatformWindow const *window) {
    if (textWindow != window || window == nullptr)
        return;
    SDL_StopTextInput();
    textWindow = nullptr;
}

bool SdlKeyboard::MustAskInputMethod() const { return inputMethod && textWindow != nullptr; }

void SdlKeyboard::Forget(PlatformWindow const *window) { StopTextInput(window); }
