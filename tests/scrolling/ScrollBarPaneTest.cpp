// What a scroll bar is made of, when it works, and what it shows and keeps.
#include "host/GlogStyleSheet.h"
#include "host/glogRec.h"
#include "tests/VirtualPlace.h"
#include "tests/scrolling/ScrollBarTest.h"
#include <cstddef>
#include <limits>
#include <type_traits>

namespace {

class ScrollBar : public ScrollBarTest {
protected:
    static ScrollBarPane *FromSheet(glogRec *owner, TestItem &item) {
        return ScrollBarPane::NewScrollBarPane(owner, item.Sheet());
    }
    // Whether a bar of that ratio, range and length is live.
    bool Works(double ratio, int range, int length = 130) {
        ScrollBarPane *const bar = Upright(length);
        client.ratio = ratio;
        bar->SetClient(&client);
        bar->Set(0, range);
        return IsLive(*bar);
    }
};

short const kBoth = ScrollBarPane::kEndBorderOutside | ScrollBarPane::kStartBorderOutside;
short const kEnd = ScrollBarPane::kEndBorderOutside, kStart = ScrollBarPane::kStartBorderOutside;
int const kLeastInt = std::numeric_limits<int>::min(), kGreatestInt = std::numeric_limits<int>::max();

} // namespace

// Class

TEST_F(ScrollBar, IsACompoundPaneFirstAndAProviderSecond) {
    ScrollBarPane *const bar = Upright();
    EXPECT_EQ(static_cast<void *>(static_cast<CompoundPane *>(bar)), static_cast<void *>(bar));
    Provider<ScrollBarPane_Listener> *const provider = bar;
    EXPECT_GT(reinterpret_cast<char *>(provider), reinterpret_cast<char *>(bar));
}

TEST_F(ScrollBar, NumbersItsEnumerationsAndFlags) {
    EXPECT_EQ(ScrollBarPane::kHorizontal, 0);
    EXPECT_EQ(ScrollBarPane::kVertical, 1);
    EXPECT_EQ(ScrollBarPane::kTowardStart, 0);
    EXPECT_EQ(ScrollBarPane::kTowardEnd, 1);
    EXPECT_EQ(ScrollBarPane::kHorizontalBar, 1);
    EXPECT_EQ(ScrollBarPane::kBottomFollowsGlog, 2);
    EXPECT_EQ(ScrollBarPane::kRightFollowsGlog, 4);
    EXPECT_EQ(ScrollBarPane::kEndBorderOutside, 32);
    EXPECT_EQ(ScrollBarPane::kStartBorderOutside, 64);
}

TEST_F(ScrollBar, ItsRecordHasSixteenBytesInTheToldOrder) {
    EXPECT_EQ(sizeof(sbarResRec), 16u);
    EXPECT_EQ(offsetof(sbarResRec, type), 0u);
    EXPECT_EQ(offsetof(sbarResRec, flags), 2u);
    EXPECT_EQ(offsetof(sbarResRec, bounds), 4u);
    EXPECT_EQ(offsetof(sbarResRec, edgeH), 12u);
    EXPECT_EQ(offsetof(sbarResRec, edgeV), 14u);
}

TEST_F(ScrollBar, AClientsOperationsStandInTheToldOrder) {
    ExpectInOrder(kAfterDestructor, &ScrollBarClient::InhibitAutoScroll, &ScrollBarClient::GetMaxScrollValue,
                  &ScrollBarClient::ScrollTo, &ScrollBarClient::GetThumbRatio,
                  &ScrollBarClient::StartScrolling, &ScrollBarClient::Scroll,
                  &ScrollBarClient::GetArrowScrollDelay, &ScrollBarClient::GetPageScrollDelay,
                  &ScrollBarClient::DoneScrolling);
}

