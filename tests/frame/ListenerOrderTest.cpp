// The operations of a listener follow those of its dependent, in the order of the interface.
#include "frame/AutoSetActivityListener.h"
#include "frame/BoxSelectPaneListener.h"
#include "frame/ButtonGroupPaneListener.h"
#include "frame/ButtonGroupPane_Listener.h"
#include "frame/DurationNotePane_Listener.h"
#include "frame/GListPane_SelectionListener.h"
#include "frame/GlogButtonPaneListener.h"
#include "frame/PictPane_Listener.h"
#include "frame/PopUpMenuListener.h"
#include "frame/ScrollBarPane_Listener.h"
#include "frame/SearchFieldPane_Listener.h"
#include "frame/TabPane_Listener.h"
#include "frame/TextEditPane_Listener.h"
#include "frame/TextPaneListener.h"
#include "frame/TrackSelectorButtonPane_Listener.h"
#include "tests/VirtualPlace.h"

namespace {

// Dependents have ProviderDying, which is private, after their destructor.
std::size_t const kAfterDependent = kAfterDestructor + 1;

class OpenBarListener : public ScrollBarPane_Listener {
public:
    void ProviderDying(Provider<ScrollBarPane_Listener> *) override {}
    void ScrollBarPaneDying() override {}
};

} // namespace

TEST(ListenerOrder, OfThoseWithOneOperation) {
    ExpectInOrder(kAfterDependent, &AutoSetActivityListener::ListenToActivity);
    ExpectInOrder(kAfterDependent, &GlogButtonPaneListener::GlogButtonPressed);
    ExpectInOrder(kAfterDependent, &ButtonGroupPaneListener::ButtonValueChanged);
    ExpectInOrder(kAfterDependent, &ButtonGroupPane_Listener::ButtonGroupPaneChanged);
    ExpectInOrder(kAfterDependent, &BoxSelectPaneListener::BoxValueChanged);
    ExpectInOrder(kAfterDependent, &TabPane_Listener::TabSelected);
    ExpectInOrder(kAfterDependent, &PictPane_Listener::PictClicked);
    ExpectInOrder(kAfterDependent, &DurationNotePane_Listener::DurationValueChanged);
    ExpectInOrder(kAfterDependent, &TrackSelectorButtonPane_Listener::TrackSelectorButtonReleased);
}

TEST(ListenerOrder, OfTextFields) {
    typedef TextPaneListener L;
    ExpectInOrder(kAfterDependent, &L::TextPaneConfirmation, &L::BeginEditing, &L::EndEditing, &L::ResetValue,
                  &L::ValueChanged);
}

TEST(ListenerOrder, OfLists) {
    typedef GListPane_SelectionListener L;
    ExpectInOrder(kAfterDependent, &L::SelectionDone, &L::ClickOccured, &L::SelectOccured);
}

TEST(ListenerOrder, OfScrollBars) { ExpectInOrder(kAfterDependent, &OpenBarListener::ScrollBarPaneDying); }

TEST(ListenerOrder, OfScrollBarsReplacesTheProviderDyingOfTheDependent) {
    ASSERT_EQ(PlaceOf(&OpenBarListener::ProviderDying), kAfterDestructor);
    Dependent<ScrollBarPane_Listener> const dependent;
    ScrollBarPane_Listener const listener;
    EXPECT_NE(OperationAt(kAfterDestructor, listener), OperationAt(kAfterDestructor, dependent));
}

TEST(ListenerOrder, OfPopUpMenus) {
    ExpectInOrder(kAfterDependent, &PopUpMenuListener::ListenToMenuChange,
                  &PopUpMenuListener::ListenToItemSelected);
}

TEST(ListenerOrder, OfSearchFields) {
    typedef SearchFieldPane_Listener L;
    ExpectInOrder(kAfterDependent, &L::TextChanged, &L::SearchIsCanceled, &L::HandleSpecialKey);
}

TEST(ListenerOrder, OfEditingPanes) {
    typedef TextEditPane_Listener L;
    ExpectInOrder(kAfterDependent, &L::TextEditPane_TextChanged, &L::TextEditPane_Autoscrolled);
}
