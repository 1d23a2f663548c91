// Box selections, and the pane that is no more than a box.
#include "buttons/BoxSelectPane.h"
#include "buttons/BoxPane.h"
#include "desktop/drawing/Surface.h"
#include "desktop/layout/LayoutEngine.h"
#include "host/CallbackAPI.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tests/PaneTest.h"

namespace {

int const kOneAtATime = 0, kEachOnItsOwn = 1;

Rect const kFirst = {20, 10, 40, 30};
Rect const kSecond = {20, 40, 40, 60};
Rect const kOverlapping = {30, 50, 50, 90}; // of the second
Rect const kAround = {20, 10, 50, 90};
OS::Size const kCorner(6, 6);

// The item of a selection with three boxes.
boost::shared_ptr<XMLLib::ContainerItem> SelectionItem(int mode, int style = BoxSelectPane::kThinFrame) {
    TestItem list;
    list.Box("Box", kFirst).Box("Box", kSecond).Box("Box", kOverlapping);
    TestItem item;
    item.Integer("Style", style).Integer("Mode", mode);
    item.Container()->AddItem(UString("RectList", UString::kByteEncoding1), list.Container());
    return item.Container();
}

class Listener : public BoxSelectPaneListener {
public:
    void BoxValueChanged(BoxSelectPane *source, short index, bool value) override {
        log.push_back(std::to_string(index) + (value ? " on" : " off"));
        if (onChange)
            onChange(source);
    }
    std::vector<std::string> log;
    std::function<void(BoxSelectPane *)> onChange;
};

typedef std::vector<std::string> Log;

class Group : public CompoundPane {
public:
    Group(glogRec *owner, bool usesLayout) {
        CompoundPaneInit(owner, 0);
        Rect box = {50, 100, 150, 300};
        SetBox(&box);
        SetUseLayout(usesLayout);
    }
};

class BoxSelect : public PaneTest {
protected:
    BoxSelectPane *New(int mode = kEachOnItsOwn, int style = BoxSelectPane::kThinFrame) {
        return BoxSelectPane::NewBoxSelectPane(glog, SelectionItem(mode, style));
    }
    BoxSelectPane *NewOf(std::vector<Rect> const &rects, int mode = kEachOnItsOwn) {
        TestItem list, item;
        for (Rect const &rect : rects)
            list.Box("Box", rect);
        item.Integer("Mode", mode);
        item.Container()->AddItem(Text("RectList"), list.Container());
        return BoxSelectPane::NewBoxSelectPane(glog, item.Container());
    }
    // The pixels of the window.
    typedef std::vector<std::vector<std::uint32_t>> Picture;
    Picture PictureOf(glogRec *window) {
        Surface const &surface = *desktop.Picture(window);
        Picture picture;
        for (int v = 0; v < surface.Height(); ++v)
            picture.emplace_back(surface.Row(v), surface.Row(v) + surface.Width());
        return picture;
    }
    // In a container at (100, 50) that lays out its items, below a gap of 30 pixels.
    BoxSelectPane *NewInLayout(int mode = kEachOnItsOwn, int style = BoxSelectPane::kThinFrame) {
        Group *const group = new Group(glog, true);
        Rect above = {0, 0, 30, 50};
        BoxPane *const spacer = new BoxPane(glog, above);
        spacer->GetLayoutRect()->SetAttribute(GlogLayoutItem::kHeight, 30, GlogLayoutItem::kPixels,
                                              UString());
        group->Add(spacer, -1);
        BoxSelectPane *const pane = New(mode, style);
        group->Add(pane, -1);
        return pane;
    }
    // Where a box lies in that layout.
    static Rect InThatLayout(Rect const &box) {
        return Moved(box, static_cast<short>(-kAround.left), static_cast<short>(30 - kAround.top));
    }
    // The same in the window.
    static Rect InThatWindow(Rect const &box) { return Moved(InThatLayout(box), 100, 50); }
    static Rect BoundsOf(BoxSelectPane &pane, short index) {
        Rect box;
        pane.GetOneBox(index, &box);
        return box;
    }
    static Rect Moved(Rect rect, short dh, short dv) {
        VelaDrawing::OffsetRect(&rect, dh, dv);
        return rect;
    }
    Lines MarksOf(BoxSelectPane &pane, Rect const &updated = Rect{0, 0, 200, 320}) {
        OSRgn region(updated);
        return Traced(pane, [&] { (pane.*&Opened<BoxSelectPane>::DrawGuts)(&region); });
    }
    Lines ThinFrames(BoxSelectPane &pane, std::vector<Rect> const &boxes) {
        return Traced(pane, [&] {
            for (Rect const &box : boxes) {
                OSPort::Current().PenNormal();
                OSPort::Current().FrameRect(box);
            }
        });
    }
};

// A selection made from a record, for what makers of their own and subclasses see.
class Subclass : public BoxSelectPane {
public:
    Subclass(glogRec *owner, boxSelResRec *record)
        : BoxSelectPane(owner, record) {}
    void SetBox(Rect *box) override {
        boxesSet.push_back(*box);
        BoxSelectPane::SetBox(box);
    }
    std::vector<Rect> boxesSet;
};

// Counts the steps of tracking.
class Steps : public VelaFoundationCallbackAPI {
public:
    Steps()
        : former(gInstance) {
        gInstance = this;
    }
    ~Steps() override { gInstance = former; }
    void TrackingStep() override { ++steps; }
    void ListTrackingStep() override { ++steps; }
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }
    int steps = 0;

private:
    VelaFoundationCallbackAPI *former;
};

