#include "desktop/drawing/Surface.h"
#include "host/EventRecordAdapter.h"
#include "tests/dialogs/DialogTest.h"
#include "text/GTextPane.h"
#include "text/SearchFieldPane.h"
#include "text/TextEditPane.h"
#include <cstring>
#include <vector>

namespace {

std::string const kPlace = "<BoundsRect top=\"20\" left=\"20\" bottom=\"40\" right=\"120\"/>";

class TextItemsTest : public DialogTest {
protected:
    GTextPane *LoadField(std::string const &keys) { return LoadOne<GTextPane>("TextField", kPlace + keys); }
    TextEditPane *LoadEdit(std::string const &keys) {
        return LoadOne<TextEditPane>("TextEdit", kPlace + keys);
    }
    static std::string TextOf(GTextPane *pane) { return Utf8::FromUString(pane->GetText()); }
    static std::string TextOf(TextEditPane *pane) { return Utf8::FromUString(pane->GetTextEdit().GetText()); }

    std::string Heard(GlogPane *pane, std::string const &script) {
        ShowGlog(pane->GetGlog(), kShowGlog);
        desktop.Play(""); // the window becomes active
        desktop.TakeMessages();
        desktop.Play(script);
        std::string all;
        for (std::string const &line : desktop.TakeMessages())
            all += line + '\n';
        return all;
    }
    // The first row of pixels that letters are seen in, in the text's box; -1: none.
    int FirstInk(GlogPane *pane) {
        ShowGlog(pane->GetGlog(), kShowGlog);
        UpdateGlog(pane->GetGlog());
        Surface const &picture = *desktop.Picture(pane->GetGlog());
        int const kDark = 0x80;
        for (int y = 21; y < 60; ++y)
            for (int x = 22; x < 118; ++x)
                if (static_cast<int>(picture.Row(y)[x] & 0xFF) < kDark)
                    return y;
        return -1;
    }
    // What is drawn of the kind.
    std::size_t Drawn(GlogPane *pane, std::string const &operation) {
        desktop.TakeDrawing(); // from here on it is written down
        ShowGlog(pane->GetGlog(), kShowGlog);
        UpdateGlog(pane->GetGlog());
        std::size_t count = 0;
        for (std::string const &line : desktop.TakeDrawing())
            count += Holds(line, "\"op\":\"" + operation + "\"");
        return count;
    }
};

// A record of a text field, byte by byte.
class FieldRecord {
public:
    FieldRecord(int flags, int moreFlags, int textWell)
        : bytes(24, 0) {
        Short(0, gtextResRec::kKind);
        int const edges[] = {20, 20, 40, 120};
        for (std::size_t i = 0; i < 4; ++i)
            Short(2 + 2 * i, edges[i]);
        bytes[10] = 31; // font 1
        bytes[11] = 2;
        bytes[12] = static_cast<unsigned char>(flags);
        bytes[13] = static_cast<unsigned char>(moreFlags);
        bytes[14] = static_cast<unsigned char>(textWell);
        Short(16, -2);
        Short(18, 7);
    }
    FieldRecord &Text(char const *utf8) {
        bytes.insert(bytes.end(), utf8, utf8 + std::strlen(utf8));
        return *this;
    }
    FieldRecord &CutTo(std::size_t size) {
        bytes.resize(size);
        return *this;
    }
    glogRec *Load() const {
        char const mark[] = "GLOGREC1";
        std::vector<unsigned char> file(mark, mark + 8);
        for (int number : {320, 200, 1, static_cast<int>(bytes.size())}) {
            file.push_back(static_cast<unsigned char>(number & 0xFF));
            file.push_back(static_cast<unsigned char>(number >> 8));
        }
        file.insert(file.end(), bytes.begin(), bytes.end());
        return LoadGlogFromRecords(file.data(), file.size(), GlogOptions(), "old.glog");
    }
    GTextPane *Field() const { return dynamic_cast<GTextPane *>(GetGlogItem(Load(), 1)); }

private:
    void Short(std::size_t at, int value) {
        bytes[at] = static_cast<unsigned char>(value & 0xFF);
        bytes[at + 1] = static_cast<unsigned char>(value >> 8 & 0xFF);
    }
    std::vector<unsigned char> bytes;
};

} // namespace

