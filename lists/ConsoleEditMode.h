// The modes of an editor that arranges panes.
#pragma once

// 0 is the default; what the other values mean is the editor's affair.
enum ConsoleEditMode : int { kConsoleEditNone = 0 };
