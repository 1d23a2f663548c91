// What the tests of check boxes and radio buttons share.
#pragma once
#include "buttons/ButtonGroupPane.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/RadioButtonPane.h"
#include "buttons/ckRadItemResRec.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "tests/PaneTest.h"
#include <sstream>

// Hears both messages of a group and writes them down in one list: "2 on", "2 off", "2 changed".
class GroupListener : public ButtonGroupPaneListener, public ButtonGroupPane_Listener {
public:
    void HangOn(ButtonGroupPane *group) {
        ButtonGroupPaneListener::DependUpon(group);
        ButtonGroupPane_Listener::DependUpon(group);
    }
    void ButtonValueChanged(ButtonGroupPane *source, short index, bool value) override {
        sources.push_back(source);
        heard.push_back(std::to_string(index) + (value ? " on" : " off"));
        if (onValue)
            onValue();
    }
    void ButtonGroupPaneChanged(ButtonGroupPane *source, short index) override {
        sources.push_back(source);
        heard.push_back(std::to_string(index) + " changed");
        if (onChange)
            onChange();
    }
    std::vector<std::string> heard;
    std::vector<ButtonGroupPane *> sources;
    std::function<void()> onValue, onChange;
};

// A pane that others see being used.
class ActivePane : public Provider<AutoSetActivityListener> {
public:
    void Use() { BroadcastChange(AutoSetActivityMsg(this), nullptr); }
};

// The XML item of a group, button by button.
class GroupItem {
public:
    explicit GroupItem(int lineSpacing = 16)
        : item(XMLLib::CreateContainer(Key("Item")))
        , buttons(XMLLib::CreateContainer(Key("RadioCheckButtonItems"))) {
        item->AddSIntItem(Key("LineSpacing"), lineSpacing);
        item->AddItem(Key("RadioCheckButtonItems"), buttons);
    }
    GroupItem &Flags(int flags) {
        item->AddSIntItem(Key("Flags"), flags);
        return *this;
    }
    GroupItem &Button(Point origin, int extension = 0) {
        ButtonWithoutOrigin(extension);
        AddPoint(*button, origin);
        return *this;
    }
    GroupItem &ButtonWithoutOrigin(int extension = 0) {
        button = XMLLib::CreateContainer(Key("Button"));
        button->AddSIntItem(Key("HitExtension"), extension);
        strings = XMLLib::CreateContainer(Key("RadioCheckButtonStrings"));
        button->AddItem(Key("RadioCheckButtonStrings"), strings);
        buttons->AddItem(Key("Button"), button);
        return *this;
    }
    // Of the button before.
    GroupItem &Label(Point origin, char const *text, int fsrid = 0) {
        LabelWithoutOrigin(text, fsrid);
        AddPoint(*label, origin);
        return *this;
    }
    GroupItem &LabelWithoutOrigin(char const *text, int fsrid = 0) {
        label = XMLLib::CreateContainer(Key("String"));
        label->AddSIntItem(Key("FSRID"), fsrid);
        label->AddUStringItem(Key("Text"), Key(text));
        strings->AddItem(Key("String"), label);
        return *this;
    }
    // Valid while this object lives.
    GlogStyleSheet *Sheet() {
        sheet.SetItemRes(item);
        return &sheet;
    }
    static UString Key(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

    boost::shared_ptr<XMLLib::ContainerItem> item, buttons;

private:
    static void AddPoint(XMLLib::ContainerItem &container, Point point) {
        boost::shared_ptr<XMLLib::ContainerItem> const spot = XMLLib::CreateContainer(Key("Origin"));
        spot->AddSIntItem(Key("kV"), point.v);
        spot->AddSIntItem(Key("kH"), point.h);
        container.AddItem(Key("Origin"), spot);
    }

    boost::shared_ptr<XMLLib::ContainerItem> button, strings, label;
    GlogStyleSheet sheet;
};

// A group whose protected operations can be called.
template <class Pane> class OpenGroup : public Pane {
public:
    using Pane::AutoSetButton;
    using Pane::DrawGuts;
    using Pane::GetReleaseIcon;
    using Pane::GlogItemFromRes;
    using Pane::HandleClick;
    using Pane::SetButton;
    using Pane::TrackButton;
};

class ButtonGroupTest : public PaneTest {
protected:
    typedef std::vector<std::string> Heard;

    // A glog whose check groups have lines of that height.
    void UseSpacing(int pixels) {
        boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(Text("Glog"));
        item->AddSIntItem(Text("GCheckGroup_LineSpacing"), pixels);
        glog =
            desktop.NewGlog(GlogOptions().Size(320, 200).StyleSheet(std::make_shared<GlogStyleSheet>(item)));
    }
    CheckBoxPane *NewBoxes(unsigned short flags = 0) {
        ckRadItemResRec record = {ckRadItemResRec::kCheckKind, flags};
        return CheckBoxPane::NewCheckBoxPane(glog, &record);
    }
    RadioButtonPane *NewRadios() {
        ckRadItemResRec record = {ckRadItemResRec::kRadioKind, 0};
        return RadioButtonPane::NewRadioButtonPane(glog, &record);
    }
    // Three buttons with labels, one below the other, from (20, 10) on: icons from 20 to 32 across, at 10, 30
    // and 50 from the top, labels from 38 on.
    static GroupItem ThreeButtons() {
        GroupItem item;
        item.Button({10, 20}, 4).Label({20, 38}, "First");
        item.Button({30, 20}, 4).Label({40, 38}, "Second");
        item.Button({50, 20}, 4).Label({60, 38}, "Third");
        return item;
    }
    CheckBoxPane *ThreeBoxes(int flags = 0) {
        GroupItem item = ThreeButtons();
        return CheckBoxPane::NewCheckBoxPane(glog, item.Flags(flags).Sheet());
    }
    RadioButtonPane *ThreeRadios() {
        GroupItem item = ThreeButtons();
        return RadioButtonPane::NewRadioButtonPane(glog, item.Sheet());
    }
    // Puts the pane into a column that begins with a gap.
    CompoundPane *PutIntoLayout(GlogPane *pane, short gap) {
        CompoundPane *const column = new CompoundPane;
        column->CompoundPaneInit(glog, 0);
        Rect box = {0, 0, 200, 300};
        column->SetBox(&box);
        column->GetLayout()->SetAttribute(GlogLayoutItem::kInsetTop, gap, GlogLayoutItem::kPixels, UString());
        column->Add(pane, -1);
        column->SetUseLayout(true);
        WithPerformLayoutRectUpdate const update(column);
        return column;
    }

    static Rect BoundsOf(ButtonGroupPane &group, short index) {
        Rect rect;
        group.GetButtonBounds(index, &rect);
        return rect;
    }
    static UString NameOf(ButtonGroupPane &group, int n) {
        UString name;
        group.GetNthButtonName(n, name);
        return name;
    }
    static TarnQuickDrawText::FontInfo InfoOf(int font) {
        SetFontData(GetIndVelaFont(font));
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return info;
    }
    static short WidthOf(char const *text, int font = 0) {
        SetFontData(GetIndVelaFont(font));
        return static_cast<short>(LooseStringWidth(Text(text), 0.0f, 1.0f));
    }
    // The icon indices that the lines draw, in order.
    static std::vector<int> IconsIn(Lines const &lines) {
        std::vector<int> icons;
        for (std::string const &line : Only("Draw1Icon", lines))
            icons.push_back(std::stoi(line.substr(line.find("\"icon\":") + 7)));
        return icons;
    }
    std::vector<int> IconsOf(ButtonGroupPane &group) { return IconsIn(DrawingOf(group)); }
};
