// The gallery's own panes, which somebody does away with while they are used.
#include "buttons/ButtonGroupPane.h"
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadGlog.h"
#include "host/CIdleChore.h"
#include "host/glogRec.h"
#include "tools/gallery/GalleryItems.h"
#include "tools/gallery/ListHeaderPane.h"
#include "tools/gallery/StepperPane.h"
#include "tools/gallery/TakeListPane.h"
#include "tools/gallery/TrackRowPane.h"
#include <gtest/gtest.h>
#include <memory>
#include <string>

namespace {

class GoneWhileUsed : public testing::Test {
protected:
    GoneWhileUsed() { GalleryItems::Add(); }

    glogRec *Shown(std::string const &items) {
        glogRec *const glog = LoadGlogFromText(
            "<Glog width=\"400\" height=\"200\"><Items>" + items + "</Items></Glog>", "used.xml");
        ShowGlog(glog, kShowGlog);
        return glog;
    }

    SimulatedDesktop desktop;
};

class RemoverOnUse : public AutoSetActivityListener {
public:
    explicit RemoverOnUse(StepperPane &pane)
        : stepper(&pane) {
        DependUpon(&pane);
    }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override { delete stepper; }
    void ProviderDying(Provider<AutoSetActivityListener> *) override { stepper = nullptr; }
    bool HasRemoved() const { return !stepper; }

private:
    StepperPane *stepper;
};

class RemoverOnToggle : public ButtonGroupPaneListener {
public:
    RemoverOnToggle(ButtonGroupPane &group, GlogPane *&pane_)
        : pane(pane_) {
        DependUpon(&group);
    }
    void ButtonValueChanged(ButtonGroupPane *, short, bool) override {
        delete pane;
        pane = nullptr;
    }

private:
    GlogPane *&pane;
};

// Removes it as soon as the desktop has nothing else to do.
class RemoverInPassing : public CIdleChore {
public:
    explicit RemoverInPassing(GlogPane *&pane_)
        : CIdleChore(1, kInitialDelay)
        , pane(pane_) {
        Assign();
    }

protected:
    void DoIdle() override {
        Cancel();
        delete pane;
        pane = nullptr;
    }

private:
    GlogPane *&pane;
};

} // namespace

TEST_F(GoneWhileUsed, TheStepperByWhoHearsThatItIsUsed) {
    glogRec *const glog = Shown("<Item type=\"Stepper\" id=\"1\"><Origin v=\"5\" h=\"5\"/>"
                                "<TextID>2</TextID><Num>7</Num></Item>");
    RemoverOnUse remover(dynamic_cast<StepperPane &>(*GetGlogItem(glog, 1)));
    desktop.Play("click 12 10\nclick 12 10\n");
    EXPECT_TRUE(remover.HasRemoved());
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GoneWhileUsed, TheRowByWhoHearsOfItsCheckBox) {
    glogRec *const glog = Shown("");
    int told = 0;
    short const kCheckBox = 5;
    GlogPane *row = TrackRowPane::NewTrackRowPane(glog, 1, 4, kCheckBox, [&](TrackRowPane &) { ++told; });
    RemoverOnToggle const remover(dynamic_cast<ButtonGroupPane &>(*row->FindByID(kCheckBox)), row);
    desktop.Play("click 14 11\n");
    EXPECT_EQ(row, nullptr);
    EXPECT_EQ(told, 0);
}

TEST_F(GoneWhileUsed, TheHeadingsByWhoHearsOfTheColumns) {
    glogRec *const glog = Shown("");
    boost::shared_ptr<ColumnList> const columns(new ColumnList(2));
    columns->SetBothEdges(0, 0, 100);
    columns->SetBothEdges(1, 100, 300);
    GlogPane *headings = nullptr;
    int told = 0;
    headings = ListHeaderPane::NewListHeaderPane(glog, columns, [&] {
        ++told;
        delete headings;
        headings = nullptr;
    });
    Rect box = {0, 0, ListHeaderPane::kHeight, 300};
    headings->SetBox(&box);
    desktop.Play("press 100 10\nmove 120 10\nmove 140 10\nrelease\n");
    EXPECT_EQ(headings, nullptr);
    EXPECT_EQ(told, 1);
    EXPECT_EQ(columns->GetWidth(0), 120);
}

TEST_F(GoneWhileUsed, TheHeadingsWhileTheMouseIsAwaited) {
    glogRec *const glog = Shown("");
    boost::shared_ptr<ColumnList> const columns(new ColumnList(2));
    columns->SetBothEdges(0, 0, 100);
    columns->SetBothEdges(1, 100, 300);
    int told = 0;
    GlogPane *headings = ListHeaderPane::NewListHeaderPane(glog, columns, [&] { ++told; });
    Rect box = {0, 0, ListHeaderPane::kHeight, 300};
    headings->SetBox(&box);
    RemoverInPassing const remover(headings);
    desktop.Play("press 100 10\nwait 0.2\nmove 120 10\nrelease\n");
    EXPECT_EQ(headings, nullptr);
    EXPECT_EQ(told, 0);
}

// In each column, since a click acts on the row in another way in each: the number is dragged, the name
// selects, the mark is tracked.
TEST_F(GoneWhileUsed, TheTakesWhileTheMouseIsAwaited) {
    for (std::string const column : {"20", "100", "200", "250"}) {
        glogRec *const glog =
            Shown("<Item type=\"TakeList\" id=\"1\"><BoundsRect top=\"5\" left=\"5\" bottom=\"155\" "
                  "right=\"305\"/><Num>12</Num><TextID>2</TextID></Item>");
        GlogPane *takes = GetGlogItem(glog, 1);
        ASSERT_NE(dynamic_cast<TakeListPane *>(takes), nullptr);
        RemoverInPassing const remover(takes);
        desktop.Play("press " + column + " 60\nwait 0.2\nmove " + column + " 90\nwait 0.2\nrelease\n");
        EXPECT_EQ(takes, nullptr) << column;
        EXPECT_EQ(CountGlogItems(glog), 0) << column;
        DisposeGlog(glog);
    }
}
