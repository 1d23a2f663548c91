// What the tests of menus share: a stored menu, a pop-up that writes down its hooks, and a look at what is
// open.
#pragma once
#include "desktop/menus/MenuAccess.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/resources/Resources.h"
#include "host/CIdleChore.h"
#include "menus/PopMPane.h"
#include "tests/PaneTest.h"
#include "tests/resources/TemporaryDirectory.h"

// A menu that notes which of its hooks were called, one word each.
class RecordingMenu : public PopUpMenu {
public:
    explicit RecordingMenu(bool mustHaveSelection = true, bool privateCopy = true)
        : PopUpMenu(privateCopy, mustHaveSelection) {}

    using PopUpMenu::DeleteOneMenuItem;
    using PopUpMenu::GetCurItemMenuInfo;
    using PopUpMenu::GetCurrentSelection;
    using PopUpMenu::InitializeMenu;
    using PopUpMenu::SetSelectedItem;

    // What was noted since the last call.
    std::string Calls() {
        std::string taken;
        taken.swap(calls);
        return taken;
    }

    Rect place{10, 10, 30, 110}; // where it opens
    bool itemInfo = true;
    OSMenuHandle chosenMenu;
    UString chosenName;
    short chosenItem = 0;

protected:
    void InvalPane() override { Note("inval"); }
    bool OKToGetCuritemInfo() const override { return itemInfo; }
    Rect GetMenuRect() override { return place; }
    void AutoSetActivity() override { Note("activity"); }
    void ItemSelected(OSMenuHandle &menu, UString const &name, short item) override {
        Note("selected " + std::to_string(item));
        chosenMenu = menu;
        chosenName = name;
        chosenItem = item;
    }
    void MenuChanged(short item) override { Note("changed " + std::to_string(item)); }
    void AboutToDoMenu() override { Note("about"); }
    void DoneWithDoMenu() override { Note("done"); }

private:
    void Note(std::string const &call) { calls += (calls.empty() ? "" : ", ") + call; }
    std::string calls;
};

// Runs a function once, so many seconds after it was made; nested loops give it its turn too.
class Later : public CIdleChore {
public:
    Later(double seconds, std::function<void()> action_)
        : CIdleChore(static_cast<long long>(seconds * 60), kInitialDelay)
        , action(std::move(action_)) {
        Assign();
    }

protected:
    void DoIdle() override {
        Cancel();
        action();
    }

private:
    std::function<void()> action;
};

class MenuTest : public PaneTest {
protected:
    // Stores menus in a directory of the application's.
    void Store(std::string const &menus) {
        directory.Write("menus/en.xml", "<menus>" + menus + "</menus>");
        Resources::Instance().AddDirectory(directory.Path());
    }

    // An open menu needs a window.
    void ShowWindow() {
        Show();
        SetPortToGlog(glog);
    }

    void Add(PopUpMenu &menu, std::initializer_list<char const *> texts) {
        for (char const *text : texts)
            menu.AddItem(Text(text), PopUpMenu::kDashIsSeparator);
    }

    static std::string Ascii(UString const &text) {
        std::string ascii;
        for (std::size_t i = 0; i < text.length(); ++i)
            ascii += static_cast<char>(text[i]);
        return ascii;
    }
    static std::string NameIn(PopUpMenu const &menu, short item) {
        UString name;
        menu.GetItemName(item, name);
        return Ascii(name);
    }

    // What DoMenu answers while the script is played.
    int Do(PopUpMenu &menu, std::string const &script) {
        desktop.Script(script);
        SetPortToGlog(glog);
        return menu.DoMenu();
    }

    TemporaryDirectory directory;
};
