#include "fuzz/storm/Meddler.h"
#include "buttons/BoxSelectPane.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/FrameButtonPane.h"
#include "buttons/GIconButtonPane.h"
#include "buttons/GIconPane.h"
#include "buttons/RadioButtonPane.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "fuzz/storm/OpenWindow.h"
#include "fuzz/storm/RandomText.h"
#include "fuzz/storm/StormWindows.h"
#include "graphics/ProgressBarPane.h"
#include "host/CompoundPane.h"
#include "host/ModalGlog.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "menus/PopMPane.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/ScrollPane.h"
#include "tabs/TabPane.h"
#include "text/GTextPane.h"
#include "text/LabelPane.h"
#include "text/TextPane.h"
#include <algorithm>
#include <cstdio>

namespace {

int const kDeepest = 3;        // disturbances within each other
int const kChangedEvery = 100; // removals where nothing can be removed; making a page anew takes long
int const kMostNested = 2;     // loops within each other that a disturbance runs
int const kMostRows = 60;      // of lists
int const kMostItems = 12;     // of menus and tabs
int const kLongestText = 600;  // units; longer ones are taken out again
int const kFarthest = 40;      // pixels that a pane is moved at a time
short const kLargestSide = 500;

char const kQuestion[] =
    "<Glog title=\"question\" width=\"160\" height=\"60\"><Items>"
    "<Item type=\"CheckBox\" id=\"3\"><RadioCheckButtonItems><Button><Origin v=\"5\" "
    "h=\"5\"/><RadioCheckButtonStrings/></Button>"
    "</RadioCheckButtonItems></Item>"
    "<Item type=\"OvalButton\" id=\"1\"><BoundsRect top=\"30\" left=\"80\" bottom=\"49\" "
    "right=\"150\"/></Item>"
    "<Item type=\"OvalButton\" id=\"2\"><BoundsRect top=\"30\" left=\"5\" bottom=\"49\" right=\"75\"/></Item>"
    "</Items></Glog>";

UString RandomUString(Chance &chance) { return Utf8::ToUString(RandomText::Of(chance)); }

void SetRandomValue(GListPane &list, Chance &chance) {
    int const count = list.GetNumItems();
    switch (chance.Below(7)) {
    case 0:
        list.SetNumItems(std::max(std::min(chance.Below(kMostRows), count), 0));
        break;
    case 1:
        if (count > 0)
            list.DelItem(chance.Below(count));
        break;
    case 2:
        list.SetScrollPosition(chance.Between(-3, count + 3));
        break;
    case 3:
        if (count > 0)
            list.SelectItem(chance.Below(count));
        break;
    case 4:
        list.DeselectAll();
        break;
    case 5:
        list.SelectAll();
        break;
    default:
        if (count > 0)
            list.PageTillVisible(chance.Below(count));
    }
}

void SetRandomValue(PopMPane &menu, Chance &chance) {
    PaneWatch const watch(&menu);
    short const count = menu.CountItems(), some = static_cast<short>(chance.Below(count + 2));
    switch (chance.Below(7)) {
    case 0:
        if (count < kMostItems)
            menu.AddItem(RandomUString(chance), PopUpMenu::kDashIsSeparator);
        break;
    case 1:
        if (count > 0)
            menu.DeleteItem(static_cast<short>(1 + chance.Below(count)));
        break;
    case 2:
        menu.DeleteAllItems();
        break;
    case 3:
        menu.SetEnableItem(some, char(chance.Below(2)));
        break;
    case 4:
        if (count < kMostItems)
            menu.InsertItem(static_cast<short>(1 + chance.Below(count + 1)), RandomUString(chance),
                            PopUpMenu::kDashIsText);
        break;
    case 5:
        menu.EnableMenu(!chance.OneIn(4));
        break;
    default:
        menu.SelectItem(some);
    }
    if (watch.PaneExists())
        menu.Inval(); // which all but a selection or a menu's enabling leaves to its caller
}

void SetRandomValue(TabPane &tabs, Chance &chance) {
    int const count = tabs.CountItems();
    switch (chance.Below(5)) {
    case 0:
        if (count < kMostItems)
            tabs.InsertItem(chance.Below(count + 1), TabPane::Item(RandomUString(chance)));
        break;
    case 1:
        if (count > 0)
            tabs.DeleteItem(chance.Below(count));
        break;
    case 2:
        if (count > 0)
            tabs.SetEnableItem(chance.Below(count), !chance.OneIn(3));
        break;
    case 3:
        if (chance.OneIn(4))
            tabs.DeleteAllItems();
        break;
    default:
        if (count > 0)
            tabs.SetSelectedItem(chance.Below(count));
    }
}

void SetRandomValue(GTextPane &field, Chance &chance) {
    int const length = static_cast<int>(field.GetText().length());
    switch (chance.Below(5)) {
    case 0:
    case 1:
        field.SetText(RandomUString(chance));
        break;
    case 2:
        field.SetSelection(static_cast<unsigned>(chance.Below(length + 1)),
                           static_cast<unsigned>(chance.Below(length + 5)));
        break;
    case 3:
        field.SetMode(static_cast<unsigned char>(chance.Below(4)));
        break;
    default:
        if (length > kLongestText)
            field.SetText(UString());
    }
}

void SetRandomValue(ButtonGroupPane &group, Chance &chance) {
    short const index = static_cast<short>(chance.Below(std::max(group.CountButtons(), 1)));
    if (group.CountButtons() == 0)
        return;
    PaneWatch const watch(&group);
    if (CheckBoxPane *const boxes = dynamic_cast<CheckBoxPane *>(&group))
        chance.OneIn(5) ? boxes->SetAllToSame(chance.OneIn(2)) : boxes->SetOne(index, chance.OneIn(2));
    else if (RadioButtonPane *const radios = dynamic_cast<RadioButtonPane *>(&group))
        radios->RadioSet(index);
    if (watch.PaneExists() && chance.OneIn(5) && group.CountButtonTexts() > 0) {
        group.SetNthButtonName(chance.Below(group.CountButtonTexts()), RandomUString(chance));
        group.Inval(); // which it leaves to its caller
    }
}

// True for a pane that has a value.
bool SetRandomValueOf(GlogPane &pane, Chance &chance) {
    if (GListPane *const list = dynamic_cast<GListPane *>(&pane))
        SetRandomValue(*list, chance);
    else if (PopMPane *const menu = dynamic_cast<PopMPane *>(&pane))
        SetRandomValue(*menu, chance);
    else if (TabPane *const tabs = dynamic_cast<TabPane *>(&pane))
        SetRandomValue(*tabs, chance);
    else if (GTextPane *const field = dynamic_cast<GTextPane *>(&pane))
        SetRandomValue(*field, chance);
    else if (ButtonGroupPane *const group = dynamic_cast<ButtonGroupPane *>(&pane))
        SetRandomValue(*group, chance);
    else if (LabelPane *const label = dynamic_cast<LabelPane *>(&pane))
        label->SetTextWithInval(RandomUString(chance));
    else if (ProgressBarPane *const bar = dynamic_cast<ProgressBarPane *>(&pane))
        bar->SetProgress(chance.Below(120), chance.Below(3) * 50);
    else if (ScrollPane *const scrolled = dynamic_cast<ScrollPane *>(&pane))
        chance.OneIn(2) ? scrolled->SetVScrollPos(chance.Below(60))
                        : scrolled->SetHScrollPos(chance.Below(60));
    else if (BoxSelectPane *const boxes = dynamic_cast<BoxSelectPane *>(&pane))
        boxes->RadSet(static_cast<short>(chance.Below(std::max<int>(boxes->GetNumBoxes(), 1))));
    else if (FrameButtonPane *const framed = dynamic_cast<FrameButtonPane *>(&pane))
        framed->ToggleState();
    else
        return false;
    return true;
}

void EnableOrNot(GlogPane &pane, bool on, Chance &chance) {
    PaneWatch const watch(&pane);
    if (GlogButtonPane *const button = dynamic_cast<GlogButtonPane *>(&pane))
        on ? button->Enable() : button->Disable();
    else if (ButtonGroupPane *const group = dynamic_cast<ButtonGroupPane *>(&pane))
        chance.OneIn(2) || group->CountButtons() == 0
            ? group->SetAllEnable(on)
            : group->SetOneEnable(static_cast<short>(chance.Below(group->CountButtons())), on);
    else if (GIconPane *const icon = dynamic_cast<GIconPane *>(&pane))
        icon->SetEnabled(on);
    else if (PopMPane *const menu = dynamic_cast<PopMPane *>(&pane))
        menu->EnableMenu(on);
    else if (TextPane *const text = dynamic_cast<TextPane *>(&pane))
        text->SetEnable(on);
    else
        return;
    if (watch.PaneExists())
        pane.Inval(); // some only store it
}

std::vector<CompoundPane *> Containers(std::vector<GlogPane *> const &panes) {
    std::vector<CompoundPane *> containers;
    for (GlogPane *pane : panes) {
        if (CompoundPane *const container = dynamic_cast<CompoundPane *>(pane))
            containers.push_back(container);
    }
    return containers;
}

// Itself counts.
bool LiesIn(GlogPane *pane, GlogPane *container) {
    for (GlogPane *at = pane; at; at = PaneAccess::Container(*at)) {
        if (at == container)
            return true;
    }
    return false;
}

} // namespace