// Fields

TEST_F(TextItemsTest, AFieldWithoutKeysIsEmptyEditableAndNotFramed) {
    GTextPane *const pane = LoadField("");
    EXPECT_EQ(BoxOf(pane), (Rect{20, 20, 40, 120}));
    EXPECT_EQ(TextOf(pane), "");
    EXPECT_EQ(pane->GetMode(), 0);
    EXPECT_EQ(pane->GetTextEditCreationFlags(false), 8u);
    EXPECT_TRUE(pane->CanTabIn());
    EXPECT_FALSE(pane->PlatformHandlesTextInputEvents());
    EXPECT_EQ(Drawn(pane, "FrameTextWell"), 0u);
    EXPECT_TRUE(Holds(ComplaintAboutItem("TextField", "<BoxIt>1</BoxIt>"), "BoundsRect"));
}

TEST_F(TextItemsTest, AFieldIsFramedByEitherKey) {
    EXPECT_EQ(Drawn(LoadField("<TextWell>1</TextWell>"), "FrameTextWell"), 1u);
    GTextPane *const boxed = LoadField("<BoxIt>1</BoxIt>");
    EXPECT_EQ(Drawn(boxed, "FrameTextWell"), 1u);
    EXPECT_EQ(BoxOf(boxed), (Rect{18, 18, 42, 122}));
    EXPECT_EQ(BoxOf(LoadField("<BoxIt>1</BoxIt><FrameOffset>5</FrameOffset>")), (Rect{18, 18, 42, 122}));
}

TEST_F(TextItemsTest, AFieldHasItsTextAndItsFont) {
    GTextPane *const pane = LoadField("<InitTextID>Bass \u00E9</InitTextID><FSRID>31</FSRID>");
    EXPECT_EQ(TextOf(pane), "Bass \u00E9");
    EXPECT_EQ(pane->GetFontFSRID(), 1);
    EXPECT_EQ(TextOf(LoadField("<InitTextID>96</InitTextID>")), "96");
}

TEST_F(TextItemsTest, AFieldsTextStandsAsItIsAligned) {
    auto const at = [&](char const *align, double h) {
        return LoadField(std::string("<InitTextID>mm</InitTextID>") + align)
            ->GetCharacterIndexForPoint(OS::Point(h, 28));
    };
    EXPECT_EQ(at("", 60), 1u);
    EXPECT_EQ(at("<Align>0</Align>", 60), 1u);
    EXPECT_EQ(at("<Align>1</Align>", 80), 0u);
    EXPECT_EQ(at("<Align>2</Align>", 66), 0u);
    EXPECT_EQ(at("<Align>2</Align>", 74), 1u);
}

TEST_F(TextItemsTest, AFieldsTextStandsLowerByItsOffset) {
    int const usual = FirstInk(LoadField("<InitTextID>Bass</InitTextID>"));
    ASSERT_GT(usual, 0);
    EXPECT_EQ(FirstInk(LoadField("<InitTextID>Bass</InitTextID><BaselineOffset>4</BaselineOffset>")),
              usual + 4);
}

TEST_F(TextItemsTest, AFieldsEngineIsAsTheKeysSay) {
    EXPECT_EQ(LoadField("<MultiLine>1</MultiLine>")->GetTextEditCreationFlags(false), 10u);
    EXPECT_EQ(LoadField("<ReadOnly>1</ReadOnly>")->GetTextEditCreationFlags(false), 12u);
    EXPECT_EQ(LoadField("<AutoScroll>1</AutoScroll>")->GetTextEditCreationFlags(false), 0u);
}

TEST_F(TextItemsTest, AReadOnlyFieldIsNotTypedInto) {
    GTextPane *const pane = LoadField("<InitTextID>fixed</InitTextID><ReadOnly>1</ReadOnly>");
    Heard(pane, "click 30 30\ntype \"x\"");
    EXPECT_EQ(TextOf(pane), "fixed");
    EXPECT_TRUE(pane->IsSelected());
}

