// Box selections, and the pane that is no more than a box.
#include "buttons/BoxSelectPane.h"
#include "buttons/BoxPane.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
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

TEST_F(BoxSelect, ItsRecordHasSixBytes) { EXPECT_EQ(sizeof(boxSelResRec), 6u); }

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

TEST_F(BoxSelect, WithoutItsListAnAssertionFails) {
    EXPECT_THROW(BoxSelectPane::NewBoxSelectPane(glog, TestItem().Container()), BrokenInvariant);
}

TEST_F(BoxSelect, AChildOfItsListThatIsNoContainerEndsInAnError) {
    TestItem list, item;
    list.Box("Box", kFirst).Integer("Box", 3);
    item.Integer("Mode", kEachOnItsOwn);
    item.Container()->AddItem(Text("RectList"), list.Container());
    EXPECT_ANY_THROW(BoxSelectPane::NewBoxSelectPane(glog, item.Container()));
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
    EXPECT_TRUE(listener.log.empty());
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

TEST_F(BoxSelect, AProcedureVariableMayBeReplaced) {
    BoxSelectPane *const pane = New();
    auto const former = btnReadOneBS;
    btnReadOneBS = [](BoxSelectPane *, int index) { return index == 77; };
    EXPECT_TRUE(btnReadOneBS(pane, 77));
    btnReadOneBS = former;
    EXPECT_FALSE(btnReadOneBS(pane, 0));
}
