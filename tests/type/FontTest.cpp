#include "desktop/resources/Resources.h"
#include "desktop/type/FontFamilies.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/FontTable.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/resources/Text.h"
#include "tests/type/Canvas.h"
#include <gtest/gtest.h>

namespace {

FontSpec Plain(int size) { return FontSpec::Make(0, 0, size); }

TEST(FamilyID, IsTheDialogFamilyAtFirst) {
    OS::Font::FamilyID const family;
    EXPECT_EQ(family.GetOrderedFontID(), OS::Font::FamilyID(OS::Font::kFixedFontFamily0).GetOrderedFontID());
    EXPECT_EQ(FontFamilies::NameOf(family), "Roboto");
}

TEST(FamilyID, HasEqualNumbersExactlyForEqualFamilies) {
    OS::Font::FamilyID const a = FontFamilies::Named("Family A"), b = FontFamilies::Named("Family B");
    EXPECT_EQ(a.GetOrderedFontID(), FontFamilies::Named("Family A").GetOrderedFontID());
    EXPECT_NE(a.GetOrderedFontID(), b.GetOrderedFontID());
    EXPECT_NE(a.GetOrderedFontID(), OS::Font::FamilyID().GetOrderedFontID());
    EXPECT_EQ(FontFamilies::Named("Roboto").GetOrderedFontID(), OS::Font::FamilyID().GetOrderedFontID());
}

TEST(FamilyID, IsCopiedAsAValue) {
    OS::Font::FamilyID const named = FontFamilies::Named("Family A");
    OS::Font::FamilyID copy(named), assigned;
    assigned = named;
    EXPECT_EQ(copy.GetOrderedFontID(), named.GetOrderedFontID());
    EXPECT_EQ(assigned.GetOrderedFontID(), named.GetOrderedFontID());
    assigned = OS::Font::kFixedFontFamily0;
    EXPECT_EQ(assigned.GetOrderedFontID(), 0u);
}

TEST(FontFamilies, KnowTheirNames) {
    EXPECT_EQ(FontFamilies::NameOf(FontFamilies::Named("Family C")), "Family C");
    EXPECT_EQ(FontFamilies::NameOf(FontFamilies::Named("Family C").GetOrderedFontID()), "Family C");
    EXPECT_EQ(FontFamilies::NameOf(999999u), "Roboto");
}

TEST(FontTable, HasTheIndicesThatResourcesName) {
    for (int index = 0; index <= 9; ++index) {
        fontSaveRec const *font = GetIndVelaFont(index);
        ASSERT_NE(font, nullptr);
        EXPECT_GT(font->size, 0) << index;
    }
}

TEST(FontTable, OtherIndicesGiveTheFirstFont) {
    EXPECT_EQ(GetIndVelaFont(-1), GetIndVelaFont(0));
    EXPECT_EQ(GetIndVelaFont(100000), GetIndVelaFont(0));
}

TEST(FontTable, ReadsFamiliesSizesAndStyles) {
    XmlFile const file = XmlFile::Parse(
        "<fonts directory='/there'><file name='a.ttf'/><file name='b.ttf' style='bold condensed'/>"
        "<font index='3' family='F' size='11' style='bold italic underline'/></fonts>",
        "fonts.xml");
    FontTable table;
    table.Read(file);
    ASSERT_EQ(table.Files().size(), 2u);
    EXPECT_EQ(table.Files()[0].path, "/there/a.ttf");
    EXPECT_EQ(table.Files()[0].face, 0);
    EXPECT_EQ(table.Files()[1].face, 33);
    FontTable::Entry const &entry = table.Entries().at(3);
    EXPECT_EQ(entry.family, "F");
    EXPECT_EQ(entry.size, 11);
    EXPECT_EQ(entry.face, 7);
}

TEST(FontTable, RefusesWhatItDoesNotKnow) {
    for (char const *text :
         {"<font/>", "<fonts><fnt/></fonts>", "<fonts><font index='-1' family='F' size='11'/></fonts>",
          "<fonts><font index='1' family='F' size='0'/></fonts>",
          "<fonts><font index='1' family='F' size='9999'/></fonts>",
          "<fonts><font index='1' size='11'/></fonts>", "<fonts><file/></fonts>",
          "<fonts><font index='1' family='F' size='11' style='medium'/></fonts>"}) {
        FontTable table;
        EXPECT_THROW(table.Read(XmlFile::Parse(text, "fonts.xml")), XmlError) << text;
    }
}

class ReplacedFonts : public testing::Test {
protected:
    ~ReplacedFonts() override { Resources::Instance().Open(Resources::FindDirectory()); }
    TemporaryDirectory directory;
};

TEST_F(ReplacedFonts, KeepTheRecordsWhereTheyWere) {
    fontSaveRec const *font = GetIndVelaFont(1);
    short const size = font->size;
    directory.Write("fonts.xml", "<fonts><font index='1' family='Other' size='33' style='bold'/></fonts>");
    Resources::Instance().AddDirectory(directory.Path());
    EXPECT_EQ(GetIndVelaFont(1), font);
    EXPECT_EQ(font->size, 33);
    EXPECT_EQ(font->face, 1);
    EXPECT_EQ(FontFamilies::NameOf(font->family), "Other");
    Resources::Instance().Open(Resources::FindDirectory());
    GetIndVelaFont(0);
    EXPECT_EQ(font->size, size);
}

TEST_F(ReplacedFonts, WithoutAFileHavePlainEntries) {
    Resources::Instance().Open(directory.Path());
    EXPECT_EQ(GetIndVelaFont(9)->size, 12);
    EXPECT_EQ(GetIndVelaFont(9)->face, 0);
}

TEST_F(ReplacedFonts, WithoutFontFilesUseTheSystems) {
    directory.Write("fonts.xml", "<fonts><file name='none.ttf'/></fonts>");
    Resources::Instance().Open(directory.Path());
    EXPECT_GT(LooseStringWidth(U("still text"), 0, 1), 20);
}

TEST_F(ReplacedFonts, ABrokenTableIsAnError) {
    directory.Write("fonts.xml", "<fonts>");
    Resources::Instance().Open(directory.Path());
    EXPECT_THROW(GetIndVelaFont(0), ResourceError);
}

TEST(SetFontData, SetsFamilyFaceAndSizeOfThePort) {
    Canvas canvas(10, 10);
    fontSaveRec const font = {FontFamilies::Named("Family A"), 33, 17};
    SetFontData(&font);
    EXPECT_EQ(VelaDrawing::GetPortTextFont(&canvas.Port()).GetOrderedFontID(),
              font.family.GetOrderedFontID());
    EXPECT_EQ(VelaDrawing::GetPortTextFace(&canvas.Port()), 33);
    EXPECT_EQ(VelaDrawing::GetPortTextSize(&canvas.Port()), 17);
}

TEST(SetFontData, IsKeptWithoutAPortForMeasuring) {
    ASSERT_EQ(DrawingPort::CurrentPort(), nullptr);
    fontSaveRec font = *GetIndVelaFont(0);
    font.size = 40;
    SetFontData(&font);
    int const large = LooseStringWidth(U("measure"), 0, 1);
    SetFontData(GetIndVelaFont(0));
    EXPECT_GT(large, 2 * LooseStringWidth(U("measure"), 0, 1));
}

TEST(GetFontInfo, GivesWholeMeasuresOfThePortsFont) {
    Canvas canvas(10, 10);
    VelaDrawing::TextSize(12);
    TarnQuickDrawText::FontInfo small, large, same;
    tarn::GetFontInfo(small);
    EXPECT_EQ(small.ascent, 12);
    EXPECT_EQ(small.descent, 3);
    EXPECT_EQ(small.leading, 0);
    EXPECT_GT(small.widMax, 11);
    VelaDrawing::TextSize(24);
    tarn::GetFontInfo(large);
    EXPECT_GT(large.ascent, small.ascent);
    EXPECT_GT(large.descent, small.descent);
    VelaDrawing::GetFontInfo(&same);
    EXPECT_EQ(same.ascent, large.ascent);
    EXPECT_EQ(same.widMax, large.widMax);
}

TEST(FontLibrary, MeasuresSizesBeyondItsRangeAsTheNearest) {
    EXPECT_EQ(FontSpec::Make(0, 0, -5).size, FontSpec::kSmallestSize);
    EXPECT_EQ(FontSpec::Make(0, 0, 32767).size, FontSpec::kLargestSize);
    EXPECT_GT(FontLibrary::Instance().Metrics(Plain(-5)).LineHeight(), 0);
}

TEST(FontLibrary, TellsFacesApart) {
    Canvas canvas(10, 10);
    VelaDrawing::TextSize(40); // large enough for whole pixels not to matter
    auto const widthOf = [](short face) {
        VelaDrawing::TextFace(face);
        return LooseStringWidth(U("Hamburgefonstiv Hamburgefonstiv"), 0, 1);
    };
    int const plain = widthOf(0), bold = widthOf(FontFace::kBold), condensed = widthOf(FontFace::kCondensed);
    EXPECT_GT(bold, plain);
    EXPECT_LT(condensed, plain * 95 / 100);
    EXPECT_GT(widthOf(FontFace::kCondensed | FontFace::kBold), condensed);
    EXPECT_EQ(widthOf(FontFace::kUnderline), plain);
}

TEST(FontLibrary, StandsInForUnknownFamilies) {
    Canvas canvas(10, 10);
    int const known = LooseStringWidth(U("Same"), 0, 1);
    VelaDrawing::TextFont(FontFamilies::Named("No Such Family"));
    EXPECT_EQ(LooseStringWidth(U("Same"), 0, 1), known);
}

TEST(FontLibrary, AddsTheSystemsFontsOnceAndKeepsItsOwnLooks) {
    Canvas canvas(300, 30);
    DrawStringAtPoint(U("Looks as before"), Point{20, 5}, -1, TextSettings::kTruncateNone);
    std::vector<std::uint32_t> const before = canvas.Copy();
    FontLibrary::Instance().AddSystemFonts();
    EXPECT_FALSE(FontLibrary::Instance().AddSystemFonts());
    canvas.Erase();
    DrawStringAtPoint(U("Looks as before"), Point{20, 5}, -1, TextSettings::kTruncateNone);
    EXPECT_EQ(canvas.Copy(), before);
}

} // namespace