TEST_F(ScrollBar, AClientRepeatsArrowsAfterThreeTicksAndPagesAfterFive) {
    EXPECT_EQ(client.ScrollBarClient::GetArrowScrollDelay(), 3);
    EXPECT_EQ(client.ScrollBarClient::GetPageScrollDelay(), 5);
}

TEST_F(ScrollBar, AClientNeedNotCareForBeginAndEnd) {
    client.ScrollBarClient::InhibitAutoScroll(glog);
    client.ScrollBarClient::DoneScrolling(nullptr);
    EXPECT_TRUE(client.log.empty());
}

// Making

TEST_F(ScrollBar, TakesOrientationAndBoundsFromItsRecord) {
    ScrollBarPane *const upright = NewBar(0, {3, 5, 100, 21});
    EXPECT_FALSE(upright->IsHorizontal());
    EXPECT_EQ(BoxOf(*upright), (Rect{3, 5, 100, 21}));
    ScrollBarPane *const level = NewBar(ScrollBarPane::kHorizontalBar, {3, 5, 19, 100});
    EXPECT_TRUE(level->IsHorizontal());
    EXPECT_EQ(BoxOf(*level), (Rect{3, 5, 19, 100}));
}

TEST_F(ScrollBar, DoesNotLookAtTheRecordsType) {
    for (short type : {-32768, -1, 0, 77, 32767}) {
        sbarResRec record = {type, 0, UprightBox(130), 0, 0};
        EXPECT_NE(ScrollBarPane::NewScrollBarPane(glog, &record), nullptr);
    }
}

TEST_F(ScrollBar, HasTheNumberZero) {
    TestItem item;
    EXPECT_EQ(Upright()->GetID(), 0);
    EXPECT_EQ(FromSheet(glog, item)->GetID(), 0);
    EXPECT_EQ((new ScrollBarPane(glog, 0, 0, 0))->GetID(), 0);
}

TEST_F(ScrollBar, StartsDeadAtZeroOfZeroWithoutClient) {
    ScrollBarPane *const bar = Upright();
    EXPECT_EQ(bar->GetPosition(), 0);
    EXPECT_EQ(bar->GetRange(), 0);
    EXPECT_EQ(bar->GetClient(), nullptr);
    EXPECT_FALSE(IsLive(*bar));
}

TEST_F(ScrollBar, IsNotMadeWithoutAGlog) {
    TestItem item;
    EXPECT_EQ(FromSheet(nullptr, item), nullptr);
    sbarResRec record = {sbarResRec::kType, 0, UprightBox(130), 0, 0};
    EXPECT_EQ(ScrollBarPane::NewScrollBarPane(nullptr, &record), nullptr);
}

TEST_F(ScrollBar, MadeLooseItIsHarmless) {
    ScrollBarPane loose(nullptr, 0, 0, 0);
    EXPECT_EQ(loose.GetGlog(), nullptr);
    EXPECT_EQ(loose.NumSubpanes(), 0);
    loose.SetClient(&client);
    loose.Set(3, 10);
    EXPECT_EQ(loose.GetPosition(), 3);
    Rect box = UprightBox(130);
    loose.SetBox(&box);
    loose.Set(4, 10);
    loose.Activate();
    loose.Deactivate();
    EXPECT_EQ(loose.GetPosition(), 4);
}

TEST_F(ScrollBar, IsMadeFromFlagsAndEdgesWithAnEmptyBox) {
    ScrollBarPane *const bar = new ScrollBarPane(glog, ScrollBarPane::kHorizontalBar, 7, 9);
    EXPECT_TRUE(bar->IsHorizontal());
    EXPECT_EQ(BoxOf(*bar), (Rect{0, 0, 0, 0}));
    EXPECT_TRUE(bar->TooSmall());
}

