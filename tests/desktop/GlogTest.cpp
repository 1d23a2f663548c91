#include "desktop/panes/Glog.h"
#include "desktop/drawing/Surface.h"
#include "host/CustomEventHandler.h"
#include "host/Services.h"
#include "host/UIEvent.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"
#include <algorithm>
#include <boost/make_shared.hpp>

namespace {

// At the end of a press it draws without a look at what has changed meanwhile.
class PressedPane : public GlogPane {
public:
    PressedPane(glogRec *owner, Rect box) {
        GlogPaneInit(owner, 1);
        SetBox(&box);
    }

private:
    int HandleClick(EventRecordAdapter *) override {
        Rect const box = GetBounds();
        Point place;
        while (MouseIsDragging(&place, nullptr)) {
        }
        SetPortToGlog(GetGlog());
        VelaDrawing::PaintRect(&box);
        return -1;
    }
    void DrawGuts(OSRgn *) override {}
};

class GlogTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *NewPane(Rect box = {10, 20, 40, 80}, char const *name = "pane") {
        return new ProbePane(glog, box, calls, name);
    }
};

// Updates

TEST_F(GlogTest, OnlyPanesThatMeetTheDamageAreDrawn) {
    ProbePane *damaged = NewPane({0, 0, 20, 20}, "damaged");
    NewPane({50, 50, 70, 70}, "other");
    Show();
    calls.clear();
    damaged->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(calls, Calls{"damaged: draw"});
}

TEST_F(GlogTest, AnUpdateWithoutDamageDrawsAndPresentsNothing) {
    NewPane();
    Show();
    calls.clear();
    UpdateGlog(glog);
    EXPECT_TRUE(calls.empty());
    EXPECT_TRUE(desktop.TakePresented(glog).empty());
}

TEST_F(GlogTest, AnUpdateInsideADrawingDoesNothing) {
    ProbePane *pane = NewPane();
    pane->onDraw = [&](OSRgn *) {
        pane->Inval();
        UpdateGlog(glog);
    };
    Show();
    calls.clear();
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(Count(calls, "pane: draw"), 1);
    UpdateGlog(glog);
    EXPECT_EQ(Count(calls, "pane: draw"), 2) << "the damage made while drawing waits for the next update";
}

TEST_F(GlogTest, APaneThatThrowsWhileItDrawsLeavesTheNextUpdateInOrder) {
    ProbePane *pane = NewPane();
    Show();
    pane->onDraw = [](OSRgn *) { throw std::runtime_error("drawing failed"); };
    pane->Inval();
    EXPECT_THROW(UpdateGlog(glog), std::runtime_error);
    pane->onDraw = nullptr;
    pane->Inval();
    calls.clear();
    UpdateGlog(glog);
    EXPECT_EQ(calls, Calls{"pane: draw"});
}

TEST_F(GlogTest, AHiddenGlogKeepsItsDamage) {
    ProbePane *pane = NewPane();
    Show();
    ShowGlog(glog, kHideGlog);
    calls.clear();
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_TRUE(calls.empty());
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(calls, (Calls{"pane: draw"}));
}

TEST_F(GlogTest, AGlogThatWasHiddenShowsAllOfItAgain) {
    NewPane();
    Show();
    ShowGlog(glog, kHideGlog);
    ShowGlog(glog, kShowGlog);
    Surface const *const shown = desktop.Picture(glog);
    ASSERT_NE(shown, nullptr);
    Surface const &drawn = *Glog::From(glog).Pixels();
    EXPECT_TRUE(std::equal(drawn.Pixels(), drawn.Pixels() + drawn.Width() * drawn.Height(), shown->Pixels()));
}

TEST_F(GlogTest, WhatAPressDrewInAWindowThatWasResizedMeanwhileIsDrawnAnew) {
    new PressedPane(glog, {20, 20, 60, 60});
    Show();
    desktop.Play("press 30 30\nresize 300 180\nrelease");
    Surface const &drawn = *Glog::From(glog).Pixels();
    EXPECT_EQ(drawn.Row(40)[40], drawn.Row(100)[100]);
}

TEST_F(GlogTest, TheUpdateRegionIsGivenInThePanesCoordinates) {
    ProbeContainer *container = new ProbeContainer(glog, {20, 30, 120, 230});
    ProbePane *pane = NewPane({10, 10, 30, 60});
    container->Add(pane, -1);
    Show();
    Rect bounds{0, 0, 0, 0};
    pane->onDraw = [&](OSRgn *region) { bounds = CarbonUtils::GetRgnBounds(region); };
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(bounds, (Rect{10, 10, 30, 60}));
}

