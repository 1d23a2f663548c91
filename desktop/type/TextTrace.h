// The lines that text calls leave in the drawing trace.
#pragma once
#include "desktop/observe/JsonLine.h"
#include "desktop/type/FontSpec.h"
#include "host/TextSettings.h"
#include "host/UString.h"

namespace TextTrace {

// Operation and text.
JsonLine Call(char const *operation, UString const &text);
// Adds family, face and size, and the current port's foreground colour.
void AddLook(JsonLine &, FontSpec const &);
// Adds alignment and truncation by name.
void AddAlignment(JsonLine &, TextSettings::Alignment);
void AddTruncation(JsonLine &, TextSettings::TruncateCode);

} // namespace TextTrace
