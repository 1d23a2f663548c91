// Check boxes and radio buttons in dialogs.
#include "buttons/CheckBoxPane.h"
#include "buttons/RadioButtonPane.h"
#include "tests/dialogs/DialogTest.h"

namespace {

// A button of a group, with its label 18 pixels to the right.
std::string Button(int v, int h, std::string const &text, std::string const &more = "") {
    std::string const origin = "<Origin v=\"" + std::to_string(v) + "\" h=\"" + std::to_string(h) +
                               "\"/><HitExtension>6</HitExtension>";
    std::string const place =
        "<Origin v=\"" + std::to_string(v + 11) + "\" h=\"" + std::to_string(h + 18) + "\"/>";
    return "<Button>" + origin + "<RadioCheckButtonStrings><String>" + place + "<Text>" + text +
           "</Text></String></RadioCheckButtonStrings>" + more + "</Button>";
}

std::string Group(std::string const &buttons, std::string const &more = "") {
    return "<LineSpacing>16</LineSpacing><RadioCheckButtonItems>" + buttons + "</RadioCheckButtonItems>" +
           more;
}

std::string const kTwo = Button(20, 20, "Erste") + Button(40, 20, "Größe");

// Numbers of a record, low byte first.
std::string Shorts(std::initializer_list<int> numbers) {
    std::string bytes;
    for (int number : numbers) {
        bytes += static_cast<char>(number & 0xFF);
        bytes += static_cast<char>(number >> 8 & 0xFF);
    }
    return bytes;
}

// Two buttons, the second without a label.
std::string Record(int kind) {
    return Shorts({kind, 1, 16, 2}) + Shorts({20, 20, 6, 1}) + Shorts({31, 38, 0, 3}) + "One" +
           Shorts({40, 20, 6, 0});
}

class ChoiceItems : public DialogTest {
protected:
    std::vector<std::string> Reported(std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        std::vector<std::string> found;
        for (std::string const &line : desktop.TakeMessages()) {
            if (Holds(line, "\"message\":\"Button"))
                found.push_back(line.substr(line.find("\"pane\"")));
        }
        return found;
    }
    static std::string Values(CheckBoxPane &group) {
        std::string values;
        for (short i = 0; i < group.CountButtons(); ++i)
            values += group.ReadOne(i) ? '1' : '0';
        return values;
    }
    glogRec *LoadRecord(std::string const &record) {
        std::string const bytes =
            "GLOGREC1" + Shorts({320, 200, 1, static_cast<int>(record.size())}) + record;
        return LoadGlogFromRecords(bytes.data(), bytes.size());
    }
    std::string AboutRecord(std::string const &record) {
        return Complaint([&] { LoadRecord(record); });
    }
};

TEST_F(ChoiceItems, HaveTheButtonsAndLabelsOfTheDialog) {
    CheckBoxPane *const group = LoadOne<CheckBoxPane>("CheckBox", Group(kTwo));
    ASSERT_EQ(group->CountButtons(), 2);
    UString name;
    group->GetNthButtonName(1, name);
    EXPECT_EQ(Utf8::FromUString(name), "Größe");
    EXPECT_EQ(BoxOf(group).left, 20);
    EXPECT_EQ(Values(*group), "00");
    EXPECT_EQ(LoadOne<RadioButtonPane>("RadioButton", Group(kTwo))->RadioGet(), 0);
}

TEST_F(ChoiceItems, HaveTheStatesAndModesOfTheDialog) {
    std::string const three = kTwo + Button(60, 20, "x", "<State>1</State><Mode>1</Mode>");
    CheckBoxPane *const boxes = LoadOne<CheckBoxPane>("CheckBox", Group(three));
    EXPECT_EQ(Values(*boxes), "001");
    EXPECT_TRUE(boxes->IsEnabled(1));
    EXPECT_FALSE(boxes->IsEnabled(2));
    RadioButtonPane *const radios = LoadOne<RadioButtonPane>("RadioButton", Group(three));
    EXPECT_EQ(radios->RadioGet(), 2);
    EXPECT_FALSE(radios->IsEnabled(2));
}

TEST_F(ChoiceItems, LieInGroups) {
    glogRec *const glog = Load(
        Dialog("<Item type=\"Group\"><Origin v=\"50\" h=\"60\"/><Items><Item type=\"CheckBox\" id=\"7\">" +
               Group(kTwo) + "</Item></Items></Item>"));
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(Reported("click 66 56").size(), 2u);
    EXPECT_TRUE(dynamic_cast<CheckBoxPane *>(GetGlogItem(glog, 7))->ReadOne(0));
}

TEST_F(ChoiceItems, NeedAtLeastOneButton) {
    EXPECT_EQ(ComplaintAboutItem("CheckBox", Group("")),
              "test.xml:1:97: item 1 (CheckBox): key RadioCheckButtonItems: <Button> is missing");
    EXPECT_TRUE(Holds(ComplaintAboutItem("RadioButton", ""), "<RadioCheckButtonItems> is missing"));
}

TEST_F(ChoiceItems, RefuseButtonsThatAreNone) {
    EXPECT_TRUE(
        Holds(ComplaintAboutItem("CheckBox", Group("<Button/>")), "<RadioCheckButtonStrings> is missing"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", Group("<Knob/>")), "there is no key <Knob>"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", Group(Button(0, 0, "a", "<Mode>2</Mode>"))),
                      "expected an integer from 0 to 1, found 2"));
}

