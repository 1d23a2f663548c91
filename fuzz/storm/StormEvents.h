// The events of a storm.
#pragma once
#include "fuzz/storm/Chance.h"
#include "fuzz/storm/StormWindows.h"
#include <string>

class Glog;
class GlogPane;
class Stage;

// Thinks up one event at a time, aimed at what is there.
class StormEvents {
public:
    StormEvents(StormDesktop &, Stage &);

    StormEvent Next(Chance &, WindowSystem::Waiter);
    // What ends a dialog or menu, stronger each time.
    StormEvent EndOfWait(int time);

private:
    StormEvent ForMainLoop(Chance &);
    StormEvent ForTracking(Chance &);
    StormEvent ForMenu(Chance &);
    StormEvent Pressed(ScriptStep const &) const;
    StormEvent Press(Chance &);
    StormEvent Click(Chance &);
    StormEvent Double(Chance &);
    StormEvent Move(Chance &);
    StormEvent Wheel(Chance &);
    StormEvent Type(Chance &);
    StormEvent Compose(Chance &);
    StormEvent AnyKey(Chance &);
    StormEvent Rest(Chance &);
    StormEvent Rare(Chance &);
    ScriptStep At(ScriptStep::Kind, Chance &);
    ScriptStep Near(ScriptStep::Kind, Chance &);
    ScriptStep Key(Chance &);
    ScriptStep Resize(Chance &);
    StormEvent Other(Chance &);
    void Aim(Chance &, ScriptStep &);
    bool IsOnStage(Glog const &) const;

    StormDesktop &desktop;
    Stage &stage;
    int lastH = 0, lastV = 0; // where the pointer was sent last
};