class Box : public PaneTest {};

} // namespace

TEST_F(Box, TakesItsRectangleFromItsMaker) {
    Rect box = {1, 2, 3, 4};
    BoxPane *const pane = new BoxPane(glog, box);
    EXPECT_EQ(BoxOf(*pane), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(pane->GetID(), 0);
}

TEST_F(Box, TakesItsRectangleFromASheet) {
    TestItem item;
    item.Box("BoundsRect", {1, 2, 3, 4});
    EXPECT_EQ(BoxOf(*new BoxPane(glog, item.Sheet())), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(BoxOf(*new BoxPane(glog, TestItem().Sheet())), (Rect{0, 0, 0, 0}));
}

TEST_F(Box, DrawsNothingAndTakesNoClicks) {
    Rect box = {10, 10, 30, 30};
    BoxPane *const pane = new BoxPane(glog, box);
    EXPECT_TRUE(DrawingOf(*pane).empty());
    Show();
    EXPECT_EQ(ResultOfClick("click 15 15"), 0);
}

TEST_F(Box, StaysUnattachedWithoutAGlog) {
    Rect box = {1, 2, 3, 4};
    BoxPane lonely(nullptr, box);
    EXPECT_EQ(lonely.GetGlog(), nullptr);
    EXPECT_EQ(BoxOf(lonely), (Rect{0, 0, 0, 0}));
}

TEST_F(Box, StaysUnattachedWithoutAGlogAlsoFromASheet) {
    TestItem item;
    item.Box("BoundsRect", {1, 2, 3, 4});
    BoxPane lonely(nullptr, item.Sheet());
    EXPECT_EQ(lonely.GetGlog(), nullptr);
    EXPECT_EQ(BoxOf(lonely), (Rect{0, 0, 0, 0}));
}

TEST_F(BoxSelect, ItsRecordHasSixBytes) { EXPECT_EQ(sizeof(boxSelResRec), 6u); }

TEST_F(BoxSelect, IsAProviderFirstAndAPaneSecond) {
    BoxSelectPane *const pane = New();
    char const *const whole = reinterpret_cast<char const *>(pane);
    EXPECT_EQ(reinterpret_cast<char const *>(static_cast<Provider<BoxSelectPaneListener> *>(pane)), whole);
    EXPECT_GT(reinterpret_cast<char const *>(static_cast<GlogPane *>(pane)), whole);
}

TEST_F(BoxSelect, TheKindOfItsRecordIsNotLookedAt) {
    boxSelResRec record = {99, 2, BoxSelectPane::kHighlight, kEachOnItsOwn};
    EXPECT_EQ(BoxSelectPane::NewBoxSelectPane(glog, &record)->GetNumBoxes(), 2);
}

TEST_F(BoxSelect, IsMadeUnderNumberZero) { EXPECT_EQ(New()->GetID(), 0); }

TEST_F(BoxSelect, FromARecordAloneItsBoxesAreEmpty) {
    boxSelResRec record = {boxSelResRec::kKind, 3, 0, kEachOnItsOwn};
    BoxSelectPane *const pane = BoxSelectPane::NewBoxSelectPane(glog, &record);
    EXPECT_EQ(pane->GetNumBoxes(), 3);
    for (short i = 0; i < 3; ++i) {
        EXPECT_EQ(BoundsOf(*pane, i), (Rect{0, 0, 0, 0}));
        EXPECT_FALSE(pane->ReadOne(i));
    }
}

TEST_F(BoxSelect, OneAtATimeStartsWithTheFirstBoxOn) {
    BoxSelectPane *const pane = New(kOneAtATime);
    EXPECT_EQ(pane->RadGet(), 0);
    EXPECT_TRUE(pane->ReadOne(0));
    EXPECT_FALSE(pane->ReadOne(1));
}

TEST_F(BoxSelect, TakesItsBoxesFromAnItemAndLiesAroundThem) {
    BoxSelectPane *const pane = New();
    ASSERT_EQ(pane->GetNumBoxes(), 3);
    EXPECT_EQ(BoundsOf(*pane, 0), kFirst);
    EXPECT_EQ(BoundsOf(*pane, 1), kSecond);
    EXPECT_EQ(BoundsOf(*pane, 2), kOverlapping);
    EXPECT_EQ(BoxOf(*pane), kAround);
    EXPECT_FALSE(pane->ReadOne(0));
}

TEST_F(BoxSelect, FromAnItemOneAtATimeBeginsWithTheFirstOnAndTellsNobody) {
    BoxSelectPane *const pane = New(kOneAtATime);
    EXPECT_EQ(pane->RadGet(), 0);
    EXPECT_TRUE(pane->ReadOne(0));
    EXPECT_FALSE(pane->ReadOne(1));
    EXPECT_FALSE(pane->ReadOne(2));
}

TEST_F(BoxSelect, ItsNaturalSizeIsThatOfTheRectangleAroundItsBoxes) {
    GlogLayoutItem::Rep const &rep = LayoutEngine::Rep(*New()->GetLayoutRect());
    EXPECT_EQ(rep.width, 80);
    EXPECT_EQ(rep.height, 30);
}

TEST_F(BoxSelect, TheRectangleAroundItsBoxesReachesAtLeastToTheOrigin) {
    BoxSelectPane *const pane = NewOf({{-50, -60, -40, -30}});
    EXPECT_EQ(BoxOf(*pane), (Rect{-50, -60, 0, 0}));
    EXPECT_EQ(BoundsOf(*pane, 0), (Rect{-50, -60, -40, -30}));
}

TEST_F(BoxSelect, WithAnEmptyListItsBoxBeginsBeyondItsEnd) {
    BoxSelectPane *const pane = NewOf({});
    EXPECT_EQ(pane->GetNumBoxes(), 0);
    EXPECT_EQ(BoxOf(*pane), (Rect{32767, 32767, 0, 0}));
    EXPECT_EQ(LayoutEngine::Rep(*pane->GetLayoutRect()).width, -32767);
}

TEST_F(BoxSelect, NumbersOfAnItemAreNarrowed) {
    TestItem box, list, item;
    box.Integer("kTop", 65536 + 20).Integer("kLeft", 10).Integer("kBottom", 65536 + 40).Integer("kRight", 30);
    list.Container()->AddItem(Text("Box"), box.Container());
    item.Integer("Style", 256 + BoxSelectPane::kThinFrame).Integer("Mode", 256);
    item.Container()->AddItem(Text("RectList"), list.Container());
    BoxSelectPane *const pane = BoxSelectPane::NewBoxSelectPane(glog, item.Container());
    EXPECT_EQ(BoundsOf(*pane, 0), kFirst);
    EXPECT_TRUE(pane->ReadOne(0)) << "a mode of 256 is one box at a time";
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst}));
}

