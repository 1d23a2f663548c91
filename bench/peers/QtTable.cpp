// The list in Qt 6 Widgets: a QTreeView with rows of one height, on a model of its own.
#include "bench/peers/PeerTable.h"
#include "bench/peers/QtToolkit.h"
#include <QAbstractTableModel>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QScrollBar>
#include <QSize>
#include <QTreeView>
#include <memory>

namespace {

class QtTable : public PeerTable {
public:
    QtTable(int &argc, char **argv)
        : toolkit("xcb", argc, argv) {}

    void Show() override {
        view.reset(new QTreeView);
        view->setFrameShape(QFrame::NoFrame);
        view->setUniformRowHeights(true);
        view->setRootIsDecorated(false);
        view->setHeaderHidden(true);
        view->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
        view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        view->setModel(&model);
        for (int column = 0; column < kColumns; ++column)
            view->setColumnWidth(column, kColumnWidth);
        QObject::connect(view.get(), &QTreeView::clicked, view.get(), [this] {
            Heard();
            heard = true;
        });
        view->setGeometry(0, 0, kWidth, kHeight);
        view->show();
        QtToolkit::WaitUntilExposed(*view);
        Repaint();
    }
    void Repaint() override {
        view->viewport()->repaint();
        QtToolkit::Settle();
    }
    void ScrollTo(int row) override {
        view->verticalScrollBar()->setValue(row); // it counts rows
        QtToolkit::Settle();
    }
    void Settle() override { QtToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        QtToolkit::WaitUntil(heard);
    }

private:
    class Model : public QAbstractTableModel {
    public:
        int rowCount(QModelIndex const &parent) const override { return parent.isValid() ? 0 : kRows; }
        int columnCount(QModelIndex const &) const override { return kColumns; }
        QVariant data(QModelIndex const &index, int role) const override {
            if (role == Qt::DisplayRole)
                return QString::fromStdString(TextOf(index.row(), index.column()));
            if (role == Qt::SizeHintRole)
                return QSize(kColumnWidth, kRowHeight);
            return QVariant();
        }
    };

    QtToolkit toolkit;
    Model model;
    std::unique_ptr<QTreeView> view;
    bool heard = false;
};

} // namespace

PeerTable *NewPeerTable(int &argc, char **argv) { return new QtTable(argc, argv); }
