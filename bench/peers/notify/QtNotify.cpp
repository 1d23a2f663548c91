// Qt's signals and slots. The signal is one that Qt brings, and that nothing else sends here.
#include "bench/peers/notify/Notify.h"
#include <QBuffer>
#include <deque>

namespace {

long long heard = 0;

struct Counter : QObject {
    void Pressed() { ++heard; }
};

class QtNotify : public Notify {
public:
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i)
            QObject::connect(&sender, &QIODevice::readyRead, &counters.emplace_back(), &Counter::Pressed);
        return true;
    }
    void Send() override { Q_EMIT sender.readyRead(); }
    long long Heard() const override { return heard; }

private:
    QBuffer sender;
    std::deque<Counter> counters;
};

} // namespace

Notify *NewNotify() { return new QtNotify; }
