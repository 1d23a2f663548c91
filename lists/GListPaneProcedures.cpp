// The procedure variables of lists.
#include "lists/GListPane.h"

int (*LSTGetNumItems)(GListPane *) = [](GListPane *list) { return list->GetNumItems(); };
int (*LSTGetNumSel)(GListPane *) = [](GListPane *list) { return list->NumSelected(); };
int (*LSTGetNumDisp)(GListPane *) = [](GListPane *list) { return list->GetNumDisplayed(); };
int (*LSTGetScrollPos)(GListPane *) = [](GListPane *list) { return list->GetScrollPos(); };
bool (*LSTGetBox)(GListPane *, GLGetBoxRec *) = [](GListPane *list, GLGetBoxRec *record) {
    return list->GLGetBox(record);
};
void (*LSTGetFirstAndLast)(GListPane *, GLFirstLastRec *) = [](GListPane *list, GLFirstLastRec *record) {
    list->GetFirstAndLast(&record->first, &record->last);
};
int (*LSTCheckHitV)(GListPane *, int v) = [](GListPane *list, int v) { return list->CheckHitV(v); };
bool (*LSTCheckSel)(GListPane *, int line) = [](GListPane *list, int line) { return list->CheckSel(line); };
void (*LSTSelAll)(GListPane *) = [](GListPane *list) { list->SelectAll(); };
void (*LSTDeselAll)(GListPane *) = [](GListPane *list) { list->DeselectAll(); };
void (*LSTSelItem)(GListPane *, int line) = [](GListPane *list, int line) { list->SelectItem(line); };
void (*LSTDeselItem)(GListPane *, int line) = [](GListPane *list, int line) { list->DeselectItem(line); };
void (*LSTSetSelMode)(GListPane *, int mode) = [](GListPane *list, int mode) {
    list->SetSelMode(static_cast<GListSelectionMode>(mode));
};
void (*LSTSetNumItems)(GListPane *, int count) = [](GListPane *list, int count) { list->SetNumItems(count); };
void (*LSTAddItem)(GListPane *, int at) = [](GListPane *list, int at) { list->AddItem(at); };
void (*LSTDelItem)(GListPane *, int at) = [](GListPane *list, int at) { list->DelItem(at); };
void (*LSTDrawLine)(GListPane *, int line) = [](GListPane *list, int line) {
    list->DrawListLine(line, GListPane::kWholeRow, nullptr);
};
void (*LSTScrollTo)(GListPane *, int position) = [](GListPane *list, int position) {
    list->SetScrollPosition(position);
};
void (*LSTPageTillVisible)(GListPane *, int line) = [](GListPane *list, int line) {
    list->PageTillVisible(line);
};
void (*LSTProtect)(GListPane *, int line) = [](GListPane *list, int line) { list->Protect(line); };
