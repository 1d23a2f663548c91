// The list in GTK 4: a GtkColumnView, on a model of its own, whose items are made when they are asked for.
#include "bench/peers/GtkToolkit.h"
#include "bench/peers/PeerTable.h"
#include <cstdint>

namespace {

char const kRowKey[] = "row";

// The model: so many objects that know their row.
struct RowModel {
    GObject parent;
};
struct RowModelClass {
    GObjectClass parent;
};

GType TypeOfItems(GListModel *) { return G_TYPE_OBJECT; }

guint CountOfItems(GListModel *) { return PeerTable::kRows; }

void *NewItem(GListModel *, guint row) {
    if (row >= static_cast<guint>(PeerTable::kRows))
        return nullptr;
    GObject *const item = G_OBJECT(g_object_new(G_TYPE_OBJECT, nullptr));
    g_object_set_data(item, kRowKey, reinterpret_cast<void *>(static_cast<std::uintptr_t>(row)));
    return item;
}

void InitList(void *list, void *) {
    GListModelInterface *const interface = static_cast<GListModelInterface *>(list);
    interface->get_item_type = TypeOfItems;
    interface->get_n_items = CountOfItems;
    interface->get_item = NewItem;
}

GType TypeOfModel() {
    static GType const type = [] {
        GType const made = g_type_register_static_simple(G_TYPE_OBJECT, "PeerRowModel", sizeof(RowModelClass),
                                                         nullptr, sizeof(RowModel), nullptr, GTypeFlags(0));
        GInterfaceInfo const info = {InitList, nullptr, nullptr};
        g_type_add_interface_static(made, G_TYPE_LIST_MODEL, &info);
        return made;
    }();
    return type;
}

class GtkTable : public PeerTable {
public:
    void Show() override {
        window = GtkToolkit::NewWindow("List", kWidth, kHeight);
        GtkSingleSelection *const selection =
            gtk_single_selection_new(G_LIST_MODEL(g_object_new(TypeOfModel(), nullptr)));
        GtkWidget *const view = gtk_column_view_new(GTK_SELECTION_MODEL(selection));
        for (int column = 0; column < kColumns; ++column)
            AddColumn(GTK_COLUMN_VIEW(view), column);
        gtk_widget_hide(gtk_widget_get_first_child(view)); // the headings
        GtkWidget *const scrolled = gtk_scrolled_window_new();
        gtk_scrolled_window_set_overlay_scrolling(GTK_SCROLLED_WINDOW(scrolled), FALSE);
        gtk_scrolled_window_set_policy(GTK_SCROLLED_WINDOW(scrolled), GTK_POLICY_NEVER, GTK_POLICY_ALWAYS);
        gtk_scrolled_window_set_child(GTK_SCROLLED_WINDOW(scrolled), view);
        gtk_window_set_child(GTK_WINDOW(window), scrolled);
        adjustment = gtk_scrolled_window_get_vadjustment(GTK_SCROLLED_WINDOW(scrolled));
        toolkit.Show(window);
        g_signal_connect(selection, "selection-changed", G_CALLBACK(Selected), this);
    }
    void Repaint() override { toolkit.ExposeAll(window); }
    // All rows have one height, but it is the style's.
    void ScrollTo(int row) override {
        gtk_adjustment_set_value(adjustment, gtk_adjustment_get_upper(adjustment) / kRows * row);
        toolkit.FinishFrame();
    }
    void Settle() override { GtkToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        GtkToolkit::WaitUntil(heard);
    }

private:
    void AddColumn(GtkColumnView *view, int number) {
        GtkListItemFactory *const factory = gtk_signal_list_item_factory_new();
        void *const column = reinterpret_cast<void *>(static_cast<std::intptr_t>(number));
        g_signal_connect(factory, "setup", G_CALLBACK(SetUp), column);
        g_signal_connect(factory, "bind", G_CALLBACK(Bind), column);
        GtkColumnViewColumn *const made = gtk_column_view_column_new(nullptr, factory);
        gtk_column_view_column_set_fixed_width(made, kColumnWidth);
        gtk_column_view_append_column(view, made);
        g_object_unref(made);
    }
    static void SetUp(GtkSignalListItemFactory *, GtkListItem *cell, void *) {
        GtkWidget *const label = gtk_label_new(nullptr);
        gtk_label_set_xalign(GTK_LABEL(label), 0);
        gtk_list_item_set_child(cell, label);
    }
    static void Bind(GtkSignalListItemFactory *, GtkListItem *cell, void *column) {
        GObject *const item = G_OBJECT(gtk_list_item_get_item(cell));
        auto const row = reinterpret_cast<std::uintptr_t>(g_object_get_data(item, kRowKey));
        std::string const text =
            TextOf(static_cast<int>(row), static_cast<int>(reinterpret_cast<std::intptr_t>(column)));
        gtk_label_set_text(GTK_LABEL(gtk_list_item_get_child(cell)), text.c_str());
    }
    static void Selected(GtkSelectionModel *, guint, guint, void *data) {
        Heard();
        static_cast<GtkTable *>(data)->heard = true;
    }

    GtkToolkit toolkit;
    GtkWidget *window = nullptr;
    GtkAdjustment *adjustment = nullptr;
    bool heard = false;
};

} // namespace

PeerTable *NewPeerTable(int &, char **) { return new GtkTable; }