TEST_F(GlogTest, PortAndClipAreWhatTheyWereAfterAnUpdate) {
    ProbePane *one = NewPane({0, 0, 50, 50}, "one"), *two = NewPane({60, 60, 90, 90}, "two");
    Show();
    one->Prepare();
    Rect const clip{5, 5, 10, 10};
    VelaDrawing::ClipRect(&clip);
    two->Inval();
    UpdateGlog(glog);
    OSRgn now;
    VelaDrawing::GetClip(&now);
    EXPECT_EQ(CarbonUtils::GetRgnBounds(&now), clip);
}

// Clicks

TEST_F(GlogTest, TheTopmostVisiblePaneUnderThePointGetsTheClick) {
    NewPane({0, 0, 50, 50}, "below");
    ProbePane *above = NewPane({0, 0, 50, 50}, "above");
    above->clickResult = 1;
    Show();
    EXPECT_EQ(ResultOfClick("click 5 6"), 1);
    EXPECT_EQ(Count(calls, "above: click 5 6"), 1);
    EXPECT_EQ(Count(calls, "below: click 5 6"), 0);
}

TEST_F(GlogTest, AClickThatIsNotTakenGivesThePaneALastChance) {
    ProbePane *pane = NewPane();
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 0);
    EXPECT_EQ(Count(calls, "pane: TryMouseControl"), 1);
    pane->clickResult = -1;
    ResultOfClick("click 25 15");
    EXPECT_EQ(Count(calls, "pane: TryMouseControl"), 1);
}

TEST_F(GlogTest, APositiveResultIsReportedAsAHitAndOthersAreNot) {
    ProbePane *pane = NewPane();
    pane->SetID(6);
    std::vector<int> hits;
    desktop.SetHitHandler([&](glogRec *where, int item, int value) {
        EXPECT_EQ(where, glog);
        hits.push_back(item * 100 + value);
    });
    Show();
    desktop.Play("click 25 15");
    pane->clickResult = -1;
    desktop.Play("click 25 15");
    pane->clickResult = 3;
    desktop.Play("click 25 15");
    EXPECT_EQ(hits, std::vector<int>{603});
}

TEST_F(GlogTest, TheSecondaryButtonHasAnOperationOfItsOwn) {
    NewPane();
    Show();
    desktop.Play("rightclick 25 15");
    EXPECT_EQ(Count(calls, "pane: secondary click"), 1);
    EXPECT_EQ(Count(calls, "pane: click 25 15"), 0);
}

TEST_F(GlogTest, AClickCarriesItsModifiersAndTicks) {
    ProbePane *pane = NewPane();
    unsigned short modifiers = 0;
    unsigned int when = 0;
    pane->onClick = [&](EventRecordAdapter *event) {
        modifiers = event->modifiers;
        when = event->when;
    };
    Show();
    desktop.Play("wait 2\nclick 25 15 shift option");
    EXPECT_EQ(modifiers, 0x0200 | 0x0800);
    EXPECT_EQ(when, 120u);
}

TEST_F(GlogTest, AClickElsewhereConfirmsTheCurrentItemsChanges) {
    ProbePane *current = NewPane({0, 0, 20, 20}, "current");
    NewPane({50, 50, 70, 70}, "other");
    glog->SetCurItem(current);
    Show();
    desktop.Play("click 5 5");
    EXPECT_EQ(Count(calls, "current: ConfirmChangesOnClickAway"), 0);
    desktop.Play("click 55 55");
    EXPECT_EQ(Count(calls, "current: ConfirmChangesOnClickAway"), 1);
}

TEST_F(GlogTest, AGlogMayBeDisposedOfByItsOwnPane) {
    ProbePane *pane = NewPane();
    pane->onClick = [&](EventRecordAdapter *) {
        DisposeGlog(glog);
        EXPECT_EQ(Count(calls, "pane: gone"), 0) << "what runs in a glog keeps it alive";
        EXPECT_TRUE(GlogError(glog));
    };
    pane->clickResult = 1;
    bool hit = false;
    desktop.SetHitHandler([&](glogRec *, int, int) { hit = true; });
    Show();
    desktop.Play("click 25 15");
    EXPECT_EQ(Count(calls, "pane: gone"), 1);
    EXPECT_FALSE(hit);
}

TEST_F(GlogTest, AGlogIsInErrorOnceItIsDisposedOfAndForGood) {
    glogRec *const other = desktop.NewGlog(GlogOptions());
    EXPECT_FALSE(GlogError(other));
    DisposeGlog(other);
    EXPECT_TRUE(GlogError(other)) << "it is gone, and not looked into";
    EXPECT_TRUE(GlogError(nullptr));
    EXPECT_FALSE(GlogError(glog));
}

TEST_F(GlogTest, OutsideOfAnyHandlerDisposalIsImmediate) {
    NewPane();
    Show();
    DisposeGlog(glog);
    EXPECT_EQ(Count(calls, "pane: gone"), 1);
    DisposeGlog(nullptr);
}

