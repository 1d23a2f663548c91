// The order of virtual operations is part of the interface: code that was compiled against it calls them by
// place.
#include "frame/Provider.h"
#include "host/CallbackAPI.h"
#include "host/CompoundPane.h"
#include "host/CustomEventHandler.h"
#include "host/GlogPane.h"
#include "host/HelpTagHelper.h"
#include "host/MouseTask.h"
#include "host/OSTextEdit.h"
#include "host/OSWindow.h"
#include "host/TarnImage.h"
#include "tests/VirtualPlace.h"
#include <cstddef>
#include <gtest/gtest.h>

namespace {

// Opens what is protected.
class OpenPane : public GlogPane {
public:
    static void Check();
    static std::size_t PlaceOfDrawGuts() { return PlaceOf(&OpenPane::DrawGuts); }
};

class OpenContainer : public CompoundPane {
public:
    static void Check();
};

std::size_t const kFirstProtected = 62;
std::size_t const kHooks = 2; // private, after DrawGuts

void OpenPane::Check() {
    typedef OpenPane P;
    ExpectInOrder(kAfterDestructor, &P::GetDrawOptimizationHints, &P::Activate, &P::Deactivate, &P::SetActive,
                  &P::Resize, &P::ContainmentChanged, &P::Select, &P::Contains, &P::ContainsForHelp,
                  &P::SetContainer, &P::GetBox, &P::GetMainDataBox, &P::GetDrawRectangle, &P::CanSetBox,
                  &P::SetBox, &P::Offset, &P::Intersects, &P::ActivateColors,
                  static_cast<void (GlogPane::*)(MouseTask &, Point const &)>(&P::TrackMouse),
                  static_cast<void (GlogPane::*)(OldMouseTask *, Point *)>(&P::TrackMouse),
                  &P::MultiTaskTrackMouse, &P::CanHandleCustomEvent, &P::DispatchCustomEvent,
                  &P::GlogItemInit, &P::Key, &P::Selectable, &P::Tab, &P::CanTabIn, &P::Error, &P::AutoResize,
                  &P::TryMouseControl, &P::Idle, &P::CanDeselect, &P::SetVisibility, &P::GetVisibility,
                  &P::Show, &P::Hide, &P::CalcBox, &P::Inval, &P::Erase, &P::ItemHeight, &P::ItemWidth,
                  &P::LocalOffset, &P::GlogOffset, &P::CastToConsoleControlSet, &P::CastToSelectStringPane,
                  &P::CastToControlItem, &P::PanePositionChanged, &P::DispatchCursor, &P::SetHelpTag,
                  &P::GetHelpTagForPoint, &P::GetID, &P::SetID, &P::FindByID, &P::ContainerChangedVisibility,
                  &P::UsesNonVLHelpTagSystem, &P::UpdateLayoutRect, &P::CopyPaneAttributes, &P::FindGophers,
                  &P::Print);
    ExpectInOrder(kFirstProtected, &P::AdjustCursorAndDisplayHelp, &P::HandleClick,
                  &P::HandleSecondaryButtonClick, &P::BecomeGopherOnSelect, &P::ConfirmChangesOnClickAway,
                  &P::PrepareDuringTrackMouse, &P::CanUpdateLayoutRect, &P::DoesLayoutNeedToBeUpdated,
                  &P::LayoutIsNowInvalid, &P::DrawGuts);
}

void OpenContainer::Check() {
    typedef OpenContainer P;
    ExpectInOrder(OpenPane::PlaceOfDrawGuts() + kHooks + 1, &P::Flush, &P::SelectSubpanes, &P::DrawFrame,
                  &P::Add, &P::AddGuts, &P::Del, &P::DelGuts, &P::DrawBackgroundGuts);
}

} // namespace

TEST(VirtualOrder, OfPanes) { OpenPane::Check(); }

TEST(VirtualOrder, OfContainersAfterThoseOfPanes) { OpenContainer::Check(); }

TEST(VirtualOrder, OfMouseTasks) {
    ExpectInOrder(kAfterDestructor, &MouseTask::MouseTaskBegin, &MouseTask::MouseTaskContinue,
                  &MouseTask::MouseTaskEnd, &MouseTask::MouseIsDragging);
}

TEST(VirtualOrder, OfCustomEventHandlersWhichHaveNoVirtualDestructor) {
    ExpectInOrder(0, &CustomEventHandler::HandleEvent, &CustomEventHandler::Clone);
}

TEST(VirtualOrder, OfHelpTagHelpers) {
    ExpectInOrder(kAfterDestructor, &HelpTagHelper::IsDefaultHelper, &HelpTagHelper::GetHelpTag);
}

TEST(VirtualOrder, OfImages) {
    ExpectInOrder(kAfterDestructor, &tarn::image::Draw, &tarn::image::GetFrameRect);
}

TEST(VirtualOrder, OfTextEditClients) {
    typedef OS::TextEditClient Client;
    ExpectInOrder(kAfterDestructor, &Client::TextEditClient_HandleEvent,
                  &Client::TextEditClient_HandleTextEntry, &Client::TextEditClient_HandleTextAction);
}

// Dependents have ProviderDying, which is private, between their destructor and what the listener adds.
TEST(VirtualOrder, OfListenersAfterThoseOfDependents) {
    ExpectInOrder(kAfterDestructor + 1, &OS::TextEditListener::TextEditListener_TextChanged,
                  &OS::TextEditListener::TextEditListener_AutoScrolled);
    ExpectInOrder(kAfterDestructor + 1, &TarnOSWindow::OSWindow_PlatformWindowListener::PlatformWindow_Opened,
                  &TarnOSWindow::OSWindow_PlatformWindowListener::PlatformWindow_Closing);
    ExpectInOrder(kAfterDestructor + 1, &ThemeChangeNotificationProvider_Listener::ThemeChanged);
}

TEST(VirtualOrder, OfMessages) {
    typedef DependentCastMessenger<GlogPaneListener> Messenger;
    ExpectInOrder(kAfterDestructor, &Messenger::CastAndBroadcast, &Messenger::BroadcastChange);
}
