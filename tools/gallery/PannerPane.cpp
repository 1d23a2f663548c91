#include "tools/gallery/PannerPane.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "graphics/ThreeDPane.h"
#include "host/GlogStyleSheet.h"
#include "tools/gallery/LabelText.h"

namespace {

// Goes with the pane.
class Readout : public MessageReporter<GlogPaneListener> {
public:
    Readout(ThreeDPane *shown, int label)
        : MessageReporter(shown)
        , pane(*shown)
        , labelID(label) {
        pane.InstallHook(Show, this);
    }

private:
    static void Show(void *self) {
        Readout const &readout = *static_cast<Readout *>(self);
        Point3D const place = readout.pane.GetValue();
        UString text = Coordinate("x ", place.x);
        text += Coordinate("   y ", place.y);
        text += Coordinate("   z ", place.z);
        LabelText::Show(readout.pane.GetGlog(), readout.labelID, text);
    }

    static UString Coordinate(char const *name, double value) {
        UString text = Utf8::ToUString(name);
        return text += LabelText::OfDecimal(value, 2);
    }

    ThreeDPane &pane;
    int labelID;
};

} // namespace

ItemType PannerPane::Type() {
    ItemType const &plain = *ItemRegistry::Instance().Find("ThreeD");
    ItemType::Maker const make = plain.maker;
    KeyList keys = plain.keys;
    keys.Integer("TextID").Required();
    return ItemType("Panner").Keys(keys).MadeBy([make](glogRec *glog, GlogStyleSheet *sheet) {
        GlogPane *const pane = make(glog, sheet);
        if (ThreeDPane *const cube = dynamic_cast<ThreeDPane *>(pane))
            new Readout(cube, sheet->GetSInt32ItemValue(ResourceKey("TextID")));
        return pane;
    });
}
