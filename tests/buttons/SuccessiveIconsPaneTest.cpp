#include "buttons/SuccessiveIconsPane.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"

namespace {

short const kFamily = 2000;
Rect const kBox = {20, 10, 36, 50};

class SuccessiveIcons : public PaneTest {
protected:
    SuccessiveIconsPane *New(int width, Rect box = kBox) {
        return new SuccessiveIconsPane(glog, box, kFamily, 3, width);
    }
    Lines IconsOf(SuccessiveIconsPane &pane) { return Only("Draw1Icon", DrawingOf(pane)); }
};

} // namespace

TEST_F(SuccessiveIcons, ItsRecordHasTwentyFourBytes) { EXPECT_EQ(sizeof(SuccessiveIconsResRec), 24u); }

TEST_F(SuccessiveIcons, AddsItsOperationAfterThoseOfAPane) {
    class Added : public GlogPane {
    public:
        virtual void First() {}
        void DrawGuts(OSRgn *) override {}
    };
    EXPECT_EQ(PlaceOf(&SuccessiveIconsPane::GetIconData), PlaceOf(&Added::First));
}

TEST_F(SuccessiveIcons, TellsWhatItDraws) {
    int family = 0, baseIcon = 0, width = 0;
    New(20)->GetIconData(family, baseIcon, width);
    EXPECT_EQ(family, kFamily);
    EXPECT_EQ(baseIcon, 3);
    EXPECT_EQ(width, 20);
}

TEST_F(SuccessiveIcons, DrawsIconAfterIconSideBySide) {
    SuccessiveIconsPane *const pane = New(20);
    EXPECT_EQ(IconsOf(*pane), Traced(*pane, [] {
                  Draw1Icon(kFamily, 3, 10, 20);
                  Draw1Icon(kFamily, 4, 30, 20);
              }));
}

TEST_F(SuccessiveIcons, TheLastIconIsCutByTheClipAlone) {
    SuccessiveIconsPane *const pane = New(25);
    EXPECT_EQ(IconsOf(*pane), Traced(*pane, [] {
                  Draw1Icon(kFamily, 3, 10, 20);
                  Draw1Icon(kFamily, 4, 35, 20);
              }));
}

TEST_F(SuccessiveIcons, AnEmptyBoxDrawsNothing) {
    EXPECT_TRUE(IconsOf(*New(20, Rect{20, 10, 36, 10})).empty());
}

TEST_F(SuccessiveIcons, TheLargestNumbersEndToo) {
    Rect const wide = {0, 0, 16, 32767};
    EXPECT_EQ(IconsOf(*New(32767, wide)).size(), 1u);
    EXPECT_EQ(IconsOf(*New(32766, wide)).size(), 2u);
}

TEST_F(SuccessiveIcons, NothingOutsideOfTheUpdateIsDrawn) {
    New(20);
    Show();
    SetPortToGlog(glog);
    Rect const part = {22, 12, 30, 20};
    VelaDrawing::InvalRect(&part);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{part}));
}

TEST_F(SuccessiveIcons, NarrowsTheClipToWhatIsUpdated) {
    SuccessiveIconsPane *const pane = New(20);
    OSRgn region(Rect{20, 10, 36, 20});
    Lines const drawn = Traced(*pane, [&] { (pane->*&Opened<SuccessiveIconsPane>::DrawGuts)(&region); });
    EXPECT_EQ(Only("NarrowClip", drawn), Traced(*pane, [&] { VelaDrawing::NarrowClip(&region); }));
}

TEST_F(SuccessiveIcons, TakesNoClicks) {
    New(20);
    Show();
    EXPECT_EQ(ResultOfClick("click 15 25"), 0);
}

TEST_F(SuccessiveIcons, IsMadeFromARecord) {
    SuccessiveIconsResRec record = {SuccessiveIconsResRec::kKind, kBox, kFamily, 5, 20};
    SuccessiveIconsPane *const pane = new SuccessiveIconsPane(glog, &record);
    EXPECT_EQ(BoxOf(*pane), kBox);
    EXPECT_EQ(IconsOf(*pane), Traced(*pane, [] {
                  Draw1Icon(kFamily, 5, 10, 20);
                  Draw1Icon(kFamily, 6, 30, 20);
              }));
}

TEST_F(SuccessiveIcons, IsMadeFromAnItem) {
    TestItem item;
    item.Box("BoundsRect", kBox).String("FamilyID", "kTransportIcons").Integer("BaseIcon", 2);
    item.Integer("Width", 30);
    SuccessiveIconsPane *const pane = SuccessiveIconsPane::NewSuccessiveIconsPane(glog, item.Container());
    EXPECT_EQ(BoxOf(*pane), kBox);
    EXPECT_EQ(IconsOf(*pane), Traced(*pane, [] {
                  Draw1Icon(kFamily, 2, 10, 20);
                  Draw1Icon(kFamily, 3, 40, 20);
              }));
}

TEST_F(SuccessiveIcons, IsNotMadeWithoutAGlog) {
    EXPECT_EQ(SuccessiveIconsPane::NewSuccessiveIconsPane(nullptr, TestItem().Container()), nullptr);
    SuccessiveIconsPane lonely(nullptr, kBox, kFamily, 3, 20);
    EXPECT_EQ(lonely.GetGlog(), nullptr);
}

TEST_F(SuccessiveIcons, NoItemFailsAnAssertion) {
    EXPECT_THROW(
        SuccessiveIconsPane::NewSuccessiveIconsPane(glog, boost::shared_ptr<XMLLib::ContainerItem>()),
        BrokenInvariant);
}
