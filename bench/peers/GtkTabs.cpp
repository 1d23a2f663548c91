// The tabs in GTK 4: a GtkNotebook.
#include "bench/peers/GtkToolkit.h"
#include "bench/peers/PeerTabs.h"

namespace {

class GtkTabs : public PeerTabs {
public:
    void Show() override {
        GtkWidget *const window = GtkToolkit::NewWindow("Tabs", kWidest, kHeight);
        GtkWidget *const content = gtk_fixed_new();
        notebook = gtk_notebook_new();
        gtk_notebook_set_scrollable(GTK_NOTEBOOK(notebook), TRUE); // otherwise it takes the room of all tabs
        for (int i = 0; i < kTabs; ++i)
            gtk_notebook_append_page(GTK_NOTEBOOK(notebook), gtk_fixed_new(),
                                     gtk_label_new(NameOf(i).c_str()));
        gtk_widget_set_size_request(notebook, kWidest, kHeight);
        gtk_fixed_put(GTK_FIXED(content), notebook, 0, 0);
        gtk_window_set_child(GTK_WINDOW(window), content);
        toolkit.Show(window);
    }
    void SetWidth(int width) override {
        gtk_widget_set_size_request(notebook, width, kHeight);
        toolkit.FinishFrame();
    }
    void Settle() override { GtkToolkit::Settle(); }

private:
    GtkToolkit toolkit;
    GtkWidget *notebook = nullptr; // the window's
};

} // namespace

PeerTabs *NewPeerTabs(int &, char **) { return new GtkTabs; }
