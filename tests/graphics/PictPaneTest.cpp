#include "graphics/PictPane.h"
#include "host/CompoundPane.h"
#include "host/HelpTagHelper.h"
#include "host/PaneWatch.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

short const kWaveform = 9000, kKeyboard = 9003; // 240 x 80, 296 x 86
short const kNoSuchPicture = 31000;

// Tells when it is drawn and deleted.
struct ImageLog {
    std::vector<Rect> drawn;
    int deleted = 0;
};
class TestImage : public tarn::image {
public:
    explicit TestImage(ImageLog &log_)
        : log(log_) {}
    ~TestImage() override { ++log.deleted; }
    void Draw(Rect const &r) override {
        log.drawn.push_back(r);
        VelaDrawing::PaintRect(&r);
    }
    Rect GetFrameRect() const override { return {3, 5, 33, 45}; } // 40 x 30

private:
    ImageLog &log;
};

class ClickEar : public PictPane_Listener {
public:
    explicit ClickEar(PictPane *pane) { Dependent<PictPane_Listener>::DependUpon(pane); }
    void PictClicked(EventRecordAdapter *event) override {
        where.push_back(event->where);
        if (then)
            then();
    }
    std::vector<Point> where;
    std::function<void()> then;
};

gpicResRec Record(Rect const &bounds, short picture = 0, bool useImageSize = false) {
    gpicResRec record;
    record.kind = gpicResRec::kKind;
    record.bounds = bounds;
    record.useImageSize = useImageSize;
    record.pictureID = picture;
    return record;
}

class PictPaneTest : public PaneTest {
protected:
    PictPane *Made(gpicResRec record) { return new PictPane(glog, 4, &record); }
    PictPane *Empty() { return Made(Record(kBox)); }
    PictPane *From(TestItem &item) { return PictPane::NewPictPane(glog, item.Sheet()); }
    AutoPtr<tarn::image> NewImage() { return AutoPtr<tarn::image>(new TestImage(log)); }
    static constexpr Rect kBox = {20, 10, 60, 110};
    ImageLog log;
};

} // namespace

// Creation

TEST_F(PictPaneTest, TakesItsBoxFromTheRecord) {
    PictPane *const pane = Made(Record(kBox, kWaveform));
    EXPECT_EQ(BoxOf(*pane), kBox);
    EXPECT_EQ(pane->GetID(), 4);
    EXPECT_EQ(pane->GetPictureID(), kWaveform);
}

TEST_F(PictPaneTest, ARecordWithoutAPictureMakesAnEmptyPane) {
    for (short picture : {short(0), short(-1)}) {
        PictPane *const pane = Made(Record(kBox, picture, true));
        EXPECT_EQ(BoxOf(*pane), kBox);
        EXPECT_EQ(pane->GetPictureID(), 0);
        Show();
        EXPECT_TRUE(DrawingOf(*pane).empty());
    }
}

TEST_F(PictPaneTest, IsAsLargeAsItsPictureIfTheRecordSaysSo) {
    EXPECT_EQ(BoxOf(*Made(Record(kBox, kWaveform, true))), (Rect{20, 10, 100, 250}));
    EXPECT_EQ(BoxOf(*Made(Record(kBox, kNoSuchPicture, true))), (Rect{20, 10, 20, 10}));
}

TEST_F(PictPaneTest, APictureAtTheEdgeOfThePlaneEndsThere) {
    EXPECT_EQ(BoxOf(*Made(Record({32700, 32700, 32710, 32710}, kWaveform, true))),
              (Rect{32700, 32700, 32767, 32767}));
}

