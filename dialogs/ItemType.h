// A kind of item that dialogs may hold.
#pragma once
#include "dialogs/KeyList.h"
#include <functional>
#include <string>

class GlogPane;
class GlogStyleSheet;
class RecordBytes;
struct glogRec;

// Says how items of one type are written and how their panes are made:
//
//     ItemRegistry::Instance().Add(ItemType("Meter")
//         .Keys(KeyList().Rect("BoundsRect").Required().Integer("Level", -60, 6))
//         .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) { return MeterPane::NewMeterPane(glog, sheet);
//         }));
//
// The keys that every item may have (Layout, HelpTag, HelpTagText, Visible) are the loader's: they need not
// be listed, and are carried out once the pane is made.
class ItemType {
public:
    // Makes a pane and attaches it to the glog. The sheet holds what the dialog says under the type's keys,
    // all of it checked. Null, or a throw of KeyFault, std::bad_alloc or TarnError, becomes a LoadError;
    // panes that the maker has attached to the glog by then are deleted.
    typedef std::function<GlogPane *(glogRec *, GlogStyleSheet *)> Maker;
    // The same from a binary record, whose kind is its first number. Bytes that are left over are an error.
    typedef std::function<GlogPane *(glogRec *, RecordBytes &)> RecordMaker;
    // Sees to it that what the pane tells its listeners is reported to those who watch the desktop's
    // messages.
    typedef std::function<void(GlogPane *)> Reporter;

    static int const kWholeKind = 0xFFFF; // all bits of a record's first number tell its kind
    static int const kLowByte = 0xFF;     // only these do

    explicit ItemType(std::string const &name_)
        : name(name_) {}

    // Each sets what it is named after and answers the type.
    ItemType &Keys(KeyList const &);
    ItemType &MadeBy(Maker);
    ItemType &FromRecord(int kind, int kindMask, RecordMaker);
    ItemType &ReportedBy(Reporter);
    // The number under which layout properties of such panes are read; see GlogLayoutRectItem. Default: 0.
    ItemType &LayoutType(int paneType);
    // The item may have <Items> of its own. The panes that its maker makes must be CompoundPanes.
    ItemType &HoldsItems();

    std::string name;                // as the attribute "type" has it
    KeyList keys;                    // beside those that every item may have
    Maker maker;                     // never empty in the registry
    int recordKind = 0;              // as a record's first number tells it
    int recordKindMask = kWholeKind; // which bits of that number count
    RecordMaker recordMaker;         // empty: there are no such records
    Reporter reporter;               // empty: such panes tell nothing
    int layoutType = 0;              // as LayoutType set it
    bool holdsItems = false;         // as HoldsItems set it
};
