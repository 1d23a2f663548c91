#include "bench/peers/QtToolkit.h"
#include "bench/peers/PeerForm.h"
#include <QFont>
#include <QTimer>
#include <QWidget>
#include <QWindow>

namespace {

int const kLongestWait = 5000; // milliseconds

// The platform has to be known before there is an application.
int &WithPlatform(char const *platform, int &argc) {
    qputenv("QT_QPA_PLATFORM", platform);
    return argc;
}

} // namespace

QtToolkit::QtToolkit(char const *platform, int &argc, char **argv)
    : application(WithPlatform(platform, argc), argv) {
    QFont font(PeerForm::kFontFamily);
    font.setPixelSize(PeerForm::kFontSize);
    QApplication::setFont(font);
}

void QtToolkit::WaitUntilExposed(QWidget &window) {
    while (!window.windowHandle() || !window.windowHandle()->isExposed())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
}

void QtToolkit::WaitUntil(bool const &over) {
    QTimer limit;
    limit.setSingleShot(true);
    limit.start(kLongestWait);
    while (!over && limit.isActive())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
}