TEST_F(BoxSelect, KeysThatAreAbsentCountAsZero) {
    TestItem list, item;
    list.Box("Box", kFirst);
    item.Container()->AddItem(Text("RectList"), list.Container());
    BoxSelectPane *const pane = BoxSelectPane::NewBoxSelectPane(glog, item.Container());
    EXPECT_TRUE(pane->ReadOne(0));
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst}));
}

TEST_F(BoxSelect, NoItemFailsAnAssertion) {
    EXPECT_THROW(BoxSelectPane::NewBoxSelectPane(glog, boost::shared_ptr<XMLLib::ContainerItem>()),
                 BrokenInvariant);
}

TEST_F(BoxSelect, AListWithAChildThatIsNoneLeavesNoPane) {
    TestItem list, item;
    list.Box("Box", kFirst).Integer("Box", 3);
    item.Integer("Mode", kEachOnItsOwn);
    item.Container()->AddItem(Text("RectList"), list.Container());
    EXPECT_THROW(BoxSelectPane::NewBoxSelectPane(glog, item.Container()), TarnError);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(BoxSelect, WithoutItsListAnAssertionFails) {
    EXPECT_THROW(BoxSelectPane::NewBoxSelectPane(glog, TestItem().Container()), BrokenInvariant);
}

TEST_F(BoxSelect, WithoutAGlogItStaysUnattachedAndWithoutBoxes) {
    std::unique_ptr<BoxSelectPane> const pane(
        BoxSelectPane::NewBoxSelectPane(nullptr, SelectionItem(kOneAtATime)));
    ASSERT_NE(pane, nullptr);
    EXPECT_EQ(pane->GetGlog(), nullptr);
    EXPECT_EQ(pane->GetNumBoxes(), 0);
}

TEST_F(BoxSelect, SetOneStoresRepaintsAndTells) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    Show();
    pane->SetOne(1, true);
    EXPECT_TRUE(pane->ReadOne(1));
    EXPECT_EQ(listener.log, (Log{"1 on"}));
    EXPECT_EQ(Repainted(), (std::vector<Rect>{kAround}));
}

TEST_F(BoxSelect, SetOneWithTheSameValueDoesNothing) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    Show();
    pane->SetOne(1, false);
    EXPECT_TRUE(listener.log.empty());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(BoxSelect, SetOneTellsAlsoWhereOneAtATimeIsOnAndLeavesTheOthers) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    pane->SetOne(2, true);
    EXPECT_EQ(listener.log, (Log{"2 on"}));
    EXPECT_TRUE(pane->ReadOne(0));
    EXPECT_EQ(pane->RadGet(), 0);
}

TEST_F(BoxSelect, AChangeIsStoredAndTheRedrawAskedForBeforeAnybodyIsTold) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    Show();
    bool value = false;
    std::vector<Rect> repainted;
    listener.onChange = [&](BoxSelectPane *source) {
        value = source->ReadOne(1);
        repainted = Repainted();
    };
    pane->SetOne(1, true);
    EXPECT_TRUE(value);
    EXPECT_EQ(repainted, (std::vector<Rect>{kAround}));
    EXPECT_TRUE(Repainted().empty()) << "once is enough";
}

TEST_F(BoxSelect, TheMessageNamesThePane) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    BoxSelectPane *source = nullptr;
    listener.onChange = [&](BoxSelectPane *sender) { source = sender; };
    pane->SetOne(2, true);
    EXPECT_EQ(source, pane);
}

