// Makes the panes of a dialog.
#pragma once
#include "dialogs/LoadError.h"
#include <functional>
#include <map>
#include <string>

class GlogPane;
struct DialogItem;
struct glogRec;

// The items must outlive it.
class PaneMaker {
public:
    explicit PaneMaker(glogRec *glog_)
        : glog(glog_) {}

    // Makes the item's pane and all that is in it, attached to the glog's top level. Throws LoadError; what
    // was made by then is deleted.
    GlogPane *Make(DialogItem const &);

    // Where the key of a pane that was made here stands; the other place for any other pane and for null.
    LoadError::Place PlaceOf(GlogPane const *, std::string const &key, LoadError::Place const &other) const;

    // Calls the function, which makes something for the item, and turns whatever goes wrong in it into a
    // LoadError. The pane is that of the fault, null when it names none.
    typedef std::function<LoadError::Place(std::string const &key, GlogPane const *)> PlaceOfKey;
    static void Guard(PlaceOfKey const &, std::function<void()> const &);

private:
    GlogPane *MakeAlone(DialogItem const &);
    void MakeInside(GlogPane *, DialogItem const &);

    glogRec *glog;
    std::map<GlogPane const *, DialogItem const *> made;
};
