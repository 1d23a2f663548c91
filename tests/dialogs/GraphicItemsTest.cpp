#include "graphics/GLinePane.h"
#include "graphics/ProgressBarPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/dialogs/OneRecord.h"

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"30\" right=\"140\"/>";

class GraphicItemsTest : public DialogTest {};

} // namespace

// Progress bars

TEST_F(GraphicItemsTest, AProgressBarStandsWhereItIsTold) {
    EXPECT_EQ(BoxOf(LoadOne<ProgressBarPane>("ProgressBar", kPlace)), (Rect{10, 20, 30, 140}));
    EXPECT_EQ(BoxOf(LoadOne<ProgressBarPane>("ProgressBar", "")), (Rect{0, 0, 0, 0}));
}

TEST_F(GraphicItemsTest, AProgressBarTellsHowFarItIs) {
    ProgressBarPane *const bar =
        LoadOne<ProgressBarPane>("ProgressBar", kPlace + "<Value>1</Value><Maximum>4</Maximum>");
    EXPECT_TRUE(Holds(Dump(bar->GetGlog()), "\"showsProgress\":true,\"percent\":25")) << Dump(bar->GetGlog());
    EXPECT_TRUE(
        Holds(Dump(LoadOne<ProgressBarPane>("ProgressBar", kPlace)->GetGlog()), "\"showsProgress\":false"));
}

TEST_F(GraphicItemsTest, AProgressBarRefusesNumbersBelowZero) {
    EXPECT_NE(ComplaintAboutItem("ProgressBar", "<Value>-1</Value>"), "no complaint");
    EXPECT_NE(ComplaintAboutItem("ProgressBar", "<Maximum>-1</Maximum>"), "no complaint");
}

// Lines

TEST_F(GraphicItemsTest, ALinesEndsMayStandInAnyOrder) {
    EXPECT_EQ(
        BoxOf(LoadOne<GLinePane>("Line", "<BoundsRect top=\"50\" left=\"140\" bottom=\"50\" right=\"20\"/>")),
        (Rect{50, 20, 53, 141}));
    EXPECT_EQ(
        BoxOf(LoadOne<GLinePane>("Line", "<BoundsRect top=\"90\" left=\"20\" bottom=\"50\" right=\"20\"/>")),
        (Rect{50, 20, 91, 23}));
}

TEST_F(GraphicItemsTest, ALineIsNotLongerThanThePlane) {
    EXPECT_TRUE(Holds(
        ComplaintAboutItem("Line", "<BoundsRect top=\"0\" left=\"30000\" bottom=\"0\" right=\"-30000\"/>"),
        "a side is longer than 32767 pixels"));
}

TEST_F(GraphicItemsTest, ARecordMakesALine) {
    GLinePane *const line = dynamic_cast<GLinePane *>(GetGlogItem(LoadOneRecord({11, 10, 20, 10, 140}), 1));
    ASSERT_NE(line, nullptr);
    EXPECT_EQ(BoxOf(line), (Rect{10, 20, 13, 141}));
    EXPECT_NE(Complaint([&] { LoadOneRecord({11, 10, 20, 10}); }), "no complaint");
    EXPECT_NE(Complaint([&] { LoadOneRecord({11, 10, 20, 10, 140, 0}); }), "no complaint");
}
