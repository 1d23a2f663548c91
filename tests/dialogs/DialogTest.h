// What the tests of dialogs share: a simulated desktop, and ways to load a dialog and to see what came of it.
#pragma once
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "host/GlogPane.h"
#include "host/glogRec.h"
#include <gtest/gtest.h>
#include <ostream>
#include <string>

inline bool operator==(Rect const &a, Rect const &b) {
    return a.top == b.top && a.left == b.left && a.bottom == b.bottom && a.right == b.right;
}
inline std::ostream &operator<<(std::ostream &out, Rect const &r) {
    return out << "{top " << r.top << ", left " << r.left << ", bottom " << r.bottom << ", right " << r.right
               << "}";
}

class DialogTest : public testing::Test {
protected:
    // A dialog of 320 x 200 with these items.
    static std::string Dialog(std::string const &items) {
        return "<Glog width=\"320\" height=\"200\"><Items>" + items + "</Items></Glog>";
    }
    static std::string Item(std::string const &type, std::string const &keys) {
        return "<Item type=\"" + type + "\" id=\"1\">" + keys + "</Item>";
    }

    glogRec *Load(std::string const &xml) { return LoadGlogFromText(xml, "test.xml"); }

    // The pane of a dialog with this one item.
    template <class Pane> Pane *LoadOne(std::string const &type, std::string const &keys) {
        glogRec *const glog = Load(Dialog(Item(type, keys)));
        Pane *const pane = dynamic_cast<Pane *>(GetGlogItem(glog, 1));
        EXPECT_NE(pane, nullptr) << type << " made a pane of another class";
        return pane;
    }

    // What LoadError says about the dialog; the desktop must have no more glogs than before.
    template <class Action> std::string Complaint(Action const &load) {
        std::size_t const before = Glogs();
        std::string complaint = "no complaint";
        try {
            load();
        } catch (LoadError const &error) {
            complaint = error.what();
            EXPECT_EQ(Glogs(), before) << "a half-made glog is left";
        }
        return complaint;
    }
    std::string ComplaintAbout(std::string const &xml) {
        return Complaint([&] { Load(xml); });
    }
    std::string ComplaintAboutItem(std::string const &type, std::string const &keys) {
        return ComplaintAbout(Dialog(Item(type, keys)));
    }

    std::size_t Glogs() { return DesktopRep::Of(desktop).Glogs().size(); }
    static Rect BoxOf(GlogPane *pane) {
        Rect box;
        pane->GetBox(&box);
        return box;
    }
    // What the tree dump says about the glog.
    std::string Dump(glogRec *glog) { return desktop.DumpTree(glog); }
    static bool Holds(std::string const &text, std::string const &part) {
        return text.find(part) != std::string::npos;
    }

    SimulatedDesktop desktop;
};
