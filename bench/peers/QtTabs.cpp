// The tabs in Qt 6 Widgets: a QTabBar.
#include "bench/peers/PeerTabs.h"
#include "bench/peers/QtToolkit.h"
#include <QTabBar>
#include <QWidget>
#include <memory>

namespace {

class QtTabs : public PeerTabs {
public:
    QtTabs(int &argc, char **argv)
        : toolkit("xcb", argc, argv) {}

    void Show() override {
        window.reset(new QWidget);
        window->setGeometry(0, 0, kWidest, kHeight);
        bar = new QTabBar(window.get());
        for (int i = 0; i < kTabs; ++i)
            bar->addTab(QString::fromStdString(NameOf(i)));
        bar->setGeometry(0, 0, kWidest, kHeight);
        window->show();
        QtToolkit::WaitUntilExposed(*window);
        Settle();
    }
    void SetWidth(int width) override {
        bar->resize(width, kHeight);
        Settle(); // which handles the update that this has posted
    }
    void Settle() override { QtToolkit::Settle(); }

private:
    QtToolkit toolkit;
    std::unique_ptr<QWidget> window;
    QTabBar *bar = nullptr; // the window's
};

} // namespace

PeerTabs *NewPeerTabs(int &argc, char **argv) { return new QtTabs(argc, argv); }
