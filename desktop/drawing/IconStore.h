// Which icons there are now.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/IconSet.h"
#include "host/OSRgn.h"
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

// One for the process. Icons are those of the theme and the directories of Resources; a change of either is
// noticed by itself. In each directory an atlas is the file atlas-THEME-PERCENT.glogatlas, such as
// atlas-dark-150.glogatlas; of those that there are the one of the port's scale is taken, else the next
// larger, else the largest. Each is mapped when first needed.
class IconStore {
public:
    static IconStore &Instance();

    // The icons for the scale. Valid until the theme or the directories change. Without artwork, or when an
    // atlas is broken, the set is empty, and the reason is in Error.
    IconSet &ForScale(DeviceScale);
    // Any of the sets: sizes are the same in all.
    IconSet &AnyScale();
    // The logical pixels of which the icon covers at least half. Valid until the theme or the directories
    // change.
    OSRgn const &Outline(short family, short index);

    // Why an atlas could not be used, with the file's name; empty when all is well.
    std::string const &Error() const { return error; }

private:
    IconStore() {}
    void FollowResources();
    IconSet &Demand(DeviceScale);
    std::vector<std::string> AtlasesFor(DeviceScale) const;

    unsigned int generation = 0; // of Resources, when the rest was set
    std::string theme, error;
    std::vector<std::vector<std::pair<int, std::string>>>
        atlases;                                  // of each directory: scale in percent, path
    std::map<int, std::unique_ptr<IconSet>> sets; // by scale in thousandths
    IconSet *latest = nullptr;                    // the set that was asked for last
    int latestScale = 0;                          // its scale, in thousandths
    std::map<std::pair<short, short>, OSRgn> outlines;
};