TEST_F(BoxSelect, AHiddenPaneChangesAndTellsButRepaintsNothing) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    Show();
    pane->SetVisibility(0);
    pane->SetOne(1, true);
    pane->RadSet(2);
    pane->ChangeStatus(true);
    EXPECT_EQ(listener.log, (Log{"1 on", "0 off", "2 on"}));
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(BoxSelect, WhileTheOldBoxGoesOffItIsStillTheCurrentOne) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    std::vector<short> current;
    listener.onChange = [&](BoxSelectPane *source) { current.push_back(source->RadGet()); };
    pane->RadSet(2);
    EXPECT_EQ(current, (std::vector<short>{0, 2}));
}

TEST_F(BoxSelect, RadSetGoesOverAlsoWhereEachBoxIsOnItsOwn) {
    BoxSelectPane *const pane = New(kEachOnItsOwn);
    Listener listener;
    listener.DependUpon(pane);
    pane->RadSet(1);
    EXPECT_EQ(listener.log, (Log{"1 on"})) << "the first was off";
    EXPECT_EQ(pane->RadGet(), 1);
}

TEST_F(BoxSelect, RadSetTellsOfTheOldBoxFirst) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    pane->RadSet(2);
    EXPECT_EQ(pane->RadGet(), 2);
    EXPECT_EQ(listener.log, (Log{"0 off", "2 on"}));
    pane->RadSet(2);
    EXPECT_EQ(listener.log.size(), 2u);
}

TEST_F(BoxSelect, AClickSwitchesABoxOver) {
    BoxSelectPane *const pane = New();
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_TRUE(pane->ReadOne(0));
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_FALSE(pane->ReadOne(0));
}

TEST_F(BoxSelect, AClickActsWhenTheMouseGoesDown) {
    BoxSelectPane *const pane = New();
    Show();
    desktop.Play("press 15 25");
    EXPECT_TRUE(pane->ReadOne(0));
}

TEST_F(BoxSelect, AClickIsNotTrackedAndTakesNoTime) {
    Steps steps;
    New();
    Show();
    double const start = desktop.Now();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_EQ(desktop.Now(), start);
    EXPECT_EQ(ResultOfClick("press 15 25\nwait 0.5\nmove 200 150\nrelease"), 1);
    EXPECT_EQ(steps.steps, 0);
}

TEST_F(BoxSelect, AnyModeButZeroSwitchesEachBoxOnItsOwn) {
    for (int mode : {2, 128, 255}) {
        BoxSelectPane *const pane = New(mode);
        Show();
        EXPECT_FALSE(pane->ReadOne(0));
        ResultOfClick("click 15 25");
        ResultOfClick("click 45 25");
        EXPECT_TRUE(pane->ReadOne(0) && pane->ReadOne(1)) << mode;
        EXPECT_EQ(pane->RadGet(), 0) << mode;
        delete pane;
    }
}

TEST_F(BoxSelect, AClickOnTheCurrentBoxDoesNotTurnItOnAgain) {
    BoxSelectPane *const pane = New(kOneAtATime);
    pane->SetOne(0, false);
    Listener listener;
    listener.DependUpon(pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_FALSE(pane->ReadOne(0));
    EXPECT_TRUE(listener.log.empty());
}

TEST_F(BoxSelect, AClickRepaintsThePaneAlone) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Rect box = {100, 100, 120, 120};
    new BoxPane(glog, box);
    Show();
    ResultOfClick("click 45 25");
    EXPECT_EQ(pane->RadGet(), 1);
    EXPECT_EQ(desktop.TakePresented(glog), (std::vector<Rect>{kAround}));
}

TEST_F(BoxSelect, AClickGoesOverToAnotherBox) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 45 25"), 2);
    EXPECT_EQ(listener.log, (Log{"0 off", "1 on"}));
    EXPECT_EQ(pane->RadGet(), 1);
}

TEST_F(BoxSelect, AClickOnTheCurrentBoxTellsNobody) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_TRUE(listener.log.empty());
    EXPECT_TRUE(pane->ReadOne(0));
}

TEST_F(BoxSelect, OfOverlappingBoxesTheLaterOneIsClicked) {
    New();
    Show();
    EXPECT_EQ(ResultOfClick("click 55 35"), 3);
}

TEST_F(BoxSelect, AClickOutsideOfEveryBoxFallsThrough) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    Show();
    EXPECT_EQ(ResultOfClick("click 35 25"), 0);
    EXPECT_EQ(ResultOfClick("click 30 25"), 0) << "the right edge is outside";
    EXPECT_EQ(ResultOfClick("click 15 40"), 0) << "the bottom edge is outside";
    EXPECT_TRUE(listener.log.empty());
}

TEST_F(BoxSelect, ABoxIsHitFromItsTopLeftToItsBottomRightPixel) {
    New();
    Show();
    EXPECT_EQ(ResultOfClick("click 40 20"), 2);
    EXPECT_EQ(ResultOfClick("click 39 20"), 0);
    EXPECT_EQ(ResultOfClick("click 89 49"), 3);
    EXPECT_EQ(ResultOfClick("click 49 39"), 2);
}

