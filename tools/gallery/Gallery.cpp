#include "tools/gallery/Gallery.h"
#include "buttons/FrameButtonPane.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"
#include "tools/gallery/ChoiceButtonPane.h"

namespace {

// Numbers of the frame's items. Those of pages are smaller.
int const kPageList = 9000;
int const kPagePlace = 9001;
int const kStatus = 9002;
int const kFirstPage = 9100; // and one more for each page

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

short const kPageButtonHeight = 28; // pixels
int const kFill = 3;                // alignment: as wide as the group

void AddChoiceItems() {
    ItemRegistry::Instance().Add(
        ItemType("Choice")
            .Keys(KeyList().Rect("BoundsRect").String("ButtonText").Required().Integer("Align", 0, 2))
            .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                return ChoiceButtonPane::NewChoiceButtonPane(glog, sheet);
            }));
}

glogRec *LoadFrame(std::string const &path) {
    AddChoiceItems();
    return LoadGlog(path);
}

UString KindOf(GlogPane *pane) {
    return Utf8::ToUString(dynamic_cast<FrameButtonPane *>(pane) ? "Frame button" : "Button");
}

UString Number(int value) {
    UString text;
    tarn::NumToUString(value, tarn::kPlainNumber, text);
    return text;
}

} // namespace

Gallery::Gallery(Desktop &desktop_, PageFiles const &files_, double scale_)
    : desktop(desktop_)
    , files(files_)
    , window(LoadFrame(files_.Frame()))
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
    SetStatus(Utf8::ToUString("Press something"));
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
    if (FrameButtonPane *button = dynamic_cast<FrameButtonPane *>(pane))
        button->ToggleState();
    Report(pane, item, value);
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
    UString text = name.empty() ? KindOf(pane) : name;
    text += Utf8::ToUString(", item ");
    text += Number(item);
    text += Utf8::ToUString(", was pressed and answered ");
    text += Number(value);
    SetStatus(text);
}

void Gallery::SetStatus(UString const &text) {
    if (LabelPane *label = dynamic_cast<LabelPane *>(Find(kStatus)))
        label->SetTextWithInval(text);
}
