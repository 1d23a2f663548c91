#include "desktop/resources/Resources.h"
#include "desktop/resources/DefaultHelpTagHelper.h"
#include "desktop/resources/HelpTag.h"
#include "desktop/resources/XmlFile.h"
#include "host/EnumToStringMap.h"
#include "host/HelpTagHelper.h"
#include "host/LocalizedStrings.h"
#include "host/NamedColors.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/resources/Text.h"
#include <gtest/gtest.h>
#include <string>

namespace {

class ResourcesTest : public testing::Test {
protected:
    ResourcesTest() {
        directory.Write("strings/en.xml", "<strings><list number='4323'><string index='1'>OK</string>"
                                          "<string index='2'>Cancel</string></list></strings>");
        directory.Write("strings/de.xml",
                        "<strings><list number='4323'><string index='2'>Abbrechen</string></list></strings>");
        directory.Write("helptags/en.xml",
                        "<helptags><group name='kZoom'><tag key='kHZoomIn' title='Zoom'>Closer</tag>"
                        "</group></helptags>");
        directory.Write("helptags/de.xml",
                        "<helptags><group name='kZoom'><tag key='kHZoomIn'>N\xC3\xA4her</tag>"
                        "</group></helptags>");
        directory.Write("iconsets.xml", "<iconsets><iconset name='kNoteGlyphs' number='1821'/></iconsets>");
        directory.Write("pictures.xml", "<pictures><picture name='kLogo' number='-7'/></pictures>");
        Resources::Instance().Open(directory.Path());
        Resources::Instance().SetLanguage("en");
    }
    ~ResourcesTest() override {
        Resources::Instance().SetLanguage("en");
        Resources::Instance().Open(Resources::FindDirectory());
    }
    TemporaryDirectory directory;
};

TEST_F(ResourcesTest, OpeningWhatIsNoDirectoryFailsAndChangesNothing) {
    EXPECT_THROW(Resources::Instance().Open(directory.Path() + "/none"), ResourceError);
    EXPECT_EQ(Resources::Instance().Directory(), directory.Path());
}

TEST_F(ResourcesTest, FindsFilesInTheDirectory) {
    EXPECT_EQ(Resources::Instance().Find("iconsets.xml"), directory.Path() + "/iconsets.xml");
    EXPECT_EQ(Resources::Instance().Find("none.xml"), "");
}

TEST_F(ResourcesTest, AnAddedDirectoryGoesBefore) {
    TemporaryDirectory own;
    own.Write("strings/en.xml",
              "<strings><list number='4323'><string index='1'>Fine</string></list></strings>");
    Resources::Instance().AddDirectory(own.Path());
    EXPECT_EQ(LocalizedStrings::GetString(4323, 1), U("Fine"));
    EXPECT_EQ(LocalizedStrings::GetString(4323, 2), U("Cancel"));
    EXPECT_EQ(Resources::Instance().Find("strings/en.xml"), own.Path() + "/strings/en.xml");
    EXPECT_EQ(Resources::Instance().Find("iconsets.xml"), directory.Path() + "/iconsets.xml");
}

TEST_F(ResourcesTest, StringsComeFromTheirList) {
    EXPECT_EQ(LocalizedStrings::GetString(4323, 1), U("OK"));
    EXPECT_EQ(LocalizedStrings::GetString(4323, 2), U("Cancel"));
}

TEST_F(ResourcesTest, AbsentStringsAreEmpty) {
    EXPECT_TRUE(LocalizedStrings::GetString(4323, 99).empty());
    EXPECT_TRUE(LocalizedStrings::GetString(1, 1).empty());
    EXPECT_TRUE(LocalizedStrings::GetString(-1, -1).empty());
}

TEST_F(ResourcesTest, StringsFollowTheLanguageAndFallBackToEnglish) {
    Resources::Instance().SetLanguage("de");
    EXPECT_EQ(LocalizedStrings::GetString(4323, 2), U("Abbrechen"));
    EXPECT_EQ(LocalizedStrings::GetString(4323, 1), U("OK"));
    Resources::Instance().SetLanguage("fr");
    EXPECT_EQ(LocalizedStrings::GetString(4323, 2), U("Cancel"));
}

TEST_F(ResourcesTest, WhatIsNoLanguageCodeIsRefused) {
    for (char const *code : {"", "e", "EN", "eng", "../x"})
        EXPECT_THROW(Resources::Instance().SetLanguage(code), ResourceError) << code;
    EXPECT_EQ(Resources::Instance().Language(), "en");
}

TEST_F(ResourcesTest, ABrokenFileIsNamedWithItsLine) {
    std::string const path = directory.Write("strings/en.xml", "<strings>\n<list number='x'/></strings>");
    Resources::Instance().Open(directory.Path());
    try {
        LocalizedStrings::GetString(4323, 1);
        FAIL() << "no error";
    } catch (ResourceError const &error) {
        EXPECT_EQ(error.File(), path);
        EXPECT_EQ(error.Line(), 2);
        EXPECT_NE(error.Message().find("\"x\""), std::string::npos);
    }
    directory.Write("strings/en.xml",
                    "<strings><list number='4323'><string index='1'>Mended</string></list></strings>");
    EXPECT_EQ(LocalizedStrings::GetString(4323, 1), U("Mended"));
}

TEST_F(ResourcesTest, UnknownElementsAreMistakes) {
    directory.Write("strings/en.xml", "<strings><lists number='4323'/></strings>");
    Resources::Instance().Open(directory.Path());
    EXPECT_THROW(LocalizedStrings::GetString(4323, 1), XmlError);
    directory.Write("helptags/en.xml", "<helptags><group name='g'><tags key='k'/></group></helptags>");
    Resources::Instance().Open(directory.Path());
    EXPECT_THROW(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("g", "k"), XmlError);
}

TEST_F(ResourcesTest, MissingFilesHaveNothingInThem) {
    TemporaryDirectory const empty;
    Resources::Instance().Open(empty.Path());
    EXPECT_TRUE(LocalizedStrings::GetString(4323, 1).empty());
    EXPECT_EQ(ISetIDMapper::Instance().GetID(U("kNoteGlyphs")), 0);
    EXPECT_EQ(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomOut"), nullptr);
}

TEST_F(ResourcesTest, NamesOfIconSetsAndPicturesHaveNumbers) {
    EXPECT_EQ(ISetIDMapper::Instance().GetID(U("kNoteGlyphs")), 1821);
    EXPECT_EQ(PictIDMapper::Instance().GetID(U("kLogo")), -7);
    EXPECT_EQ(ISetIDMapper::Instance().GetID(U("kLogo")), 0);
    EXPECT_EQ(PictIDMapper::Instance().GetID(UString()), 0);
}

TEST_F(ResourcesTest, NumbersStandForThemselves) {
    EXPECT_EQ(ISetIDMapper::Instance().GetID(U("1004")), 1004);
    EXPECT_EQ(ISetIDMapper::Instance().GetID(U("99999999999")), 0);
}

TEST_F(ResourcesTest, HelpTagsHaveTextAndPerhapsATitle) {
    LocalizedStrings::HelpTag const *tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    ASSERT_NE(tag, nullptr);
    EXPECT_EQ(tag->Title(), U("Zoom"));
    EXPECT_EQ(tag->Text(), U("Closer"));
    EXPECT_EQ(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"), tag);
}

TEST_F(ResourcesTest, UnknownHelpTagsAreNull) {
    LocalizedStrings::HelpTagMgr &tags = LocalizedStrings::HelpTagMgr::Instance();
    EXPECT_EQ(tags.DemandHelpTag("kZoom", "kNone"), nullptr);
    EXPECT_EQ(tags.DemandHelpTag("kNone", "kHZoomIn"), nullptr);
    EXPECT_EQ(tags.DemandHelpTag(nullptr, "kHZoomIn"), nullptr);
    EXPECT_EQ(tags.DemandHelpTag("kZoom", nullptr), nullptr);
}

TEST_F(ResourcesTest, AHelpTagStaysAndFollowsTheLanguage) {
    LocalizedStrings::HelpTag const *tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    Resources::Instance().SetLanguage("de");
    EXPECT_EQ(tag->Text(), U("N\xC3\xA4her"));
    EXPECT_TRUE(tag->Title().empty());
    EXPECT_EQ(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"), tag);
}

TEST_F(ResourcesTest, AHelpTagThatIsNoMoreIsEmpty) {
    LocalizedStrings::HelpTag const *tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    TemporaryDirectory const empty;
    Resources::Instance().Open(empty.Path());
    EXPECT_TRUE(tag->Text().empty());
}

TEST_F(ResourcesTest, AThemeSetsTheNamedColours) {
    directory.Write("themes/odd.xml",
                    "<theme><color name='kHiliteColor' value='#FF8000'/><paint name='x' value='y'/></theme>");
    directory.Write("themes/light.xml", "<theme><color name='kHiliteColor' value='#2a6bdb'/></theme>");
    Resources::Instance().SetTheme("odd");
    EXPECT_EQ(Resources::Instance().Theme(), "odd");
    EXPECT_EQ(kHiliteColor.red, 0xFFFF);
    EXPECT_EQ(kHiliteColor.green, 0x8080);
    EXPECT_EQ(kHiliteColor.blue, 0);
    Resources::Instance().SetTheme("light");
    EXPECT_EQ(kHiliteColor.green, 0x6B6B);
}

TEST_F(ResourcesTest, AThemeThatIsMissingOrBrokenChangesNothing) {
    directory.Write("themes/light.xml", "<theme><color name='kHiliteColor' value='#102030'/></theme>");
    Resources::Instance().SetTheme("light");
    directory.Write("themes/bad.xml", "<theme><color name='kHiliteColor' value='#ffffff'/>\n"
                                      "<color name='kHiliteColor' value='white'/></theme>");
    directory.Write("themes/odd.xml", "<theme><color name='kNoSuchColor' value='#ffffff'/></theme>");
    EXPECT_THROW(Resources::Instance().SetTheme("none"), ResourceError);
    EXPECT_THROW(Resources::Instance().SetTheme("bad"), ResourceError);
    EXPECT_THROW(Resources::Instance().SetTheme("odd"), ResourceError);
    EXPECT_EQ(Resources::Instance().Theme(), "light");
    EXPECT_EQ(kHiliteColor.red, 0x1010);
}

TEST(FindDirectory, FindsTheArtworkBesideTheLibrary) {
    EXPECT_NE(Resources::FindDirectory().find("share/glogpanes/artwork"), std::string::npos);
}

class HelpTagHelpers : public ResourcesTest {
protected:
    LocalizedStrings::HelpTag const *Tag() {
        return LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    }
    bool Ask(HelpTagHelper &helper, Point where) {
        return helper.GetHelpTag(where, tag, rect, placement, delay);
    }

    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect rect = {9, 9, 9, 9};
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = -1;
};

TEST_F(HelpTagHelpers, APartAnswersWithWhatItWasAddedWith) {
    MultiHelpTagHelper helper;
    helper.AddHelpTag(Tag(), Rect{0, 0, 10, 20}, OS::Help::kPlacementForParts, 0.25);
    ASSERT_TRUE(Ask(helper, Point{9, 19}));
    EXPECT_EQ(tag, Tag());
    EXPECT_EQ(rect.right, 20);
    EXPECT_EQ(placement, OS::Help::kPlacementForParts);
    EXPECT_EQ(delay, 0.25);
}

TEST_F(HelpTagHelpers, BottomAndRightEdgesAreOutside) {
    MultiHelpTagHelper helper;
    helper.AddHelpTag(Tag(), Rect{0, 0, 10, 20}, OS::Help::kPlacementForParts, 0.25);
    EXPECT_FALSE(Ask(helper, Point{10, 5}));
    EXPECT_FALSE(Ask(helper, Point{5, 20}));
    EXPECT_EQ(tag, nullptr);
    EXPECT_EQ(rect.top, 9);
    EXPECT_EQ(delay, -1);
}

TEST_F(HelpTagHelpers, WherePartsOverlapTheFirstAnswers) {
    MultiHelpTagHelper helper;
    helper.AddHelpTag(Tag(), Rect{0, 0, 10, 10}, OS::Help::kPlacementForParts, 1);
    helper.AddHelpTag(Tag(), Rect{0, 0, 20, 20}, OS::Help::kPlacementForParts, 2);
    ASSERT_TRUE(Ask(helper, Point{5, 5}));
    EXPECT_EQ(delay, 1);
}

TEST_F(HelpTagHelpers, NullTagsAreNotAdded) {
    MultiHelpTagHelper helper;
    helper.AddHelpTag(nullptr, Rect{0, 0, 10, 10}, OS::Help::kPlacementForParts, 1);
    EXPECT_FALSE(Ask(helper, Point{5, 5}));
}

TEST_F(HelpTagHelpers, ClearedHelpersAnswerNothing) {
    MultiHelpTagHelper helper;
    helper.AddHelpTag(Tag(), Rect{0, 0, 10, 10}, OS::Help::kPlacementForParts, 1);
    helper.ClearHelpTags();
    EXPECT_FALSE(Ask(helper, Point{5, 5}));
}

TEST_F(HelpTagHelpers, TheDefaultHelperAnswersEverywhereAndKeepsTheRectangle) {
    DefaultHelpTagHelper helper(Tag());
    ASSERT_TRUE(Ask(helper, Point{-500, 500}));
    EXPECT_EQ(tag, Tag());
    EXPECT_EQ(rect.top, 9);
    EXPECT_EQ(placement, OS::Help::kPlacementForParts);
    EXPECT_EQ(delay, 0.5);
}

TEST_F(HelpTagHelpers, TheDefaultHelperWithoutATagAnswersNothing) {
    DefaultHelpTagHelper helper(nullptr);
    EXPECT_FALSE(Ask(helper, Point{0, 0}));
}

TEST_F(HelpTagHelpers, KnowWhetherTheyAreTheDefault) {
    EXPECT_TRUE(DefaultHelpTagHelper(nullptr).IsDefaultHelper());
    EXPECT_FALSE(MultiHelpTagHelper().IsDefaultHelper());
}

} // namespace