TEST_F(BoxSelect, ListenersMayLeaveDuringTheMessage) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener first, second;
    first.DependUpon(pane);
    second.DependUpon(pane);
    first.onChange = [&](BoxSelectPane *source) { first.CancelDependency(source); };
    pane->RadSet(1);
    EXPECT_EQ(first.log, (Log{"0 off"}));
    EXPECT_EQ(second.log, (Log{"0 off", "1 on"}));
}

TEST_F(BoxSelect, AListenerMayChangeOtherBoxes) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [](BoxSelectPane *source) { source->SetOne(2, true); };
    pane->SetOne(0, true);
    EXPECT_EQ(listener.log, (Log{"0 on", "2 on"}));
}

TEST_F(BoxSelect, AListenerMayChooseAnotherBox) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [&](BoxSelectPane *source) {
        if (listener.log.back() == "1 on")
            source->RadSet(2);
    };
    Show();
    EXPECT_EQ(ResultOfClick("click 45 25"), 2);
    EXPECT_EQ(pane->RadGet(), 2);
    EXPECT_EQ(listener.log, (Log{"0 off", "1 on", "1 off", "2 on"}));
}

TEST_F(BoxSelect, AListenerOfASwitchMayDeleteThePane) {
    BoxSelectPane *const pane = New();
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [](BoxSelectPane *source) { delete source; };
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(BoxSelect, AListenerMayDeleteThePaneWhenTheOldBoxIsOff) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [](BoxSelectPane *source) { delete source; };
    Show();
    EXPECT_EQ(ResultOfClick("click 45 25"), 2);
    EXPECT_EQ(listener.log, (Log{"0 off"}));
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(BoxSelect, AListenerMayDeleteThePaneWhenTheNewBoxIsOn) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [&](BoxSelectPane *source) {
        if (listener.log.back() == "1 on")
            delete source;
    };
    Show();
    EXPECT_EQ(ResultOfClick("click 45 25"), 2);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(BoxSelect, AListenerMayCloseTheWindow) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [this](BoxSelectPane *) { DisposeGlog(glog); };
    Show();
    desktop.Play("click 45 25");
    EXPECT_EQ(listener.log, (Log{"0 off", "1 on"}));
}

TEST_F(BoxSelect, AListenerMayDeleteTheNeighbour) {
    BoxSelectPane *const pane = New();
    Rect box = {100, 100, 120, 120};
    BoxPane *const neighbour = new BoxPane(glog, box);
    Listener listener;
    listener.DependUpon(pane);
    listener.onChange = [neighbour](BoxSelectPane *) { delete neighbour; };
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 1);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(BoxSelect, StyleZeroFramesWhatIsOn) {
    BoxSelectPane *const pane = New();
    EXPECT_TRUE(MarksOf(*pane).empty());
    pane->SetOne(0, true);
    pane->SetOne(2, true);
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst, kOverlapping}));
}

TEST_F(BoxSelect, StylesOneAndTwoMarkWithARoundHighlightAndDarkerOutline) {
    for (int style : {BoxSelectPane::kHighlight, BoxSelectPane::kHighlightToo}) {
        BoxSelectPane *const pane = New(kOneAtATime, style);
        EXPECT_EQ(MarksOf(*pane), Traced(*pane,
                                         [&] {
                                             OSPort &port = OSPort::Current();
                                             port.SetForeColor(kHiliteColor);
                                             port.PaintRoundRect(kFirst, kCorner);
                                             WithDarkenDrawMode const darken(70, glog->GetStyleSheet(),
                                                                             WithDarkenDrawMode::kMode1);
                                             port.FrameRoundRect(kFirst, kCorner);
                                         }))
            << style;
    }
}

TEST_F(BoxSelect, OtherStylesDrawNothing) {
    EXPECT_TRUE(MarksOf(*New(kOneAtATime, 3)).empty());
    EXPECT_TRUE(MarksOf(*New(kOneAtATime, 255)).empty());
}

TEST_F(BoxSelect, OnlyBoxesThatAreUpdatedAreMarked) {
    BoxSelectPane *const pane = New();
    pane->SetOne(0, true);
    pane->SetOne(2, true);
    EXPECT_EQ(MarksOf(*pane, Rect{20, 60, 50, 90}), ThinFrames(*pane, {kOverlapping}));
}

TEST_F(BoxSelect, AMarkIsDrawnInPartWhenPartOfItIsUpdated) {
    BoxSelectPane *const pane = New(kOneAtATime, BoxSelectPane::kHighlight);
    Show();
    Picture const whole = PictureOf(glog);
    SetPortToGlog(glog);
    Rect const all = {0, 0, 200, 320}, part = {25, 0, 30, 20};
    VelaDrawing::PaintRect(&all);
    VelaDrawing::InvalRect(&part);
    UpdateGlog(glog);
    Picture const redrawn = PictureOf(glog);
    for (short v = 0; v < 60; ++v)
        for (short h = 0; h < 100; ++h)
            ASSERT_EQ(redrawn[v][h], VelaDrawing::PtInRect(Point{v, h}, &part) ? whole[v][h] : redrawn[0][0])
                << v << " " << h;
    EXPECT_TRUE(pane->ReadOne(0));
}

