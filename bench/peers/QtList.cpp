// The list in Qt 6 Widgets: a QScrollArea.
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerList.h"
#include <QApplication>
#include <QFont>
#include <QLabel>
#include <QScrollArea>
#include <QScrollBar>
#include <QWindow>
#include <memory>

namespace {

class QtList : public PeerList {
public:
    QtList(int &argc, char **argv)
        : application(argc, argv) {
        QFont font(PeerForm::kFontFamily);
        font.setPixelSize(PeerForm::kFontSize);
        QApplication::setFont(font);
    }

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
        while (!area->windowHandle() || !area->windowHandle()->isExposed())
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        Settle();
    }
    void ScrollTo(int position) override {
        area->verticalScrollBar()->setValue(position);
        Settle(); // which handles the update that this has posted
    }
    void Settle() override { QGuiApplication::sync(); }

private:
    QApplication application;
    std::unique_ptr<QScrollArea> area;
};

} // namespace

PeerList *NewPeerList(int &argc, char **argv) {
    qputenv("QT_QPA_PLATFORM", "xcb");
    return new QtList(argc, argv);
}
