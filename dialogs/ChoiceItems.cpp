// Check boxes and radio buttons in dialogs.
#include "buttons/CheckBoxPane.h"
#include "buttons/RadioButtonPane.h"
#include "buttons/ckRadItemResRec.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include <limits>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

int const kLargestSpacing = 1000;    // pixels
int const kLargestExtension = 16000; // pixels
int const kLargestFont = 255;
int const kLargestMode = 1;
std::size_t const kMostButtons = std::numeric_limits<short>::max();

char const kButtonsKey[] = "RadioCheckButtonItems";
char const kButtonKey[] = "Button";
char const kStringsKey[] = "RadioCheckButtonStrings";
char const kStringKey[] = "String";

// Messages

class ValueReporter : public MessageReporter<ButtonGroupPaneListener> {
public:
    using MessageReporter::MessageReporter;
    void ButtonValueChanged(ButtonGroupPane *group, short index, bool value) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*group)
                                    .Text("message", std::string("ButtonValueChanged"))
                                    .Integer("index", index)
                                    .Flag("value", value));
    }
};

class ChangeReporter : public MessageReporter<ButtonGroupPane_Listener> {
public:
    using MessageReporter::MessageReporter;
    void ButtonGroupPaneChanged(ButtonGroupPane *group, short index) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*group)
                                    .Text("message", std::string("ButtonGroupPaneChanged"))
                                    .Integer("index", index));
    }
};

void ReportChanges(GlogPane *pane) {
    if (ButtonGroupPane *group = dynamic_cast<ButtonGroupPane *>(pane)) {
        new ValueReporter(group);
        new ChangeReporter(group);
    }
}

// Tree dump

template <class LineOf> std::string ArrayOf(int count, LineOf const &lineOf) {
    std::string array = "[";
    for (int i = 0; i < count; ++i)
        array += (i ? "," : "") + lineOf(i).Finish();
    return array + ']';
}

bool IsOn(ButtonGroupPane &group, short index) {
    if (CheckBoxPane *boxes = dynamic_cast<CheckBoxPane *>(&group))
        return boxes->ReadOne(index);
    RadioButtonPane *const radios = dynamic_cast<RadioButtonPane *>(&group);
    return radios && radios->RadioGet() == index;
}

bool DescribeChoices(GlogPane &pane, JsonLine &line) {
    ButtonGroupPane *const group = dynamic_cast<ButtonGroupPane *>(&pane);
    if (!group)
        return false;
    line.Raw(
        "buttons", ArrayOf(group->CountButtons(), [group](int i) {
            short const index = static_cast<short>(i);
            return JsonLine().Flag("value", IsOn(*group, index)).Flag("enabled", group->IsEnabled(index));
        }));
    line.Raw("labels", ArrayOf(group->CountButtonTexts(), [group](int n) {
                 UString text;
                 group->GetNthButtonName(n, text);
                 return JsonLine().Text("text", text);
             }));
    return true;
}

// Creators

bool IsSet(Container const &item, char const *key) { return item->GetSIntItemValue(ResourceKey(key)) != 0; }

// Calls the function with the index and item of each button.
template <class Function> void ForEachButton(GlogStyleSheet *sheet, Function const &function) {
    Container const buttons = sheet->GetContainerItem(ResourceKey(kButtonsKey));
    for (std::size_t i = 0; i < buttons->GetNumItems(); ++i)
        function(static_cast<short>(i), XMLLib::ContainerFromItem(buttons->GetNthItem(i)));
}

// Indices of buttons are 16 bits wide.
void RequireButtonCount(GlogStyleSheet *sheet) {
    std::size_t const count = sheet->GetContainerItem(ResourceKey(kButtonsKey))->GetNumItems();
    if (count < 1 || count > kMostButtons)
        throw KeyFault(kButtonsKey, "expected 1 to " + std::to_string(kMostButtons) + " buttons, found " +
                                        std::to_string(count));
}

// Creators of their own read no enabling.
void SetModes(GlogStyleSheet *sheet, ButtonGroupPane *group) {
    ForEachButton(sheet, [group](short index, Container const &button) {
        if (IsSet(button, "Mode"))
            group->SetOneEnable(index, false);
    });
}

GlogPane *MakeCheckBoxes(glogRec *glog, GlogStyleSheet *sheet) {
    RequireButtonCount(sheet);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, sheet);
    if (!group)
        return nullptr;
    ForEachButton(sheet, [group](short index, Container const &button) {
        group->SetOne(index, IsSet(button, "State"));
    });
    SetModes(sheet, group);
    return group;
}

// The index of the button that is on; the first where none says so.
short CurrentButton(GlogStyleSheet *sheet) {
    short const kNone = -1;
    short current = kNone;
    ForEachButton(sheet, [&current](short index, Container const &button) {
        if (!IsSet(button, "State"))
            return;
        if (current != kNone)
            throw KeyFault(kButtonsKey, "only one radio button can be on");
        current = index;
    });
    return current == kNone ? 0 : current;
}