TEST_F(BoxSelect, MarksComeIntoItsOwnWindowWhateverPortIsTheCurrentOne) {
    BoxSelectPane *const pane = New(kOneAtATime);
    OSRgn region(kAround);
    LeaveForAnotherPort();
    (pane->*&Opened<BoxSelectPane>::DrawGuts)(&region);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(BoxSelect, MarksLeaveTheColoursOfThePortToTheHost) {
    New(kOneAtATime, BoxSelectPane::kHighlight);
    Rect below = {100, 10, 120, 30};
    class Frame : public BoxPane {
    public:
        using BoxPane::BoxPane;
        void DrawGuts(OSRgn *) override { GetColors(&colors); }
        SaveColorRec colors;
    };
    Frame *const later = new Frame(glog, below);
    Show();
    EXPECT_EQ(later->colors.fore.red, 0);
    EXPECT_EQ(later->colors.fore.green, 0);
    EXPECT_EQ(later->colors.fore.blue, 0);
}

TEST_F(BoxSelect, AHiddenPaneMarksNothing) {
    BoxSelectPane *const pane = New(kOneAtATime);
    pane->SetVisibility(0);
    EXPECT_TRUE(MarksOf(*pane).empty());
}

TEST_F(BoxSelect, InitStatusTurnsTheMarksOffWithoutRepainting) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Show();
    pane->InitStatus(false);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_TRUE(MarksOf(*pane).empty());
    pane->InitStatus(true);
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst}));
}

TEST_F(BoxSelect, ChangeStatusTurnsTheMarksOffAndRepaints) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Show();
    pane->ChangeStatus(false);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{kAround}));
    EXPECT_TRUE(MarksOf(*pane).empty());
    pane->ChangeStatus(true);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{kAround}));
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst}));
}

TEST_F(BoxSelect, ChangeStatusInvalidatesAlsoWhenNothingChanges) {
    BoxSelectPane *const pane = New(kOneAtATime);
    pane->InitStatus(false);
    Show();
    pane->ChangeStatus(false);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{kAround}));
    EXPECT_TRUE(MarksOf(*pane).empty());
}

TEST_F(BoxSelect, WhileMarksAreOffClicksAndValuesGoOn) {
    BoxSelectPane *const pane = New(kOneAtATime);
    pane->InitStatus(false);
    Show();
    EXPECT_EQ(ResultOfClick("click 45 25"), 2);
    EXPECT_TRUE(pane->ReadOne(1));
    EXPECT_TRUE(MarksOf(*pane).empty());
}

TEST_F(BoxSelect, SetOriginMovesItByItsVirtualOperation) {
    boxSelResRec record = {boxSelResRec::kKind, 1, 0, kEachOnItsOwn};
    Subclass *const pane = new Subclass(glog, &record);
    Rect box = {20, 10, 50, 90};
    pane->SetBox(&box);
    pane->SetOrigin(Point{120, 110});
    EXPECT_EQ(pane->boxesSet, (std::vector<Rect>{box, {120, 110, 150, 190}}));
}

TEST_F(BoxSelect, BoxesAndBoxFollowSetBoxInAContainerWithoutLayout) {
    BoxSelectPane *const pane = New();
    (new Group(glog, false))->Add(pane, -1);
    Rect moved = Moved(kAround, 5, 7);
    pane->SetBox(&moved);
    EXPECT_EQ(BoundsOf(*pane, 1), Moved(kSecond, 5, 7));
}

TEST_F(BoxSelect, ItsBoxesMoveAlongWithIt) {
    BoxSelectPane *const pane = New();
    pane->SetOrigin(Point{25, 17});
    EXPECT_EQ(BoxOf(*pane), Moved(kAround, 7, 5));
    EXPECT_EQ(BoundsOf(*pane, 0), Moved(kFirst, 7, 5));
    EXPECT_EQ(BoundsOf(*pane, 2), Moved(kOverlapping, 7, 5));
}

TEST_F(BoxSelect, ItsBoxesKeepTheirSizeWhenItGrows) {
    BoxSelectPane *const pane = New();
    Rect larger = {20, 10, 150, 190};
    pane->SetBox(&larger);
    EXPECT_EQ(BoundsOf(*pane, 1), kSecond);
}

TEST_F(BoxSelect, InAGroupWithoutLayoutItsBoxesStayAsTheyAre) {
    BoxSelectPane *const pane = New();
    (new Group(glog, false))->Add(pane, -1);
    EXPECT_EQ(BoundsOf(*pane, 0), kFirst);
    EXPECT_EQ(BoundsOf(*pane, 2), kOverlapping);
    Show();
    EXPECT_EQ(ResultOfClick("click 115 75"), 1);
    EXPECT_TRUE(pane->ReadOne(0));
}

TEST_F(BoxSelect, KeepsTheContainerThatItIsGiven) {
    class Knowing : public Subclass {
    public:
        using Subclass::Subclass;
        CompoundPane *Container() const { return container; }
    };
    boxSelResRec record = {boxSelResRec::kKind, 1, 0, 0};
    Knowing *const pane = new Knowing(glog, &record);
    Group *const group = new Group(glog, true);
    pane->SetContainer(group);
    EXPECT_EQ(pane->Container(), group);
    pane->SetContainer(nullptr);
    EXPECT_EQ(pane->Container(), nullptr);
}