TEST_F(ScrollBar, ReadsItsKeys) {
    TestItem item;
    item.Integer("Flags", ScrollBarPane::kHorizontalBar | ScrollBarPane::kRightFollowsGlog)
        .Integer("EdgeH", 30)
        .Integer("EdgeV", 40)
        .Box("BoundsRect", {10, 20, 26, 90});
    ScrollBarPane *const bar = FromSheet(glog, item);
    EXPECT_TRUE(bar->IsHorizontal());
    EXPECT_EQ(BoxOf(*bar), (Rect{10, 20, 26, 290}));
}

TEST_F(ScrollBar, ReadsTheLowerEdgeToo) {
    TestItem item;
    item.Integer("Flags", ScrollBarPane::kBottomFollowsGlog)
        .Integer("EdgeV", 40)
        .Box("BoundsRect", {10, 20, 26, 36});
    EXPECT_EQ(BoxOf(*FromSheet(glog, item)), (Rect{10, 20, 160, 36}));
}

TEST_F(ScrollBar, WithoutKeysItStandsUprightInAnEmptyBox) {
    TestItem item;
    ScrollBarPane *const bar = FromSheet(glog, item);
    EXPECT_FALSE(bar->IsHorizontal());
    EXPECT_EQ(BoxOf(*bar), (Rect{0, 0, 0, 0}));
}

TEST_F(ScrollBar, CutsItsNumbersToSixteenBits) {
    TestItem item;
    item.Integer("Flags", 0x70000 | ScrollBarPane::kHorizontalBar | ScrollBarPane::kRightFollowsGlog)
        .Integer("EdgeH", 0x1000A)
        .Box("BoundsRect", {10, 20, 26, 90});
    EXPECT_EQ(BoxOf(*FromSheet(glog, item)), (Rect{10, 20, 26, 310}));
}

TEST_F(ScrollBar, ASheetWithoutItemBreaksAnInvariant) {
    GlogStyleSheet sheet;
    EXPECT_THROW(ScrollBarPane::NewScrollBarPane(glog, &sheet), BrokenInvariant);
}

// Parts

TEST_F(ScrollBar, LiesBetweenItsArrowsWithinItsFrame) {
    ScrollBarPane *const upright = Upright(130);
    EXPECT_EQ(BoxOfPart(*upright, kUpArrow), (Rect{1, 1, 15, 15}));
    EXPECT_EQ(BoxOfPart(*upright, kThumb), (Rect{15, 1, 115, 15}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{115, 1, 129, 15}));
    ScrollBarPane *const level = Level(130);
    EXPECT_EQ(BoxOfPart(*level, kUpArrow), (Rect{1, 1, 15, 15}));
    EXPECT_EQ(BoxOfPart(*level, kThumb), (Rect{1, 15, 15, 115}));
    EXPECT_EQ(BoxOfPart(*level, kDownArrow), (Rect{1, 115, 15, 129}));
}

TEST_F(ScrollBar, HasBothArrowsAtTheEndWhereThePlatformWantsThem) {
    ArrowsTogether const together;
    ScrollBarPane *const upright = Upright(130);
    EXPECT_EQ(BoxOfPart(*upright, kThumb), (Rect{1, 1, 101, 15}));
    EXPECT_EQ(BoxOfPart(*upright, kUpArrow), (Rect{101, 1, 115, 15}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{115, 1, 129, 15}));
    ScrollBarPane *const level = Level(130);
    EXPECT_EQ(BoxOfPart(*level, kThumb), (Rect{1, 1, 15, 101}));
    EXPECT_EQ(BoxOfPart(*level, kUpArrow), (Rect{1, 101, 15, 115}));
    EXPECT_EQ(BoxOfPart(*level, kDownArrow), (Rect{1, 115, 15, 129}));
}

TEST_F(ScrollBar, KeepsTheArrangementThatItWasMadeWith) {
    ScrollBarPane *const bar = Upright(130);
    ArrowsTogether const together;
    Rect box = UprightBox(200);
    bar->SetBox(&box);
    EXPECT_EQ(BoxOfPart(*bar, kUpArrow), (Rect{1, 1, 15, 15}));
}