TEST_F(ChoiceItems, RefuseTwoRadioButtonsThatAreOn) {
    std::string const on = "<State>1</State>";
    std::string const complaint =
        ComplaintAboutItem("RadioButton", Group(Button(0, 0, "a", on) + Button(20, 0, "b", on)));
    EXPECT_TRUE(Holds(complaint, "RadioCheckButtonItems: only one radio button can be on")) << complaint;
}

TEST_F(ChoiceItems, ReportBothMessagesOfAClick) {
    ShowGlog(Load(Dialog("<Item type=\"CheckBox\" id=\"3\">" + Group(kTwo) + "</Item>")), kShowGlog);
    EXPECT_EQ(Reported("click 25 45"),
              (std::vector<std::string>{
                  "\"pane\":\"CheckBoxPane\",\"id\":3,\"message\":\"ButtonValueChanged\",\"index\":1,"
                  "\"value\":true}",
                  "\"pane\":\"CheckBoxPane\",\"id\":3,\"message\":\"ButtonGroupPaneChanged\",\"index\":1}"}));
}

TEST_F(ChoiceItems, TellTheTreeDumpTheirButtons) {
    std::string const dump = Dump(
        Load(Dialog(Item("CheckBox", Group(kTwo + Button(60, 20, "x", "<State>1</State><Mode>1</Mode>"))))));
    EXPECT_TRUE(Holds(dump, "\"class\":\"CheckBoxPane\"")) << dump;
    EXPECT_TRUE(Holds(dump, "\"buttons\":[{\"value\":false,\"enabled\":true},{\"value\":false,\"enabled\":"
                            "true},{\"value\":true,\"enabled\":false}]"))
        << dump;
    EXPECT_TRUE(Holds(dump, "\"labels\":[{\"text\":\"Erste\"},{\"text\":\"Größe\"},{\"text\":\"x\"}]"))
        << dump;
}

TEST_F(ChoiceItems, AreMadeFromRecords) {
    CheckBoxPane *const boxes = dynamic_cast<CheckBoxPane *>(GetGlogItem(LoadRecord(Record(54)), 1));
    RadioButtonPane *const radios = dynamic_cast<RadioButtonPane *>(GetGlogItem(LoadRecord(Record(53)), 1));
    ASSERT_TRUE(boxes && radios);
    for (ButtonGroupPane *group :
         {static_cast<ButtonGroupPane *>(boxes), static_cast<ButtonGroupPane *>(radios)}) {
        EXPECT_EQ(group->CountButtons(), 2);
        ASSERT_EQ(group->CountButtonTexts(), 1);
        UString name;
        group->GetNthButtonName(0, name);
        EXPECT_EQ(Utf8::FromUString(name), "One");
        Rect second;
        group->GetButtonBounds(1, &second);
        EXPECT_EQ(second, (Rect{40, 20, 53, 38}));
    }
}

TEST_F(ChoiceItems, OfRecordsTakeTheirFlags) {
    glogRec *const glog = LoadRecord(Record(54));
    ShowGlog(glog, kShowGlog);
    desktop.Play("click 25 25 command");
    EXPECT_EQ(Values(*dynamic_cast<CheckBoxPane *>(GetGlogItem(glog, 1))), "01");
}

TEST_F(ChoiceItems, OfRecordsCutAtAnyLengthAreAnError) {
    std::string const whole = Record(54);
    for (std::size_t length = 0; length < whole.size(); ++length)
        EXPECT_TRUE(Holds(AboutRecord(whole.substr(0, length)), "before it is complete")) << length;
}