TEST_F(TextItemsTest, TheTabKeyPassesAFieldByThatSaysSo) {
    GTextPane *const pane = LoadField("<NoTabIn>1</NoTabIn>");
    Heard(pane, "key Tab");
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_TRUE(pane->Selectable());
}

TEST_F(TextItemsTest, AFieldThatCannotBeSelectedTakesNeitherClicksNorKeys) {
    GTextPane *const pane = LoadField("<NotSelectable>1</NotSelectable>");
    Heard(pane, "click 30 30\ntype \"x\"\nkey Tab");
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_EQ(TextOf(pane), "");
}

TEST_F(TextItemsTest, ClicksAndKeysAreHitsWhereTheKeysSaySo) {
    std::vector<int> hits;
    desktop.SetHitHandler([&](glogRec *, int, int value) { hits.push_back(value); });
    Heard(LoadField(""), "click 30 30\ntype \"x\"");
    EXPECT_EQ(hits, std::vector<int>());
    Heard(LoadField("<RetOnClick>1</RetOnClick>"), "click 30 30\ntype \"x\"");
    EXPECT_EQ(hits, std::vector<int>{1});
    Heard(LoadField("<RetOnModify>1</RetOnModify>"), "click 30 30\ntype \"x\"");
    EXPECT_EQ(hits, (std::vector<int>{1, 2}));
}

TEST_F(TextItemsTest, ThePlatformHandlesTextInputWhereAFieldSaysSo) {
    EXPECT_TRUE(LoadField("<PlatformHandlesTextInputEvents>1</PlatformHandlesTextInputEvents>")
                    ->PlatformHandlesTextInputEvents());
    EXPECT_FALSE(LoadField("<PlatformHandlesTextInputEvents>0</PlatformHandlesTextInputEvents>")
                     ->PlatformHandlesTextInputEvents());
}

TEST_F(TextItemsTest, AFieldHasItsMode) {
    EXPECT_EQ(LoadField("<Mode>5</Mode>")->GetMode(), 5);
    GTextPane *const locked = LoadField("<Mode>255</Mode>");
    EXPECT_EQ(locked->GetMode(), 255);
    EXPECT_FALSE(locked->Selectable());
}

TEST_F(TextItemsTest, PartsOfAFieldLookAsItsRunsSay) {
    GTextPane *const pane = LoadField(
        "<InitTextID>Bass left</InitTextID><StyleRuns><Run><Start>0</Start><End>4</End><FSRID>9</FSRID>"
        "<Color red=\"65535\" green=\"32896\" blue=\"0\"/></Run><Run><Start>5</Start><End>900</End>"
        "<FSRID>1</FSRID></Run></StyleRuns>");
    ASSERT_EQ(pane->GetNumberStyleRuns(), 3u);
    unsigned int start = 0, end = 0;
    OS::TextStyle style;
    pane->GetNthStyleRun(0, start, end, style);
    EXPECT_EQ(start, 0u);
    EXPECT_EQ(end, 4u);
    EXPECT_EQ(style.size, GetIndVelaFont(9)->size);
    EXPECT_EQ(style.color.r, 1.0);
    EXPECT_NEAR(style.color.g, 0.502, 0.001);
    EXPECT_EQ(style.color.b, 0.0);
    pane->GetNthStyleRun(2, start, end, style);
    EXPECT_EQ(start, 5u);
    EXPECT_EQ(end, 9u);
    EXPECT_EQ(style.size, GetIndVelaFont(1)->size);
    EXPECT_EQ(pane->GetTextEditCreationFlags(true) & 1u, 1u);
}

TEST_F(TextItemsTest, ColoursOfItsOwnThatNoProgramHasSetAreTheThemes) {
    int const usual = FirstInk(LoadField("<InitTextID>Bass</InitTextID>"));
    EXPECT_EQ(FirstInk(LoadField("<InitTextID>Bass</InitTextID><UseSavedColors>1</UseSavedColors>")), usual);
}