TEST_F(BoxSelect, InALayoutItsBoxesCountFromItsTopLeftCorner) {
    Group *const group = new Group(glog, true);
    Rect above = {0, 0, 30, 50};
    BoxPane *const spacer = new BoxPane(glog, above);
    spacer->GetLayoutRect()->SetAttribute(GlogLayoutItem::kHeight, 30, GlogLayoutItem::kPixels, UString());
    group->Add(spacer, -1);
    BoxSelectPane *const pane = New();
    group->Add(pane, -1);
    Show();
    Rect const box = BoxOf(*pane);
    EXPECT_EQ(box.top, 30);
    EXPECT_EQ(box.bottom - box.top, kAround.bottom - kAround.top) << "its natural height";
    EXPECT_EQ(BoundsOf(*pane, 0), Moved(kFirst, static_cast<short>(box.left - kAround.left),
                                        static_cast<short>(box.top - kAround.top)));
    EXPECT_EQ(BoundsOf(*pane, 2), Moved(kOverlapping, static_cast<short>(box.left - kAround.left),
                                        static_cast<short>(box.top - kAround.top)));
}

TEST_F(BoxSelect, InALayoutItsBoxesAreClickedWhereTheyAreDrawn) {
    Group *const group = new Group(glog, true);
    BoxSelectPane *const pane = New();
    group->Add(pane, -1);
    Show();
    Rect const second = BoundsOf(*pane, 1);
    int const h = 100 + second.left + 2, v = 50 + second.top + 2; // the group stands at (100, 50)
    EXPECT_EQ(ResultOfClick("click " + std::to_string(h) + " " + std::to_string(v)), 2);
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {second}));
}

TEST_F(BoxSelect, InALayoutEveryStyleMarksTheBoxesWhereTheyLie) {
    for (int style : {BoxSelectPane::kHighlight, BoxSelectPane::kHighlightToo}) {
        BoxSelectPane *const pane = NewInLayout(kOneAtATime, style);
        Show();
        Rect const first = InThatLayout(kFirst);
        EXPECT_EQ(MarksOf(*pane), Traced(*pane,
                                         [&] {
                                             OSPort &port = OSPort::Current();
                                             port.SetForeColor(kHiliteColor);
                                             port.PaintRoundRect(first, kCorner);
                                             WithDarkenDrawMode const darken(70, glog->GetStyleSheet(),
                                                                             WithDarkenDrawMode::kMode1);
                                             port.FrameRoundRect(first, kCorner);
                                         }))
            << style;
    }
    BoxSelectPane *const pane = NewInLayout(kOneAtATime, BoxSelectPane::kThinFrame);
    Show();
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {InThatLayout(kFirst)}));
    EXPECT_TRUE(MarksOf(*pane, Rect{0, 0, 10, 10}).empty());
}

