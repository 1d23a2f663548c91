// Which text gets the keys of a window.
#pragma once

class TextEditor;
namespace TarnOSWindow {
class OSWindow;
}

// Each window has one active text at most: the one that became active last. While there is one, input methods
// may work in the window.
namespace TextFocus {

void Take(TextEditor &, TarnOSWindow::OSWindow &);
// Without effect for one that is not its window's.
void Leave(TextEditor &);
// Null when the window has none.
TextEditor *Of(TarnOSWindow::OSWindow &);
// The insertion point of the window's text has moved; to be called when input methods should follow.
void CaretMoved(TextEditor &);

} // namespace TextFocus
