// The list in GTK 4: a GtkScrolledWindow, drawn by its Cairo renderer.
#include "bench/peers/GtkToolkit.h"
#include "bench/peers/PeerList.h"

namespace {

class GtkList : public PeerList {
public:
    void Show() override {
        GtkWidget *const window = GtkToolkit::NewWindow("List", kWidth + kBarWidth, kHeight);
        GtkWidget *const scrolled = gtk_scrolled_window_new();
        gtk_scrolled_window_set_overlay_scrolling(GTK_SCROLLED_WINDOW(scrolled), FALSE);
        GtkWidget *const content = gtk_fixed_new();
        for (int i = 0; i < kLabels; ++i) {
            GtkWidget *const label = gtk_label_new(TextOf(i).c_str());
            gtk_label_set_xalign(GTK_LABEL(label), 0);
            gtk_widget_set_size_request(label, kWidth, kRowHeight);
            gtk_fixed_put(GTK_FIXED(content), label, 0, i * kRowHeight);
        }
        gtk_scrolled_window_set_child(GTK_SCROLLED_WINDOW(scrolled), content);
        gtk_window_set_child(GTK_WINDOW(window), scrolled);
        adjustment = gtk_scrolled_window_get_vadjustment(GTK_SCROLLED_WINDOW(scrolled));
        toolkit.Show(window);
    }
    void ScrollTo(int position) override {
        gtk_adjustment_set_value(adjustment, position);
        toolkit.FinishFrame();
    }
    void Settle() override { GtkToolkit::Settle(); }

private:
    GtkToolkit toolkit;
    GtkAdjustment *adjustment = nullptr;
};

} // namespace

PeerList *NewPeerList(int &, char **) { return new GtkList; }
