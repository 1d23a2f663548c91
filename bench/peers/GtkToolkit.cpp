#include "bench/peers/GtkToolkit.h"
#include "bench/peers/PeerForm.h"
#include <cstdio>
#include <cstdlib>
#include <gdk/x11/gdkx.h>

namespace {

int const kPointsPerInch = 72, kPixelsPerInch = 96;
unsigned const kLongestWait = 5000; // milliseconds

gboolean TimeOut(void *timedOut) {
    *static_cast<bool *>(timedOut) = true;
    return G_SOURCE_REMOVE;
}

} // namespace

GtkToolkit::GtkToolkit() {
    g_setenv("GDK_BACKEND", "x11", TRUE);
    g_setenv("GSK_RENDERER", "cairo", TRUE);
    g_setenv("GTK_A11Y", "none", TRUE); // there is no bus to tell
    g_setenv("GSETTINGS_BACKEND", "memory", TRUE);
    if (!gtk_init_check()) {
        std::fprintf(stderr, "peer_gtk: no display\n");
        std::exit(EXIT_FAILURE);
    }
    std::string const font = std::string(PeerForm::kFontFamily) + ' ' +
                             std::to_string(PeerForm::kFontSize * kPointsPerInch / kPixelsPerInch);
    // An animated change would be many frames instead of one.
    g_object_set(gtk_settings_get_default(), "gtk-font-name", font.c_str(), "gtk-enable-animations", FALSE,
                 nullptr);
}

GtkWidget *GtkToolkit::NewWindow(char const *title, int width, int height) {
    GtkWidget *const window = gtk_window_new();
    gtk_window_set_title(GTK_WINDOW(window), title);
    gtk_window_set_decorated(GTK_WINDOW(window), FALSE);
    gtk_window_set_default_size(GTK_WINDOW(window), width, height);
    return window;
}

void GtkToolkit::Show(GtkWidget *window) {
    gtk_widget_show(window);
    g_signal_connect(gtk_widget_get_frame_clock(window), "after-paint", G_CALLBACK(Painted), this);
    FinishFrame();
    while (g_main_context_iteration(nullptr, FALSE)) {
    }
}

void GtkToolkit::FinishFrame() {
    for (int const before = frames; frames == before;)
        g_main_context_iteration(nullptr, TRUE);
    gdk_display_sync(gdk_display_get_default());
}

void GtkToolkit::ExposeAll(GtkWidget *window) {
    Display *const display = gdk_x11_display_get_xdisplay(gtk_widget_get_display(window));
    GdkSurface *const target = gtk_native_get_surface(GTK_NATIVE(window));
    XClearArea(display, gdk_x11_surface_get_xid(target), 0, 0, 0, 0, True);
    XSync(display, False);
    FinishFrame();
}

void GtkToolkit::Settle() {
    while (g_main_context_iteration(nullptr, FALSE)) {
    }
    gdk_display_sync(gdk_display_get_default());
}

void GtkToolkit::WaitUntil(bool const &over) {
    bool timedOut = false;
    unsigned const limit = g_timeout_add(kLongestWait, TimeOut, &timedOut);
    while (!over && !timedOut)
        g_main_context_iteration(nullptr, TRUE);
    if (!timedOut)
        g_source_remove(limit);
}

void GtkToolkit::Painted(GdkFrameClock *, void *toolkit) { ++static_cast<GtkToolkit *>(toolkit)->frames; }