TEST_F(TextItemsTest, AFieldRefusesNumbersOutOfTheirRanges) {
    struct {
        char const *key, *value;
    } const faults[] = {{"FSRID", "256"},
                        {"FSRID", "-1"},
                        {"Align", "3"},
                        {"Align", "-1"},
                        {"BoxIt", "2"},
                        {"NoTabIn", "2"},
                        {"RetOnClick", "2"},
                        {"RetOnModify", "-1"},
                        {"MultiLine", "2"},
                        {"ReadOnly", "2"},
                        {"AutoScroll", "x"},
                        {"NotSelectable", "2"},
                        {"UseSavedColors", "2"},
                        {"TextWell", "2"},
                        {"FrameOffset", "1001"},
                        {"FrameOffset", "-1001"},
                        {"BaselineOffset", "1001"},
                        {"Mode", "256"},
                        {"FirstLineOffset", "1x"},
                        {"PlatformHandlesTextInputEvents", "2"},
                        {"NoSuchKey", "1"}};
    for (auto const &fault : faults) {
        std::string const key = fault.key;
        std::string const complaint =
            ComplaintAboutItem("TextField", kPlace + "<" + key + ">" + fault.value + "</" + key + ">");
        EXPECT_TRUE(Holds(complaint, key)) << key << ": " << complaint;
        EXPECT_TRUE(Holds(complaint, "test.xml")) << complaint;
    }
}

TEST_F(TextItemsTest, AFieldRefusesRunsThatAreNone) {
    auto const complaint = [&](std::string const &run) {
        return ComplaintAboutItem("TextField", kPlace + "<StyleRuns>" + run + "</StyleRuns>");
    };
    EXPECT_TRUE(Holds(complaint("<Run><End>4</End></Run>"), "Start"));
    EXPECT_TRUE(Holds(complaint("<Run><Start>0</Start></Run>"), "End"));
    EXPECT_TRUE(Holds(complaint("<Run><Start>-1</Start><End>4</End></Run>"), "Start"));
    EXPECT_TRUE(Holds(complaint("<Run><Start>0</Start><End>2147483648</End></Run>"), "End"));
    EXPECT_TRUE(Holds(
        complaint("<Run><Start>0</Start><End>4</End><Color red=\"65536\" green=\"0\" blue=\"0\"/></Run>"),
        "red"));
    EXPECT_TRUE(Holds(complaint("<Walk/>"), "Walk"));
}

TEST_F(TextItemsTest, WatchersHearOfAFieldFromItsClickToItsEnd) {
    std::string const heard =
        Heard(LoadField("<InitTextID>a</InitTextID>"), "click 100 30\ntype \"b\"\nkey Escape");
    std::size_t place = 0;
    for (char const *message : {"BeginEditing\",\"text\":\"a\"", "ValueChanged\",\"text\":\"ab\"",
                                "ResetValue\",\"text\":\"ab\"", "EndEditing", "TextPaneConfirmation"}) {
        place = heard.find(message, place);
        ASSERT_NE(place, std::string::npos) << message << '\n' << heard;
    }
}

TEST_F(TextItemsTest, TheDumpTellsTextSelectionAndMode) {
    GTextPane *const pane = LoadField("<InitTextID>Bass</InitTextID><Mode>5</Mode>");
    pane->SetSelection(1, 3);
    EXPECT_TRUE(
        Holds(Dump(pane->GetGlog()), "\"text\":\"Bass\",\"mode\":5,\"selectionStart\":1,\"selectionEnd\":3"))
        << Dump(pane->GetGlog());
}

TEST_F(TextItemsTest, OnlyWithStyleRunsMayPartsOfAFieldLookDifferently) {
    auto const runsAfterAChange = [this](std::string const &keys) {
        GTextPane *const pane = LoadField("<InitTextID>Bass left</InitTextID>" + keys);
        OS::TextStyle style;
        style.size = 20;
        pane->SetSelection(0, 2);
        pane->SetStyle(7, style);
        return pane->GetNumberStyleRuns();
    };
    EXPECT_EQ(runsAfterAChange(""), 1u);
    EXPECT_EQ(runsAfterAChange("<StyleRuns><Run><Start>6</Start><End>7</End></Run></StyleRuns>"), 4u);
}

// Records

