// Shaped texts for the calls that bring no layout of their own, and those that layouts have no use for just
// now.
#pragma once
#include "desktop/type/ShapedText.h"
#include <memory>
#include <string_view>

namespace ShapedTextCache {

// The text in that shape. Valid until the next call.
ShapedText const &Get(std::u16string_view, TextShape const &);
// The text in one line, shortened as the shape says only if it is wider than the shape's width.
ShapedText const &GetFitted(std::u16string_view, TextShape const &);
// Width of the whole text in one line, as Get would give it.
int Width(std::u16string_view, TextShape const &);

// Keeps for a while what a layout drops because it is to have another text or shape.
void SetAside(std::u16string_view, TextShape const &, std::unique_ptr<ShapedText>);
// The text in that shape, for the caller alone: one that was set aside, or else a new one.
std::unique_ptr<ShapedText> TakeAside(std::u16string_view, TextShape const &);

} // namespace ShapedTextCache
