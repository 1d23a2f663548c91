// A dialog that has to be answered before anything else.
//
// A program derives a class from this one, makes an object on the stack, opens the dialog with ModalGlogInit
// and runs it with ModalLoop. The class takes what the user has entered in Read.
#pragma once
#include "host/ModalGlog.h"
#include "host/PortSavers.h"
#include "host/glogRec.h"
#include <boost/scoped_ptr.hpp>

// The order of virtual operations and of fields is fixed. The dialog goes with the object.
class ModalGlogClass {
public:
    virtual ~ModalGlogClass();

    // Shows the dialog and runs it until an item ends it, which HandleItem decides; its number is the result,
    // and its value is written. -1, at once, when no dialog was opened; -1 too when the window has gone or
    // the program is to end. The flag, which counts as false for 0, goes to DoModalGlog and means nothing
    // there; the last two numbers are the items that return and escape press, 0 for items 1 and 2. The cursor
    // does not change meanwhile. The value must not be null.
    short ModalLoop(int *value, unsigned char arg, int a, int b);

    // What DoModalGlog calls: asks the filter of `self`, which is a ModalGlogClass.
    static char FilterHook(glogRec *, void *self, EventRecordAdapter *, short *item, int *value);

protected:
    // The numbers of the items that confirm and cancel.
    ModalGlogClass(short okItem = 1, short cancelItem = 2);

    // Opens the dialog of a window resource, invisible, and makes its port current for as long as the object
    // lives. Whether there is a dialog now: one that was opened before stays if this one cannot be opened,
    // and is disposed of otherwise.
    bool ModalGlogInit(short resourceID);

    short GetOKItemNum() { return okItem; }         // the item that confirms
    short GetCancelItemNum() { return cancelItem; } // the item that cancels
    glogRec *GlogP() { return glog; }               // null before ModalGlogInit; stays the object's
    void DisableIdleChores() { idleChores = kDontRunIdleChores; } // while the dialog runs

    // Whether the item that was hit ends the dialog. By default the confirming one does if Read says so, the
    // cancelling one always, others never.
    virtual char HandleItem(short item, int value);
    virtual char ReadError(); // GlogError of the dialog

private:
    // Sees each event before the dialog does: true ends the event with the item and the value that are
    // written here; without an item the dialog goes on. By default false.
    virtual char ModalFilter(EventRecordAdapter *, short *item, int *value);
    // Takes what the user has entered; false keeps the dialog open. By default true.
    virtual char Read();

    short okItem;
    short cancelItem;
    glogRec *glog;
    boost::scoped_ptr<WithPort> portSaver;
    bool isOpen;
    RunIdleChores idleChores;
};