TEST_F(PictPaneTest, ItsPicturesSizeIsItsNaturalOne) {
    Show();
    PictPane *const pane = Made(Record(kBox, kWaveform, true));
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 9);
    Rect box{0, 0, 200, 320};
    group->SetBox(&box);
    group->SetUseLayout(true);
    group->Add(pane, -1);
    UpdateGlog(glog);
    EXPECT_EQ(pane->GetDrawRectangle().right - pane->GetDrawRectangle().left, 240);
    pane->SetPngImage(kKeyboard);
    UpdateGlog(glog);
    Rect const place = pane->GetDrawRectangle();
    EXPECT_EQ(place.right - place.left, 296);
    EXPECT_EQ(place.bottom - place.top, 86);
}

TEST_F(PictPaneTest, ASheetNamesThePicture) {
    TestItem item;
    PictPane *const pane = From(
        item.Box("BoundsRect", kBox).String("ResIDName", "kKeyboardPicture").Integer("PicUseImageSize", 2));
    EXPECT_EQ(pane->GetID(), 0);
    EXPECT_EQ(pane->GetPictureID(), kKeyboard);
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 106, 306}));
}

TEST_F(PictPaneTest, ASheetWithoutKeysMakesAnEmptyPane) {
    TestItem item;
    PictPane *const pane = From(item);
    EXPECT_EQ(BoxOf(*pane), (Rect{0, 0, 0, 0}));
    EXPECT_EQ(pane->GetPictureID(), 0);
}

TEST_F(PictPaneTest, WithoutAGlogThereIsAFailure) {
    TestItem item;
    EXPECT_THROW(PictPane::NewPictPane(nullptr, item.Sheet()), TarnError);
}

// Drawing

TEST_F(PictPaneTest, StretchesItsPictureToItsBox) {
    PictPane *const pane = Made(Record(kBox, kWaveform));
    Show();
    EXPECT_EQ(Only("PngImage::Draw", DrawingOf(*pane)),
              Traced(*pane, [] { PngImage(kWaveform).Draw(kBox); }));
}

TEST_F(PictPaneTest, ANumberWithoutAPictureShowsNothing) {
    PictPane *const pane = Made(Record(kBox, kNoSuchPicture));
    Show();
    EXPECT_EQ(pane->GetPictureID(), kNoSuchPicture);
    EXPECT_EQ(Only("PngImage::Draw", DrawingOf(*pane)).size(), 1u) << "the image itself knows";
}

TEST_F(PictPaneTest, DrawsWithinTheRegionAndItsClip) {
    PictPane *const pane = Empty();
    pane->SetImage(NewImage());
    OSRgn clip(Rect{30, 20, 50, 40});
    pane->SetClipRegion(&clip);
    Show();
    OSRgn update(Rect{0, 0, 40, 200});
    Lines const drawn = Traced(*pane, [&] { (pane->*&Opened<PictPane>::DrawGuts)(&update); });
    EXPECT_EQ(Only("NarrowClip", drawn), Traced(*pane, [&] {
                  VelaDrawing::NarrowClip(&update);
                  VelaDrawing::NarrowClip(&clip);
              }));
    EXPECT_EQ(log.drawn.back(), kBox);
}

TEST_F(PictPaneTest, KeepsACopyOfItsClip) {
    PictPane *const pane = Empty();
    pane->SetImage(NewImage());
    {
        OSRgn clip(Rect{30, 20, 50, 40});
        pane->SetClipRegion(&clip);
    }
    Show();
    EXPECT_EQ(Only("NarrowClip", DrawingOf(*pane)).size(), 2u);
    pane->SetClipRegion(nullptr);
    EXPECT_EQ(Only("NarrowClip", DrawingOf(*pane)).size(), 1u);
}

