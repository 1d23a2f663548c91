// The form in GTK 4, drawn by its Cairo renderer: the others draw with the processor too.
#include "bench/peers/GtkToolkit.h"
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include <vector>

namespace {

class GtkPeer : public Peer {
public:
    ~GtkPeer() override { Destroy(); }

    void Build(int count, int height) override {
        window = GtkToolkit::NewWindow(PeerForm::kTitle, PeerForm::kWidth, height);
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
    }
    void Show() override { toolkit.Show(window); }

    void Repaint() override { toolkit.ExposeAll(window); }
    void Toggle(int box) override {
        GtkCheckButton *const button = boxes[static_cast<std::size_t>(box)];
        gtk_check_button_set_active(button, !gtk_check_button_get_active(button));
        toolkit.FinishFrame();
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

    void Settle() override { GtkToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        GtkToolkit::WaitUntil(heard);
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

    static void Toggled(GtkCheckButton *, void *data) {
        GtkPeer *const peer = static_cast<GtkPeer *>(data);
        peer->Heard();
        peer->heard = true;
    }
    GtkToolkit toolkit;
    GtkWidget *window = nullptr, *form = nullptr;
    std::vector<GtkCheckButton *> boxes; // the window's
    cairo_surface_t *surface = nullptr;
    bool heard = false;
};

} // namespace

Peer *NewPeer(bool, int &, char **) { return new GtkPeer; }
