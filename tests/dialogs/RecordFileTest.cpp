// Dialogs of binary records.
#include "buttons/FrameButtonPane.h"
#include "buttons/OvalButtonPane.h"
#include "buttons/StudButtonPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"
#include "text/LabelPane.h"
#include <vector>

namespace {

// Bytes put together number by number.
class Bytes {
public:
    Bytes &Short(int value) {
        bytes += static_cast<char>(value & 0xFF);
        bytes += static_cast<char>(value >> 8 & 0xFF);
        return *this;
    }
    Bytes &Byte(int value) {
        bytes += static_cast<char>(value);
        return *this;
    }
    Bytes &Text(std::string const &text) {
        bytes += text;
        return *this;
    }
    std::string const &Get() const { return bytes; }

private:
    std::string bytes;
};

std::string Oval() { return Bytes().Short(18).Short(20).Short(30).Short(100).Short(2).Short(1).Get(); }
std::string Stud() { return Bytes().Short(5).Short(-30).Short(-80).Short(3).Short(64).Get(); }
std::string Frame() {
    return Bytes()
        .Short(13)
        .Short(60)
        .Short(20)
        .Short(1821)
        .Short(2)
        .Short(1)
        .Short(8)
        .Short(2)
        .Short(1)
        .Get();
}
std::string Label() {
    return Bytes().Short(9).Short(50).Short(200).Byte(6).Byte(1).Short(0).Text("Größe").Get();
}

std::string Records(std::vector<std::string> const &records, int width = 320, int height = 200) {
    Bytes bytes;
    bytes.Text("GLOGREC1").Short(width).Short(height).Short(static_cast<int>(records.size()));
    for (std::string const &record : records)
        bytes.Short(static_cast<int>(record.size())).Text(record);
    return bytes.Get();
}

class RecordDialog : public DialogTest {
protected:
    glogRec *LoadRecords(std::string const &bytes) {
        return LoadGlogFromRecords(bytes.data(), bytes.size(), GlogOptions().Title("Old").Growable(true),
                                   "old.glog");
    }
    std::string About(std::string const &bytes) {
        return Complaint([&] { LoadRecords(bytes); });
    }
};

TEST_F(RecordDialog, HasTheSizeOfItsHeaderAndTheRestOfTheOptions) {
    glogRec *const glog = LoadRecords(Records({}, 360, 220));
    EXPECT_EQ(GetGlogWidth(glog), 360);
    EXPECT_EQ(GetGlogHeight(glog), 220);
    EXPECT_EQ(Glog::From(glog).Options().title, "Old");
    EXPECT_TRUE(Glog::From(glog).Options().growable);
}

TEST_F(RecordDialog, MakesThePanesOfItsRecordsUnderTheirPlaces) {
    glogRec *const glog = LoadRecords(Records({Oval(), Stud(), Frame(), Label()}));
    ASSERT_EQ(CountGlogItems(glog), 4);
    OvalButtonPane *const oval = dynamic_cast<OvalButtonPane *>(GetGlogItem(glog, 1));
    StudButtonPane *const stud = dynamic_cast<StudButtonPane *>(GetGlogItem(glog, 2));
    FrameButtonPane *const frame = dynamic_cast<FrameButtonPane *>(GetGlogItem(glog, 3));
    LabelPane *const label = dynamic_cast<LabelPane *>(GetGlogItem(glog, 4));
    ASSERT_TRUE(oval && stud && frame && label);
    UString text;
    oval->GetButtonText(text);
    EXPECT_EQ(Utf8::FromUString(text), "Cancel");
    EXPECT_EQ(BoxOf(oval), (Rect{20, 30, 39, 130}));
    stud->GetButtonText(text);
    EXPECT_EQ(Utf8::FromUString(text), "Record");
    EXPECT_EQ(BoxOf(stud), (Rect{170, 240, 190, 304}));
    EXPECT_EQ(BoxOf(frame), (Rect{60, 20, 78, 46}));
    EXPECT_EQ(Utf8::FromUString(label->GetText()), "Größe");
    EXPECT_EQ(label->GetFontFSRID(), 6);
    EXPECT_EQ(BoxOf(label).right, 200);
}

TEST_F(RecordDialog, TakesOnlyTheLowByteOfAnOvalButtonsKind) {
    std::string oval = Oval();
    oval[1] = 0x40;
    EXPECT_NE(dynamic_cast<OvalButtonPane *>(GetGlogItem(LoadRecords(Records({oval})), 1)), nullptr);
}

TEST_F(RecordDialog, TakesTheWholeKindOfTheOthers) {
    std::string stud = Stud();
    stud[1] = 0x40;
    EXPECT_EQ(About(Records({stud})),
              "old.glog: byte 16: item 1: there is no kind of record with the number 16389");
}

TEST_F(RecordDialog, IsRecognisedInAFile) {
    TemporaryDirectory directory;
    glogRec *const glog = LoadGlog(directory.Write("old.glog", Records({Oval()})));
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(RecordDialog, NamesItsFileInErrors) {
    TemporaryDirectory directory;
    std::string const path = directory.Write("old.glog", Records({Oval()}) + "?");
    EXPECT_EQ(Complaint([&] { LoadGlog(path); }), path + ": byte 28: 1 byte after the last item");
}

TEST_F(RecordDialog, CutAtAnyLengthIsAnError) {
    std::string const whole = Records({Oval(), Stud(), Frame(), Label()});
    for (std::size_t length = 0; length < whole.size(); ++length)
        EXPECT_TRUE(Holds(About(whole.substr(0, length)), "old.glog: byte ")) << length;
    EXPECT_EQ(About(whole), "no complaint");
}

TEST_F(RecordDialog, WithARecordCutAtAnyLengthIsAnError) {
    std::string const label = Label().substr(0, 10);
    for (std::string const &record : {Oval(), Stud(), Frame(), label}) {
        for (std::size_t length = 0; length < record.size(); ++length)
            EXPECT_TRUE(Holds(About(Records({record.substr(0, length)})), "before it is complete")) << length;
    }
}

TEST_F(RecordDialog, TellsWhereARecordEnds) {
    EXPECT_EQ(About(Records({Oval(), Stud().substr(0, 7)})),
              "old.glog: byte 37: item 2 (StudButton): the record ends after 7 bytes, before it is complete");
    EXPECT_EQ(About(Records({Stud() + "xy"})),
              "old.glog: byte 26: item 1 (StudButton): 2 bytes after the record's last field");
}

TEST_F(RecordDialog, TellsWhichItemIsMissing) {
    std::string const two = Records({Oval(), Stud()});
    EXPECT_EQ(About(two.substr(0, two.size() - 12)),
              "old.glog: byte 28: item 2: the dialog ends before this item");
    EXPECT_EQ(About(two.substr(0, two.size() - 1)),
              "old.glog: byte 30: item 2: the record should have 10 bytes, but only 9 bytes are left");
}

TEST_F(RecordDialog, MustBeginWithItsMagic) {
    std::string other = Records({});
    other[7] = '2';
    EXPECT_EQ(About(other), "old.glog: byte 0: a dialog of records begins with GLOGREC1");
}

TEST_F(RecordDialog, MustHaveAPossibleSize) {
    EXPECT_EQ(About(Records({}, 0, 200)), "old.glog: byte 8: expected a width from 1 to 16000, found 0");
    EXPECT_EQ(About(Records({}, 320, 40000)),
              "old.glog: byte 10: expected a height from 1 to 16000, found 40000");
}

TEST_F(RecordDialog, MustNotClaimTooManyItems) {
    EXPECT_EQ(About(Bytes().Text("GLOGREC1").Short(9).Short(9).Short(0xFFFF).Get()),
              "old.glog: byte 12: more than 32767 items");
}

TEST_F(RecordDialog, ReplacesBrokenTextInLabels) {
    std::string const label = Label().substr(0, 10) + "a\xFF" + "b";
    LabelPane *const pane = dynamic_cast<LabelPane *>(GetGlogItem(LoadRecords(Records({label})), 1));
    EXPECT_EQ(Utf8::FromUString(pane->GetText()), "a\uFFFDb");
}

} // namespace
