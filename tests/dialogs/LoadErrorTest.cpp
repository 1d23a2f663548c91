// What is said about dialogs that are wrong: the place, the item, the key, and what was expected.
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/TarnError.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"

namespace {

std::string Repeated(std::string const &text, int times) {
    std::string all;
    for (int i = 0; i < times; ++i)
        all += text;
    return all;
}

class WrongDialog : public DialogTest {
protected:
    // The item stands in a line and at a column of its own, so that messages tell them apart.
    std::string About(std::string const &type, std::string const &keys) {
        return ComplaintAbout("<Glog width=\"320\" height=\"200\"><Items>\n  <Item type=\"" + type +
                              "\" id=\"3\">\n    " + keys + "</Item></Items></Glog>");
    }
};

TEST_F(WrongDialog, ErrorsTellTheirParts) {
    try {
        Load("<Glog width=\"9\" height=\"9\"><Items>\n <Item type=\"OvalButton\" id=\"3\">"
             "<TextNum>two</TextNum></Item></Items></Glog>");
        FAIL() << "no error";
    } catch (LoadError const &error) {
        EXPECT_EQ(error.File(), "test.xml");
        EXPECT_EQ(error.Line(), 2);
        EXPECT_EQ(error.Column(), 33);
        EXPECT_EQ(error.Byte(), -1);
        EXPECT_EQ(error.Item(), "item 3 (OvalButton)");
        EXPECT_EQ(error.Key(), "TextNum");
        EXPECT_EQ(error.Message(), "expected an integer, found \"two\"");
        EXPECT_STREQ(error.what(),
                     "test.xml:2:33: item 3 (OvalButton): key TextNum: expected an integer, found \"two\"");
    }
}

TEST_F(WrongDialog, NoXmlNamesLineAndColumn) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\">\n  <Items></Glog>").substr(0, 11),
              "test.xml:2:");
    EXPECT_TRUE(Holds(ComplaintAbout(""), "test.xml:"));
    EXPECT_TRUE(Holds(ComplaintAbout("<Glog width="), "test.xml:1:"));
    EXPECT_TRUE(Holds(ComplaintAbout("nonsense"), "test.xml:1:"));
}

TEST_F(WrongDialog, EveryTruncationIsAnError) {
    std::string const whole =
        Dialog(Item("OvalButton",
                    "<BoundsRect top=\"1\" left=\"2\" bottom=\"3\" right=\"4\"/><TextNum>1</TextNum>") +
               "<Item type=\"Group\"><Items><Item type=\"Label\"><Text>ä</Text></Item></Items></Item>");
    for (std::size_t length = 0; length < whole.size(); ++length)
        EXPECT_NE(ComplaintAbout(whole.substr(0, length)), "no complaint") << length;
    EXPECT_EQ(ComplaintAbout(whole), "no complaint");
}

TEST_F(WrongDialog, DeepNestingIsAnError) {
    int const levels = 10000;
    EXPECT_TRUE(
        Holds(ComplaintAbout(Repeated("<a>", levels) + Repeated("</a>", levels)), "within each other"));
    EXPECT_TRUE(Holds(ComplaintAbout(Dialog(Repeated("<Item type=\"Group\"><Items>", levels) +
                                            Repeated("</Items></Item>", levels))),
                      "within each other"));
}

TEST_F(WrongDialog, GroupsMayBeNestedAsDeepAsXml) {
    int const levels = 254; // two elements each, below <Glog><Items>
    glogRec *const glog =
        Load(Dialog(Repeated("<Item type=\"Group\"><Items>", levels) + "<Item type=\"Spacer\" id=\"5\"/>" +
                    Repeated("</Items></Item>", levels)));
    ShowGlog(glog, kShowGlog);
    EXPECT_NE(GetGlogItem(glog, 5), nullptr);
}

TEST_F(WrongDialog, TooManyItemsAreAnError) {
    EXPECT_EQ(ComplaintAbout(Dialog(Repeated("<Item type=\"Spacer\"/>", 32768))),
              "test.xml:1:32: more than 32767 items");
}

