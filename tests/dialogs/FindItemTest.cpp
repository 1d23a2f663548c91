#include "dialogs/FindItem.h"
#include "buttons/OvalButtonPane.h"
#include "tabs/TabPane.h"
#include "tests/dialogs/DialogTest.h"

namespace {

class FindItemTest : public DialogTest {
protected:
    glogRec *glog =
        Load(Dialog("<Item type=\"Group\"><Items><Item type=\"OvalButton\" id=\"6\"/></Items></Item>"));
};

TEST_F(FindItemTest, ThePaneOfTheItemIsFoundInContainersAndAsItsBase) {
    EXPECT_EQ(FindItem<OvalButtonPane>(glog, 6), GetGlogItem(glog, 6));
    EXPECT_EQ(FindItem<GlogButtonPane>(glog, 6), GetGlogItem(glog, 6));
}

TEST_F(FindItemTest, AnotherClassIsAnErrorThatNamesBoth) {
    try {
        FindItem<TabPane>(glog, 6);
        FAIL() << "no error";
    } catch (LoadError const &error) {
        EXPECT_STREQ(error.what(), "test.xml: item 6 (OvalButtonPane): the program looks for a TabPane here");
    }
}

TEST_F(FindItemTest, ANumberThatNoItemHasIsAnErrorAlsoWhereAPlaceHasIt) {
    ASSERT_NE(GetGlogItem(glog, 1), nullptr);
    for (int id : {1, 99}) {
        try {
            FindItem<TabPane>(glog, id);
            FAIL() << "no error";
        } catch (LoadError const &error) {
            EXPECT_EQ(error.what(), "test.xml: item " + std::to_string(id) +
                                        ": the program looks for this TabPane, and there is no such item");
        }
    }
}

} // namespace
