// The text in Qt 6 Widgets: a QPlainTextEdit.
#include "bench/peers/PeerText.h"
#include "bench/peers/QtToolkit.h"
#include <QPlainTextEdit>
#include <QTextCursor>
#include <memory>

namespace {

class QtText : public PeerText {
public:
    QtText(int &argc, char **argv)
        : toolkit("xcb", argc, argv) {}

    void Show() override {
        edit.reset(new QPlainTextEdit);
        edit->setFrameShape(QFrame::NoFrame);
        edit->setGeometry(0, 0, kWidth, kHeight);
        edit->setPlainText(QString::fromStdString(Lines()));
        edit->show();
        QtToolkit::WaitUntilExposed(*edit);
        QTextCursor cursor = edit->textCursor();
        cursor.setPosition(kMiddle);
        edit->setTextCursor(cursor);
        edit->centerCursor();
        edit->setFocus();
        Settle();
    }
    void Type() override {
        edit->insertPlainText(QString(QChar(kTyped)));
        Settle(); // which handles the update that this has posted
    }
    void Delete() override {
        edit->textCursor().deletePreviousChar();
        Settle();
    }
    void Settle() override { QtToolkit::Settle(); }

private:
    QtToolkit toolkit;
    std::unique_ptr<QPlainTextEdit> edit;
};

} // namespace

PeerText *NewPeerText(int &argc, char **argv) { return new QtText(argc, argv); }
