// The procedure variables of lists as other programs find them: exported by the built library, as data that
// can be written.
#include "tests/LibraryExports.h"
#include "tests/lists/ListTest.h"
#include <iterator>
#include <type_traits>

namespace {

char const *const kNames[] = {"LSTGetNumItems", "LSTGetNumSel",       "LSTGetNumDisp",      "LSTGetScrollPos",
                              "LSTGetBox",      "LSTGetFirstAndLast", "LSTCheckHitV",       "LSTCheckSel",
                              "LSTSelAll",      "LSTDeselAll",        "LSTSelItem",         "LSTDeselItem",
                              "LSTSetSelMode",  "LSTSetNumItems",     "LSTAddItem",         "LSTDelItem",
                              "LSTDrawLine",    "LSTScrollTo",        "LSTPageTillVisible", "LSTProtect"};

class ListProcedures : public ListTest {};

} // namespace

TEST_F(ListProcedures, AreExportedByTheBuiltLibraryAsWritableData) {
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

TEST_F(ListProcedures, AreAllThatTheLibraryExportsUnderTheirPrefix) {
    std::size_t ours = 0;
    for (auto const &symbol : ExportsOfTheLibrary())
        ours += symbol.first.rfind("LST", 0) == 0;
    EXPECT_EQ(ours, std::size(kNames));
}

TEST_F(ListProcedures, HaveTheSignaturesThatProgramsCallThemBy) {
    typedef void (*OfRow)(GListPane *, int);
    typedef int (*Number)(GListPane *);
    EXPECT_TRUE((std::is_same<decltype(LSTGetNumItems), Number>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTGetNumSel), Number>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTGetNumDisp), Number>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTGetScrollPos), Number>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTGetBox), bool (*)(GListPane *, GLGetBoxRec *)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTGetFirstAndLast), void (*)(GListPane *, GLFirstLastRec *)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTCheckHitV), int (*)(GListPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTCheckSel), bool (*)(GListPane *, int)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTSelAll), void (*)(GListPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTDeselAll), void (*)(GListPane *)>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTSelItem), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTDeselItem), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTSetSelMode), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTSetNumItems), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTAddItem), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTDelItem), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTDrawLine), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTScrollTo), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTPageTillVisible), OfRow>::value));
    EXPECT_TRUE((std::is_same<decltype(LSTProtect), OfRow>::value));
}

TEST_F(ListProcedures, ReplacedByNameAreWhatCallersCall) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    static int row;
    row = -1;
    typedef void (*OfRow)(GListPane *, int);
    {
        Replaced<OfRow> const replaced(Find<OfRow>("LSTSelItem"),
                                       [](GListPane *, int given) { row = given; });
        LSTSelItem(list, 3);
    }
    EXPECT_EQ(row, 3);
    EXPECT_FALSE(list->CheckSel(3));
    LSTSelItem(list, 3);
    EXPECT_TRUE(list->CheckSel(3));
}

// What each does

TEST_F(ListProcedures, AnswerWhatTheListKnows) {
    GListPane *const list = Filled(100, kListSelectSeveral);
    list->SelectItem(4);
    list->SelectItem(6);
    list->SetScrollPosition(2);
    EXPECT_EQ(LSTGetNumItems(list), 100);
    EXPECT_EQ(LSTGetNumSel(list), 2);
    EXPECT_EQ(LSTGetNumDisp(list), 7);
    EXPECT_EQ(LSTGetScrollPos(list), 2);
    EXPECT_EQ(LSTCheckHitV(list, 40), 3);
    EXPECT_TRUE(LSTCheckSel(list, 4));
    EXPECT_FALSE(LSTCheckSel(list, 5));
    GLGetBoxRec box = {3, {0, 0, 0, 0}};
    EXPECT_TRUE(LSTGetBox(list, &box));
    EXPECT_EQ(box.box, RowBox(*list, 3));
    GLFirstLastRec rows = {0, 0};
    LSTGetFirstAndLast(list, &rows);
    EXPECT_EQ(rows.first, 2);
    EXPECT_EQ(rows.last, 8);
}

TEST_F(ListProcedures, Select) {
    GListPane *const list = Filled(4, kListSelectSeveral);
    LSTSelAll(list);
    EXPECT_EQ(SelectedRows(*list), (std::vector<int>{0, 1, 2, 3}));
    LSTDeselItem(list, 1);
    EXPECT_EQ(SelectedRows(*list), (std::vector<int>{0, 2, 3}));
    LSTDeselAll(list);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>());
    LSTSetSelMode(list, 3);
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectToggle);
}

TEST_F(ListProcedures, ChangeTheRows) {
    GListPane *const list = Filled(4);
    LSTSetNumItems(list, 9);
    LSTAddItem(list, 3);
    EXPECT_EQ(list->GetNumItems(), 10);
    LSTDelItem(list, 0);
    EXPECT_EQ(list->GetNumItems(), 9);
}

TEST_F(ListProcedures, ScrollAndDraw) {
    GListPane *const list = Filled(100);
    Show();
    LSTScrollTo(list, 30);
    EXPECT_EQ(list->GetScrollPos(), 30);
    LSTPageTillVisible(list, 60);
    EXPECT_EQ(list->GetScrollPos(), 59);
    LSTDrawLine(list, 60);
    EXPECT_EQ(drawer.TakeRows(), (Log{"60"}));
    LSTProtect(list, 60);
    LSTDrawLine(list, 60);
    EXPECT_EQ(drawer.TakeRows(), Log());
}
