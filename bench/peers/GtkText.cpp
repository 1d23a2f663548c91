// The text in GTK 4: a GtkTextView.
#include "bench/peers/GtkToolkit.h"
#include "bench/peers/PeerText.h"

namespace {

class GtkLongText : public PeerText {
public:
    void Show() override {
        GtkWidget *const window = GtkToolkit::NewWindow("Text", kWidth, kHeight);
        GtkWidget *const scrolled = gtk_scrolled_window_new();
        GtkWidget *const view = gtk_text_view_new();
        gtk_scrolled_window_set_child(GTK_SCROLLED_WINDOW(scrolled), view);
        gtk_window_set_child(GTK_WINDOW(window), scrolled);
        buffer = gtk_text_view_get_buffer(GTK_TEXT_VIEW(view));
        std::string const text = Lines();
        gtk_text_buffer_set_text(buffer, text.c_str(), static_cast<int>(text.size()));
        toolkit.Show(window);
        gtk_widget_grab_focus(view);
        GtkTextIter middle;
        gtk_text_buffer_get_iter_at_offset(buffer, &middle, kMiddle);
        gtk_text_buffer_place_cursor(buffer, &middle);
        gtk_text_view_scroll_to_mark(GTK_TEXT_VIEW(view), gtk_text_buffer_get_insert(buffer), 0, TRUE, 0,
                                     0.5);
        toolkit.FinishFrame();
        Settle();
    }
    void Type() override {
        char const typed[] = {kTyped, 0};
        gtk_text_buffer_insert_interactive_at_cursor(buffer, typed, 1, TRUE);
        toolkit.FinishFrame();
    }
    void Delete() override {
        GtkTextIter at;
        gtk_text_buffer_get_iter_at_mark(buffer, &at, gtk_text_buffer_get_insert(buffer));
        gtk_text_buffer_backspace(buffer, &at, TRUE, TRUE);
        toolkit.FinishFrame();
    }
    void Settle() override { GtkToolkit::Settle(); }

private:
    GtkToolkit toolkit;
    GtkTextBuffer *buffer = nullptr; // the view's
};

} // namespace

PeerText *NewPeerText(int &, char **) { return new GtkLongText; }
