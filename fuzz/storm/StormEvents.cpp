#include "fuzz/storm/StormEvents.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "fuzz/storm/RandomText.h"
#include "fuzz/storm/Stage.h"
#include "host/CompoundPane.h"
#include "host/EventRecordAdapter.h"
#include "host/VelaDrawing.h"
#include <algorithm>

namespace {

int const kEscapes = 6;          // that may close a menu with submenus
int const kWidest = 480;         // pixels of a window
int const kNear = 30;            // pixels that the mouse moves at a time
double const kLongestWait = 1.2; // seconds
double const kLongestHold = 0.4; // of the mouse in one place

int const kNamedKeys[] = {KeyCodes::kReturn, KeyCodes::kEnter,  KeyCodes::kEscape,    KeyCodes::kTab,
                          KeyCodes::kSpace,  KeyCodes::kLeft,   KeyCodes::kBackspace, KeyCodes::kDelete,
                          KeyCodes::kRight,  KeyCodes::kUp,     KeyCodes::kDown,      KeyCodes::kHome,
                          KeyCodes::kEnd,    KeyCodes::kPageUp, KeyCodes::kPageDown,  KeyCodes::kTab,
                          KeyCodes::kF1,     KeyCodes::kHelp};
char const kLetters[] = "acvxzzabehiklmnoprstuy0123456789 .-";
int const kMenuKeys[] = {KeyCodes::kDown,   KeyCodes::kUp,     KeyCodes::kRight, KeyCodes::kLeft,
                         KeyCodes::kReturn, KeyCodes::kEscape, KeyCodes::kSpace, KeyCodes::kEnd};

unsigned short RandomModifiers(Chance &chance) {
    static unsigned short const kBits[] = {Modifiers::kShift, Modifiers::kCommand, Modifiers::kOption,
                                           Modifiers::kControl};
    unsigned short modifiers = 0;
    while (chance.OneIn(4))
        modifiers = static_cast<unsigned short>(modifiers | chance.Of(kBits));
    return modifiers;
}

StormEvent Of(ScriptStep const &step) {
    StormEvent event;
    event.steps.push_back(step);
    return event;
}

ScriptStep Plain(ScriptStep::Kind kind) {
    ScriptStep step;
    step.kind = kind;
    return step;
}

ScriptStep Wait(Chance &chance, double longest) {
    ScriptStep step = Plain(ScriptStep::kWait);
    step.seconds = longest * chance.Below(50) / 50;
    return step;
}

StormEvent KeyOf(int key) {
    ScriptStep step = Plain(ScriptStep::kKey);
    step.key = key;
    return Of(step);
}

// False when no menu is open; one that has no such item stays open.
bool AnswerMenu(std::vector<int> const &path) {
    MenuTracker *const menu = MenuTracker::Open();
    if (!menu || menu->Panels().empty())
        return false;
    std::string reason;
    menu->Answer(path, reason);
    return true;
}

std::vector<GlogPane *> ShownOf(std::vector<GlogPane *> panes) {
    panes.erase(
        std::remove_if(panes.begin(), panes.end(), [](GlogPane *pane) { return !pane->GetVisibility(); }),
        panes.end());
    return panes;
}

std::vector<GlogPane *> ShownIn(GlogPane &pane) {
    std::vector<GlogPane *> panes;
    CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane);
    for (short i = 0; container && i < container->NumSubpanes(); ++i)
        panes.push_back(container->Get(i));
    return ShownOf(panes);
}

} // namespace

StormEvents::StormEvents(StormDesktop &desktop_, Stage &stage_)
    : desktop(desktop_)
    , stage(stage_) {}

bool StormEvents::IsOnStage(Glog const &glog) const { return stage.Window() == &glog; }

StormEvent StormEvents::Next(Chance &chance, WindowSystem::Waiter waiter) {
    switch (waiter) {
    case WindowSystem::Waiter::kTracking:
    case WindowSystem::Waiter::kAsking:
        return ForTracking(chance);
    case WindowSystem::Waiter::kPause:
        return chance.OneIn(3) ? ForMainLoop(chance) : Of(Wait(chance, kLongestWait));
    case WindowSystem::Waiter::kModal:
        return MenuTracker::Open() ? ForMenu(chance) : ForMainLoop(chance);
    default:
        return ForMainLoop(chance);
    }
}

