// What listeners of a program might do at the wrong moment.
#pragma once
#include "fuzz/storm/Chance.h"
#include "fuzz/storm/Stage.h"
#include <string>

class StormDesktop;

// Disturbs panes: adds, removes, moves, hides, disables, changes them, and what is around them.
class Meddler {
public:
    // Writes what it does to the standard error, if `telling`.
    Meddler(StormDesktop &, Stage &, bool telling);

    // One disturbance, from wherever.
    void Disturb(Chance &);
    // What cannot be done at any moment; between events.
    void DisturbDesktop(Chance &);

private:
    GlogPane *Any(Chance &) const; // null when there is none
    GlogPane *AnyLoose(Chance &) const;
    GlogPane *Told(GlogPane *) const;
    void Remove(Chance &);
    void Move(Chance &);
    void Add(Chance &);
    void Shape(Chance &);
    void ShowOrHide(Chance &);
    void Enable(Chance &);
    void Value(Chance &);
    void Keyboard(Chance &);
    void Window(Chance &);
    void Nest(Chance &);

    StormDesktop &desktop;
    Stage &stage;
    bool const telling;
    int depth = 0; // of disturbances within each other
    int nested = 0;
};
