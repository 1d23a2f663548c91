// The ready-made messages and those with names of their own.
#include "frame/Message.h"
#include "frame/AutoSetActivityListener.h"
#include "frame/BoxSelectPaneListener.h"
#include "frame/ButtonGroupPaneListener.h"
#include "frame/GlogButtonPaneListener.h"
#include "frame/PictPane_Listener.h"
#include "frame/PopUpMenuListener.h"
#include "tests/frame/Stranger.h"
#include <boost/ref.hpp>
#include <gtest/gtest.h>
#include <string>
#include <type_traits>
#include <vector>

namespace {

struct Thing {
    int value;
};

class Hearer : public Dependent<Hearer> {
public:
    void Nothing() { calls.push_back("nothing"); }
    void Number(int number) { calls.push_back(std::to_string(number)); }
    void ByReference(Thing const &thing) { things.push_back(&thing); }
    void ByWrapper(Thing &thing) { ++thing.value; }
    void Two(int number, bool flag) { calls.push_back(std::to_string(number) + (flag ? " yes" : " no")); }
    void Three(char const *word, int first, int second) {
        calls.push_back(word + std::to_string(first) + " " + std::to_string(second));
    }

    std::vector<std::string> calls;
    std::vector<Thing const *> things;
};

typedef std::vector<std::string> Calls;

static_assert(std::is_abstract<DependentCastMessenger<Hearer>>::value, "a message says what it calls");
static_assert(std::has_virtual_destructor<DependentCastMessenger<Hearer>>::value, "");
static_assert(sizeof(DependentCastMessenger<Hearer>) == sizeof(void *), "a table and nothing else");

} // namespace

TEST(Message, WithoutArgumentsCallsTheFunction) {
    Hearer hearer;
    Message0<Hearer>(&Hearer::Nothing).BroadcastChange(&hearer);
    EXPECT_EQ(hearer.calls, Calls{"nothing"});
}

TEST(Message, WithOneArgumentHandsItOn) {
    Hearer hearer;
    int const number = 12;
    Message1<Hearer, int, int>(&Hearer::Number, &number).BroadcastChange(&hearer);
    EXPECT_EQ(hearer.calls, Calls{"12"});
}

TEST(Message, WithTwoArgumentsKeepsTheirOrder) {
    Hearer hearer;
    int const number = 3;
    bool const flag = true;
    Message2<Hearer, int, int, bool, bool>(&Hearer::Two, &number, &flag).BroadcastChange(&hearer);
    EXPECT_EQ(hearer.calls, Calls{"3 yes"});
}

TEST(Message, WithThreeArgumentsKeepsTheirOrder) {
    Hearer hearer;
    char const *const word = "tab ";
    int const first = 1, second = 2;
    Message3<Hearer, char const *, char const *, int, int, int, int>(&Hearer::Three, &word, &first, &second)
        .BroadcastChange(&hearer);
    EXPECT_EQ(hearer.calls, Calls{"tab 1 2"});
}

TEST(Message, ReadsItsArgumentsAnewForEachListener) {
    Hearer hearer;
    int number = 1;
    Message1<Hearer, int, int> message(&Hearer::Number, &number);
    message.BroadcastChange(&hearer);
    number = 2;
    message.BroadcastChange(&hearer);
    EXPECT_EQ(hearer.calls, (Calls{"1", "2"}));
}

TEST(Message, AReferenceIsToTheSendersOwnObject) {
    Hearer hearer;
    Thing const thing = {5};
    Message1<Hearer, Thing const &, Thing>(&Hearer::ByReference, &thing).BroadcastChange(&hearer);
    EXPECT_EQ(hearer.things, std::vector<Thing const *>{&thing});
}

TEST(Message, AWrappedReferenceIsToTheWrappedObject) {
    Hearer hearer;
    Thing thing = {5};
    boost::reference_wrapper<Thing> const wrapped(thing);
    Message1<Hearer, Thing &, boost::reference_wrapper<Thing>>(&Hearer::ByWrapper, &wrapped)
        .BroadcastChange(&hearer);
    EXPECT_EQ(thing.value, 6);
}

TEST(Message, ReachesAllDependentsOfAProvider) {
    Hearer first, second;
    Provider<Hearer> provider;
    provider.AddDependent(&first);
    provider.AddDependent(&second);
    provider.BroadcastChange(Message0<Hearer>(&Hearer::Nothing), nullptr);
    EXPECT_EQ(first.calls, Calls{"nothing"});
    EXPECT_EQ(second.calls, Calls{"nothing"});
}

