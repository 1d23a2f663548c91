// Which operations of the listener classes have to be overridden, and what the messages hand on to them.
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
#include "frame/SearchTextPane_Listener.h"
#include "frame/TabPane_Listener.h"
#include "frame/TextEditPane_Listener.h"
#include "frame/TextPaneListener.h"
#include "frame/TrackSelectorButtonPane_Listener.h"
#include "tests/frame/Stranger.h"
#include <gtest/gtest.h>
#include <string>
#include <type_traits>
#include <typeinfo>
#include <vector>

namespace {

template <class L> constexpr bool HasToBeImplemented() { return std::is_abstract<L>::value; }

static_assert(HasToBeImplemented<AutoSetActivityListener>(), "");
static_assert(HasToBeImplemented<GlogButtonPaneListener>(), "");
static_assert(HasToBeImplemented<ButtonGroupPaneListener>(), "");
static_assert(HasToBeImplemented<ButtonGroupPane_Listener>(), "");
static_assert(HasToBeImplemented<BoxSelectPaneListener>(), "");
static_assert(HasToBeImplemented<GListPane_SelectionListener>(), "");
static_assert(HasToBeImplemented<PopUpMenuListener>(), "");
static_assert(HasToBeImplemented<TabPane_Listener>(), "");
static_assert(HasToBeImplemented<PictPane_Listener>(), "");
static_assert(HasToBeImplemented<TrackSelectorButtonPane_Listener>(), "");

static_assert(!HasToBeImplemented<TextPaneListener>(), "");
static_assert(!HasToBeImplemented<ScrollBarPane_Listener>(), "");
static_assert(!HasToBeImplemented<DurationNotePane_Listener>(), "");
static_assert(!HasToBeImplemented<SearchFieldPane_Listener>(), "");
static_assert(!HasToBeImplemented<SearchTextPane_Listener>(), "");
static_assert(!HasToBeImplemented<TextEditPane_Listener>(), "");

// With exactly the operations that have to be there. It would not be a complete class otherwise.
class LeastSelectionListener : public GListPane_SelectionListener {
public:
    void SelectionDone(GListPane *) override {}
    void ClickOccured(GListPane *, int, int, bool) override {}
};
static_assert(!HasToBeImplemented<LeastSelectionListener>(), "SelectOccured has a default");

class LeastMenuListener : public PopUpMenuListener {
public:
    void ListenToMenuChange(PopUpMenu *, short) override {}
};
static_assert(!HasToBeImplemented<LeastMenuListener>(), "ListenToItemSelected has a default");

typedef std::vector<std::string> Calls;

// Subscribes a listener to a provider of its class and sends it one message.
template <class L> void Deliver(L &listener, DependentCastMessenger<L> const &message) {
    Provider<L> provider;
    provider.AddDependent(&listener);
    provider.BroadcastChange(message, nullptr);
}

// Calls that have a default must leave the broadcast undisturbed for whoever comes next.
template <class L, class Recorder>
void DeliverPastDefault(Recorder &recorder, DependentCastMessenger<L> const &message) {
    L silent;
    Provider<L> provider;
    provider.AddDependent(&silent);
    provider.AddDependent(&recorder);
    provider.BroadcastChange(message, nullptr);
}

} // namespace

// The listener at the start of an object is found by its address as a dependent: both are the same. Only
// addresses are compared, so that abstract listeners can be looked at too.
template <class L> void ExpectAtTheStart() {
    alignas(L) static char room[sizeof(L)];
    L *const listener = reinterpret_cast<L *>(room);
    EXPECT_EQ(static_cast<void *>(static_cast<Dependent<L> *>(listener)), static_cast<void *>(listener))
        << typeid(L).name();
}

template <class... Ls> void ExpectAllAtTheStart() { (ExpectAtTheStart<Ls>(), ...); }

TEST(Listeners, BeginWithTheirDependent) {
    ExpectAllAtTheStart<AutoSetActivityListener, BoxSelectPaneListener, ButtonGroupPaneListener,
                        ButtonGroupPane_Listener, DurationNotePane_Listener, GListPane_SelectionListener,
                        GlogButtonPaneListener, PictPane_Listener, PopUpMenuListener, ScrollBarPane_Listener,
                        SearchFieldPane_Listener, SearchTextPane_Listener, TabPane_Listener,
                        TextEditPane_Listener, TextPaneListener, TrackSelectorButtonPane_Listener>();
}

