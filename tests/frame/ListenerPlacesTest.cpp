// Listeners of several classes, which have their listening part in different places.
#include "frame/Provider.h"
#include <gtest/gtest.h>

namespace {

class TalkListener : public Dependent<TalkListener> {
public:
    virtual void Said() = 0;
};

struct Talk : DependentCastMessenger<TalkListener> {
    void BroadcastChange(TalkListener *listener) override { listener->Said(); }
};

struct Ear : TalkListener {
    void Said() override { ++heard; }
    int heard = 0;
};

struct Furniture {
    virtual ~Furniture() {}
    long weight[3] = {};
};
struct Sofa : Furniture, Ear {};

struct Left : Ear {};
struct Right : Ear {};
struct Head : Left, Furniture, Right {};

} // namespace

TEST(ListenerPlaces, ListenersOfSeveralClassesHearInTurn) {
    Provider<TalkListener> sender;
    Ear ears[2];
    Sofa sofas[2];
    for (int i : {0, 1}) {
        ears[i].DependUpon(&sender);
        sofas[i].DependUpon(&sender);
    }
    sender.BroadcastChange(Talk(), nullptr);
    for (int i : {0, 1}) {
        EXPECT_EQ(ears[i].heard, 1);
        EXPECT_EQ(sofas[i].heard, 1);
    }
}

TEST(ListenerPlaces, AnObjectWithTwoListeningPartsHearsWithBoth) {
    Provider<TalkListener> sender;
    Head head;
    static_cast<Left &>(head).DependUpon(&sender);
    static_cast<Right &>(head).DependUpon(&sender);
    sender.BroadcastChange(Talk(), nullptr);
    sender.BroadcastChange(Talk(), nullptr);
    EXPECT_EQ(static_cast<Left &>(head).heard, 2);
    EXPECT_EQ(static_cast<Right &>(head).heard, 2);
}
