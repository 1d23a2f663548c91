// The list in FLTK 1.3: an Fl_Table, which leaves the drawing of cells to the program.
#include "bench/peers/FltkToolkit.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerTable.h"
#include <FL/Fl.H>
#include <FL/Fl_Table.H>
#include <FL/Fl_Window.H>
#include <FL/fl_draw.H>
#include <algorithm>
#include <memory>

namespace {

int const kMargin = 3; // pixels

class FltkTable : public PeerTable {
public:
    void Show() override {
        window.reset(new Fl_Window(0, 0, kWidth, kHeight, "List"));
        window->clear_border();
        table = new Table;
        table->callback(Clicked, this);
        window->end();
        window->show();
        window->wait_for_expose();
        Repaint();
    }
    void Repaint() override {
        table->redraw();
        FltkToolkit::Finish();
    }
    void ScrollTo(int row) override {
        table->row_position(row);
        FltkToolkit::Finish();
    }
    void Settle() override { FltkToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        FltkToolkit::WaitUntil(heard);
    }

private:
    class Table : public Fl_Table {
    public:
        Table()
            : Fl_Table(0, 0, kWidth, kHeight) {
            box(FL_NO_BOX);
            rows(1); // further ones are as high as the last; to set each would take hours
            row_height(0, kRowHeight);
            rows(kRows);
            cols(kColumns);
            col_width_all(kColumnWidth);
            end();
        }
        // Fl_Table's own selection is one of cells, made by dragging; here it is a row.
        void Select(int row) {
            int const before = selected;
            selected = row;
            // Fl_Table draws every cell of a range, also those that do not show.
            bool const showed = before >= toprow && before <= botrow;
            int const other = showed ? before : row;
            redraw_range(std::min(other, row), std::max(other, row), 0, kColumns - 1);
        }

    protected:
        void draw_cell(TableContext context, int row, int column, int h, int v, int width,
                       int height) override {
            if (context == CONTEXT_STARTPAGE)
                fl_font(FL_HELVETICA, PeerForm::kFontSize);
            if (context != CONTEXT_CELL)
                return;
            fl_push_clip(h, v, width, height);
            fl_color(row == selected ? FL_SELECTION_COLOR : FL_BACKGROUND2_COLOR);
            fl_rectf(h, v, width, height);
            fl_color(row == selected ? FL_WHITE : FL_FOREGROUND_COLOR);
            fl_draw(TextOf(row, column).c_str(), h + kMargin, v, width - 2 * kMargin, height, FL_ALIGN_LEFT);
            fl_pop_clip();
        }

    private:
        int selected = 0;
    };

    static void Clicked(Fl_Widget *, void *data) {
        FltkTable *const peer = static_cast<FltkTable *>(data);
        if (peer->table->callback_context() != Fl_Table::CONTEXT_CELL)
            return;
        if (Fl::event() == FL_PUSH)
            peer->table->Select(peer->table->callback_row());
        if (Fl::event() != FL_RELEASE)
            return;
        Heard();
        peer->heard = true;
    }

    FltkToolkit toolkit;
    std::unique_ptr<Fl_Window> window;
    Table *table = nullptr; // the window's
    bool heard = false;
};

} // namespace

PeerTable *NewPeerTable(int &, char **) { return new FltkTable; }