TEST_F(ScrollBar, ABorderOutsideTheEndGivesThePartsOnePixelMoreEachWay) {
    ScrollBarPane *const upright = Upright(130, kEnd);
    EXPECT_EQ(BoxOfPart(*upright, kUpArrow), (Rect{1, 1, 15, 16}));
    EXPECT_EQ(BoxOfPart(*upright, kThumb), (Rect{15, 1, 116, 16}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{116, 1, 130, 16}));
    ScrollBarPane *const level = Level(130, kEnd);
    EXPECT_EQ(BoxOfPart(*level, kUpArrow), (Rect{1, 1, 16, 15}));
    EXPECT_EQ(BoxOfPart(*level, kThumb), (Rect{1, 15, 16, 116}));
    EXPECT_EQ(BoxOfPart(*level, kDownArrow), (Rect{1, 116, 16, 130}));
}

TEST_F(ScrollBar, ABorderOutsideTheStartTakesAwayTheInsetAlongTheBarOnly) {
    ScrollBarPane *const upright = Upright(130, kStart);
    EXPECT_EQ(BoxOfPart(*upright, kUpArrow), (Rect{0, 1, 14, 16}));
    EXPECT_EQ(BoxOfPart(*upright, kThumb), (Rect{14, 1, 115, 16}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{115, 1, 129, 16}));
    ScrollBarPane *const level = Level(130, kStart);
    EXPECT_EQ(BoxOfPart(*level, kUpArrow), (Rect{1, 0, 16, 14}));
    EXPECT_EQ(BoxOfPart(*level, kThumb), (Rect{1, 14, 16, 115}));
    EXPECT_EQ(BoxOfPart(*level, kDownArrow), (Rect{1, 115, 16, 129}));
}

TEST_F(ScrollBar, BothBordersOutsideGiveTwoPixels) {
    ScrollBarPane *const upright = Upright(130, kBoth);
    EXPECT_EQ(BoxOfPart(*upright, kUpArrow), (Rect{0, 1, 14, 17}));
    EXPECT_EQ(BoxOfPart(*upright, kThumb), (Rect{14, 1, 116, 17}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{116, 1, 130, 17}));
    ScrollBarPane *const level = Level(130, kBoth);
    EXPECT_EQ(BoxOfPart(*level, kUpArrow), (Rect{1, 0, 17, 14}));
    EXPECT_EQ(BoxOfPart(*level, kThumb), (Rect{1, 14, 17, 116}));
    EXPECT_EQ(BoxOfPart(*level, kDownArrow), (Rect{1, 116, 17, 130}));
}

TEST_F(ScrollBar, EveryValueOfTheFlagsMakesABar) {
    for (int flags = 0; flags < 256; ++flags) {
        ScrollBarPane *const bar = NewBar(static_cast<short>(flags), {10, 20, 160, 180});
        ASSERT_EQ(bar->NumSubpanes(), 3) << flags;
        EXPECT_EQ(bar->IsHorizontal(), (flags & 1) != 0) << flags;
        EXPECT_EQ(LengthOf(*bar, kUpArrow), 14) << flags;
        EXPECT_EQ(LengthOf(*bar, kDownArrow), 14) << flags;
        Live(bar);
        DrawingOfPart(*bar, kThumb);
    }
}

TEST_F(ScrollBar, FlagsWithoutMeaningChangeNothing) {
    short const meaningless = static_cast<short>(~(1 | 2 | 4 | 32 | 64));
    ScrollBarPane *const bar = Upright(130, meaningless);
    EXPECT_EQ(BoxOf(*bar), UprightBox(130));
    EXPECT_EQ(BoxOfPart(*bar, kThumb), (Rect{15, 1, 115, 15}));
}

