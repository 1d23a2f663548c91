// Whatever is redrawn of a list looks as if all of it had been drawn.
#include "desktop/drawing/Surface.h"
#include "lists/ListTextDrawer.h"
#include "tests/lists/ListTest.h"
#include <random>

namespace {

class GListPaneDamageTest : public ListTest {
protected:
    GListPane *NewTextList(int style, int rows) {
        glistResRec record = Record(kListSelectSeveral);
        record.style = style;
        record.firstLineOffset = 3;
        GListPane *const list = Equipped(NewList(record), rows);
        list->SetLineDrawer(new ListTextDrawer(list,
                                               [](int line, int column, ListCell &cell) {
                                                   tarn::NumToUString(line * 10LL + column,
                                                                      tarn::kPlainNumber, cell.text);
                                                   cell.iconFamily = column == 1 ? short(1821) : short(0);
                                                   cell.icon = static_cast<short>(line % 8);
                                               }),
                            true);
        if (rows > 3)
            list->SelectItem(2);
        Show();
        return list;
    }
    std::string PixelsOf() const {
        Surface const &picture = *desktop.Picture(glog);
        std::size_t const pixels =
            static_cast<std::size_t>(picture.Width()) * static_cast<std::size_t>(picture.Height());
        return std::string(reinterpret_cast<char const *>(picture.Pixels()), pixels * sizeof(std::uint32_t));
    }
    void Redraw(Rect const &damage) {
        SetPortToGlog(glog);
        VelaDrawing::InvalRect(&damage);
        UpdateGlog(glog);
    }
    std::string FullPicture() {
        Redraw({0, 0, 200, 320});
        return PixelsOf();
    }
    // Redraws places all over the window, which must not change it.
    void ExpectSteady() {
        std::string const full = FullPicture();
        std::mt19937 random(7);
        auto const below = [&random](int limit) {
            return static_cast<short>(random() % static_cast<unsigned int>(limit));
        };
        for (int i = 0; i < 60; ++i) {
            Rect damage;
            damage.top = below(130);
            damage.left = below(240);
            damage.bottom = static_cast<short>(damage.top + 1 + below(40));
            damage.right = static_cast<short>(damage.left + 1 + below(60));
            Redraw(damage);
            ASSERT_TRUE(PixelsOf() == full) << damage;
        }
    }
};

} // namespace

TEST_F(GListPaneDamageTest, AnyPartOfAListOfDialogStyleIsRedrawnAsItWas) {
    NewTextList(glistResRec::kDialogStyle, 100);
    ExpectSteady();
}

TEST_F(GListPaneDamageTest, AnyPartOfASmallListIsRedrawnAsItWas) {
    NewTextList(glistResRec::kSmallStyle, 100);
    ExpectSteady();
}

TEST_F(GListPaneDamageTest, AnyPartOfAListWithFewRowsIsRedrawnAsItWas) {
    for (int style : {glistResRec::kDialogStyle, glistResRec::kSmallStyle}) {
        GListPane *const list = NewTextList(style, 2);
        ExpectSteady();
        delete list;
    }
}

TEST_F(GListPaneDamageTest, WhatSelectingRedrawsIsAllThatHasChanged) {
    for (int style : {glistResRec::kDialogStyle, glistResRec::kSmallStyle}) {
        GListPane *const list = NewTextList(style, 100);
        std::vector<std::function<void()>> const changes = {
            [&] { list->SelectItem(0); },
            [&] { list->SelectItem(5); },
            [&] { list->DeselectItem(2); },
            [&] { list->SelectAll(); },
            [&] { list->DeselectAll(); },
            [&] { desktop.Play("wait 1\nclick " + At(3)); },
            [&] { desktop.Play("wait 1\npress " + At(1) + "\nmove " + At(4) + "\nrelease"); },
            [&] {
                desktop.Play("wait 1\npress " + At(1) +
                             "\nmove 40 140\nwait 0.2\nmove 40 5\nwait 0.1\nrelease");
            },
            [&] { list->SetSelMode(kListSelectOne); },
            [&] { list->SetSelRange(4, 4); },
            [&] { desktop.Play("activate off"); },
            [&] { desktop.Play("activate on"); },
            [&] { list->SetScrollPosition(7); },
            [&] { list->DelItem(8); },
        };
        for (std::size_t i = 0; i < changes.size(); ++i) {
            changes[i]();
            UpdateGlog(glog);
            std::string const redrawn = PixelsOf();
            ASSERT_TRUE(redrawn == FullPicture()) << "change " << i << ", style " << style;
        }
        delete list;
    }
}

// A row that is dragged to another place, once its owner has moved it.
TEST_F(GListPaneDamageTest, AMovedRowNeedsNoFurtherDrawing) {
    std::vector<int> order;
    for (int i = 0; i < 10; ++i)
        order.push_back(i);
    glistResRec record = Record();
    record.style = glistResRec::kSmallStyle;
    GListPane *const list = Equipped(NewList(record), 10);
    list->SetLineDrawer(new ListTextDrawer(list,
                                           [&order](int line, int, ListCell &cell) {
                                               tarn::NumToUString(order[static_cast<std::size_t>(line)],
                                                                  tarn::kPlainNumber, cell.text);
                                           }),
                        true);
    listener.onCall = [&](std::string const &call) {
        if (call.find("click") != 0)
            return;
        int const to = list->MoveItem({60, 100});
        ASSERT_EQ(to, 4);
        order.erase(order.begin() + 2);
        order.insert(order.begin() + to, 2);
    };
    Show();
    desktop.Play("press 100 60\nmove 100 92\nrelease");
    UpdateGlog(glog);
    std::string const moved = PixelsOf();
    EXPECT_EQ(order, (std::vector<int>{0, 1, 3, 4, 2, 5, 6, 7, 8, 9}));
    EXPECT_TRUE(moved == FullPicture());
}