Meddler::Meddler(StormDesktop &desktop_, Stage &stage_, bool telling_)
    : desktop(desktop_)
    , stage(stage_)
    , telling(telling_) {}

void Meddler::Disturb(Chance &chance) {
    if (depth == kDeepest || !stage.Window())
        return;
    ++depth;
    struct Way {
        char const *name;
        void (Meddler::*disturb)(Chance &);
    };
    static Way const kWays[] = {{"remove", &Meddler::Remove},
                                {"move", &Meddler::Move},
                                {"add", &Meddler::Add},
                                {"shape", &Meddler::Shape},
                                {"shape", &Meddler::Shape},
                                {"show or hide", &Meddler::ShowOrHide},
                                {"enable", &Meddler::Enable},
                                {"enable", &Meddler::Enable},
                                {"show or hide", &Meddler::ShowOrHide},
                                {"value", &Meddler::Value},
                                {"value", &Meddler::Value},
                                {"value", &Meddler::Value},
                                {"value", &Meddler::Value},
                                {"keyboard", &Meddler::Keyboard},
                                {"window", &Meddler::Window},
                                {"nest", &Meddler::Nest}};
    Way const &way = chance.Of(kWays);
    if (telling)
        std::fprintf(stderr, "        %s\n", way.name);
    (this->*way.disturb)(chance);
    --depth;
}

