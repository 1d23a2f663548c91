// What panes tell an engine of editable text, and how.
#pragma once

namespace TextFieldFlags {

// What an engine is created with; see OSTextEdit::Create.
enum Bit : unsigned int { kStyled = 1, kSeveralLines = 2, kReadOnly = 4, kNoAutoScroll = 8 };

// All of them for such a text.
inline unsigned int Of(bool styled, bool severalLines, bool readOnly, bool autoScroll) {
    return (styled ? kStyled : 0u) | (severalLines ? kSeveralLines : 0u) | (readOnly ? kReadOnly : 0u) |
           (autoScroll ? 0u : kNoAutoScroll);
}

} // namespace TextFieldFlags

namespace TextStyleMask {
// Which parts of a style count.
enum Mask : unsigned int { kFont = 7, kAll = 15 };
} // namespace TextStyleMask