TEST_F(ScrollBar, ANewBoxStretchesTheTroughAlone) {
    ScrollBarPane *const bar = Upright(130);
    Rect box = {10, 20, 110, 36};
    bar->SetBox(&box);
    EXPECT_EQ(BoxOfPart(*bar, kUpArrow), (Rect{1, 1, 15, 15}));
    EXPECT_EQ(BoxOfPart(*bar, kThumb), (Rect{15, 1, 85, 15}));
    EXPECT_EQ(BoxOfPart(*bar, kDownArrow), (Rect{85, 1, 99, 15}));
}

TEST_F(ScrollBar, IsSixteenPixelsAcrossInALayout) {
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    group->SetUseLayout(true);
    Rect room = {0, 0, 100, 100};
    group->SetBox(&room);
    ScrollBarPane *const upright = NewBar(0, {0, 0, 0, 0});
    group->Add(upright, -1);
    upright->GetLayoutRect()->SetAttribute(GlogLayoutItem::kGrowHeight, 1, GlogLayoutItem::kPixels,
                                           UString());
    WithPerformLayoutRectUpdate const settled(group);
    EXPECT_EQ(BoxOf(*upright), (Rect{0, 0, 100, 16}));
    EXPECT_EQ(BoxOfPart(*upright, kDownArrow), (Rect{85, 1, 99, 15}));
}

// What it keeps

TEST_F(ScrollBar, SetClientOnlyStores) {
    ScrollBarPane *const bar = Live(Upright());
    RecordingClient other;
    client.TakeLog();
    bar->SetClient(&other);
    EXPECT_EQ(bar->GetClient(), &other);
    EXPECT_TRUE(client.log.empty());
    EXPECT_TRUE(other.log.empty());
    EXPECT_TRUE(IsLive(*bar));
    bar->SetClient(nullptr);
    EXPECT_EQ(bar->GetClient(), nullptr);
    EXPECT_TRUE(IsLive(*bar));
}

TEST_F(ScrollBar, SetClientRepaintsNothing) {
    ScrollBarPane *const bar = Live(Upright());
    Show();
    bar->SetClient(nullptr);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollBar, SetStoresBothNumbersWhateverTheyAre) {
    ScrollBarPane *const bar = Live(Upright());
    for (int position : {kLeastInt, -1, 0, 1, kGreatestInt})
        for (int range : {kLeastInt, -1, 0, 1, kGreatestInt}) {
            bar->Set(position, range);
            EXPECT_EQ(bar->GetPosition(), position);
            EXPECT_EQ(bar->GetRange(), range);
            DrawingOfPart(*bar, kThumb);
        }
}

TEST_F(ScrollBar, SetRepaintsTheWholeBarEvenWhenNothingChanges) {
    ScrollBarPane *const bar = Live(Upright(), 5);
    Show();
    bar->Set(5, client.greatest);
    EXPECT_EQ(Repainted(), std::vector<Rect>{UprightBox(130)});
}

TEST_F(ScrollBar, SetTellsTheClientNothing) {
    ScrollBarPane *const bar = Live(Upright());
    client.TakeLog();
    bar->Set(7, 20);
    EXPECT_TRUE(client.log.empty());
}

// Live and dead

TEST_F(ScrollBar, WithoutClientIsLiveWithAThumbOfSixteenPixels) {
    ScrollBarPane *const bar = Upright();
    bar->Set(0, 10);
    EXPECT_TRUE(IsLive(*bar));
}

TEST_F(ScrollBar, ARangeBelowOneMakesItDead) {
    EXPECT_FALSE(Works(0.1, kLeastInt));
    EXPECT_FALSE(Works(0.1, -1));
    EXPECT_FALSE(Works(0.1, 0));
    EXPECT_TRUE(Works(0.1, 1));
    EXPECT_TRUE(Works(0.1, kGreatestInt));
}

TEST_F(ScrollBar, ARatioOfOneOrMoreMakesItDead) {
    EXPECT_TRUE(Works(0.999, 10));
    EXPECT_FALSE(Works(1.0, 10));
    EXPECT_FALSE(Works(1e300, 10));
    EXPECT_FALSE(Works(std::numeric_limits<double>::infinity(), 10));
}