GlogPane *MakeRadioButtons(glogRec *glog, GlogStyleSheet *sheet) {
    RequireButtonCount(sheet);
    short const current = CurrentButton(sheet);
    RadioButtonPane *const group = RadioButtonPane::NewRadioButtonPane(glog, sheet);
    if (!group)
        return nullptr;
    group->RadioSet(current);
    SetModes(sheet, group);
    return group;
}

// Records: they are turned into the items that the same panes have in XML.

void AddOrigin(XMLLib::ContainerItem &item, Point origin) {
    Container const point = XMLLib::CreateContainer(ResourceKey("Origin"));
    point->AddSIntItem(ResourceKey("kV"), origin.v);
    point->AddSIntItem(ResourceKey("kH"), origin.h);
    item.AddItem(ResourceKey("Origin"), point);
}

int ReadCount(RecordBytes &bytes) { return static_cast<unsigned short>(bytes.Short()); }

UString ReadText(RecordBytes &bytes) {
    std::string utf8;
    for (int left = ReadCount(bytes); left > 0; --left)
        utf8 += static_cast<char>(bytes.Byte());
    return Utf8::ToUString(utf8);
}

Container ReadString(RecordBytes &bytes) {
    Container item = XMLLib::CreateContainer(ResourceKey(kStringKey));
    AddOrigin(*item, bytes.ReadPoint());
    item->AddSIntItem(ResourceKey("FSRID"), bytes.Short("FSRID", 0, kLargestFont));
    item->AddUStringItem(ResourceKey("Text"), ReadText(bytes));
    return item;
}

Container ReadButton(RecordBytes &bytes) {
    Container item = XMLLib::CreateContainer(ResourceKey(kButtonKey));
    AddOrigin(*item, bytes.ReadPoint());
    item->AddSIntItem(ResourceKey("HitExtension"), bytes.Short("HitExtension", 0, kLargestExtension));
    Container const strings = XMLLib::CreateContainer(ResourceKey(kStringsKey));
    for (int left = ReadCount(bytes); left > 0; --left)
        strings->AddItem(ResourceKey(kStringKey), ReadString(bytes));
    item->AddItem(ResourceKey(kStringsKey), strings);
    return item;
}

Container ReadRecord(RecordBytes &bytes) {
    Container item = XMLLib::CreateContainer(ResourceKey("Item"));
    bytes.Short(); // the kind
    item->AddSIntItem(ResourceKey("Flags"), bytes.Short());
    item->AddSIntItem(ResourceKey("LineSpacing"), bytes.Short("LineSpacing", 0, kLargestSpacing));
    Container const buttons = XMLLib::CreateContainer(ResourceKey(kButtonsKey));
    for (int left = ReadCount(bytes); left > 0; --left)
        buttons->AddItem(ResourceKey(kButtonKey), ReadButton(bytes));
    item->AddItem(ResourceKey(kButtonsKey), buttons);
    return item;
}

GlogPane *MakeCheckBoxesFromRecord(glogRec *glog, RecordBytes &bytes) {
    GlogStyleSheet sheet(ReadRecord(bytes));
    return MakeCheckBoxes(glog, &sheet);
}

GlogPane *MakeRadioButtonsFromRecord(glogRec *glog, RecordBytes &bytes) {
    GlogStyleSheet sheet(ReadRecord(bytes));
    return MakeRadioButtons(glog, &sheet);
}

// Keys

KeyList StringKeys() {
    return KeyList().Point("Origin").Integer("FSRID", 0, kLargestFont).String("Text").Required();
}

KeyList ButtonKeys() {
    return KeyList()
        .Point("Origin")
        .Integer("HitExtension", 0, kLargestExtension)
        .Container(kStringsKey, KeyList().Container(kStringKey, StringKeys()).Repeated())
        .Required()
        .Integer("Mode", 0, kLargestMode)
        .Flag("State");
}

KeyList GroupKeys() {
    return KeyList()
        .Integer("LineSpacing", 0, kLargestSpacing)
        .Integer("Flags")
        .Container(kButtonsKey, KeyList().Container(kButtonKey, ButtonKeys()).Required().Repeated())
        .Required();
}

} // namespace

void AddChoiceItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeChoices);
    registry.Add(ItemType("CheckBox")
                     .Keys(GroupKeys())
                     .MadeBy(MakeCheckBoxes)
                     .FromRecord(ckRadItemResRec::kCheckKind, ItemType::kWholeKind, MakeCheckBoxesFromRecord)
                     .ReportedBy(ReportChanges)
                     .LayoutType(ckRadItemResRec::kCheckKind));
    registry.Add(
        ItemType("RadioButton")
            .Keys(GroupKeys())
            .MadeBy(MakeRadioButtons)
            .FromRecord(ckRadItemResRec::kRadioKind, ItemType::kWholeKind, MakeRadioButtonsFromRecord)
            .ReportedBy(ReportChanges)
            .LayoutType(ckRadItemResRec::kRadioKind));
}