TEST(NamedMessage, ActivityNamesItsSource) {
    struct : AutoSetActivityListener {
        Provider<AutoSetActivityListener> *heard = nullptr;
        void ListenToActivity(Provider<AutoSetActivityListener> *source) override { heard = source; }
    } listener;
    Provider<AutoSetActivityListener> source;
    source.AddDependent(&listener);
    source.BroadcastChange(AutoSetActivityMsg(&source), nullptr);
    EXPECT_EQ(listener.heard, &source);
}

TEST(NamedMessage, APressNamesTheButton) {
    struct : GlogButtonPaneListener {
        GlogButtonPane *heard = nullptr;
        void GlogButtonPressed(GlogButtonPane *source) override { heard = source; }
    } listener;
    GlogButtonPane *const button = Stranger<GlogButtonPane>();
    GlogButtonPanePressedMsg(button).BroadcastChange(&listener);
    EXPECT_EQ(listener.heard, button);
}

TEST(NamedMessage, AButtonsValueNamesGroupIndexAndValue) {
    struct : ButtonGroupPaneListener {
        ButtonGroupPane *group = nullptr;
        short button = -1;
        bool on = false;
        void ButtonValueChanged(ButtonGroupPane *source, short index, bool value) override {
            group = source;
            button = index;
            on = value;
        }
    } listener;
    ButtonGroupPane *const group = Stranger<ButtonGroupPane>();
    ButtonValueChangeMsg(group, 4, true).BroadcastChange(&listener);
    EXPECT_EQ(listener.group, group);
    EXPECT_EQ(listener.button, 4);
    EXPECT_TRUE(listener.on);
}

TEST(NamedMessage, ABoxsValueNamesPaneIndexAndValue) {
    struct : BoxSelectPaneListener {
        BoxSelectPane *pane = nullptr;
        short box = -1;
        bool on = true;
        void BoxValueChanged(BoxSelectPane *source, short index, bool value) override {
            pane = source;
            box = index;
            on = value;
        }
    } listener;
    BoxSelectPane *const pane = Stranger<BoxSelectPane>();
    BoxSelectPaneChangeMsg(pane, 2, false).BroadcastChange(&listener);
    EXPECT_EQ(listener.pane, pane);
    EXPECT_EQ(listener.box, 2);
    EXPECT_FALSE(listener.on);
}

TEST(NamedMessage, AClickOnAPictureHandsTheEventOn) {
    struct : PictPane_Listener {
        EventRecordAdapter *heard = nullptr;
        void PictClicked(EventRecordAdapter *event) override { heard = event; }
    } listener;
    EventRecordAdapter *const event = Stranger<EventRecordAdapter>();
    PictClickMsg(event).BroadcastChange(&listener);
    EXPECT_EQ(listener.heard, event);
}

namespace {

class MenuHearer : public PopUpMenuListener {
public:
    void ListenToMenuChange(PopUpMenu *menu_, short item_) override {
        menu = menu_;
        item = item_;
    }
    void ListenToItemSelected(PopUpMenu *menu_, OSMenuHandle &submenu_, UString const &name_,
                              short item_) override {
        menu = menu_;
        submenu = submenu_;
        name = name_;
        item = item_;
    }

    PopUpMenu *menu = nullptr;
    short item = 0;
    OSMenuHandle submenu;
    UString name;
};

} // namespace

TEST(NamedMessage, AMenuChangeNamesMenuAndItem) {
    MenuHearer listener;
    PopUpMenu *const menu = Stranger<PopUpMenu>();
    PopUpMenuChangeMsg(menu, 3).BroadcastChange(&listener);
    EXPECT_EQ(listener.menu, menu);
    EXPECT_EQ(listener.item, 3);
}

TEST(NamedMessage, AChoiceNamesMenuItemNameAndSubmenu) {
    MenuHearer listener;
    PopUpMenu *const menu = Stranger<PopUpMenu>();
    OSMenuHandle const submenu = OSMenuHandle::CreateNewHierarchicalMenu();
    UString const name("More", UString::kByteEncoding1);
    ItemSelectedMsg(menu, 5, name, submenu).BroadcastChange(&listener);
    EXPECT_EQ(listener.menu, menu);
    EXPECT_EQ(listener.item, 5);
    EXPECT_TRUE(listener.name == name);
    EXPECT_TRUE(listener.submenu == submenu);
}

TEST(NamedMessage, AChoiceHoldsCopiesOfNameAndSubmenu) {
    MenuHearer listener;
    OSMenuHandle submenu = OSMenuHandle::CreateNewHierarchicalMenu();
    OSMenuHandle const same = submenu;
    UString name("More", UString::kByteEncoding1);
    ItemSelectedMsg message(nullptr, 1, name, submenu);
    name.clear();
    submenu.clear();
    message.BroadcastChange(&listener);
    EXPECT_TRUE(listener.name == UString("More", UString::kByteEncoding1));
    EXPECT_TRUE(listener.submenu == same);
}
