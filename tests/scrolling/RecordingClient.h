// A client of scroll bars that notes what it is asked and told, and does what a test likes.
#pragma once
#include "host/Services.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include <algorithm>
#include <functional>
#include <string>
#include <vector>

// Scrolls a position from 0 to a greatest value in steps of its own choice.
class RecordingClient : public ScrollBarClient {
public:
    // One call of Scroll.
    struct Step {
        double time; // seconds
        int amount;
        int multiplier; // as it was found
    };

    void InhibitAutoScroll(glogRec *announced) override {
        announcedGlog = announced;
        Note("inhibit");
        Call(onInhibit);
    }
    int GetMaxScrollValue(ScrollBarPane *) override {
        Note("greatest?");
        int const answer = greatest;
        Call(onGreatest);
        return answer;
    }
    void ScrollTo(ScrollBarPane *bar, int target) override {
        Note("to " + std::to_string(target));
        targets.push_back(target);
        position = std::max(0, std::min(target, greatest));
        if (setsBar)
            bar->Set(position, greatest);
        Call(onScrollTo);
    }
    double GetThumbRatio(ScrollBarPane *) override { return ratio; }
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override {
        Note(byUnit ? "start by unit" : "start by page");
        amount = byUnit ? unit : page;
        multiplier = firstMultiplier;
        Call(onStart);
    }
    void Scroll(ScrollBarPane *bar, int &amount, int &multiplier) override {
        Note("scroll " + std::to_string(amount) + " x " + std::to_string(multiplier));
        steps.push_back({TarnSystemTime::GetCurrentEventTime(), amount, multiplier});
        position = static_cast<int>(std::clamp<long long>(0LL + position + amount, 0, std::max(greatest, 0)));
        multiplier += acceleration;
        if (setsBar)
            bar->Set(position, greatest);
        Call(onScroll);
    }
    int GetArrowScrollDelay() override {
        int const answer = arrowDelay ? arrowDelay : ScrollBarClient::GetArrowScrollDelay();
        Call(onDelay);
        return answer;
    }
    int GetPageScrollDelay() override {
        int const answer = pageDelay ? pageDelay : ScrollBarClient::GetPageScrollDelay();
        Call(onDelay);
        return answer;
    }
    void DoneScrolling(ScrollBarPane *) override {
        Note("done");
        Call(onDone);
    }

    std::vector<std::string> TakeLog() {
        std::vector<std::string> taken;
        taken.swap(log);
        return taken;
    }

    int position = 0, greatest = 1000;
    double ratio = 0.1;
    int unit = 1, page = 10, firstMultiplier = 1;
    int acceleration = 0;              // added to the multiplier by each step
    int arrowDelay = 0, pageDelay = 0; // ticks; 0: the default
    bool setsBar = true;
    std::function<void()> onInhibit, onGreatest, onStart, onScroll, onScrollTo, onDelay, onDone;
    std::vector<std::string> log;
    std::vector<Step> steps;
    std::vector<int> targets;
    glogRec *announcedGlog = nullptr;

private:
    void Note(std::string const &line) { log.push_back(line); }
    // A copy, since the action may delete the client.
    static void Call(std::function<void()> action) {
        if (action)
            action();
    }
};