TEST_F(BoxSelect, InALayoutClicksChangeAndRepaintItWhereItLies) {
    BoxSelectPane *const pane = NewInLayout(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    Show();
    Rect const third = InThatWindow(kOverlapping);
    EXPECT_EQ(ResultOfClick("click " + std::to_string(third.left) + " " + std::to_string(third.top)), 3);
    EXPECT_EQ(listener.log, (Log{"0 off", "2 on"}));
    std::vector<Rect> const presented = desktop.TakePresented(glog);
    ASSERT_EQ(presented.size(), 1u);
    EXPECT_EQ(presented[0].top, InThatWindow(kAround).top);
    EXPECT_EQ(ResultOfClick("click " + std::to_string(third.right) + " " + std::to_string(third.top)), 0);
}

TEST_F(BoxSelect, InALayoutSetBoxMovesNoBoxWithinThePane) {
    BoxSelectPane *const pane = NewInLayout();
    Show();
    Rect const before = BoundsOf(*pane, 1), box = BoxOf(*pane);
    Rect elsewhere = Moved(box, 40, 20);
    pane->SetBox(&elsewhere);
    EXPECT_EQ(BoundsOf(*pane, 1), Moved(before, 40, 20)) << "counted from the corner of the box";
    pane->SetOrigin(Point{box.top, box.left});
    EXPECT_EQ(BoundsOf(*pane, 1), before);
}

TEST_F(BoxSelect, InALayoutAHelpTagHoldsForItsBoxWhereItLies) {
    BoxSelectPane *const pane = NewInLayout();
    Show();
    LocalizedStrings::HelpTag const *const stock =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector");
    pane->AttachHelpTag(1, stock);
    Rect const second = InThatLayout(kSecond);
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect place = {0, 0, 0, 0};
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = 0;
    ASSERT_TRUE(pane->GetHelpTagForPoint(Point{static_cast<short>(second.top + 5), 35}, tag, place, placement,
                                         delay));
    EXPECT_EQ(place, (Rect{second.top, static_cast<short>(second.left + 2), second.bottom,
                           static_cast<short>(second.right - 2)}));
}

TEST_F(BoxSelect, BoxesOfARecordComeIntoALayoutToo) {
    boxSelResRec record = {boxSelResRec::kKind, 2, 0, kOneAtATime};
    Group *const group = new Group(glog, true);
    BoxSelectPane *const pane = BoxSelectPane::NewBoxSelectPane(glog, &record);
    group->Add(pane, -1);
    Show();
    EXPECT_EQ(BoundsOf(*pane, 1), (Rect{0, 0, 0, 0}));
}

TEST_F(BoxSelect, TakenOutOfALayoutItsBoxesStayCountedFromTheirCorner) {
    Group *const group = new Group(glog, true);
    BoxSelectPane *const pane = New();
    group->Add(pane, -1);
    group->DelGuts(0, true);
    std::unique_ptr<BoxSelectPane> const kept(pane);
    pane->SetContainer(nullptr);
    EXPECT_EQ(BoundsOf(*pane, 0), Moved(kFirst, -10, -20));
    EXPECT_EQ(BoundsOf(*pane, 2), Moved(kOverlapping, -10, -20));
}

TEST_F(BoxSelect, WithoutBoxesItMayComeIntoALayout) {
    boxSelResRec record = {boxSelResRec::kKind, 0, 0, kEachOnItsOwn};
    BoxSelectPane *const pane = BoxSelectPane::NewBoxSelectPane(glog, &record);
    (new Group(glog, true))->Add(pane, -1);
    EXPECT_EQ(pane->GetNumBoxes(), 0);
}

TEST_F(BoxSelect, AHelpTagHoldsForItsBoxALittleNarrowed) {
    BoxSelectPane *const pane = New();
    LocalizedStrings::HelpTag const *const stock =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector");
    pane->SetHelpTag(stock); // of the whole pane: gives way
    pane->AttachHelpTag(1, stock);
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect place = {0, 0, 0, 0};
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = 0;
    EXPECT_FALSE(pane->GetHelpTagForPoint(Point{25, 15}, tag, place, placement, delay));
    EXPECT_FALSE(pane->GetHelpTagForPoint(Point{25, 41}, tag, place, placement, delay));
    ASSERT_TRUE(pane->GetHelpTagForPoint(Point{25, 42}, tag, place, placement, delay));
    EXPECT_EQ(tag, stock);
    EXPECT_EQ(place, (Rect{20, 42, 40, 58}));
    EXPECT_EQ(placement, OS::Help::kPlacementForParts);
    EXPECT_DOUBLE_EQ(delay, 0.5);
}

TEST_F(BoxSelect, AProgramsOwnHelpTagHelperStaysInCharge) {
    class Own : public HelpTagHelper {
    public:
        bool IsDefaultHelper() const override { return false; }
        bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, enum OS::Help::Placement &,
                        double &) override {
            return false;
        }
    };
    BoxSelectPane *const pane = New();
    Own *const own = new Own;
    pane->SetHelpTagHelper(AutoPtr<HelpTagHelper>(own));
    pane->AttachHelpTag(
        0, LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector"));
    EXPECT_EQ(pane->GetHelpTagHelper(), own);
}

TEST_F(BoxSelect, FurtherHelpTagsJoinTheFirst) {
    BoxSelectPane *const pane = New();
    LocalizedStrings::HelpTag const *const stock =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector");
    pane->AttachHelpTag(0, stock);
    HelpTagHelper *const helper = pane->GetHelpTagHelper();
    pane->AttachHelpTag(1, stock);
    EXPECT_EQ(pane->GetHelpTagHelper(), helper);
}

TEST_F(BoxSelect, ItsProcedureVariablesReadAndSetBoxes) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Listener listener;
    listener.DependUpon(pane);
    btnSetOneBS(pane, 2, true);
    EXPECT_TRUE(btnReadOneBS(pane, 2));
    radSetBS(pane, 1);
    EXPECT_EQ(radGetBS(pane), 1);
    EXPECT_EQ(listener.log, (Log{"2 on", "0 off", "1 on"}));
    btnOneBoxRec rec = {1, {0, 0, 0, 0}};
    btnGetOneBox(pane, &rec);
    EXPECT_EQ(rec.box, kSecond);
}

TEST_F(BoxSelect, ItsProcedureVariableForTheOriginMovesItAndAnswersTrue) {
    BoxSelectPane *const pane = New();
    EXPECT_TRUE(btnSetOriginBS(pane, 120, 110));
    EXPECT_EQ(BoxOf(*pane), Moved(kAround, 100, 100));
    EXPECT_EQ(BoundsOf(*pane, 0), Moved(kFirst, 100, 100));
}

TEST_F(BoxSelect, ItsProcedureVariablesForTheStatusStoreOrRepaint) {
    BoxSelectPane *const pane = New(kOneAtATime);
    Show();
    gbsInitStatus(pane, false);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_TRUE(MarksOf(*pane).empty());
    gbsChangeStatus(pane, true);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{kAround}));
    EXPECT_EQ(MarksOf(*pane), ThinFrames(*pane, {kFirst}));
}

TEST_F(BoxSelect, ItsProcedureVariablesNarrowTheIndex) {
    BoxSelectPane *const pane = New();
    btnSetOneBS(pane, 0x10001, true);
    EXPECT_TRUE(pane->ReadOne(1));
    EXPECT_TRUE(btnReadOneBS(pane, 0x10001));
    radSetBS(pane, 0x10002);
    EXPECT_EQ(radGetBS(pane), 2);
}
