// Where a storm takes place.
#pragma once
#include "fuzz/storm/Chance.h"
#include <memory>
#include <string>
#include <vector>

class GlogPane;
class StormDesktop;
struct glogRec;

// A window with panes on a desktop.
class Stage {
public:
    virtual ~Stage() {}
    // Null once it was closed.
    virtual glogRec *Window() const = 0;
    // Exchanges the panes in the window, or the window itself. May be called from inside a pane.
    virtual void Change(Chance &) = 0;
    // Opens another window in place of one that was closed. Not to be called from inside a pane.
    virtual void Reopen(Chance &) = 0;
    // The panes that events are meant for, at the top.
    virtual std::vector<GlogPane *> Panes() const = 0;
    // All panes that anybody may take out, move and delete.
    virtual std::vector<GlogPane *> Loose() const = 0;
    // Puts one more pane into the window; null when it does not hold any.
    virtual GlogPane *AddPane(Chance &) = 0;
};

namespace Stages {

// Throws std::runtime_error for a page that the gallery has not.
std::unique_ptr<Stage> GalleryPage(StormDesktop &, std::string const &directory, std::string const &page);
// A window of random items.
std::unique_ptr<Stage> RandomDialog(StormDesktop &, Chance &);

} // namespace Stages
