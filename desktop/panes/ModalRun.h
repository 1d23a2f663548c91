// A glog that has to be answered before anything else.
#pragma once
#include "host/ModalGlog.h"

class Glog;
struct InputEvent;

// Stands on the stack while the glog runs. Runs may lie within each other: the innermost takes all input, and
// that of other glogs is thrown away. Return and enter press the item that confirms, if there is one to be
// pressed, unless the pane with the keyboard takes them; escape and closing the window press the item that
// cancels, or, where there is none, count as a hit of it.
class ModalRun {
public:
    ModalRun(Glog &, GlogFilterHook, void *self, int confirmItem, int cancelItem, RunIdleChores);
    ~ModalRun();
    ModalRun(ModalRun const &) = delete;
    ModalRun &operator=(ModalRun const &) = delete;
    static ModalRun *Innermost(); // null: none

    // Waits for a hit. Writes -1 as the item when the glog went away or the program is to end.
    void Run(short *item, int *value);

    // Does with the event what a modal glog does; false: it goes on to its glog as usual.
    bool Takes(InputEvent const &, Glog *target);
    // A hit in a glog; false when it is none of this one's.
    bool NoteHit(Glog &, int item, int value);

private:
    bool IsOver() const;
    void Hit(int item, int value);
    bool Filters(InputEvent const &);
    bool TakesKey(InputEvent const &);
    bool Press(int item, InputEvent const &);
    void Cancel(InputEvent const &);

    Glog &glog;
    GlogFilterHook const filter;
    void *const self; // the filter's
    int const confirmItem, cancelItem;
    RunIdleChores const chores;
    ModalRun *const outer;
    bool isHit = false;
    short hitItem;
    int hitValue = 0;
};