TEST_F(TextItemsTest, ARecordMakesAFieldWithItsTextAtByte24) {
    GTextPane *const pane = FieldRecord(gtextResRec::kBoxIt, 0, 0).Text("Bass \u00E9").Field();
    ASSERT_NE(pane, nullptr);
    EXPECT_EQ(BoxOf(pane), (Rect{18, 18, 42, 122}));
    EXPECT_EQ(TextOf(pane), "Bass \u00E9");
    EXPECT_EQ(pane->GetFontFSRID(), 1);
    EXPECT_EQ(TextOf(FieldRecord(0, 0, 0).Field()), "");
}

TEST_F(TextItemsTest, TheFirstOfTheTwoOffsetsOfARecordIsThatOfTheFrame) {
    GTextPane *const pane = FieldRecord(0, 0, 0).Text("a").Field();
    ASSERT_NE(pane, nullptr);
    pane->SetBoxAndFrame(true, true);
    desktop.TakeDrawing(); // from here on it is written down
    ShowGlog(pane->GetGlog(), kShowGlog);
    UpdateGlog(pane->GetGlog());
    std::string drawn;
    for (std::string const &line : desktop.TakeDrawing())
        if (Holds(line, "\"op\":\"DrawTextEdit\""))
            drawn = line;
    EXPECT_TRUE(Holds(drawn, "[22,22,38,118]")) << drawn;
}

TEST_F(TextItemsTest, EachFlagOfARecordIsTheFieldsOwn) {
    auto const field = [](int flags, int more = 0, int well = 0) {
        return FieldRecord(flags, more, well).Text("a").Field();
    };
    EXPECT_EQ(BoxOf(field(0)), (Rect{20, 20, 40, 120}));
    EXPECT_EQ(BoxOf(field(0x01)), (Rect{18, 18, 42, 122}));
    EXPECT_FALSE(field(0x02)->CanTabIn());
    EXPECT_TRUE(field(0xFD)->GetVisibility());
    std::vector<int> hits;
    desktop.SetHitHandler([&](glogRec *, int, int value) { hits.push_back(value); });
    Heard(field(0x04), "click 30 30\ntype \"x\"");
    Heard(field(0x08), "click 30 30\ntype \"x\"");
    EXPECT_EQ(hits, (std::vector<int>{1, 2}));
    EXPECT_EQ(field(0x10)->GetTextEditCreationFlags(false), 10u);
    EXPECT_EQ(field(0x20)->GetTextEditCreationFlags(false), 0u);
    EXPECT_FALSE(field(0x40)->Selectable());
    EXPECT_TRUE(field(0x80)->Selectable());
    EXPECT_EQ(field(0, 0x01)->GetTextEditCreationFlags(false), 12u);
    EXPECT_EQ(field(0, 0xFE)->GetTextEditCreationFlags(false), 8u);
    EXPECT_EQ(Drawn(field(0, 0, 0), "FrameTextWell"), 0u);
    EXPECT_EQ(Drawn(field(0, 0, -1), "FrameTextWell"), 1u);
}

TEST_F(TextItemsTest, ARecordThatIsCutIsRefused) {
    for (std::size_t size : {2u, 9u, 11u, 12u, 14u, 17u, 19u, 23u})
        EXPECT_NE(Complaint([&] { FieldRecord(0, 0, 0).CutTo(size).Load(); }), "no complaint") << size;
    EXPECT_EQ(Complaint([&] { FieldRecord(0, 0, 0).Load(); }), "no complaint");
}

// Bare engines

TEST_F(TextItemsTest, ABareTextBeginsBetweenTwoPixels) {
    OS::RectBase<OS::RectTag> const whole = LoadEdit("")->GetFractionalBounds();
    EXPECT_EQ(whole.origin.x, 20);
    EXPECT_EQ(whole.size.width, 100);
    TextEditPane *const pane = LoadEdit("<FractionH>25</FractionH><FractionV>50</FractionV>");
    OS::RectBase<OS::RectTag> const bounds = pane->GetFractionalBounds();
    EXPECT_EQ(bounds.origin.x, 20.25);
    EXPECT_EQ(bounds.origin.y, 20.5);
    EXPECT_EQ(bounds.size.width, 100);
    EXPECT_EQ(bounds.size.height, 20);
    EXPECT_EQ(BoxOf(pane), (Rect{20, 20, 41, 121}));
}

