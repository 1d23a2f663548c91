// A field from its dialog to what its listeners and the clipboard get.
#include "desktop/windows/WindowSystem.h"
#include "tests/dialogs/DialogTest.h"
#include "text/GTextPane.h"
#include <vector>

namespace {

std::string const kField = "<BoundsRect top=\"20\" left=\"20\" bottom=\"36\" right=\"200\"/><BoxIt>1</BoxIt>";

class Field : public DialogTest {
protected:
    GTextPane *Shown(std::string const &keys) {
        GTextPane *const pane = LoadOne<GTextPane>("TextField", kField + keys);
        ShowGlog(pane->GetGlog(), kShowGlog);
        desktop.Play(""); // the window becomes active
        desktop.TakeMessages();
        return pane;
    }
    std::string Utf8Of(GTextPane *pane) { return Utf8::FromUString(pane->GetText()); }
    std::vector<std::string> MessagesNamed(std::string const &name) {
        std::vector<std::string> found;
        for (std::string const &line : desktop.TakeMessages())
            if (Holds(line, "\"message\":\"" + name + "\""))
                found.push_back(line);
        return found;
    }
};

} // namespace

TEST_F(Field, IsTypedInto) {
    GTextPane *const pane = Shown("");
    desktop.Play("click 40 28\ntype \"Bass\"");
    EXPECT_EQ(Utf8Of(pane), "Bass");
    EXPECT_EQ(MessagesNamed("ValueChanged").size(), 4u);
}

TEST_F(Field, ItsSelectionIsCopiedAndPasted) {
    GTextPane *const pane = Shown("<InitTextID>Drums left</InitTextID>");
    desktop.Play("doubleclick 30 28\nkey c command");
    EXPECT_EQ(desktop.Windows().GetClipboardText(), "Drums");
    desktop.Play("key End\nkey v command");
    EXPECT_EQ(Utf8Of(pane), "Drums leftDrums");
}
