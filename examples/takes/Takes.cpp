#include "Takes.h"
#include "buttons/GlogButtonPane.h"
#include "dialogs/FindItem.h"
#include "lists/GListPane.h"
#include "lists/ListTextDrawer.h"
#include "menus/PopMPane.h"
#include "text/GTextPane.h"

Takes::Takes(glogRec *glog)
    : name(FindItem<GTextPane>(glog, kName))
    , rating(FindItem<PopMPane>(glog, kRating)) {
    GlogButtonPaneListener::DependUpon(FindItem<GlogButtonPane>(glog, kAdd));
    TextPaneListener::DependUpon(name);
    PopUpMenuListener::DependUpon(rating);
    list = FindItem<GListPane>(glog, kList);
    list->SetSelectionListener(this);
    auto const cells = [this](int line, int column, ListCell &cell) { FillIn(line, column, cell); };
    list->SetLineDrawer(new ListTextDrawer(list.Get(), cells), true);
}

Takes::~Takes() {
    if (list)
        list->SetSelectionListener(nullptr);
}

// The button adds a take and selects it, for field and menu to say what it is.
void Takes::GlogButtonPressed(GlogButtonPane *) {
    int const line = static_cast<int>(takes.size());
    takes.push_back({UString(), 1});
    list->AddItem(line);
    list->SetSelRange(line, line);
    list->PageTillVisible(line);
    SelectionDone(list.Get());
}

// The list asks for a cell whenever it draws one.
void Takes::FillIn(int line, int column, ListCell &cell) const {
    Take const &take = takes[static_cast<std::size_t>(line)];
    if (column == 0)
        cell.text = take.name;
    else
        rating->GetItemName(take.rating, cell.text);
}

// The field renames the selected take, letter by letter.
void Takes::ValueChanged(GTextPane *) {
    if (Take *const take = Selected()) {
        take->name = name->GetText();
        list->InvalRow(list->GetFirstSelectedItem());
    }
}

// The menu rates it.
void Takes::ListenToMenuChange(PopUpMenu *, short item) {
    if (Take *const take = Selected()) {
        take->rating = item;
        list->InvalRow(list->GetFirstSelectedItem());
    }
}

// A click in the list shows the take in field and menu.
void Takes::SelectionDone(GListPane *) {
    if (Take *const take = Selected()) {
        name->SetText(take->name);
        rating->SelectItem(take->rating);
    }
}

Takes::Take *Takes::Selected() {
    int const line = list->GetFirstSelectedItem();
    return line >= 0 && line < list->GetNumItems() ? &takes[static_cast<std::size_t>(line)] : nullptr;
}
