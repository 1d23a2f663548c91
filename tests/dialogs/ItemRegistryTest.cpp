// Item types of a program's own.
#include "dialogs/ItemRegistry.h"
#include "dialogs/GroupPane.h"
#include "dialogs/NearestName.h"
#include "dialogs/RecordBytes.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "tests/dialogs/DialogTest.h"
#include <stdexcept>

namespace {

int const kMeterKind = 77;

// A program's own pane.
class MeterPane : public GlogPane {
public:
    MeterPane(glogRec *owner, int level_)
        : level(level_) {
        GlogPaneInit(owner, 0);
    }
    int level;
    boost::shared_ptr<XMLLib::ContainerItem> keys;

protected:
    void DrawGuts(OSRgn *) override {}
};

GlogPane *MakeMeter(glogRec *glog, GlogStyleSheet *sheet) {
    MeterPane *const pane = new MeterPane(glog, sheet->GetSInt32ItemValue(ResourceKey("Level")));
    pane->keys = sheet->GetItemRes();
    return pane;
}

class ProgramsItem : public DialogTest {
protected:
    ProgramsItem() {
        ItemRegistry::Instance().Add(
            ItemType("Meter")
                .Keys(KeyList()
                          .Integer("Level", -60, 6)
                          .Required()
                          .Container("Marks", KeyList().Integer("Mark", 0, 9).Repeated())
                          .Anything("More"))
                .MadeBy(MakeMeter)
                .FromRecord(kMeterKind, ItemType::kWholeKind,
                            [](glogRec *glog, RecordBytes &bytes) -> GlogPane * {
                                bytes.Short();
                                return new MeterPane(glog, bytes.Short());
                            })
                .ReportedBy([this](GlogPane *pane) { reported = pane; }));
    }
    MeterPane *LoadMeter(std::string const &more = std::string()) {
        return LoadOne<MeterPane>("Meter", "<Level>-12</Level>" + more);
    }
    static boost::shared_ptr<XMLLib::ContainerItem> Inside(boost::shared_ptr<XMLLib::ContainerItem> item,
                                                           char const *key) {
        return item->GetContainerItem(ResourceKey(key));
    }

    GlogPane *reported = nullptr;
};

TEST_F(ProgramsItem, IsMadeByItsMaker) { EXPECT_EQ(LoadMeter()->level, -12); }

TEST_F(ProgramsItem, HasTheKeysThatEveryItemHas) {
    EXPECT_FALSE(LoadMeter("<Visible>0</Visible>")->GetVisibility());
}

TEST_F(ProgramsItem, IsCheckedAgainstItsKeys) {
    EXPECT_EQ(ComplaintAboutItem("Meter", "<Level>7</Level>"),
              "test.xml:1:65: item 1 (Meter): key Level: expected an integer from -60 to 6, found 7");
    EXPECT_EQ(ComplaintAboutItem("Meter", ""), "test.xml:1:39: item 1 (Meter): <Level> is missing");
    EXPECT_TRUE(Holds(ComplaintAboutItem("Metre", ""), "did you mean Meter?"));
}

TEST_F(ProgramsItem, MayRepeatAKeyThatMayBeRepeated) {
    MeterPane *const pane = LoadMeter("<Marks><Mark>1</Mark><Mark>5</Mark></Marks>");
    EXPECT_EQ(Inside(pane->keys, "Marks")->GetNumItems(), 2u);
}

TEST_F(ProgramsItem, MayHoldAnythingUnderAFreeKey) {
    MeterPane *const pane =
        LoadMeter("<More><Count>12</Count><Name>Peak</Name><Digits type=\"string\">42</Digits>"
                  "<Far type=\"integer\">-9000000000</Far>"
                  "<Box top=\"1\" left=\"2\" bottom=\"3\" right=\"4\"/><Spot v=\"5\" h=\"6\"/>"
                  "<Inner><Deep>1</Deep></Inner></More>");
    boost::shared_ptr<XMLLib::ContainerItem> const more = Inside(pane->keys, "More");
    ASSERT_TRUE(more);
    EXPECT_EQ(more->GetSIntItemValue(ResourceKey("Count")), 12);
    EXPECT_EQ(Utf8::FromUString(more->GetUStringItemValue(ResourceKey("Name"))), "Peak");
    EXPECT_EQ(Utf8::FromUString(more->GetUStringItemValue(ResourceKey("Digits"))), "42");
    EXPECT_EQ(more->GetSIntItemValue(ResourceKey("Far")), -9000000000LL);
    EXPECT_EQ(XMLLib::GetRect(more, ResourceKey("Box")), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(XMLLib::GetPoint(more, ResourceKey("Spot")).v, 5);
    EXPECT_EQ(XMLLib::GetPoint(more, ResourceKey("Spot")).h, 6);
    EXPECT_EQ(Inside(more, "Inner")->GetSIntItemValue(ResourceKey("Deep")), 1);
}

TEST_F(ProgramsItem, IsCheckedUnderAFreeKeyToo) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Meter", "<Level>0</Level><More><A type=\"integer\">x</A></More>"),
                      "key More/A: expected an integer, found \"x\""));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Meter", "<Level>0</Level><More><A type=\"float\">1</A></More>"),
                      "key More/A: expected the type \"integer\" or \"string\", found \"float\""));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Meter", "<Level>0</Level><More>a<B/></More>"),
                      "key More: <More> may hold no text"));
}