TEST_F(PictPaneTest, IsDrawnInItsOwnPortAndNotAtAllWithoutAnImage) {
    PictPane *const pane = Empty();
    Show();
    LeaveForAnotherPort();
    (pane->*&Opened<PictPane>::DrawGuts)(nullptr);
    EXPECT_FALSE(IsInItsPort());
    pane->SetImageNoUpdate(NewImage());
    (pane->*&Opened<PictPane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(PictPaneTest, WhatIsDrawnAfterwardsIsNotClipped) {
    PictPane *const pane = Empty();
    pane->SetImage(NewImage());
    OSRgn clip(Rect{30, 20, 50, 40});
    pane->SetClipRegion(&clip);
    Show();
    DrawingOf(*pane);
    pane->Prepare();
    OSRgn after;
    VelaDrawing::GetClip(&after);
    Rect const bounds = CarbonUtils::GetRgnBounds(&after);
    EXPECT_GT(bounds.right, 40);
}

// Images

TEST_F(PictPaneTest, AnotherImageIsRepainted) {
    PictPane *const pane = Empty();
    Show();
    pane->SetImage(NewImage());
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
    EXPECT_EQ(log.drawn, std::vector<Rect>{kBox});
    pane->SetPngImage(kWaveform);
    EXPECT_EQ(pane->GetPictureID(), kWaveform);
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
    pane->SetImage(NewImage());
    EXPECT_EQ(pane->GetPictureID(), 0);
}

TEST_F(PictPaneTest, AnotherImageMakesItsPortTheCurrentOneUnlessItOnlyStores) {
    PictPane *const pane = Empty();
    Show();
    LeaveForAnotherPort();
    pane->SetImageNoUpdate(NewImage());
    pane->SetPngImageNoUpdate(kWaveform);
    EXPECT_FALSE(IsInItsPort());
    pane->SetImage(NewImage());
    EXPECT_TRUE(IsInItsPort());
    LeaveForAnotherPort();
    pane->SetPngImage(kWaveform);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(PictPaneTest, WithoutUpdateAnotherImageOnlyStores) {
    PictPane *const pane = Empty();
    Show();
    pane->SetImageNoUpdate(NewImage());
    pane->SetPngImageNoUpdate(kWaveform);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(PictPaneTest, TheImageBeforeIsDeleted) {
    PictPane *const pane = Empty();
    pane->SetImage(NewImage());
    EXPECT_EQ(log.deleted, 0);
    pane->SetImage(NewImage());
    EXPECT_EQ(log.deleted, 1);
    pane->SetImage(AutoPtr<tarn::image>());
    EXPECT_EQ(log.deleted, 2);
    Show();
    EXPECT_TRUE(DrawingOf(*pane).empty()) << "null clears it";
}

TEST_F(PictPaneTest, TheSameImageAgainIsKept) {
    PictPane *const pane = Empty();
    TestImage *const image = new TestImage(log);
    pane->SetImage(AutoPtr<tarn::image>(image));
    pane->SetImageNoUpdate(AutoPtr<tarn::image>(image));
    EXPECT_EQ(log.deleted, 0);
    delete pane;
    EXPECT_EQ(log.deleted, 1);
}

TEST_F(PictPaneTest, ResizesToItsImage) {
    PictPane *const pane = Empty();
    pane->ResizeToPic();
    EXPECT_EQ(BoxOf(*pane), kBox) << "there is none";
    pane->SetImage(NewImage());
    EXPECT_EQ(BoxOf(*pane), kBox);
    pane->ResizeToPic();
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 50, 50}));
}

TEST_F(PictPaneTest, APaneAsLargeAsItsPictureTakesTheNextOnesSize) {
    PictPane *const pane = Made(Record(kBox, kWaveform, true));
    pane->SetPngImageNoUpdate(kKeyboard);
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 106, 306}));
}

TEST_F(PictPaneTest, AnotherThemeShowsItsOwnPicture) {
    PictPane *const pane = Made(Record({0, 0, 80, 240}, kWaveform));
    Show();
    desktop.SetTheme("dark");
    EXPECT_FALSE(Repainted().empty());
    EXPECT_FALSE(Only("PngImage::Draw", DrawingOf(*pane)).empty());
}

// Help tags

