// The code of the guide that is no part of its example, as it stands there.
#include "desktop/SimulatedDesktop.h"
#include "desktop/resources/Resources.h"
#include "dialogs/FindItem.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "frame/ModalGlogClass.h"
#include "frame/ResourceReading.h"
#include "host/GlogPane.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/docs/Document.h"
#include "tests/resources/TemporaryDirectory.h"
#include "text/GTextPane.h"
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
