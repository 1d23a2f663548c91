// A listener class for the tests of messaging, and a listener that writes down what happens to it.
#pragma once
#include "frame/Message.h"
#include <functional>
#include <string>
#include <vector>

class Ears : public Dependent<Ears> {
public:
    virtual void Hear(std::string const &word) = 0;
};

typedef Provider<Ears> Mouth;
typedef std::vector<std::string> Log;

// Says one word to all dependents of the mouth but one.
inline void Say(Mouth &mouth, std::string const &word, Dependent<Ears> *exclude = nullptr) {
    mouth.BroadcastChange(Message1<Ears, std::string const &, std::string>(&Ears::Hear, &word), exclude);
}

// Writes "name: word" for each word, "name: dying" for each provider that goes, and does something on either
// occasion.
class Listener : public Ears {
public:
    Listener(std::string const &itsName, Log &itsLog)
        : name(itsName)
        , log(itsLog) {}

    void Hear(std::string const &word) override {
        log.push_back(name + ": " + word);
        // A copy: the action may replace itself, or destroy this listener.
        std::function<void()> const action = onHear;
        if (action)
            action();
    }

    std::function<void()> onHear;
    std::function<void(Mouth *)> onDying;

private:
    void ProviderDying(Mouth *mouth) override {
        log.push_back(name + ": dying");
        std::function<void(Mouth *)> const action = onDying;
        if (action)
            action(mouth);
    }

    std::string name;
    Log &log;
};
