#include "lists/ListLineDrawer.h"

ListLineDrawer::~ListLineDrawer() {}

bool ListLineDrawer::GetHelpTagForLogicalColumn(int, int, LocalizedStrings::HelpTag const *, Rect &,
                                                OS::Help::Placement &, double &) {
    return false;
}
