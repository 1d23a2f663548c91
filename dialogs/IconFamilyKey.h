// Names of icon families in dialogs.
#pragma once
#include "host/UString.h"

// Throws KeyFault for the key when there is no icon family of the name. An empty name and "0" stand for none
// and pass.
void RequireIconFamily(UString const &name, char const *key);