TEST_F(WrongDialog, TooMuchXmlIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAbout(std::string((std::size_t(64) << 20) + 1, ' ')), "larger than 64 MiB"));
}

TEST_F(WrongDialog, TheRootMustBeAGlog) {
    EXPECT_EQ(ComplaintAbout("<Dialog/>"), "test.xml:1:1: the root element is <Dialog>, not <Glog>");
}

TEST_F(WrongDialog, WidthAndHeightMustBeThere) {
    EXPECT_EQ(ComplaintAbout("<Glog height=\"9\"><Items/></Glog>"),
              "test.xml:1:1: <Glog> lacks the attribute \"width\"");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\"><Items/></Glog>"),
              "test.xml:1:1: <Glog> lacks the attribute \"height\"");
}

TEST_F(WrongDialog, SizesMustBeInRange) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"0\" height=\"9\"><Items/></Glog>"),
              "test.xml:1:1: attribute width: expected an integer from 1 to 16000, found 0");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"16001\"><Items/></Glog>"),
              "test.xml:1:1: attribute height: expected an integer from 1 to 16000, found 16001");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9.5\"><Items/></Glog>"),
              "test.xml:1:1: attribute height: expected an integer, found \"9.5\"");
    EXPECT_EQ(
        ComplaintAbout("<Glog width=\"9\" height=\"9\" minWidth=\"50\" maxWidth=\"40\"><Items/></Glog>"),
        "test.xml:1:1: the largest size is smaller than the smallest");
}

TEST_F(WrongDialog, UnknownGlogAttributesAreNamedWithTheNearestKnown) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\" growble=\"yes\"><Items/></Glog>"),
              "test.xml:1:1: <Glog> takes no attribute \"growble\"; did you mean growable?");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\" growable=\"maybe\"><Items/></Glog>"),
              "test.xml:1:1: attribute growable: expected yes or no, found \"maybe\"");
}

TEST_F(WrongDialog, ATitleIsEitherWrittenOrListed) {
    EXPECT_EQ(
        ComplaintAbout(
            "<Glog title=\"a\" titleList=\"1\" titleIndex=\"1\" width=\"9\" height=\"9\"><Items/></Glog>"),
        "test.xml:1:1: a title is either the attribute title, or titleList with titleIndex");
    EXPECT_EQ(ComplaintAbout("<Glog titleList=\"4323\" width=\"9\" height=\"9\"><Items/></Glog>"),
              "test.xml:1:1: a title is either the attribute title, or titleList with titleIndex");
    EXPECT_EQ(ComplaintAbout(
                  "<Glog titleList=\"4323\" titleIndex=\"999\" width=\"9\" height=\"9\"><Items/></Glog>"),
              "test.xml:1:1: the string list 4323 has no string 999");
}

TEST_F(WrongDialog, ItemsMustBeThereOnce) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\"/>"), "test.xml:1:1: <Items> is missing");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\"><Items/>\n<Items/></Glog>"),
              "test.xml:2:1: <Items> stands here for the second time");
}

TEST_F(WrongDialog, OnlyKnownElementsStandInAGlog) {
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\">\n <Itmes/></Glog>"),
              "test.xml:2:2: there is no <Itmes> in <Glog>; did you mean Items?");
    EXPECT_EQ(ComplaintAbout("<Glog width=\"9\" height=\"9\">Text<Items/></Glog>"),
              "test.xml:1:1: <Glog> may hold no text, found \"Text\"");
    EXPECT_EQ(ComplaintAbout(Dialog("<OvalButton/>")),
              "test.xml:1:39: expected <Item> in <Items>, found <OvalButton>");
    EXPECT_EQ(ComplaintAbout(Dialog("text")), "test.xml:1:32: <Items> may hold no text, found \"text\"");
}