TEST_F(ProgramsItem, MayComeFromARecord) {
    std::string const bytes("GLOGREC1\x40\x00\x40\x00\x01\x00\x04\x00\x4D\x00\x03\x00", 20);
    glogRec *const glog = LoadGlogFromRecords(bytes.data(), bytes.size());
    MeterPane *const pane = dynamic_cast<MeterPane *>(GetGlogItem(glog, 1));
    ASSERT_NE(pane, nullptr);
    EXPECT_EQ(pane->level, 3);
    EXPECT_EQ(reported, pane);
}

TEST_F(ProgramsItem, IsReported) {
    GlogPane *const pane = LoadMeter();
    EXPECT_EQ(reported, pane);
}

TEST_F(ProgramsItem, HoldsItemsOnlyIfItsPaneDoes) {
    ItemRegistry::Instance().Add(
        ItemType("Liar")
            .MadeBy([](glogRec *glog, GlogStyleSheet *) -> GlogPane * { return new MeterPane(glog, 0); })
            .HoldsItems());
    EXPECT_EQ(ComplaintAboutItem("Liar", "<Items><Item type=\"Spacer\"/></Items>"),
              "test.xml:1:39: item 1 (Liar): panes of this type hold no items");
    EXPECT_EQ(ComplaintAboutItem("Liar", "<Items/>"), "no complaint");
}

TEST_F(ProgramsItem, MayReplaceAStockType) {
    ItemType const stock = *ItemRegistry::Instance().Find("Spacer");
    ItemRegistry::Instance().Add(ItemType("Spacer").MadeBy(
        [](glogRec *glog, GlogStyleSheet *) -> GlogPane * { return new MeterPane(glog, 5); }));
    EXPECT_EQ(LoadOne<MeterPane>("Spacer", "")->level, 5);
    ItemRegistry::Instance().Add(stock);
}

TEST_F(ProgramsItem, MustBeComplete) {
    EXPECT_THROW(ItemRegistry::Instance().Add(ItemType("").MadeBy(MakeMeter)), std::invalid_argument);
    EXPECT_THROW(ItemRegistry::Instance().Add(ItemType("Unmade")), std::invalid_argument);
    EXPECT_THROW(
        ItemRegistry::Instance().Add(ItemType("Twice").Keys(KeyList().Flag("Visible")).MadeBy(MakeMeter)),
        std::invalid_argument);
    EXPECT_EQ(ItemRegistry::Instance().Find("Unmade"), nullptr);
}

TEST_F(ProgramsItem, MustNotTakeTheRecordsOfAnother) {
    auto const maker = [](glogRec *, RecordBytes &) -> GlogPane * { return nullptr; };
    EXPECT_THROW(ItemRegistry::Instance().Add(
                     ItemType("Thief").MadeBy(MakeMeter).FromRecord(18, ItemType::kLowByte, maker)),
                 std::invalid_argument);
}

TEST(ItemNames, AreNearInSpiteOfCaseAndSlips) {
    std::vector<std::string> const names = {"OvalButton", "StudButton", "Label", "id"};
    EXPECT_EQ(NearestName::Of("ovalbutton", names), "OvalButton");
    EXPECT_EQ(NearestName::Of("OvlaButton", names), "OvalButton");
    EXPECT_EQ(NearestName::Of("Lable", names), "Label");
    EXPECT_EQ(NearestName::Of("idd", names), "id");
}

TEST(ItemNames, AreNotNearWhenNothingIsAlike) {
    std::vector<std::string> const names = {"OvalButton", "Label"};
    EXPECT_EQ(NearestName::Of("Zeppelin", names), "");
    EXPECT_EQ(NearestName::Of("", names), "");
    EXPECT_EQ(NearestName::Of(std::string(100000, 'x'), names), "");
}

TEST(ItemNames, AreAllTheHintWhenNothingIsAlike) {
    EXPECT_EQ(NearestName::Hint("Zeppelin", {"OvalButton", "Label"}), "; possible: OvalButton, Label");
    EXPECT_EQ(NearestName::Hint("Zeppelin", {}), "");
}

} // namespace
