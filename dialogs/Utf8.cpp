#include "dialogs/Utf8.h"
#include "desktop/resources/Utf.h"

UString Utf8::ToUString(std::string const &utf8) { return Utf::FromUtf8(utf8); }

std::string Utf8::FromUString(UString const &text) { return Utf::ToUtf8(text); }
