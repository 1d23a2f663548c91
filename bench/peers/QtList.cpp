// The list in Qt 6 Widgets: a QScrollArea.
#include "bench/peers/PeerList.h"
#include "bench/peers/QtToolkit.h"
#include <QLabel>
#include <QScrollArea>
#include <QScrollBar>
#include <memory>

namespace {

class QtList : public PeerList {
public:
    QtList(int &argc, char **argv)
        : toolkit("xcb", argc, argv) {}

    void Show() override {
        area.reset(new QScrollArea);
        area->setFrameShape(QFrame::NoFrame);
        area->setGeometry(0, 0, kWidth + kBarWidth, kHeight);
        auto *const content = new QWidget;
        content->resize(kWidth, kLabels * kRowHeight);
        for (int i = 0; i < kLabels; ++i) {
            auto *const label = new QLabel(QString::fromStdString(TextOf(i)), content);
            label->setGeometry(0, i * kRowHeight, kWidth, kRowHeight);
        }
        area->setWidget(content);
        area->show();
        QtToolkit::WaitUntilExposed(*area);
        Settle();
    }
    void ScrollTo(int position) override {
        area->verticalScrollBar()->setValue(position);
        Settle(); // which handles the update that this has posted
    }
    void Settle() override { QtToolkit::Settle(); }

private:
    QtToolkit toolkit;
    std::unique_ptr<QScrollArea> area;
};

} // namespace

PeerList *NewPeerList(int &argc, char **argv) { return new QtList(argc, argv); }