GlogPane *Meddler::Any(Chance &chance) const {
    std::vector<GlogPane *> panes = stage.Panes();
    GlogPane *pane = nullptr;
    while (!panes.empty()) {
        pane = chance.OfMany(panes);
        panes.clear();
        CompoundPane *const container = dynamic_cast<CompoundPane *>(pane);
        for (short i = 0; container && !chance.OneIn(3) && i < container->NumSubpanes(); ++i)
            panes.push_back(container->Get(i));
    }
    return Told(pane);
}

GlogPane *Meddler::AnyLoose(Chance &chance) const {
    std::vector<GlogPane *> const loose = stage.Loose();
    return loose.empty() ? nullptr : Told(chance.OfMany(loose));
}

GlogPane *Meddler::Told(GlogPane *pane) const {
    if (telling && pane)
        std::fprintf(stderr, "        %s %d\n", MessageTrace::ClassName(*pane).c_str(), pane->GetID());
    return pane;
}

void Meddler::Remove(Chance &chance) {
    GlogPane *const pane = AnyLoose(chance);
    if (!pane) {
        if (chance.OneIn(kChangedEvery))
            stage.Change(chance);
        return;
    }
    CompoundPane *const container = PaneAccess::Container(*pane);
    PaneWatch const watch(container);
    if (container && chance.OneIn(2)) {
        container->Del(container->Find(pane));
        if (watch.PaneExists())
            container->Inval(); // a grid has moved the rest without drawing it
    } else {
        pane->Inval();
        delete pane;
    }
}

void Meddler::Move(Chance &chance) {
    GlogPane *const pane = AnyLoose(chance);
    if (!pane)
        return;
    std::vector<CompoundPane *> const containers = Containers(stage.Loose());
    if (containers.empty())
        return;
    CompoundPane *const into = chance.OfMany(containers);
    if (LiesIn(into, pane))
        return;
    PaneWatch const watch(into);
    pane->Inval();
    into->Add(pane, static_cast<short>(chance.Between(-1, into->NumSubpanes())));
    if (watch.PaneExists())
        into->Inval(); // a pane of a negative height lets a grid move the rest backward
}

