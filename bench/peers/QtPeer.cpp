// The form in Qt 6 Widgets.
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/QtToolkit.h"
#include <QCheckBox>
#include <QRadioButton>
#include <QWidget>
#include <memory>
#include <vector>

namespace {

class QtPeer : public Peer {
public:
    QtPeer(bool offscreen, int &argc, char **argv)
        : toolkit(offscreen ? "offscreen" : "xcb", argc, argv) {}

    void Build(int count, int height) override {
        window.reset(new QWidget);
        window->setWindowTitle(PeerForm::kTitle);
        window->setGeometry(0, 0, PeerForm::kWidth, height);
        for (int group = 0; group < PeerForm::kGroups; ++group)
            AddGroup(PeerForm::OfGroup(group));
        for (int box = 0; box < count; ++box) {
            PeerForm::Place const place = PeerForm::OfBox(box);
            auto *const button =
                new QCheckBox(QString::fromStdString(PeerForm::TextOfBox(box)), window.get());
            button->setGeometry(place.h, place.v, PeerForm::kColumnWidth, PeerForm::kRowHeight);
            QObject::connect(button, &QCheckBox::clicked, button, [this] {
                Heard();
                heard = true;
            });
            boxes.push_back(button);
        }
    }
    void Destroy() override {
        boxes.clear();
        window.reset(); // with all widgets
    }
    void Show() override {
        window->show();
        QtToolkit::WaitUntilExposed(*window);
        Repaint();
    }

    void Repaint() override {
        window->repaint();
        QtToolkit::Settle();
    }
    void Toggle(int box) override {
        boxes[static_cast<std::size_t>(box)]->toggle();
        QtToolkit::Settle(); // which handles the update that this has posted
    }
    // Off screen the platform has no display, and keeps its windows as images.
    void RepaintOffscreen() override { window->repaint(); }

    void Settle() override { QtToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        QtToolkit::WaitUntil(heard);
    }

private:
    void AddGroup(PeerForm::Place corner) {
        auto *const group = new QWidget(window.get());
        group->setGeometry(corner.h, corner.v, PeerForm::kGroupWidth, PeerForm::kGroupHeight);
        for (int radio = 0; radio < PeerForm::kRadiosPerGroup; ++radio) {
            PeerForm::Place const place = PeerForm::OfRadio(radio);
            auto *const button =
                new QRadioButton(QString::fromStdString(PeerForm::TextOfRadio(radio)), group);
            button->setGeometry(place.h, place.v, PeerForm::kColumnWidth, PeerForm::kRowHeight);
            button->setChecked(radio == 0);
        }
    }

    QtToolkit toolkit;
    std::unique_ptr<QWidget> window;
    std::vector<QCheckBox *> boxes; // the window's
    bool heard = false;
};

} // namespace

Peer *NewPeer(bool offscreen, int &argc, char **argv) { return new QtPeer(offscreen, argc, argv); }
