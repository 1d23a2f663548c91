// Makes the panes of a dialog.
#pragma once
#include "dialogs/LoadError.h"
#include <functional>

class GlogPane;
struct DialogItem;
struct glogRec;

class PaneMaker {
public:
    explicit PaneMaker(glogRec *glog_)
        : glog(glog_) {}

    // Makes the item's pane and all that is in it, attached to the glog's top level. Throws LoadError; what
    // was made by then is deleted.
    GlogPane *Make(DialogItem const &);

    // Calls the function, which makes something for the item, and turns whatever goes wrong in it into a
    // LoadError.
    typedef std::function<LoadError::Place(std::string const &key)> PlaceOfKey;
    static void Guard(PlaceOfKey const &, std::function<void()> const &);

private:
    GlogPane *MakeAlone(DialogItem const &);
    void MakeInside(GlogPane *, DialogItem const &);

    glogRec *glog;
};
