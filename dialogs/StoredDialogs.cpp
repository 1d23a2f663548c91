// The windows that resources hold are dialogs.
#include "desktop/panes/StoredWindows.h"
#include "dialogs/LoadGlog.h"

namespace {

// As long as this library is there.
struct Maker {
    Maker() { StoredWindows::SetMaker(LoadGlog); }
    ~Maker() { StoredWindows::SetMaker(nullptr); }
} const maker;

} // namespace