// Keys and tabs

TEST_F(GlogTest, KeysGoToTheCurrentItem) {
    ProbePane *pane = NewPane();
    Show();
    desktop.Play("key a");
    EXPECT_EQ(Count(calls, "pane: Key 97"), 0);
    glog->SetCurItem(pane);
    desktop.Play("key a\nkey Return\nkey Escape\nkey Up");
    EXPECT_EQ(Count(calls, "pane: Key 97"), 1);
    EXPECT_EQ(Count(calls, "pane: Key 13"), 1);
    EXPECT_EQ(Count(calls, "pane: Key 27"), 1);
    EXPECT_EQ(Count(calls, "pane: Key 30"), 1);
}

TEST_F(GlogTest, TypedTextArrivesCharacterByCharacter) {
    ProbePane *pane = NewPane();
    glog->SetCurItem(pane);
    Show();
    desktop.Play("type \"Hi!\"");
    EXPECT_EQ(Count(calls, "pane: Key 72"), 1);
    EXPECT_EQ(Count(calls, "pane: Key 105"), 1);
    EXPECT_EQ(Count(calls, "pane: Key 33"), 1);
}

TEST_F(GlogTest, AKeyThatAnswersTwoIsAHit) {
    ProbePane *pane = NewPane();
    pane->SetID(3);
    glog->SetCurItem(pane);
    std::vector<int> hits;
    desktop.SetHitHandler([&](glogRec *, int item, int value) { hits.push_back(item * 100 + value); });
    Show();
    pane->keyResult = -1;
    desktop.Play("key a");
    pane->keyResult = 2;
    desktop.Play("key a");
    EXPECT_EQ(hits, std::vector<int>{302});
}

TEST_F(GlogTest, TabGoesFromTheCurrentItemToTheNextThatTakesIt) {
    ProbePane *one = NewPane({0, 0, 9, 9}, "one"), *two = NewPane({0, 0, 9, 9}, "two"),
              *three = NewPane({0, 0, 9, 9}, "three");
    one->takesTab = three->takesTab = true;
    one->becomesGopher = three->becomesGopher = true;
    glog->SetCurItem(one);
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), three);
    EXPECT_EQ(Count(calls, "two: Tab 1"), 1);
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), one) << "after the last comes the first";
    desktop.Play("key Tab shift");
    EXPECT_EQ(glog->GetCurItem(), three);
    (void)two;
}

TEST_F(GlogTest, TabWithoutACurrentItemIsOfferedFromTheFirstPaneOnAndToSubpanes) {
    NewPane({0, 0, 9, 9}, "first");
    ProbeContainer *container = new ProbeContainer(glog, {0, 0, 100, 100});
    ProbePane *inside = NewPane({0, 0, 9, 9}, "inside");
    container->Add(inside, -1);
    inside->takesTab = inside->becomesGopher = true;
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), inside);
    EXPECT_EQ(Count(calls, "first: Tab 1"), 1);
}

TEST_F(GlogTest, HiddenPanesAreNotOfferedTheTab) {
    ProbePane *pane = NewPane();
    pane->takesTab = pane->becomesGopher = true;
    pane->SetVisibility(0);
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(Count(calls, "pane: Tab 1"), 0);
}

TEST_F(GlogTest, ACurrentItemThatKeepsTheTabStaysCurrent) {
    ProbePane *keeps = NewPane({0, 0, 9, 9}, "keeps"), *other = NewPane({0, 0, 9, 9}, "other");
    other->takesTab = true;
    glog->SetCurItem(keeps);
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), keeps);
    EXPECT_EQ(Count(calls, "other: Tab 1"), 0);
}

// The wheel

class WheelPane : public ProbePane {
public:
    using ProbePane::ProbePane;
    CustomEventHandler *CanHandleCustomEvent(UIEvent *event) override {
        return takesWheel && IsMouseWheelEvent(*event) ? new (std::nothrow) Handler(this) : nullptr;
    }
    bool takesWheel = true;

private:
    struct Handler : CustomEventHandler {
        explicit Handler(WheelPane *pane_)
            : pane(pane_) {}
        bool HandleEvent(UIEvent *event) override {
            boost::shared_ptr<UIEvent::MouseWheelParams> params = event->GetMouseWheelParams();
            pane->calls.push_back(pane->name + ": wheel " + std::to_string(params->axis) + " " +
                                  std::to_string(static_cast<int>(params->delta)));
            return true;
        }
        CustomEventHandler *Clone() override { return new (std::nothrow) Handler(pane); }
        WheelPane *pane;
    };
};