TEST_F(ScrollBar, ARatioOfZeroOrLessOrNoNumberLeavesItLive) {
    EXPECT_TRUE(Works(0.0, 10));
    EXPECT_TRUE(Works(-5.0, 10));
    EXPECT_TRUE(Works(-std::numeric_limits<double>::infinity(), 10));
    EXPECT_TRUE(Works(std::numeric_limits<double>::quiet_NaN(), 10));
}

TEST_F(ScrollBar, WorksFromFortyNinePixelsOn) {
    EXPECT_FALSE(Works(0.1, 10, 48));
    EXPECT_TRUE(Works(0.1, 10, 49));
    EXPECT_TRUE(Upright(48)->TooSmall());
    EXPECT_FALSE(Upright(49)->TooSmall());
    EXPECT_TRUE(Level(48)->TooSmall());
    EXPECT_FALSE(Level(49)->TooSmall());
}

TEST_F(ScrollBar, ALengthBeyondSixteenBitsIsTooSmall) {
    EXPECT_TRUE(NewBar(0, {-20000, 0, 20000, 16})->TooSmall());
    EXPECT_FALSE(NewBar(0, {-16000, 0, 16000, 16})->TooSmall());
}

TEST_F(ScrollBar, ComesToLifeAndDiesWithWhatItIsSet) {
    ScrollBarPane *const bar = Live(Upright());
    EXPECT_TRUE(IsLive(*bar));
    bar->Set(0, 0);
    EXPECT_FALSE(IsLive(*bar));
    bar->Set(0, 10);
    EXPECT_TRUE(IsLive(*bar));
    client.ratio = 1.0;
    bar->Set(0, 10);
    EXPECT_FALSE(IsLive(*bar));
}

TEST_F(ScrollBar, ANewBoxKeepsThePositionAndAsksAgainWhetherItWorks) {
    ScrollBarPane *const bar = Live(Upright(48), 30);
    EXPECT_FALSE(IsLive(*bar));
    Rect box = UprightBox(49);
    bar->SetBox(&box);
    EXPECT_TRUE(IsLive(*bar));
    EXPECT_EQ(bar->GetPosition(), 30);
    EXPECT_EQ(bar->GetRange(), 1000);
    box = UprightBox(48);
    bar->SetBox(&box);
    EXPECT_FALSE(IsLive(*bar));
    EXPECT_EQ(bar->GetPosition(), 30);
}

TEST_F(ScrollBar, BoxesOfAllShapesDoNoHarm) {
    short const ends[] = {-32768, -1, 0, 1, 15, 48, 49, 32767};
    ScrollBarPane *const upright = Live(Upright()), *const level = Live(Level());
    for (short start : ends)
        for (short end : ends)
            for (ScrollBarPane *bar : {upright, level}) {
                Rect box = {start, start, end, end};
                bar->SetBox(&box);
                DrawingOfPart(*bar, kThumb);
                EXPECT_EQ(BoxOf(*bar), box);
            }
}

// Edges

TEST_F(ScrollBar, AnUprightBarMayFollowTheRightSide) {
    ScrollBarPane *const bar = NewBar(ScrollBarPane::kRightFollowsGlog, {10, 0, 100, 5}, 12, 0);
    EXPECT_EQ(BoxOf(*bar), (Rect{10, 292, 100, 308}));
}

TEST_F(ScrollBar, ALevelBarMayFollowTheRightSide) {
    ScrollBarPane *const bar =
        NewBar(ScrollBarPane::kRightFollowsGlog | ScrollBarPane::kHorizontalBar, {10, 7, 26, 100}, 12, 0);
    EXPECT_EQ(BoxOf(*bar), (Rect{10, 7, 26, 308}));
}