TEST_F(WrongDialog, AStyleSheetHasOnlyKnownKeys) {
    EXPECT_EQ(ComplaintAbout(
                  "<Glog width=\"9\" height=\"9\"><StyleSheet>\n<BaselineOfset>1</BaselineOfset></StyleSheet>"
                  "<Items/></Glog>"),
              "test.xml:2:1: there is no key <BaselineOfset>; did you mean BaselineOffset?");
    EXPECT_EQ(
        ComplaintAbout("<Glog width=\"9\" height=\"9\"><StyleSheet>\n<BaselineOffset>high</BaselineOffset>"
                       "</StyleSheet><Items/></Glog>"),
        "test.xml:2:1: key BaselineOffset: expected an integer, found \"high\"");
}

TEST_F(WrongDialog, AnItemMustHaveAKnownType) {
    EXPECT_EQ(About("OvalButon", ""),
              "test.xml:2:3: item 3 (OvalButon): there is no item type \"OvalButon\"; "
              "did you mean OvalButton?");
    EXPECT_EQ(ComplaintAbout(Dialog("<Item id=\"4\"/>")),
              "test.xml:1:39: item 4 (?): <Item> lacks the attribute \"type\"");
    EXPECT_EQ(ComplaintAbout(Dialog("<Item type=\"Spacer\" idd=\"4\"/>")),
              "test.xml:1:39: item (Spacer): <Item> takes no attribute \"idd\"; did you mean id?");
}

TEST_F(WrongDialog, AnIdIsASmallPositiveNumberOfItsOwn) {
    EXPECT_EQ(ComplaintAbout(Dialog("<Item type=\"Spacer\" id=\"0\"/>")),
              "test.xml:1:39: item 0 (Spacer): attribute id: expected an integer from 1 to 32767, found 0");
    EXPECT_EQ(ComplaintAbout(Dialog("<Item type=\"Spacer\" id=\"x\"/>")),
              "test.xml:1:39: item x (Spacer): attribute id: expected an integer, found \"x\"");
    EXPECT_EQ(ComplaintAbout(
                  "<Glog width=\"9\" height=\"9\"><Items><Item type=\"Spacer\" id=\"2\"/>\n"
                  "<Item type=\"Group\"><Items>\n<Item type=\"Label\" id=\"2\"><Text/></Item></Items></Item>"
                  "</Items></Glog>"),
              "test.xml:3:1: item 2 (Label): the item in line 1 has this id too");
}

TEST_F(WrongDialog, UnknownKeysAreNamedWithTheNearestKnown) {
    EXPECT_EQ(About("OvalButton", "<TextNumber>1</TextNumber>"),
              "test.xml:3:5: item 3 (OvalButton): there is no key <TextNumber>; did you mean TextNum?");
    EXPECT_TRUE(
        Holds(About("OvalButton", "<Items/>"), "test.xml:3:5: item 3 (OvalButton): there is no key <Items>"))
        << "only groups hold items";
}

TEST_F(WrongDialog, AllThatIsPossibleIsNamedWhereNothingKnownIsNear) {
    EXPECT_EQ(
        About("Spacer", "<Colour>1</Colour>"),
        "test.xml:3:5: item 3 (Spacer): there is no key <Colour>; possible: Layout, HelpTag, HelpTagText, "
        "Visible");
    std::string const types = About("Zeppelin", "");
    EXPECT_TRUE(Holds(types, "there is no item type \"Zeppelin\"; possible: Box, BoxSelect, CheckBox, "))
        << types;
    EXPECT_TRUE(Holds(types, ", ZoomButtons, ZoomSlider")) << types;
}

TEST_F(WrongDialog, AKeyStandsOnce) {
    EXPECT_EQ(About("OvalButton", "<TextNum>1</TextNum><TextNum>1</TextNum>"),
              "test.xml:3:25: item 3 (OvalButton): key TextNum: the key stands here for the second time");
    EXPECT_EQ(About("Group", "<Items/><Items/>"),
              "test.xml:3:13: item 3 (Group): key Items: the key stands here for the second time");
}

