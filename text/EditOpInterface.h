// How edit commands reach the pane that has the keyboard.
#pragma once
#include "host/CommandSpecifier.h"

struct glogRec;

// The mix-in of panes that know the commands of an Edit menu. In programs with a desktop, command or control
// with X, C, V and A reaches them too.
class EditOpInterface {
public:
    EditOpInterface();

    // Class and numbers of the commands.
    enum { kEditClass = 15 };
    enum Command { kSelectAll = 1, kCut = 11, kCopy = 12, kPaste = 13, kClear = 15 };

    // Whether the pane knows the command, by its number alone.
    virtual bool CanDoOp(CommandSpecifier const &) = 0;
    // The flag tells whether the caller is to take the command as a change that counts.
    virtual void Cut(bool &commits) = 0;
    virtual void Copy() = 0;
    virtual void Paste(bool &commits) = 0;
    // Deletes what is selected; false, and the flag untouched, when nothing is.
    virtual bool Clear(bool &commits) = 0;
    virtual void SelectAll() = 0;

    // The glog's current item; null without a glog or item, and for an item that has no edit commands.
    static EditOpInterface *GetActiveItemInterface(glogRec *);
    // Whether the current item knows the command, which must be of the class of edit commands.
    static bool CanDoEditOp(glogRec *, CommandSpecifier const &);
    // Carries the command out on the current item. False when there is none that could, for a number that is
    // none of the commands, and for a Clear without anything to clear. The flag is untouched when there is
    // none that could, and false before the item is asked. The class of the command does not count here: that
    // is what CanDoEditOp is to be asked for first.
    static bool DoEditOp(glogRec *, CommandSpecifier const &, bool &commits);

protected:
    ~EditOpInterface() {} // nobody deletes by this base
    // What CanDoOp answers for a pane with all five commands.
    static bool KnowsCommand(CommandSpecifier const &);
};