TEST_F(ScrollBar, AnUprightBarMayFollowTheBottom) {
    ScrollBarPane *const bar = NewBar(ScrollBarPane::kBottomFollowsGlog, {10, 7, 100, 23}, 0, 20);
    EXPECT_EQ(BoxOf(*bar), (Rect{10, 7, 180, 23}));
}

TEST_F(ScrollBar, ALevelBarMayFollowTheBottom) {
    ScrollBarPane *const bar =
        NewBar(ScrollBarPane::kBottomFollowsGlog | ScrollBarPane::kHorizontalBar, {10, 7, 20, 100}, 0, 20);
    EXPECT_EQ(BoxOf(*bar), (Rect{164, 7, 180, 100}));
}

TEST_F(ScrollBar, MayFollowBothEdges) {
    short const both = ScrollBarPane::kBottomFollowsGlog | ScrollBarPane::kRightFollowsGlog;
    EXPECT_EQ(BoxOf(*NewBar(both, {10, 7, 20, 100}, -1, 14)), (Rect{10, 305, 186, 321}));
}

TEST_F(ScrollBar, StaysAtItsEdgesWhenTheGlogIsResized) {
    short const both = ScrollBarPane::kBottomFollowsGlog | ScrollBarPane::kRightFollowsGlog;
    ScrollBarPane *const bar = Live(NewBar(both, {0, 0, 0, 0}, 0, 15), 40);
    Show();
    desktop.Play("resize 400 300");
    EXPECT_EQ(BoxOf(*bar), (Rect{0, 384, 285, 400}));
    EXPECT_EQ(LengthOf(*bar, kThumb), 255);
    EXPECT_EQ(bar->GetPosition(), 40);
    desktop.Play("resize 400 60");
    EXPECT_FALSE(IsLive(*bar));
}

TEST_F(ScrollBar, ThatFollowsNothingStaysWhenTheGlogIsResized) {
    ScrollBarPane *const bar = Live(Upright());
    Show();
    bar->Resize({50, 50});
    EXPECT_TRUE(Repainted().empty());
    EXPECT_EQ(BoxOf(*bar), UprightBox(130));
}

TEST_F(ScrollBar, RepaintsItsOldAndNewPlaceWhenItIsResized) {
    ScrollBarPane *const bar = NewBar(ScrollBarPane::kRightFollowsGlog, {0, 0, 100, 16}, 0, 0);
    Rect astray = {0, 100, 100, 116};
    Show();
    bar->GlogPane::SetBox(&astray);
    bar->Resize({0, 0});
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{0, 100, 100, 116}, {0, 304, 100, 320}}));
}

TEST_F(ScrollBar, InALayoutItFollowsNothing) {
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    group->SetUseLayout(true);
    Rect room = {0, 0, 100, 100};
    group->SetBox(&room);
    ScrollBarPane *const bar = NewBar(ScrollBarPane::kRightFollowsGlog, {0, 0, 100, 16});
    group->Add(bar, -1);
    WithPerformLayoutRectUpdate const settled(group);
    Rect const before = BoxOf(*bar);
    bar->Resize({50, 50});
    EXPECT_EQ(BoxOf(*bar), before);
}

// Windows in front and behind

TEST_F(ScrollBar, LooksDeadInAWindowThatIsNotActive) {
    ScrollBarPane *const bar = Live(Upright());
    Show();
    desktop.Play("activate off");
    EXPECT_FALSE(IsLive(*bar));
    desktop.Play("activate on");
    EXPECT_TRUE(IsLive(*bar));
}

TEST_F(ScrollBar, MayStayActiveInTheBackgroundForGood) {
    ScrollBarPane *const bar = Live(Upright());
    Show();
    bar->SetActiveInBackground();
    desktop.Play("activate off");
    EXPECT_TRUE(IsLive(*bar));
    desktop.Play("activate on\nactivate off");
    EXPECT_TRUE(IsLive(*bar));
}