TEST(Listeners, OfAButtonGroupHearWhichButtonChanged) {
    struct : ButtonGroupPane_Listener {
        ButtonGroupPane *group = nullptr;
        short button = -1;
        void ButtonGroupPaneChanged(ButtonGroupPane *source, short index) override {
            group = source;
            button = index;
        }
    } listener;
    ButtonGroupPane *const group = Stranger<ButtonGroupPane>();
    short const index = 7;
    Deliver<ButtonGroupPane_Listener>(
        listener, Message2<ButtonGroupPane_Listener, ButtonGroupPane *, ButtonGroupPane *, short, short>(
                      &ButtonGroupPane_Listener::ButtonGroupPaneChanged, &group, &index));
    EXPECT_EQ(listener.group, group);
    EXPECT_EQ(listener.button, 7);
}

namespace {

class TextRecorder : public TextPaneListener {
public:
    void TextPaneConfirmation(GTextPane *pane) override { Note("confirmation", pane); }
    void BeginEditing(GTextPane *pane) override { Note("begin", pane); }
    void EndEditing(GTextPane *pane) override { Note("end", pane); }
    void ResetValue(GTextPane *pane) override { Note("reset", pane); }
    void ValueChanged(GTextPane *pane) override { Note("changed", pane); }

    Calls calls;

private:
    void Note(char const *what, GTextPane *pane) {
        calls.push_back(pane == Stranger<GTextPane>() ? what : "wrong pane");
    }
};

} // namespace

TEST(Listeners, OfATextFieldHearEachStepOfEditing) {
    typedef Message1<TextPaneListener, GTextPane *, GTextPane *> Step;
    TextRecorder recorder;
    GTextPane *const pane = Stranger<GTextPane>();
    for (Step::Function step :
         {&TextPaneListener::BeginEditing, &TextPaneListener::ValueChanged, &TextPaneListener::ResetValue,
          &TextPaneListener::EndEditing, &TextPaneListener::TextPaneConfirmation})
        DeliverPastDefault<TextPaneListener>(recorder, Step(step, &pane));
    EXPECT_EQ(recorder.calls, (Calls{"begin", "changed", "reset", "end", "confirmation"}));
}

namespace {

// Opens the private operation, which only a scroll bar may name.
class BarRecorder : public ScrollBarPane_Listener {
public:
    int dying = 0;
    void ScrollBarPaneDying() override { ++dying; }
    static void (ScrollBarPane_Listener::*Operation())() {
        return static_cast<void (ScrollBarPane_Listener::*)()>(&BarRecorder::ScrollBarPaneDying);
    }
};

} // namespace

TEST(Listeners, OfAScrollBarHearThatItDies) {
    BarRecorder recorder;
    Deliver<ScrollBarPane_Listener>(recorder, Message0<ScrollBarPane_Listener>(BarRecorder::Operation()));
    EXPECT_EQ(recorder.dying, 1);
}

TEST(Listeners, OfAScrollBarHearNothingMoreWhenItsProviderGoes) {
    BarRecorder recorder;
    {
        Provider<ScrollBarPane_Listener> provider;
        provider.AddDependent(&recorder);
        provider.BroadcastChange(Message0<ScrollBarPane_Listener>(BarRecorder::Operation()), nullptr);
        ASSERT_EQ(recorder.dying, 1);
    }
    EXPECT_EQ(recorder.dying, 1);
}

TEST(Listeners, OfTabsHearTheNewAndTheOldItem) {
    struct : TabPane_Listener {
        TabPane *pane = nullptr;
        int newItem = -1, oldItem = -1;
        void TabSelected(TabPane *source, int now, int before) override {
            pane = source;
            newItem = now;
            oldItem = before;
        }
    } listener;
    TabPane *const pane = Stranger<TabPane>();
    int const now = 2, before = 1;
    Deliver<TabPane_Listener>(listener, Message3<TabPane_Listener, TabPane *, TabPane *, int, int, int, int>(
                                            &TabPane_Listener::TabSelected, &pane, &now, &before));
    EXPECT_EQ(listener.pane, pane);
    EXPECT_EQ(listener.newItem, 2);
    EXPECT_EQ(listener.oldItem, 1);
}

TEST(Listeners, OfADurationHearWhichPaneChanged) {
    struct : DurationNotePane_Listener {
        DurationNotePane *pane = nullptr;
        void DurationValueChanged(DurationNotePane *source) override { pane = source; }
    } listener;
    DurationNotePane *const pane = Stranger<DurationNotePane>();
    DeliverPastDefault<DurationNotePane_Listener>(
        listener, Message1<DurationNotePane_Listener, DurationNotePane *, DurationNotePane *>(
                      &DurationNotePane_Listener::DurationValueChanged, &pane));
    EXPECT_EQ(listener.pane, pane);
}

