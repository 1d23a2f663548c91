#include "lists/ListLineDrawer.h"
#include "tests/VirtualPlace.h"

TEST(ListLineDrawerTest, HasItsOperationsInTheirOrder) {
    ExpectInOrder(kAfterDestructor, &ListLineDrawer::DrawLine, &ListLineDrawer::GetHelpTagForLogicalColumn);
}

TEST(ListLineDrawerTest, HasNoHelpTagsByDefault) {
    class Drawer : public ListLineDrawer {
        void DrawLine(int, Rect *, bool) override {}
    } drawer;
    Rect box = {1, 2, 3, 4};
    OS::Help::Placement placement = OS::Help::Placement(1);
    double location = 0.25;
    EXPECT_FALSE(drawer.GetHelpTagForLogicalColumn(0, 0, nullptr, box, placement, location));
    EXPECT_EQ(box.right, 4);
    EXPECT_EQ(placement, 1);
    EXPECT_EQ(location, 0.25);
}
