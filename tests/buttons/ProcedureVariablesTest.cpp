// The procedure variables as other programs find them: exported by the built library, as data that can be
// written.
#include "buttons/BoxSelectPane.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/FrameButtonPane.h"
#include "buttons/GIconPane.h"
#include "buttons/GlogButtonPane.h"
#include "buttons/RadioButtonPane.h"
#include "tests/LibraryExports.h"
#include "tests/buttons/ButtonGroupTest.h"
#include <type_traits>

namespace {

char const *const kNames[] = {
    // of push buttons
    "btnDepress", "btnRelease", "btnEnable", "btnDisable", "btnFlash", "gcSetModeBP", "gfbSetState",
    // of groups
    "btnSetAllEnable", "btnSetOneEnable", "btnSetAllToSame", "btnSetOneCB", "btnReadOneCB", "btnToggleOne",
    "radGet", "radSet",
    // of box selections
    "btnReadOneBS", "btnSetOneBS", "btnSetOriginBS", "btnGetOneBox", "radGetBS", "radSetBS", "gbsInitStatus",
    "gbsChangeStatus",
    // of icons
    "gcIconGetIconNum", "gcIconSetIconNum", "gcIconSetDecalProc", "gcStateIconGetCurState",
    "gcStateIconSetCurState", "gcStateIconGetNumStates", "gcStateIconSetNumStates", "gcStateIconGetEnable",
    "gcStateIconSetEnable"};

class ProcedureVariables : public ButtonGroupTest {};

} // namespace

TEST_F(ProcedureVariables, AreExportedByTheBuiltLibraryAsWritableData) {
    std::map<std::string, Symbol> const exports = ExportsOfTheLibrary();
    for (char const *name : kNames) {
        auto const found = exports.find(name);
        ASSERT_NE(found, exports.end()) << name;
        EXPECT_TRUE(found->second.type == 'D' || found->second.type == 'B')
            << name << " is of type " << found->second.type;
        // The address sanitizer puts a zone behind each.
        EXPECT_GE(std::stoul(found->second.size, nullptr, 16), sizeof(void *)) << name;
    }
}

TEST_F(ProcedureVariables, AreAllThatTheLibraryExportsUnderTheirPrefixes) {
    std::vector<std::string> const names(std::begin(kNames), std::end(kNames));
    std::vector<std::string> unknown;
    for (auto const &symbol : ExportsOfTheLibrary())
        for (char const *prefix : {"btn", "gbs", "gfb", "rad", "gcIcon", "gcStateIcon"}) {
            bool const ours = symbol.first.rfind(prefix, 0) == 0;
            if (ours && std::find(names.begin(), names.end(), symbol.first) == names.end())
                unknown.push_back(symbol.first);
        }
    EXPECT_EQ(unknown, std::vector<std::string>());
}

TEST_F(ProcedureVariables, LeadSomewhereFromTheStart) {
    for (char const *name : kNames) {
        void **const variable = Find<void *>(name);
        ASSERT_NE(variable, nullptr) << name;
        EXPECT_NE(*variable, nullptr) << name;
    }
}

TEST_F(ProcedureVariables, HaveTheSignaturesThatProgramsCallThemBy) {
    EXPECT_TRUE((std::is_same<decltype(btnDepress), void (*)(GlogButtonPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnRelease), void (*)(GlogButtonPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnEnable), void (*)(GlogButtonPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnDisable), void (*)(GlogButtonPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnFlash), void (*)(GlogButtonPane *, short)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcSetModeBP), void (*)(GlogButtonPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(gfbSetState), void (*)(FrameButtonPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetAllEnable), void (*)(ButtonGroupPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetOneEnable), void (*)(ButtonGroupPane *, int, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetAllToSame), void (*)(CheckBoxPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetOneCB), void (*)(CheckBoxPane *, int, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnReadOneCB), bool (*)(CheckBoxPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnToggleOne), bool (*)(CheckBoxPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(radGet), short (*)(RadioButtonPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(radSet), void (*)(RadioButtonPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnReadOneBS), bool (*)(BoxSelectPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetOneBS), void (*)(BoxSelectPane *, int, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnSetOriginBS), bool (*)(BoxSelectPane *, int, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(btnGetOneBox), void (*)(BoxSelectPane *, btnOneBoxRec *)>::value));
    EXPECT_TRUE((std::is_same<decltype(radGetBS), short (*)(BoxSelectPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(radSetBS), void (*)(BoxSelectPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(gbsInitStatus), void (*)(BoxSelectPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(gbsChangeStatus), void (*)(BoxSelectPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcIconGetIconNum), int (*)(GIconPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcIconSetIconNum), void (*)(GIconPane *, int)>::value));
    EXPECT_TRUE(
        (std::is_same<decltype(gcIconSetDecalProc),
                      void (*)(GIconPane *, void (*)(glogRec *, Rect, bool, bool, GIconPane *))>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconGetEnable), bool (*)(GIconPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconSetEnable), void (*)(GIconPane *, bool)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconGetCurState), int (*)(GIconPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconSetCurState), void (*)(GIconPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconGetNumStates), int (*)(GIconPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(gcStateIconSetNumStates), void (*)(GIconPane *, int)>::value));
}

TEST_F(ProcedureVariables, ReplacedByNameAreWhatCallersCall) {
    CheckBoxPane *const group = ThreeBoxes();
    static int index;
    index = -1;
    {
        typedef void (*SetOne)(CheckBoxPane *, int, bool);
        Replaced<SetOne> const replaced(Find<SetOne>("btnSetOneCB"),
                                        [](CheckBoxPane *, int given, bool) { index = given; });
        btnSetOneCB(group, 2, true);
    }
    EXPECT_EQ(index, 2);
    EXPECT_FALSE(group->ReadOne(2));
    btnSetOneCB(group, 2, true);
    EXPECT_TRUE(group->ReadOne(2));
}

TEST_F(ProcedureVariables, ReplacedByNameAreWhatTheLibraryItselfCalls) {
    static std::vector<std::string> calls;
    calls.clear();
    class Button : public GlogButtonPane {
    public:
        explicit Button(glogRec *owner) {
            InitGlogButtonPane(owner, kEnabled);
            Rect box = {10, 10, 30, 60};
            SetBox(&box);
        }
        void DrawGuts(OSRgn *) override {}
    };
    Button *const button = new Button(glog);
    Show();
    typedef void (*OfButton)(GlogButtonPane *);
    {
        Replaced<OfButton> const depress(Find<OfButton>("btnDepress"), [](GlogButtonPane *pane) {
            calls.push_back("depress");
            pane->Depress();
        });
        Replaced<OfButton> const release(Find<OfButton>("btnRelease"), [](GlogButtonPane *pane) {
            calls.push_back("release");
            pane->Release();
        });
        EXPECT_EQ(ResultOfClick("click 20 20"), 1);
    }
    EXPECT_EQ(calls, (std::vector<std::string>{"depress", "release"}));
    EXPECT_EQ(button->Flash(0), 1);
    EXPECT_EQ(calls.size(), 2u) << "the former ones are back";
}
