// The list in GTK 4: a GtkScrolledWindow, drawn by its Cairo renderer.
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerList.h"
#include <cstdio>
#include <cstdlib>
#include <gtk/gtk.h>

namespace {

int const kPointsPerInch = 72, kPixelsPerInch = 96;

class GtkList : public PeerList {
public:
    GtkList() {
        if (!gtk_init_check()) {
            std::fprintf(stderr, "peer_gtk: no display\n");
            std::exit(EXIT_FAILURE);
        }
        std::string const font = std::string(PeerForm::kFontFamily) + ' ' +
                                 std::to_string(PeerForm::kFontSize * kPointsPerInch / kPixelsPerInch);
        g_object_set(gtk_settings_get_default(), "gtk-font-name", font.c_str(), "gtk-enable-animations",
                     FALSE, nullptr);
    }

    void Show() override {
        GtkWidget *const window = gtk_window_new();
        gtk_window_set_decorated(GTK_WINDOW(window), FALSE); // else its frame takes of the list's room
        gtk_window_set_default_size(GTK_WINDOW(window), kWidth + kBarWidth, kHeight);
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
        gtk_widget_show(window);
        g_signal_connect(gtk_widget_get_frame_clock(window), "after-paint", G_CALLBACK(Painted), this);
        FinishFrame();
        Settle();
    }
    void ScrollTo(int position) override {
        gtk_adjustment_set_value(adjustment, position);
        FinishFrame();
    }
    void Settle() override {
        while (g_main_context_iteration(nullptr, FALSE)) {
        }
        gdk_display_sync(gdk_display_get_default());
    }

private:
    void FinishFrame() {
        for (int const before = frames; frames == before;)
            g_main_context_iteration(nullptr, TRUE);
        gdk_display_sync(gdk_display_get_default());
    }
    static void Painted(GdkFrameClock *, void *list) { ++static_cast<GtkList *>(list)->frames; }

    GtkAdjustment *adjustment = nullptr;
    int frames = 0;
};

} // namespace

PeerList *NewPeerList(int &, char **) {
    g_setenv("GDK_BACKEND", "x11", TRUE);
    g_setenv("GSK_RENDERER", "cairo", TRUE);
    g_setenv("GTK_A11Y", "none", TRUE); // there is no bus to tell
    g_setenv("GSETTINGS_BACKEND", "memory", TRUE);
    return new GtkList;
}
