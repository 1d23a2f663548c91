// Presses that follow each other faster than a button shows the one before.
#include "buttons/OvalButtonPane.h"
#include "tests/PaneTest.h"

namespace {

class QuickPresses : public PaneTest {
protected:
    QuickPresses() {
        for (short i = 0; i < 2; ++i) {
            gobResRec record = {gobResRec::kKind, 20, static_cast<short>(20 + i * 100), 80, 1, 0};
            OvalButtonPane::NewOvalButtonPane(glog, &record)->SetID(i + 1);
        }
        Show();
    }

    Lines Results(std::string const &script) { return ReportsOf(script, "id"); }
};

TEST_F(QuickPresses, EachGetsItsOwnRelease) {
    EXPECT_EQ(Results("click 40 30\nclick 140 30\nclick 40 30"),
              (Lines{"\"id\":1,\"message\":\"HandleClick\",\"result\":1}",
                     "\"id\":2,\"message\":\"HandleClick\",\"result\":1}",
                     "\"id\":1,\"message\":\"HandleClick\",\"result\":1}"}));
}

TEST_F(QuickPresses, ADragThatHadToWaitIsFollowed) {
    EXPECT_EQ(Results("click 40 30\npress 140 30\nmove 300 190\nrelease\nclick 40 30"),
              (Lines{"\"id\":1,\"message\":\"HandleClick\",\"result\":1}",
                     "\"id\":2,\"message\":\"HandleClick\",\"result\":-1}",
                     "\"id\":1,\"message\":\"HandleClick\",\"result\":1}"}));
}

TEST_F(QuickPresses, APressThatNobodyWantsDoesNotDisturbTheNext) {
    EXPECT_EQ(Results("click 40 30\nclick 300 190\nclick 140 30"),
              (Lines{"\"id\":1,\"message\":\"HandleClick\",\"result\":1}",
                     "\"id\":2,\"message\":\"HandleClick\",\"result\":1}"}));
}

} // namespace