TEST_F(PictPaneTest, PartsHaveHelpTagsOfTheirOwn) {
    PictPane *const pane = Empty();
    LocalizedStrings::HelpTagMgr &tags = LocalizedStrings::HelpTagMgr::Instance();
    LocalizedStrings::HelpTag const *const left = tags.DemandHelpTag("kZoom", "kHZoomIn");
    LocalizedStrings::HelpTag const *const right = tags.DemandHelpTag("kZoom", "kHZoomOut");
    pane->SetHelpTag(tags.DemandHelpTag("kZoom", "kVZoomIn")); // of the pane as a whole
    pane->AttachHelpTag(left, {20, 10, 60, 50}, OS::Help::kPlacementForParts, 0.25);
    pane->AttachHelpTag(right, {20, 50, 60, 110}, OS::Help::kPlacementForParts, 0.75);
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect place;
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = 0;
    ASSERT_TRUE(pane->GetHelpTagForPoint({30, 40}, tag, place, placement, delay));
    EXPECT_EQ(tag, left);
    EXPECT_EQ(place, (Rect{20, 10, 60, 50}));
    EXPECT_EQ(placement, OS::Help::kPlacementForParts);
    EXPECT_EQ(delay, 0.25);
    ASSERT_TRUE(pane->GetHelpTagForPoint({30, 60}, tag, place, placement, delay));
    EXPECT_EQ(tag, right);
    pane->ClearHelpTags();
    EXPECT_FALSE(pane->GetHelpTagForPoint({30, 40}, tag, place, placement, delay));
}

TEST_F(PictPaneTest, ClearingRemovesTheTagOfTheWholePane) {
    PictPane *const pane = Empty();
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kVZoomIn"));
    pane->ClearHelpTags();
    ASSERT_NE(pane->GetHelpTagHelper(), nullptr);
    EXPECT_FALSE(pane->GetHelpTagHelper()->IsDefaultHelper());
}

// Clicks

TEST_F(PictPaneTest, AClickIsToldAndGivesOne) {
    PictPane *const pane = Empty();
    Show();
    ClickEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click 30 40"), 1);
    EXPECT_EQ(ear.where, std::vector<Point>{(Point{40, 30})});
}

TEST_F(PictPaneTest, AClickThatNobodyHearsGivesOne) {
    Empty();
    Show();
    EXPECT_EQ(ResultOfClick("click 30 40"), 1);
}

TEST_F(PictPaneTest, ClicksMayGoThrough) {
    TestItem item;
    PictPane *const pane = From(item.Box("BoundsRect", kBox).Integer("PicAllowClickThrough", 1));
    Show();
    ClickEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click 30 40"), 0);
    EXPECT_TRUE(ear.where.empty());
}

TEST_F(PictPaneTest, AClickThatGoesThroughReachesWhatIsBelow) {
    for (bool inContainer : {false, true}) {
        gpicResRec record = Record(kBox);
        PictPane *const below = new PictPane(glog, 1, &record);
        TestItem item;
        PictPane *const above = From(item.Box("BoundsRect", kBox).Integer("PicAllowClickThrough", 1));
        if (inContainer) {
            CompoundPane *const group = new CompoundPane;
            group->CompoundPaneInit(glog, 9);
            Rect all{0, 0, 200, 320};
            group->SetBox(&all);
            group->Add(below, -1);
            group->Add(above, -1);
        }
        Show();
        ClickEar const ear(below);
        desktop.Play("click 30 40");
        EXPECT_EQ(ear.where, std::vector<Point>{(Point{40, 30})}) << (inContainer ? "in a container" : "");
        if (!inContainer) {
            delete above;
            delete below;
        }
    }
}

TEST_F(PictPaneTest, MayBeDeletedByWhoHearsOfAClick) {
    PictPane *const pane = Empty();
    Show();
    PaneWatch const watch(pane);
    ClickEar ear(pane);
    ear.then = [&] { delete pane; };
    desktop.Play("click 30 40");
    EXPECT_FALSE(watch.PaneExists());
}
