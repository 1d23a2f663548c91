// The form in GTK 4, drawn by its Cairo renderer: the others draw with the processor too.
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include <cstdio>
#include <cstdlib>
#include <gdk/x11/gdkx.h>
#include <gtk/gtk.h>
#include <vector>

namespace {

int const kPointsPerInch = 72, kPixelsPerInch = 96;
unsigned const kLongestWait = 5000; // milliseconds

class GtkPeer : public Peer {
public:
    GtkPeer() {
        if (!gtk_init_check()) {
            std::fprintf(stderr, "peer_gtk: no display\n");
            std::exit(EXIT_FAILURE);
        }
        std::string const font = std::string(PeerForm::kFontFamily) + ' ' +
                                 std::to_string(PeerForm::kFontSize * kPointsPerInch / kPixelsPerInch);
        // An animated change of a check box would be many frames instead of one.
        g_object_set(gtk_settings_get_default(), "gtk-font-name", font.c_str(), "gtk-enable-animations",
                     FALSE, nullptr);
    }
    ~GtkPeer() override { Destroy(); }

    void Build(int count, int height) override {
        window = gtk_window_new();
        gtk_window_set_title(GTK_WINDOW(window), PeerForm::kTitle);
        gtk_window_set_decorated(GTK_WINDOW(window), FALSE); // else its frame takes of the form's room
        gtk_window_set_default_size(GTK_WINDOW(window), PeerForm::kWidth, height);
        form = gtk_fixed_new();
        gtk_window_set_child(GTK_WINDOW(window), form);
        for (int group = 0; group < PeerForm::kGroups; ++group)
            AddGroup(PeerForm::OfGroup(group));
        for (int box = 0; box < count; ++box) {
            GtkWidget *const button = gtk_check_button_new_with_label(PeerForm::TextOfBox(box).c_str());
            PeerForm::Place const place = PeerForm::OfBox(box);
            Put(form, button, place.h, place.v);
            g_signal_connect(button, "toggled", G_CALLBACK(Toggled), this);
            boxes.push_back(GTK_CHECK_BUTTON(button));
        }
    }
    void Destroy() override {
        boxes.clear();
        if (surface)
            cairo_surface_destroy(surface);
        surface = nullptr;
        if (window)
            gtk_window_destroy(GTK_WINDOW(window));
        window = form = nullptr;
        frames = 0;
    }
    void Show() override {
        gtk_widget_show(window);
        GdkFrameClock *const clock = gtk_widget_get_frame_clock(window);
        g_signal_connect(clock, "after-paint", G_CALLBACK(Painted), this);
        FinishFrame();
        while (g_main_context_iteration(nullptr, FALSE)) {
        }
    }

    // An exposure of the whole window. Widgets keep what they have drawn as nodes, which are turned into
    // pixels; the widgets themselves are not asked again, which would only take longer.
    void Repaint() override {
        Display *const display = gdk_x11_display_get_xdisplay(gtk_widget_get_display(window));
        GdkSurface *const target = gtk_native_get_surface(GTK_NATIVE(window));
        XClearArea(display, gdk_x11_surface_get_xid(target), 0, 0, 0, 0, True);
        XSync(display, False);
        FinishFrame();
    }
    void Toggle(int box) override {
        GtkCheckButton *const button = boxes[static_cast<std::size_t>(box)];
        gtk_check_button_set_active(button, !gtk_check_button_get_active(button));
        FinishFrame();
    }
    void RepaintOffscreen() override {
        int const width = gtk_widget_get_width(form), height = gtk_widget_get_height(form);
        if (!surface)
            surface = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width, height);
        GdkPaintable *const paintable = gtk_widget_paintable_new(form);
        GtkSnapshot *const snapshot = gtk_snapshot_new();
        gdk_paintable_snapshot(paintable, snapshot, width, height);
        GskRenderNode *const node = gtk_snapshot_free_to_node(snapshot);
        cairo_t *const cairo = cairo_create(surface);
        gsk_render_node_draw(node, cairo);
        cairo_destroy(cairo);
        gsk_render_node_unref(node);
        g_object_unref(paintable);
    }

    void Settle() override {
        while (g_main_context_iteration(nullptr, FALSE)) {
        }
        gdk_display_sync(gdk_display_get_default());
    }
    void WaitUntilHeard() override {
        heard = timedOut = false;
        unsigned const limit = g_timeout_add(kLongestWait, TimeOut, this);
        while (!heard && !timedOut)
            g_main_context_iteration(nullptr, TRUE);
        if (!timedOut)
            g_source_remove(limit);
    }

private:
    static void Put(GtkWidget *into, GtkWidget *button, int h, int v) {
        gtk_widget_set_size_request(button, PeerForm::kColumnWidth, PeerForm::kRowHeight);
        gtk_fixed_put(GTK_FIXED(into), button, h, v);
    }
    void AddGroup(PeerForm::Place corner) {
        GtkWidget *const group = gtk_fixed_new();
        GtkWidget *first = nullptr;
        for (int radio = 0; radio < PeerForm::kRadiosPerGroup; ++radio) {
            GtkWidget *const button = gtk_check_button_new_with_label(PeerForm::TextOfRadio(radio).c_str());
            if (first)
                gtk_check_button_set_group(GTK_CHECK_BUTTON(button), GTK_CHECK_BUTTON(first));
            else
                gtk_check_button_set_active(GTK_CHECK_BUTTON(button), TRUE);
            first = first ? first : button;
            PeerForm::Place const place = PeerForm::OfRadio(radio);
            Put(group, button, place.h, place.v);
        }
        gtk_fixed_put(GTK_FIXED(form), group, corner.h, corner.v);
    }

    void FinishFrame() {
        for (int const before = frames; frames == before;)
            g_main_context_iteration(nullptr, TRUE);
        gdk_display_sync(gdk_display_get_default());
    }
    static void Painted(GdkFrameClock *, void *peer) { ++static_cast<GtkPeer *>(peer)->frames; }
    static void Toggled(GtkCheckButton *, void *data) {
        GtkPeer *const peer = static_cast<GtkPeer *>(data);
        peer->Heard();
        peer->heard = true;
    }
    static gboolean TimeOut(void *peer) {
        static_cast<GtkPeer *>(peer)->timedOut = true;
        return G_SOURCE_REMOVE;
    }

    GtkWidget *window = nullptr, *form = nullptr;
    std::vector<GtkCheckButton *> boxes; // the window's
    cairo_surface_t *surface = nullptr;
    int frames = 0;
    bool heard = false, timedOut = false;
};

} // namespace

Peer *NewPeer(bool, int &, char **) {
    g_setenv("GDK_BACKEND", "x11", TRUE);
    g_setenv("GSK_RENDERER", "cairo", TRUE);
    g_setenv("GTK_A11Y", "none", TRUE); // there is no bus to tell
    g_setenv("GSETTINGS_BACKEND", "memory", TRUE);
    return new GtkPeer;
}