TEST_F(TextItemsTest, ABareTextHasItsTextAndItsFont) {
    TextEditPane *const pane = LoadEdit("<Text>Notes</Text><FSRID>9</FSRID>");
    EXPECT_EQ(TextOf(pane), "Notes");
    OS::TextStyle style;
    pane->GetTextEdit().GetStyle(7, style);
    EXPECT_EQ(style.size, GetIndVelaFont(9)->size);
}

TEST_F(TextItemsTest, ABareTextIsEditedAsItsFlagsSay) {
    TextEditPane *const one = LoadEdit("<Text>a</Text>");
    Heard(one, "click 100 30\ntype \"b\"\nkey Return");
    EXPECT_EQ(TextOf(one), "ab");
    TextEditPane *const several = LoadEdit("<Text>a</Text><MultiLine>1</MultiLine>");
    Heard(several, "click 100 25\ntype \"b\"\nkey Return");
    EXPECT_EQ(TextOf(several), "ab\n");
    TextEditPane *const fixed = LoadEdit("<Text>a</Text><ReadOnly>1</ReadOnly>");
    Heard(fixed, "click 100 30\ntype \"b\"");
    EXPECT_EQ(TextOf(fixed), "a");
}

TEST_F(TextItemsTest, ABareTextThatLosesTheKeyboardIsEditedNoLonger) {
    TextEditPane *const pane = LoadEdit("<Text>a</Text>");
    Heard(pane, "click 100 30\ntype \"b\"");
    EXPECT_TRUE(pane->GetTextEdit().IsActive());
    pane->GetGlog()->SetCurItem(nullptr);
    desktop.Play("type \"c\"");
    EXPECT_FALSE(pane->GetTextEdit().IsActive());
    EXPECT_EQ(TextOf(pane), "ab");
}

TEST_F(TextItemsTest, ABareTextTellsThatItHasScrolledOnlyWhereItFollows) {
    std::string const script = "click 100 30\ntype \"a text that is wider than its place\"";
    EXPECT_TRUE(Holds(Heard(LoadEdit("<AutoScroll>1</AutoScroll>"), script), "Autoscrolled"));
    std::string const fixed = Heard(LoadEdit(""), script);
    EXPECT_TRUE(Holds(fixed, "\"message\":\"TextChanged\""));
    EXPECT_FALSE(Holds(fixed, "Autoscrolled"));
}

TEST_F(TextItemsTest, ABareTextRefusesWhatIsOutOfRange) {
    struct {
        char const *key, *value;
    } const faults[] = {{"FractionH", "100"}, {"FractionV", "-1"}, {"FSRID", "256"},
                        {"MultiLine", "2"},   {"ReadOnly", "2"},   {"AutoScroll", "2"}};
    for (auto const &fault : faults) {
        std::string const key = fault.key;
        EXPECT_TRUE(Holds(
            ComplaintAboutItem("TextEdit", kPlace + "<" + key + ">" + fault.value + "</" + key + ">"), key))
            << key;
    }
    EXPECT_TRUE(Holds(ComplaintAboutItem("TextEdit", ""), "BoundsRect"));
}

// Search fields

TEST_F(TextItemsTest, ASearchFieldHasItsBoxAndTellsOfItsSearch) {
    SearchFieldPane *const pane = LoadOne<SearchFieldPane>(
        "SearchField", "<BoundsRect top=\"20\" left=\"20\" bottom=\"40\" right=\"220\"/>");
    EXPECT_EQ(BoxOf(pane), (Rect{20, 20, 40, 220}));
    std::string const heard = Heard(pane, "click 80 30\ntype \"a\"\nkey Up\nkey Down\nkey Escape");
    std::size_t place = 0;
    for (char const *message : {"TextChanged\",\"text\":\"a\"", "HandleSpecialKey\",\"key\":\"Up\"",
                                "HandleSpecialKey\",\"key\":\"Down\"", "SearchIsCanceled"}) {
        place = heard.find(message, place);
        ASSERT_NE(place, std::string::npos) << message << '\n' << heard;
    }
    EXPECT_TRUE(Holds(ComplaintAboutItem("SearchField", ""), "BoundsRect"));
}
