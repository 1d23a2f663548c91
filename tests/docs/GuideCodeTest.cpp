// The code of the guide that is no part of its example, as it stands there.
#include "desktop/SimulatedDesktop.h"
#include "desktop/resources/Resources.h"
#include "dialogs/FindItem.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "frame/ModalGlogClass.h"
#include "frame/ResourceReading.h"
#include "frame/TabPane_Listener.h"
#include "host/GlogPane.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PanePtr.h"
#include "host/VelaDrawing.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include "tabs/TabPane.h"
#include "tests/docs/Document.h"
#include "tests/resources/TemporaryDirectory.h"
#include "text/GTextPane.h"
#include "text/TextPane.h"
#include <algorithm>
#include <gtest/gtest.h>

namespace {

UString tempo;

class TempoDialog : public ModalGlogClass {
public:
    bool Ask() {
        int value = 0;
        return ModalGlogInit(700) && ModalLoop(&value, 0, 0, 0) == GetOKItemNum();
    }

private:
    char Read() override {
        tempo = FindItem<GTextPane>(GlogP(), 3)->GetText();
        return !tempo.empty(); // false keeps the dialog open
    }
};

// A level from 0 to 100 as a bar. A click sets it back.
class MeterPane : public GlogPane {
public:
    MeterPane(glogRec *owner, Rect box, int newLevel)
        : level(newLevel) {
        GlogPaneInit(owner, 0);
        SetBox(&box);
    }

protected:
    void DrawGuts(OSRgn *) override {
        Rect box;
        GetBox(&box);
        box.right = static_cast<short>(box.left + (box.right - box.left) * level / 100);
        VelaDrawing::PaintRect(&box);
    }
    int HandleClick(EventRecordAdapter *) override {
        level = 0;
        Inval();
        return 1; // a hit
    }

private:
    int level;
};

GlogPane *MakeMeter(glogRec *glog, GlogStyleSheet *sheet) {
    return new MeterPane(glog, OptionalRect(sheet->GetItemRes(), "BoundsRect"),
                         sheet->GetSInt32ItemValue(ResourceKey("Level")));
}

void AddMeters() {
    ItemRegistry::Instance().Add(ItemType("Meter")
                                     .Keys(KeyList().Rect("BoundsRect").Required().Integer("Level", 0, 100))
                                     .MadeBy(MakeMeter));
}

// Shows the page of the selected tab.
class Pages : public TabPane_Listener {
public:
    explicit Pages(glogRec *glog)
        : pages{FindItem<GlogPane>(glog, 2), FindItem<GlogPane>(glog, 3)} {
        DependUpon(FindItem<TabPane>(glog, 1));
    }
    void TabSelected(TabPane *, int item, int former) override {
        pages[former]->Hide();
        pages[item]->Show();
    }

private:
    GlogPane *pages[2];
};

// A level from 0 to 100 that is slid, with a text that says it.
class Level : public ScrollBarClient {
public:
    explicit Level(glogRec *glog)
        : text(FindItem<TextPane>(glog, 5)) {
        bar = FindItem<ScrollBarPane>(glog, 4);
        bar->SetClient(this);
        ScrollTo(bar.Get(), bar->GetPosition());
    }
    ~Level() override {
        if (bar)
            bar->SetClient(nullptr);
    }

    int GetMaxScrollValue(ScrollBarPane *) override { return 100; }
    double GetThumbRatio(ScrollBarPane *) override { return 0.1; }
    void ScrollTo(ScrollBarPane *, int position) override {
        level = std::min(std::max(position, 0), 100);
        bar->Set(level, 100);
        text->SetText(Utf8::ToUString(std::to_string(level) + " %"));
    }
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override {
        amount = byUnit ? 1 : 10;
        multiplier = 1;
    }
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override {
        ScrollTo(bar.Get(), level + amount * multiplier);
    }

private:
    int level = 0;
    PanePtr<ScrollBarPane> bar;
    TextPane *text;
};

// The last dialog of the guide that has the part.
std::string GuideDialog(std::string const &part) {
    std::string found;
    for (std::string const &xml : Document("docs/guide.md").Blocks("xml")) {
        if (xml.find(part) != std::string::npos)
            found = xml;
    }
    return found;
}

} // namespace

TEST(GuideCode, AsksInADialogUntilThereIsAnAnswer) {
    SimulatedDesktop desktop;
    TemporaryDirectory directory;
    directory.Write("windows/700.xml", GuideDialog("Tempo"));
    Resources::Instance().AddDirectory(directory.Path());
    TempoDialog dialog;
    desktop.Script("key Return\nwait 1\nclick 100 26\ntype \"132\"\nclick 148 61");
    EXPECT_TRUE(dialog.Ask());
    EXPECT_EQ(tempo, UString("132", UString::kByteEncoding1));
}

TEST(GuideCode, CancelsTheDialog) {
    SimulatedDesktop desktop;
    TemporaryDirectory directory;
    directory.Write("windows/700.xml", GuideDialog("Tempo"));
    Resources::Instance().AddDirectory(directory.Path());
    TempoDialog dialog;
    desktop.Script("wait 1\nkey Escape");
    EXPECT_FALSE(dialog.Ask());
    EXPECT_GT(desktop.Now(), 1.0) << "the dialog was not up until then";
}

TEST(GuideCode, MakesPanesOfItsOwn) {
    SimulatedDesktop desktop;
    AddMeters();
    glogRec *const glog = LoadGlogFromText(GuideDialog("\"Meter\""), "guide.md");
    ShowGlog(glog, kShowGlog);
    desktop.TakeDrawing();
    int hits = 0;
    desktop.SetHitHandler([&](glogRec *, int, int) { ++hits; });
    desktop.Play("click 40 24");
    EXPECT_EQ(hits, 1);
    EXPECT_FALSE(desktop.TakeDrawing().empty());
}

TEST(GuideCode, ShowsThePageOfTheTab) {
    SimulatedDesktop desktop;
    glogRec *const glog = LoadGlogFromText(GuideDialog("\"Tabs\""), "guide.md");
    Pages pages(glog);
    ShowGlog(glog, kShowGlog);
    EXPECT_TRUE(GetGlogItem(glog, 4)->GetVisibility());
    desktop.Play("resize 360 240\nclick @1+70+8\nwait 1\nclick @6\ntype \"Comp\"");
    EXPECT_FALSE(GetGlogItem(glog, 4)->GetVisibility());
    EXPECT_EQ(Utf8::FromUString(FindItem<GTextPane>(glog, 6)->GetText()), "Comp");
    Rect const page = GetGlogItem(glog, 3)->GetDrawRectangle();
    EXPECT_EQ(page.right, 360 - 16);
    EXPECT_EQ(page.bottom, 240 - 16);
}

TEST(GuideCode, TellsWhatIsSlid) {
    SimulatedDesktop desktop;
    glogRec *const glog = LoadGlogFromText(GuideDialog("\"Tabs\""), "guide.md");
    Level level(glog);
    ShowGlog(glog, kShowGlog);
    auto const said = [&] { return Utf8::FromUString(FindItem<TextPane>(glog, 5)->GetText()); };
    EXPECT_EQ(said(), "70 %");
    desktop.Play("click @4+8+8");
    EXPECT_EQ(said(), "69 %");
    desktop.Play("click @4+24+8\nwait 1");
    EXPECT_EQ(said(), "59 %");
    desktop.Play("wheel @4 0 1000");
    EXPECT_EQ(said(), "0 %");
}