// Somewhere in a shown pane of the window in front.
void StormEvents::Aim(Chance &chance, ScriptStep &step) {
    Glog *const front = DesktopRep::Of(desktop).Front();
    if (!front)
        return;
    step.h = chance.Between(-2, front->Width() + 2);
    step.v = chance.Between(-2, front->Height() + 2);
    std::vector<GlogPane *> panes = ShownOf(IsOnStage(*front) ? stage.Panes() : front->Items());
    if (chance.OneIn(20))
        return;
    GlogPane *pane = nullptr;
    while (!panes.empty()) {
        pane = chance.OfMany(panes);
        panes = chance.OneIn(6) ? std::vector<GlogPane *>() : ShownIn(*pane);
    }
    if (!pane)
        return;
    Rect const part = PaneAccess::VisiblePart(*pane);
    if (part.right > part.left && part.bottom > part.top) {
        step.h = chance.Between(part.left, part.right - 1);
        step.v = chance.Between(part.top, part.bottom - 1);
    }
}

ScriptStep StormEvents::At(ScriptStep::Kind kind, Chance &chance) {
    ScriptStep step = Plain(kind);
    Aim(chance, step);
    step.modifiers = RandomModifiers(chance);
    lastH = step.h;
    lastV = step.v;
    return step;
}

ScriptStep StormEvents::Near(ScriptStep::Kind kind, Chance &chance) {
    ScriptStep step = Plain(kind);
    step.h = lastH += chance.Between(-kNear, kNear);
    step.v = lastV += chance.Between(-kNear, kNear);
    return step;
}

ScriptStep StormEvents::Key(Chance &chance) {
    ScriptStep step = Plain(ScriptStep::kKey);
    step.key = chance.OneIn(2) ? chance.Of(kNamedKeys)
                               : kLetters[chance.Below(static_cast<int>(sizeof kLetters) - 1)];
    step.modifiers = RandomModifiers(chance);
    return step;
}

ScriptStep StormEvents::Resize(Chance &chance) {
    ScriptStep step = Plain(ScriptStep::kResize);
    bool const usual = !chance.OneIn(4);
    step.h = chance.Between(usual ? kWidest / 2 : 1, kWidest);
    step.v = chance.Between(usual ? kWidest / 2 : 1, kWidest);
    return step;
}

// What only real window systems report.
StormEvent StormEvents::Other(Chance &chance) {
    static InputEvent::Kind const kKinds[] = {
        InputEvent::kMouseLeave, InputEvent::kExposed,    InputEvent::kMoved,     InputEvent::kMouseDown,
        InputEvent::kMouseUp,    InputEvent::kMouseLeave, InputEvent::kTextInput, InputEvent::kKeyUp};
    StormEvent event;
    Glog *const front = DesktopRep::Of(desktop).Front();
    if (!front)
        return event;
    event.isOther = true;
    event.other.window = front->Window();
    event.other.kind = chance.OneIn(200) ? InputEvent::kCloseRequested : chance.Of(kKinds);
    int const kMiddleButton = 3;
    event.other.button = kMiddleButton;
    event.other.clicks = 1;
    event.other.h = lastH;
    event.other.v = lastV;
    event.other.key = KeyCodes::kSpace;
    return event;
}

StormEvent StormEvents::ForMainLoop(Chance &chance) {
    static StormEvent (StormEvents::*const kWays[])(Chance &) = {
        &StormEvents::Press,  &StormEvents::Press,  &StormEvents::Press,  &StormEvents::Press,
        &StormEvents::Press,  &StormEvents::Press,  &StormEvents::Click,  &StormEvents::Click,
        &StormEvents::Click,  &StormEvents::Click,  &StormEvents::Click,  &StormEvents::Click,
        &StormEvents::Click,  &StormEvents::Double, &StormEvents::Move,   &StormEvents::Move,
        &StormEvents::Wheel,  &StormEvents::Wheel,  &StormEvents::Type,   &StormEvents::Compose,
        &StormEvents::AnyKey, &StormEvents::AnyKey, &StormEvents::AnyKey, &StormEvents::AnyKey,
        &StormEvents::Rest,   &StormEvents::Rest,   &StormEvents::Rest,   &StormEvents::Rare};
    return (this->*chance.Of(kWays))(chance);
}

