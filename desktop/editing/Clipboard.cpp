#include "desktop/editing/Clipboard.h"
#include "desktop/resources/Utf.h"
#include "desktop/windows/EventLoop.h"

UString Clipboard::Text() {
    EventLoop *const loop = EventLoop::Open();
    return loop ? Utf::FromUtf8(loop->Windows().GetClipboardText()) : UString();
}

void Clipboard::SetText(UString const &text) {
    constexpr char kReplacement[] = "\xEF\xBF\xBD";
    EventLoop *const loop = EventLoop::Open();
    if (!loop)
        return;
    std::string utf8 = Utf::ToUtf8(text);
    for (std::size_t zero = utf8.find('\0'); zero != std::string::npos; zero = utf8.find('\0', zero))
        utf8.replace(zero, 1, kReplacement);
    loop->Windows().SetClipboardText(utf8);
}
