// The gallery's stepper.
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadGlog.h"
#include "host/GlogPane.h"
#include "host/glogRec.h"
#include "tools/gallery/GalleryItems.h"
#include "tools/gallery/StepperPane.h"
#include <gtest/gtest.h>

namespace {

class Remover : public AutoSetActivityListener {
public:
    explicit Remover(StepperPane &pane)
        : stepper(&pane) {
        DependUpon(&pane);
    }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override { delete stepper; }
    void ProviderDying(Provider<AutoSetActivityListener> *) override { stepper = nullptr; }
    bool HasRemoved() const { return !stepper; }

private:
    StepperPane *stepper;
};

} // namespace

TEST(Stepper, MayBeDeletedByWhoHearsThatItIsUsed) {
    SimulatedDesktop desktop;
    GalleryItems::Add();
    glogRec *const glog =
        LoadGlogFromText("<Glog width=\"60\" height=\"40\"><Items><Item type=\"Stepper\" id=\"1\">"
                         "<Origin v=\"5\" h=\"5\"/><TextID>2</TextID><Num>7</Num></Item>"
                         "</Items></Glog>",
                         "stepper.xml");
    ShowGlog(glog, kShowGlog);
    Remover remover(dynamic_cast<StepperPane &>(*GetGlogItem(glog, 1)));
    desktop.Play("click 12 10\nclick 12 10\n");
    EXPECT_TRUE(remover.HasRemoved());
    EXPECT_EQ(CountGlogItems(glog), 0);
}