// A button that is held is let go before it is pressed again.
StormEvent StormEvents::Pressed(ScriptStep const &step) const {
    bool const isHeld = desktop.System().IsMouseDown() && step.kind != ScriptStep::kRightClick;
    return Of(isHeld ? Plain(ScriptStep::kRelease) : step);
}

StormEvent StormEvents::Press(Chance &chance) { return Pressed(At(ScriptStep::kPress, chance)); }

StormEvent StormEvents::Click(Chance &chance) { return Pressed(At(ScriptStep::kClick, chance)); }

StormEvent StormEvents::Double(Chance &chance) {
    return Pressed(At(chance.OneIn(3) ? ScriptStep::kRightClick : ScriptStep::kDoubleClick, chance));
}

StormEvent StormEvents::Move(Chance &chance) { return Of(At(ScriptStep::kMove, chance)); }

StormEvent StormEvents::Wheel(Chance &chance) {
    ScriptStep step = At(ScriptStep::kWheel, chance);
    (chance.OneIn(3) ? step.wheelH : step.wheelV) = chance.Between(-3, 3);
    return Of(step);
}

StormEvent StormEvents::Type(Chance &chance) {
    ScriptStep step = Plain(ScriptStep::kType);
    step.text = RandomText::Of(chance);
    return Of(step);
}

StormEvent StormEvents::Compose(Chance &chance) {
    ScriptStep step = Plain(ScriptStep::kCompose);
    step.text = chance.OneIn(3) ? std::string() : RandomText::Of(chance);
    step.caret = chance.Below(10);
    return Of(step);
}

StormEvent StormEvents::AnyKey(Chance &chance) { return Of(Key(chance)); }

StormEvent StormEvents::Rest(Chance &chance) { return Of(Wait(chance, kLongestWait)); }

StormEvent StormEvents::Rare(Chance &chance) {
    int const lot = chance.Below(20);
    if (lot < 2)
        return Of(Resize(chance));
    if (lot < 8) {
        ScriptStep step = Plain(ScriptStep::kActivate);
        step.on = !chance.OneIn(3);
        return Of(step);
    }
    return lot < 12 ? Of(Plain(ScriptStep::kRelease)) : Other(chance);
}

StormEvent StormEvents::ForTracking(Chance &chance) {
    int const lot = chance.Below(32);
    if (lot < 8)
        return Of(Plain(ScriptStep::kRelease));
    if (lot < 12)
        return Of(Wait(chance, kLongestHold));
    if (lot == 12)
        return ForMainLoop(chance);
    return Of(lot < 16 ? At(ScriptStep::kMove, chance) : Near(ScriptStep::kMove, chance));
}

StormEvent StormEvents::ForMenu(Chance &chance) {
    int const lot = chance.Below(16);
    if (lot < 6)
        return KeyOf(chance.Of(kMenuKeys));
    if (lot < 9)
        return Of(Near(ScriptStep::kMove, chance));
    if (lot < 12)
        return Pressed(Near(lot == 9 ? ScriptStep::kClick : ScriptStep::kPress, chance));
    if (lot == 12)
        return Of(Plain(ScriptStep::kRelease));
    if (lot == 13)
        return Of(Wait(chance, kLongestWait));
    if (lot == 14)
        return ForMainLoop(chance);
    std::vector<int> path(static_cast<std::size_t>(chance.Between(1, 2)));
    std::generate(path.begin(), path.end(), [&] { return chance.Below(6); });
    AnswerMenu(path);
    return Of(Wait(chance, 0));
}

StormEvent StormEvents::EndOfWait(int time) {
    if (time < kEscapes)
        return KeyOf(KeyCodes::kEscape);
    if (time == kEscapes)
        return KeyOf(KeyCodes::kReturn);
    StormEvent event;
    Glog *const front = DesktopRep::Of(desktop).Front();
    if (front && !IsOnStage(*front))
        DisposeGlog(front);
    else if (!AnswerMenu({0}) && front)
        DisposeGlog(front);
    event.isOther = true; // a look up
    return event;
}