TEST(Listeners, OfATrackSelectorHearOfItsRelease) {
    struct : TrackSelectorButtonPane_Listener {
        int released = 0;
        void TrackSelectorButtonReleased() override { ++released; }
    } listener;
    Deliver<TrackSelectorButtonPane_Listener>(
        listener, Message0<TrackSelectorButtonPane_Listener>(
                      &TrackSelectorButtonPane_Listener::TrackSelectorButtonReleased));
    EXPECT_EQ(listener.released, 1);
}

namespace {

class SearchRecorder : public SearchFieldPane_Listener {
public:
    void TextChanged(UString const &changed) override { text = &changed; }
    void SearchIsCanceled() override { ++canceled; }
    void HandleSpecialKey(EventRecordAdapter *pressed) override { key = pressed; }

    UString const *text = nullptr;
    int canceled = 0;
    EventRecordAdapter *key = nullptr;
};

} // namespace

TEST(Listeners, OfASearchFieldGetTheTextItself) {
    SearchRecorder recorder;
    UString const *const text = Stranger<UString>();
    DeliverPastDefault<SearchFieldPane_Listener>(recorder,
                                                 Message1<SearchFieldPane_Listener, UString const &, UString>(
                                                     &SearchFieldPane_Listener::TextChanged, text));
    EXPECT_EQ(recorder.text, text);
}

TEST(Listeners, OfASearchFieldHearThatTheSearchWasGivenUp) {
    SearchRecorder recorder;
    DeliverPastDefault<SearchFieldPane_Listener>(
        recorder, Message0<SearchFieldPane_Listener>(&SearchFieldPane_Listener::SearchIsCanceled));
    EXPECT_EQ(recorder.canceled, 1);
}

TEST(Listeners, OfASearchFieldGetTheArrowKeys) {
    SearchRecorder recorder;
    EventRecordAdapter *const event = Stranger<EventRecordAdapter>();
    DeliverPastDefault<SearchFieldPane_Listener>(
        recorder, Message1<SearchFieldPane_Listener, EventRecordAdapter *, EventRecordAdapter *>(
                      &SearchFieldPane_Listener::HandleSpecialKey, &event));
    EXPECT_EQ(recorder.key, event);
}

namespace {

class EditRecorder : public TextEditPane_Listener {
public:
    void TextEditPane_TextChanged(TextEditPane &pane) override { changed = &pane; }
    void TextEditPane_Autoscrolled(TextEditPane &pane) override { scrolled = &pane; }

    TextEditPane *changed = nullptr;
    TextEditPane *scrolled = nullptr;
};

typedef Message1<TextEditPane_Listener, TextEditPane &, boost::reference_wrapper<TextEditPane>> EditMessage;

} // namespace

TEST(Listeners, OfAnEditingPaneHearThatItsTextChanged) {
    EditRecorder recorder;
    boost::reference_wrapper<TextEditPane> const pane(*Stranger<TextEditPane>());
    DeliverPastDefault<TextEditPane_Listener>(
        recorder, EditMessage(&TextEditPane_Listener::TextEditPane_TextChanged, &pane));
    EXPECT_EQ(recorder.changed, Stranger<TextEditPane>());
    EXPECT_EQ(recorder.scrolled, nullptr);
}

TEST(Listeners, OfAnEditingPaneHearThatItScrolled) {
    EditRecorder recorder;
    boost::reference_wrapper<TextEditPane> const pane(*Stranger<TextEditPane>());
    DeliverPastDefault<TextEditPane_Listener>(
        recorder, EditMessage(&TextEditPane_Listener::TextEditPane_Autoscrolled, &pane));
    EXPECT_EQ(recorder.scrolled, Stranger<TextEditPane>());
    EXPECT_EQ(recorder.changed, nullptr);
}

namespace {

// One object may listen to several kinds of provider and be told of the death of each.
class ManySided : public ButtonGroupPaneListener, public TabPane_Listener {
public:
    void ButtonValueChanged(ButtonGroupPane *, short, bool) override { calls.push_back("button"); }
    void TabSelected(TabPane *, int, int) override { calls.push_back("tab"); }

    Calls calls;

private:
    void ProviderDying(Provider<ButtonGroupPaneListener> *) override { calls.push_back("buttons gone"); }
    void ProviderDying(Provider<TabPane_Listener> *) override { calls.push_back("tabs gone"); }
};

} // namespace

TEST(Listeners, OfSeveralKindsInOneObjectAreToldApart) {
    ManySided both;
    {
        Provider<TabPane_Listener> tabs;
        Provider<ButtonGroupPaneListener> buttons;
        both.TabPane_Listener::DependUpon(&tabs);
        both.ButtonGroupPaneListener::DependUpon(&buttons);
        buttons.BroadcastChange(ButtonValueChangeMsg(nullptr, 0, true), nullptr);
    }
    EXPECT_EQ(both.calls, (Calls{"button", "buttons gone", "tabs gone"}));
}