void Meddler::Add(Chance &chance) {
    std::vector<CompoundPane *> const containers = Containers(stage.Loose());
    CompoundPane *into = containers.empty() || chance.OneIn(3) ? nullptr : chance.OfMany(containers);
    GlogPane *const pane = stage.AddPane(chance);
    // Making a pane runs others.
    std::vector<GlogPane *> const now = stage.Loose();
    if (pane && into && std::find(now.begin(), now.end(), into) != now.end())
        into->Add(pane, -1);
    else if (pane)
        pane->Inval();
}

void Meddler::Shape(Chance &chance) {
    GlogPane *const pane = AnyLoose(chance);
    if (!pane || !pane->CanSetBox())
        return;
    PaneWatch const watch(pane);
    Rect box;
    pane->GetBox(&box);
    pane->Inval();
    switch (chance.Below(4)) {
    case 0:
        pane->Offset({static_cast<short>(chance.Between(-kFarthest, kFarthest)),
                      static_cast<short>(chance.Between(-kFarthest, kFarthest))});
        break;
    case 1:
        pane->CalcBox();
        break;
    default:
        box.right = static_cast<short>(box.left + chance.Between(-2, 120));
        box.bottom = static_cast<short>(box.top + chance.Between(-2, 90));
        pane->SetBox(&box);
    }
    if (watch.PaneExists())
        pane->Inval();
}

void Meddler::ShowOrHide(Chance &chance) {
    GlogPane *const pane = Any(chance);
    if (!pane)
        return;
    // Mostly shown, so that there is something to do.
    chance.OneIn(4) ? pane->Hide() : pane->Show();
}

void Meddler::Enable(Chance &chance) {
    if (GlogPane *const pane = Any(chance))
        EnableOrNot(*pane, !chance.OneIn(4), chance);
}

void Meddler::Value(Chance &chance) {
    GlogPane *const pane = Any(chance);
    if (!pane)
        return;
    if (!SetRandomValueOf(*pane, chance))
        pane->Inval();
}

void Meddler::Keyboard(Chance &chance) {
    GlogPane *const pane = Any(chance);
    switch (pane && pane->Selectable() ? chance.Below(4) : 3) {
    case 0:
        stage.Window()->SetCurItem(pane);
        break;
    case 1:
        pane->Select(true);
        break;
    case 2:
        pane->Select(false);
        break;
    default:
        stage.Window()->SetCurItem(nullptr);
    }
}

void Meddler::Window(Chance &chance) {
    glogRec *const window = stage.Window();
    switch (chance.Below(60)) {
    case 0:
        DisposeGlog(window);
        break;
    case 1:
        stage.Change(chance);
        break;
    case 2:
        ShowGlog(window, kHideGlog);
        if (stage.Window() == window)
            ShowGlog(window, kShowGlog);
        break;
    case 3: {
        Rect place = {100, 80, static_cast<short>(100 + chance.Between(20, kLargestSide)),
                      static_cast<short>(80 + chance.Between(20, kLargestSide))};
        PositionGlog(window, &place, chance.OneIn(2));
        break;
    }
    case 4:
        desktop.SetTheme(chance.OneIn(2) ? "dark" : "light");
        break;
    case 5:
        desktop.SetScale(chance.OneIn(4) ? 1.5 : 1);
        break;
    case 6:
        desktop.DumpTree(window);
        break;
    default:
        UpdateGlog(window);
    }
}

void Meddler::Nest(Chance &chance) {
    if (nested == kMostNested)
        return;
    ++nested;
    switch (chance.Below(6)) {
    case 0: {
        OpenWindow question;
        question.Watch(LoadGlogFromText(kQuestion, "question"));
        ShowGlog(question.Get(), kShowGlog);
        short item = 0;
        int value = 0;
        DoModalGlog(question.Get(), &item, &value, nullptr, nullptr, false, 2, 0, 0, false,
                    chance.OneIn(2) ? kRunIdleChores : kDontRunIdleChores);
        DisposeGlog(question.Get());
        break;
    }
    case 1:
        desktop.ProcessEvents(0.05);
        break;
    default:
        Yield(chance.Below(3) * 0.02);
    }
    --nested;
}

void Meddler::DisturbDesktop(Chance &chance) {
    switch (chance.Below(16)) {
    case 0:
        desktop.SetTheme(chance.OneIn(2) ? "dark" : "light");
        break;
    case 1:
        desktop.SetScale(chance.OneIn(3) ? 2 : chance.OneIn(3) ? 1.25 : 1);
        break;
    case 2:
    case 3:
        if (stage.Window())
            stage.Change(chance);
        break;
    default:
        desktop.SetScale(1);
    }
}