TEST_F(ScrollBar, ADeadBarStaysDeadInBackgroundAndFront) {
    ScrollBarPane *const bar = Upright();
    Show();
    bar->SetActiveInBackground();
    desktop.Play("activate off");
    EXPECT_FALSE(IsLive(*bar));
    desktop.Play("activate on");
    EXPECT_FALSE(IsLive(*bar));
}

TEST_F(ScrollBar, RepaintsWhenTheWindowGoesBehindOrComesForward) {
    ScrollBarPane *const bar = Upright();
    Show();
    bar->Deactivate();
    EXPECT_EQ(Repainted(), std::vector<Rect>{UprightBox(130)});
    bar->Activate();
    EXPECT_EQ(Repainted(), std::vector<Rect>{UprightBox(130)});
}

// Nothing looks after the window when the state changes, so that such a bar is live behind.
TEST_F(ScrollBar, ComesToLifeInTheBackgroundToo) {
    ScrollBarPane *const bar = Upright();
    Show();
    desktop.Play("activate off");
    Live(bar);
    EXPECT_TRUE(IsLive(*bar));
}

TEST_F(ScrollBar, WhatIsSetInTheBackgroundShowsInFront) {
    ScrollBarPane *const bar = Live(Upright());
    Show();
    desktop.Play("activate off");
    bar->Set(0, 0);
    desktop.Play("activate on");
    EXPECT_FALSE(IsLive(*bar));
}

TEST_F(ScrollBar, MayBeMadeInAShownWindow) {
    Show();
    ScrollBarPane *const bar = Live(Upright());
    UpdateGlog(glog);
    EXPECT_TRUE(IsLive(*bar));
    desktop.Play("activate off");
    EXPECT_FALSE(IsLive(*bar));
}

// Going away

namespace {

class Mourner : public ScrollBarPane_Listener {
public:
    std::function<void()> onDeath;
    int deaths = 0;

private:
    void ScrollBarPaneDying() override {
        ++deaths;
        if (onDeath)
            onDeath();
    }
};

} // namespace

TEST_F(ScrollBar, TellsItsListenersOnceThatItIsDying) {
    ScrollBarPane *const bar = Upright();
    Mourner first, second;
    first.DependUpon(bar);
    second.DependUpon(bar);
    delete bar;
    EXPECT_EQ(first.deaths, 1);
    EXPECT_EQ(second.deaths, 1);
}

TEST_F(ScrollBar, StillStandsWhileItsListenersHearOfItsDeath) {
    ScrollBarPane *const bar = Live(Upright(), 12);
    Mourner mourner;
    mourner.DependUpon(bar);
    mourner.onDeath = [&] {
        EXPECT_EQ(bar->GetPosition(), 12);
        EXPECT_EQ(bar->NumSubpanes(), 3);
        bar->SetClient(nullptr);
        bar->Set(0, 0);
    };
    delete bar;
    EXPECT_EQ(mourner.deaths, 1);
}

TEST_F(ScrollBar, DoesNotTellItsClientThatItIsDying) {
    ScrollBarPane *const bar = Live(Upright());
    client.TakeLog();
    delete bar;
    EXPECT_TRUE(client.log.empty());
}

TEST_F(ScrollBar, AListenerMayDeleteANeighbourOrItself) {
    ScrollBarPane *const bar = Upright(), *const neighbour = Level();
    std::unique_ptr<Mourner> mourner(new Mourner);
    Mourner other;
    mourner->DependUpon(bar);
    other.DependUpon(bar);
    mourner->onDeath = [&] {
        delete neighbour;
        mourner.reset();
    };
    delete bar;
    EXPECT_EQ(other.deaths, 1);
    Show();
}

TEST_F(ScrollBar, DiesWithItsGlogAndTellsSo) {
    Mourner mourner;
    mourner.DependUpon(Upright());
    DisposeGlog(glog);
    EXPECT_EQ(mourner.deaths, 1);
}
