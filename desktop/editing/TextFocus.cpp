#include "desktop/editing/TextFocus.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/PlatformWindow.h"
#include <algorithm>
#include <utility>
#include <vector>

namespace {

typedef std::pair<TarnOSWindow::OSWindow *, TextEditor *> Active;

std::vector<Active> &All() {
    static std::vector<Active> all;
    return all;
}

PlatformWindow *PlatformOf(TarnOSWindow::OSWindow *window) {
    Glog *const glog = dynamic_cast<Glog *>(window);
    return glog ? glog->Window() : nullptr;
}

} // namespace

void TextFocus::Take(TextEditor &editor, TarnOSWindow::OSWindow &window) {
    auto const found =
        std::find_if(All().begin(), All().end(), [&](Active const &a) { return a.first == &window; });
    if (found != All().end())
        found->second = &editor;
    else
        All().emplace_back(&window, &editor);
    CaretMoved(editor);
}

void TextFocus::Leave(TextEditor &editor) {
    auto const found =
        std::find_if(All().begin(), All().end(), [&](Active const &a) { return a.second == &editor; });
    if (found == All().end())
        return;
    PlatformWindow *const platform = PlatformOf(found->first);
    All().erase(found);
    if (platform)
        platform->StopTextInput();
}

TextEditor *TextFocus::Of(TarnOSWindow::OSWindow &window) {
    for (Active const &active : All())
        if (active.first == &window)
            return active.second;
    return nullptr;
}

void TextFocus::CaretMoved(TextEditor &editor) {
    TarnOSWindow::OSWindow *const window = editor.WindowNow();
    if (!window || Of(*window) != &editor)
        return;
    if (PlatformWindow *const platform = PlatformOf(window))
        platform->StartTextInput(editor.CaretBox());
}