TEST_F(GlogTest, TheWheelGoesToTheTopmostPaneThatTakesItAxisByAxis) {
    new WheelPane(glog, {0, 0, 50, 50}, calls, "wheel");
    Show();
    desktop.Play("");
    calls.clear();
    desktop.Play("wheel 5 5 2 -1\nwheel 100 100 0 3");
    EXPECT_EQ(calls, (Calls{"wheel: wheel 0 2", "wheel: wheel 1 -1"}));
}

TEST_F(GlogTest, AContainerOffersTheWheelToTheSubpaneUnderThePointer) {
    ProbeContainer *container = new ProbeContainer(glog, {10, 10, 110, 110});
    container->Add(new WheelPane(glog, {0, 0, 40, 40}, calls, "upper"), -1);
    container->Add(new WheelPane(glog, {50, 0, 90, 40}, calls, "lower"), -1);
    Show();
    desktop.Play("");
    calls.clear();
    desktop.Play("wheel 20 70 0 1");
    EXPECT_EQ(calls, Calls{"lower: wheel 1 1"});
}

// Activation and windows

TEST_F(GlogTest, ActivationReachesEveryPaneOnce) {
    ProbePane *pane = NewPane();
    Show();
    desktop.Play("");
    EXPECT_TRUE(pane->IsActive());
    EXPECT_EQ(Count(calls, "pane: Activate"), 1);
    desktop.Play("activate off");
    EXPECT_FALSE(pane->IsActive());
    desktop.Play("activate off\nactivate on\nactivate on");
    EXPECT_EQ(Count(calls, "pane: Activate"), 2);
    EXPECT_EQ(Count(calls, "pane: Deactivate"), 1);
}

TEST_F(GlogTest, AClickThatActivatedTheWindowIsKnownAsSuch) {
    ProbePane *pane = NewPane();
    std::vector<bool> activating;
    pane->onClick = [&](EventRecordAdapter *) {
        activating.push_back(glog->DidActivateWithCurrentMouseDown());
    };
    Show();
    desktop.Play("wait 1\nactivate off\nwait 1\nactivate on\nclick 25 15\nwait 1\nclick 25 15");
    EXPECT_EQ(activating, (std::vector<bool>{true, false}));
    EXPECT_FALSE(glog->DidActivateWithCurrentMouseDown());
}

TEST_F(GlogTest, ResizingTheWindowTellsThePanesAndRedrawsEverything) {
    NewPane();
    Show();
    calls.clear();
    desktop.Play("resize 330 190");
    EXPECT_EQ(GetGlogWidth(glog), 330);
    EXPECT_EQ(GetGlogHeight(glog), 190);
    EXPECT_EQ(Count(calls, "pane: Resize 10 -10"), 1);
    EXPECT_EQ(Count(calls, "pane: draw"), 1);
    EXPECT_EQ(desktop.Picture(glog)->Width(), 330);
}

TEST_F(GlogTest, SizeLimitsHoldForTheWindow) {
    glog->SetMinSize(300, 150);
    glog->SetMaxSize(400, 250);
    Show();
    desktop.Play("resize 1000 10");
    EXPECT_EQ(GetGlogWidth(glog), 400);
    EXPECT_EQ(GetGlogHeight(glog), 150);
}

TEST_F(GlogTest, PositionGlogMovesAndSizesTheWindow) {
    Show();
    Rect place{100, 200, 300, 450};
    PositionGlog(glog, &place, false);
    EXPECT_EQ(GetGlogWidth(glog), 250);
    EXPECT_EQ(GetGlogHeight(glog), 200);
    Point p{0, 0};
    SetPortToGlog(glog);
    VelaDrawing::LocalToGlobal(&p);
    EXPECT_EQ(p, (Point{100, 200}));
    VelaDrawing::GlobalToLocal(&p);
    EXPECT_EQ(p, (Point{0, 0}));
}

TEST_F(GlogTest, SetPortToGlogUsesTheWindowsCoordinates) {
    ProbeContainer *container = new ProbeContainer(glog, {20, 30, 120, 230});
    Show();
    container->Prepare();
    SetPortToGlog(glog);
    EXPECT_EQ(GetLocalPortRect(OSPort::GetCurrent()), (Rect{0, 0, 200, 320}));
}

TEST_F(GlogTest, DrawingOutsideAnUpdateShowsAtTheNextWait) {
    ProbePane *pane = NewPane();
    Show();
    pane->Prepare();
    GrayForeColor(0);
    Rect const r{12, 22, 14, 24};
    VelaDrawing::PaintRect(&r);
    EXPECT_NE(desktop.Picture(glog)->Row(12)[22], 0xFF000000u);
    desktop.ProcessEvents(0);
    EXPECT_EQ(desktop.Picture(glog)->Row(12)[22], 0xFF000000u);
}

} // namespace
