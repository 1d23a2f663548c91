#include "tools/gallery/Gallery.h"
#include "buttons/BoxSelectPane.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/FrameButtonPane.h"
#include "buttons/GIconButton.h"
#include "buttons/GIconButtonPane.h"
#include "buttons/RadioButtonPane.h"
#include "buttons/TwistDownButton.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "graphics/PictPane.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/glogRec.h"
#include "menus/PopMPane.h"
#include "tools/gallery/ChoiceButtonPane.h"
#include "tools/gallery/GalleryItems.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"

namespace {

// Numbers of the frame's items. Those of pages are smaller.
int const kPageList = 9000;
int const kPagePlace = 9001;
int const kStatus = 9002;
int const kFirstPage = 9100; // and one more for each page

// On a page: the group that a triangle opens has the triangle's number and this.
int const kDetailsOffset = 100;

struct ThemeChoice {
    int id;
    char const *theme;
};
ThemeChoice const kThemes[] = {{9010, "light"}, {9011, "dark"}};

struct ScaleChoice {
    int id;
    double scale;
};
ScaleChoice const kScales[] = {{9020, 1.0}, {9021, 1.5}, {9022, 2.0}};

short const kPageButtonHeight = 18; // pixels
int const kFill = 3;                // alignment: as wide as the group

glogRec *LoadFrame(PageFiles const &files) {
    GalleryItems::Add();
    files.AddResources();
    return LoadGlog(files.Frame());
}

// What a hit pane without a name of its own is called.
Phrase KindOf(GlogPane *pane) {
    if (dynamic_cast<FrameButtonPane *>(pane))
        return Phrase::kFrameButton;
    if (dynamic_cast<BoxSelectPane *>(pane))
        return Phrase::kBoxSelect;
    if (dynamic_cast<TwistDownButton *>(pane))
        return Phrase::kTriangle;
    if (dynamic_cast<CheckBoxPane *>(pane))
        return Phrase::kCheckBoxes;
    if (dynamic_cast<RadioButtonPane *>(pane))
        return Phrase::kRadioButtons;
    if (dynamic_cast<GIconButton *>(pane) || dynamic_cast<GIconButtonPane *>(pane))
        return Phrase::kIconButton;
    if (dynamic_cast<PopMPane *>(pane))
        return Phrase::kPopUpMenu;
    if (dynamic_cast<PictPane *>(pane))
        return Phrase::kPicture;
    return dynamic_cast<GIconPane *>(pane) ? Phrase::kIcon : Phrase::kButton;
}

} // namespace

Gallery::Gallery(Desktop &desktop_, PageFiles const &files_, double scale_)
    : desktop(desktop_)
    , files(files_)
    , window(LoadFrame(files_))
    , commands([this](CommandSpecifier const &command) { ReportCommand(command); })
    , scale(scale_) {
    AddPageButtons();
    ShowPage(0);
    MarkChoices();
    desktop.SetHitHandler([this](glogRec *, int item, int value) { Hit(item, value); });
    ShowGlog(window, kShowGlog);
}

GlogPane *Gallery::Find(int id) const { return GetGlogItem(window, static_cast<short>(id)); }

CompoundPane *Gallery::Container(int id) const { return dynamic_cast<CompoundPane *>(Find(id)); }

void Gallery::AddPageButtons() {
    CompoundPane *const list = Container(kPageList);
    Rect const box = {0, 0, kPageButtonHeight, 0};
    int id = kFirstPage;
    for (PageFile const &file : files.Pages()) {
        UString const title = Utf8::ToUString(ReadGlogOptions(file.path).title);
        ChoiceButtonPane *const button = ChoiceButtonPane::NewChoiceButtonPane(window, box, title);
        button->SetID(id++);
        button->GetLayoutRect()->SetAttribute(GlogLayoutItem::kAlignment, kFill, GlogLayoutItem::kPixels,
                                              UString());
        list->Add(button, -1);
    }
    desktop.FinishGlog(window);
}

void Gallery::ShowPage(std::size_t index) {
    CompoundPane *const place = Container(kPagePlace);
    short const before = place->NumSubpanes();
    LoadItems(files.Pages()[index].path, place);
    for (short i = 0; i < before; ++i)
        place->Del(0);
    page = index;
    MarkChoices();
    SetStatus(Phrases::Get(Phrase::kPressSomething));
}

void Gallery::Choose(int id, bool on) {
    if (ChoiceButtonPane *button = dynamic_cast<ChoiceButtonPane *>(Find(id)))
        button->SetChosen(on);
}

void Gallery::MarkChoices() {
    for (std::size_t i = 0; i < files.Pages().size(); ++i)
        Choose(kFirstPage + static_cast<int>(i), i == page);
    for (ThemeChoice const &choice : kThemes)
        Choose(choice.id, choice.theme == desktop.Theme());
    for (ScaleChoice const &choice : kScales)
        Choose(choice.id, choice.scale == scale);
}

void Gallery::Hit(int item, int value) {
    if (Navigate(item)) {
        MarkChoices();
        return;
    }
    GlogPane *const pane = Find(item);
    ShowEffect(pane, item);
    Report(pane, item, value);
}

// What a program would do about a hit, where the pane leaves it to the program.
void Gallery::ShowEffect(GlogPane *pane, int item) {
    if (FrameButtonPane *button = dynamic_cast<FrameButtonPane *>(pane)) {
        button->ToggleState();
    } else if (TwistDownButton *triangle = dynamic_cast<TwistDownButton *>(pane)) {
        if (GlogPane *details = Find(item + kDetailsOffset))
            triangle->IsOpen() ? details->Show() : details->Hide();
    } else if (GIconPane *icon = dynamic_cast<GIconPane *>(pane);
               icon && !dynamic_cast<GIconButton *>(pane)) {
        icon->SetCurState(static_cast<short>((icon->GetCurState() + 1) % icon->GetNumStates()));
        icon->Inval();
    }
}

bool Gallery::Navigate(int item) {
    for (ThemeChoice const &choice : kThemes) {
        if (choice.id == item)
            return desktop.SetTheme(choice.theme), true;
    }
    for (ScaleChoice const &choice : kScales) {
        if (choice.id == item)
            return SetScale(choice.scale), true;
    }
    if (item < kFirstPage || item >= kFirstPage + static_cast<int>(files.Pages().size()))
        return false;
    ShowPage(static_cast<std::size_t>(item - kFirstPage));
    return true;
}

void Gallery::SetScale(double factor) {
    scale = factor;
    desktop.SetScale(factor);
}

void Gallery::Report(GlogPane *pane, int item, int value) {
    GlogButtonPane *const button = dynamic_cast<GlogButtonPane *>(pane);
    UString name;
    if (button)
        button->GetButtonText(name);
    if (name.empty())
        name = Phrases::Get(KindOf(pane));
    SetStatus(
        Phrases::Fill(Phrase::kWasPressed, {name, LabelText::OfNumber(item), LabelText::OfNumber(value)}));
}

void Gallery::ReportCommand(CommandSpecifier const &command) {
    SetStatus(Phrases::Fill(Phrase::kCommandSent,
                            {LabelText::OfNumber(command.commandID), LabelText::OfNumber(command.classID)}));
}

void Gallery::SetStatus(UString const &text) { LabelText::Show(window, kStatus, text); }