TEST_F(ChoiceItems, OfRecordsNeedButtonsAndTheBytesForThem) {
    EXPECT_EQ(AboutRecord(Shorts({54, 0, 16, 0})),
              "records: byte 16: item 1 (CheckBox): key RadioCheckButtonItems: expected 1 to 32767 buttons, "
              "found 0");
    EXPECT_TRUE(Holds(AboutRecord(Shorts({53, 0, 16, 0xFFFF, 0, 0})), "before it is complete"));
    EXPECT_TRUE(
        Holds(AboutRecord(Shorts({53, 0, 16, 1}) + Shorts({20, 20, 6, 0xFFFF})), "before it is complete"));
    EXPECT_TRUE(Holds(
        AboutRecord(Shorts({53, 0, 16, 1}) + Shorts({20, 20, 6, 1}) + Shorts({31, 38, 0, 0xFFFF}) + "One"),
        "before it is complete"));
    EXPECT_TRUE(Holds(AboutRecord(Record(54) + "?"), "1 byte after the record's last field"));
}

TEST_F(ChoiceItems, OfRecordsRefuseSpacingsExtensionsAndFontsThatThereAreNot) {
    auto const about = [this](int spacing, int extension, int font) {
        return AboutRecord(Shorts({54, 0, spacing, 1}) + Shorts({20, 20, extension, 1}) +
                           Shorts({31, 38, font, 1}) + "x");
    };
    EXPECT_EQ(about(-1, 0, 0), "records: byte 20: item 1 (CheckBox): key LineSpacing: expected an integer "
                               "from 0 to 1000, found -1");
    EXPECT_EQ(about(0, 16001, 0), "records: byte 28: item 1 (CheckBox): key HitExtension: expected an "
                                  "integer from 0 to 16000, found 16001");
    EXPECT_EQ(about(0, 0, -1), "records: byte 36: item 1 (CheckBox): key FSRID: expected an integer from 0 "
                               "to 255, found -1");
    EXPECT_EQ(about(0, 0, 255), "no complaint");
}

TEST_F(ChoiceItems, RefuseMoreButtonsThanThereAreIndices) {
    std::string const button = "<Button><RadioCheckButtonStrings/></Button>";
    std::string all;
    for (int i = 0; i < 32768; ++i)
        all += button;
    for (char const *type : {"CheckBox", "RadioButton"}) {
        std::string const complaint = ComplaintAboutItem(type, Group(all));
        EXPECT_TRUE(Holds(complaint, "key RadioCheckButtonItems: expected 1 to 32767 buttons, found 32768"))
            << complaint;
    }
}

TEST_F(ChoiceItems, OfAsManyButtonsAsThereAreIndicesAreMade) {
    std::string const button = "<Button><RadioCheckButtonStrings/></Button>";
    std::string all;
    for (int i = 0; i < 32766; ++i)
        all += button;
    all += "<Button><RadioCheckButtonStrings/><State>1</State></Button>";
    RadioButtonPane *const group = LoadOne<RadioButtonPane>("RadioButton", Group(all));
    EXPECT_EQ(group->CountButtons(), 32767);
    EXPECT_EQ(group->RadioGet(), 32766);
}

TEST_F(ChoiceItems, RefuseMoreLabelsThanThereAreKeysForTexts) {
    std::string label = "<String><Text>x</Text></String>", all;
    for (int i = 0; i < 32768; ++i)
        all += label;
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", Group("<Button><RadioCheckButtonStrings>" + all +
                                                           "</RadioCheckButtonStrings></Button>")),
                      "memory has run out"));
    EXPECT_EQ(LoadOne<CheckBoxPane>("CheckBox", Group(kTwo))->CountButtonTexts(), 2) << "keys were lost";
}

TEST_F(ChoiceItems, RefuseNumbersOutOfRange) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", "<LineSpacing>-1</LineSpacing>" +
                                                         Group(kTwo).substr(Group("").find("<Radio"))),
                      "key LineSpacing: expected an integer from 0 to 1000, found -1"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", Group("<Button><HitExtension>-1</HitExtension>"
                                                           "<RadioCheckButtonStrings/></Button>")),
                      "HitExtension: expected an integer from 0 to 16000, found -1"));
    EXPECT_TRUE(Holds(
        ComplaintAboutItem("CheckBox", Group("<Button><RadioCheckButtonStrings><String><FSRID>256</FSRID>"
                                             "<Text>x</Text></String></RadioCheckButtonStrings></Button>")),
        "FSRID: expected an integer from 0 to 255, found 256"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("CheckBox", Group("<Button><Origin v=\"40000\" h=\"0\"/>"
                                                           "<RadioCheckButtonStrings/></Button>")),
                      "expected an integer from -32768 to 32767, found 40000"));
}

} // namespace
