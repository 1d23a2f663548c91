#include "dialogs/IconFamilyKey.h"
#include "dialogs/KeyFault.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"

void RequireIconFamily(UString const &name, char const *key) {
    UString const none = ResourceKey("0");
    if (!name.empty() && !(name == none) && ISetIDMapper::Instance().GetID(name) == 0)
        throw KeyFault(key, "there is no icon family \"" + Utf8::FromUString(name) + "\"");
}