TEST_F(WrongDialog, RequiredKeysMustBeThere) {
    EXPECT_EQ(About("Label", "<FSRID>0</FSRID>"), "test.xml:2:3: item 3 (Label): <Text> is missing");
    EXPECT_EQ(About("TextField", ""), "test.xml:2:3: item 3 (TextField): <BoundsRect top=\"\" left=\"\" "
                                      "bottom=\"\" right=\"\"> is missing");
    EXPECT_EQ(About("CheckBox", ""), "test.xml:2:3: item 3 (CheckBox): <RadioCheckButtonItems> is missing");
}

TEST_F(WrongDialog, IntegersMustBeInRange) {
    EXPECT_EQ(About("FrameButton", "<IconID>32768</IconID>"),
              "test.xml:3:5: item 3 (FrameButton): key IconID: expected an integer from -32768 to 32767, "
              "found 32768");
    EXPECT_EQ(About("FrameButton", "<IconID>-32769</IconID>"),
              "test.xml:3:5: item 3 (FrameButton): key IconID: expected an integer from -32768 to 32767, "
              "found -32769");
    EXPECT_EQ(
        About("OvalButton", "<TextNum>-1</TextNum>"),
        "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer from 0 to 32767, found -1");
    EXPECT_EQ(About("OvalButton", "<Mode>256</Mode>"),
              "test.xml:3:5: item 3 (OvalButton): key Mode: expected an integer from 0 to 255, found 256");
    EXPECT_EQ(About("OvalButton", "<Visible>2</Visible>"),
              "test.xml:3:5: item 3 (OvalButton): key Visible: expected an integer from 0 to 1, found 2");
    EXPECT_EQ(About("OvalButton", "<TextNum>99999999999999999999</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found "
              "\"99999999999999999999\"");
}

TEST_F(WrongDialog, IntegersMustBeIntegers) {
    EXPECT_EQ(About("OvalButton", "<TextNum/>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found nothing");
    EXPECT_EQ(About("OvalButton", "<TextNum>1 2</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found \"1 2\"");
    EXPECT_EQ(About("OvalButton", "<TextNum type=\"string\">1</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: this is of type \"integer\", not \"string\"");
    EXPECT_EQ(About("OvalButton", "<TextNum><One/></TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found the element <One>");
    EXPECT_EQ(About("OvalButton", "<TextNum tpe=\"integer\">1</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: <TextNum> takes no attribute \"tpe\"; did you "
              "mean type?");
}

TEST_F(WrongDialog, StringsMustBeStrings) {
    EXPECT_EQ(About("Label", "<Text type=\"integer\">1</Text>"),
              "test.xml:3:5: item 3 (Label): key Text: this is of type \"string\", not \"integer\"");
    EXPECT_EQ(About("Label", "<Text>a<b/></Text>"),
              "test.xml:3:5: item 3 (Label): key Text: expected a string, found the element <b>");
    EXPECT_EQ(About("Label", "<Text list=\"4323\"/>"),
              "test.xml:3:5: item 3 (Label): key Text: <Text> lacks the attribute \"index\"");
    EXPECT_EQ(About("Label", "<Text list=\"4323\" index=\"999\"/>"),
              "test.xml:3:5: item 3 (Label): key Text: the string list 4323 has no string 999");
    EXPECT_EQ(About("Label", "<Text list=\"4323\" index=\"1\">OK</Text>"),
              "test.xml:3:5: item 3 (Label): key Text: <Text> may hold no text, found \"OK\"");
}

TEST_F(WrongDialog, LongTextsAreCutInMessagesBetweenCharacters) {
    EXPECT_EQ(About("OvalButton", "<TextNum>" + Repeated("ä", 100) + "</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found \"" +
                  Repeated("ä", 20) + "...\"");
    EXPECT_EQ(About("OvalButton", "<TextNum>x" + Repeated("ä", 100) + "</TextNum>"),
              "test.xml:3:5: item 3 (OvalButton): key TextNum: expected an integer, found \"x" +
                  Repeated("ä", 19) + "...\"");
}

TEST_F(WrongDialog, WordsMustBeKnown) {
    EXPECT_EQ(About("Group", "<Direction>up</Direction>"),
              "test.xml:3:5: item 3 (Group): key Direction: expected vert, horiz or free, found \"up\"");
    EXPECT_EQ(About("Group", "<Style>shiny</Style>"),
              "test.xml:3:5: item 3 (Group): key Style: expected plain or panel, found \"shiny\"");
}

TEST_F(WrongDialog, RectanglesMustBeWhole) {
    EXPECT_EQ(
        About("OvalButton", "<BoundsRect top=\"1\" left=\"2\" right=\"4\"/>"),
        "test.xml:3:5: item 3 (OvalButton): key BoundsRect: <BoundsRect> lacks the attribute \"bottom\"");
    EXPECT_EQ(
        About("OvalButton", "<BoundsRect top=\"x\" left=\"2\" bottom=\"3\" right=\"4\"/>"),
        "test.xml:3:5: item 3 (OvalButton): key BoundsRect: attribute top: expected an integer, found \"x\"");
    EXPECT_EQ(About("OvalButton", "<BoundsRect top=\"1\" left=\"40000\" bottom=\"3\" right=\"4\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: attribute left: expected an integer from "
              "-32768 to "
              "32767, found 40000");
    EXPECT_EQ(About("OvalButton", "<BoundsRect top=\"1\" left=\"2\" bottom=\"3\" right=\"4\" width=\"5\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: <BoundsRect> takes no attribute \"width\"; "
              "possible: top, left, bottom, right");
    EXPECT_EQ(About("OvalButton", "<BoundsRect><kTop>1</kTop></BoundsRect>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: expected nothing but the attributes top, "
              "left, bottom "
              "or right, found <kTop>");
    EXPECT_EQ(About("OvalButton", "<BoundsRect>1 2 3 4</BoundsRect>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: <BoundsRect> may hold no text, found \"1 2 "
              "3 4\"");
}

TEST_F(WrongDialog, RectanglesMustNotBeInsideOut) {
    EXPECT_EQ(About("OvalButton", "<BoundsRect top=\"5\" left=\"2\" bottom=\"3\" right=\"4\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: bottom lies above top");
    EXPECT_EQ(About("OvalButton", "<BoundsRect top=\"1\" left=\"9\" bottom=\"3\" right=\"4\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: right lies left of left");
    EXPECT_EQ(About("OvalButton", "<BoundsRect top=\"1\" left=\"-32768\" bottom=\"3\" right=\"32767\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key BoundsRect: a side is longer than 32767 pixels");
}

TEST_F(WrongDialog, PointsMustBeWhole) {
    EXPECT_EQ(About("Label", "<Text/><Origin v=\"1\"/>"),
              "test.xml:3:12: item 3 (Label): key Origin: <Origin> lacks the attribute \"h\"");
    EXPECT_EQ(About("Label", "<Text/><Origin v=\"1\" h=\"70000\"/>"),
              "test.xml:3:12: item 3 (Label): key Origin: attribute h: expected an integer from -32768 to "
              "32767, found "
              "70000");
}

TEST_F(WrongDialog, KeysWithinKeysAreNamedByTheirPath) {
    EXPECT_EQ(About("OvalButton", "<Layout><InsetTop>-1</InsetTop></Layout>"),
              "test.xml:3:13: item 3 (OvalButton): key Layout/InsetTop: expected an integer from 0 to 1000, "
              "found -1");
    EXPECT_EQ(
        About("OvalButton", "<Layout><InsetTip>1</InsetTip></Layout>"),
        "test.xml:3:13: item 3 (OvalButton): key Layout: there is no key <InsetTip>; did you mean InsetTop?");
    EXPECT_EQ(About("OvalButton", "<Layout>wide</Layout>"),
              "test.xml:3:5: item 3 (OvalButton): key Layout: <Layout> may hold no text, found \"wide\"");
    EXPECT_EQ(About("OvalButton", "<Layout Width=\"3\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key Layout: <Layout> takes no attribute \"Width\"");
}

TEST_F(WrongDialog, HelpTagsMustExist) {
    EXPECT_EQ(About("OvalButton", "<HelpTag group=\"kGallery\" key=\"kNone\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key HelpTag: there is no help tag \"kNone\" in the group "
              "\"kGallery\"");
    EXPECT_EQ(About("OvalButton", "<HelpTag group=\"kGallery\"/>"),
              "test.xml:3:5: item 3 (OvalButton): key HelpTag: <HelpTag> lacks the attribute \"key\"");
}

TEST_F(WrongDialog, IconFamiliesMustExist) {
    EXPECT_EQ(About("FrameButton", "<ISetID>kNoSuch</ISetID>"),
              "test.xml:3:5: item 3 (FrameButton): key ISetID: there is no icon family \"kNoSuch\"");
}

TEST_F(WrongDialog, ItemsInGroupsAreNamedToo) {
    EXPECT_EQ(About("Group", "<Items>\n<Item type=\"OvalButton\"><Mode>x</Mode></Item></Items>"),
              "test.xml:4:25: item (OvalButton): key Mode: expected an integer, found \"x\"");
    EXPECT_EQ(
        About("Group", "<Items>\n<Item type=\"FrameButton\" id=\"4\"><ISetID>kNo</ISetID></Item></Items>"),
        "test.xml:4:33: item 4 (FrameButton): key ISetID: there is no icon family \"kNo\"");
}

TEST_F(WrongDialog, MissingFilesAreNamed) {
    EXPECT_EQ(Complaint([] { LoadGlog("/nowhere/a.xml"); }),
              "/nowhere/a.xml: the file cannot be opened: No such file or directory");
    EXPECT_EQ(Complaint([] { ReadGlogOptions("/nowhere/a.xml"); }),
              "/nowhere/a.xml: the file cannot be opened: No such file or directory");
}

TEST_F(WrongDialog, ADirectoryIsNoDialog) {
    TemporaryDirectory directory;
    EXPECT_EQ(Complaint([&] { LoadGlog(directory.Path()); }),
              directory.Path() + ": the file cannot be read: Is a directory");
}

// A type whose maker fails in the way that its key says.
class FailingItem : public WrongDialog {
protected:
    static void Fail(std::string const &how) {
        if (how == "memory")
            throw std::bad_alloc();
        if (how == "part")
            FailMemFullError();
        if (how == "key")
            throw KeyFault("How", "this cannot be");
        throw std::runtime_error("broken");
    }
    FailingItem() {
        ItemRegistry::Instance().Add(ItemType("Failing")
                                         .Keys(KeyList().String("How"))
                                         .MadeBy([](glogRec *, GlogStyleSheet *sheet) -> GlogPane * {
                                             UString const how =
                                                 sheet->GetUStringItemValue(ResourceKey("How"));
                                             if (!how.empty())
                                                 Fail(Utf8::FromUString(how));
                                             return nullptr;
                                         }));
    }
};

TEST_F(FailingItem, WithoutAPaneIsAnError) {
    EXPECT_EQ(About("Failing", ""), "test.xml:2:3: item 3 (Failing): the pane cannot be made");
}

TEST_F(FailingItem, MayThrow) {
    EXPECT_EQ(About("Failing", "<How>memory</How>"), "test.xml:2:3: item 3 (Failing): memory has run out");
    EXPECT_EQ(About("Failing", "<How>part</How>"),
              "test.xml:2:3: item 3 (Failing): a part that the pane needs is missing, "
              "or memory has run out");
    EXPECT_EQ(About("Failing", "<How>key</How>"), "test.xml:3:5: item 3 (Failing): key How: this cannot be");
    EXPECT_EQ(About("Failing", "<How>otherwise</How>"), "test.xml:2:3: item 3 (Failing): broken");
}

TEST_F(FailingItem, TakesTheItemsBeforeItAlong) {
    EXPECT_NE(ComplaintAbout(Dialog(Item("OvalButton", "") +
                                    "<Item type=\"Group\"><Items><Item type=\"Label\"><Text/>"
                                    "</Item><Item type=\"Failing\"/></Items></Item>")),
              "no complaint");
    EXPECT_EQ(Glogs(), 0u);
}

} // namespace
