// What every comparison with GTK 4 begins with.
#pragma once
#include <gtk/gtk.h>

// Drawn by the Cairo renderer: the others draw with the processor too.
class GtkToolkit {
public:
    // With the font that all toolkits use. Ends the program when there is no display.
    GtkToolkit();

    // A new window without frame, which would take of the room of what is in it.
    static GtkWidget *NewWindow(char const *title, int width, int height);
    // Shows the window, and waits until it is drawn. Frames are those of this window from then on.
    void Show(GtkWidget *window);
    // Waits until a frame has been painted and the server has it.
    void FinishFrame();
    // An exposure of the whole window, and the frame that it leads to. Widgets keep what they have drawn as
    // nodes, which are turned into pixels; the widgets themselves are not asked again, which would only take
    // longer.
    void ExposeAll(GtkWidget *window);
    // Handles what has come.
    static void Settle();
    // Waits for events and handles them, until `over` or for a while.
    static void WaitUntil(bool const &over);

private:
    static void Painted(GdkFrameClock *, void *toolkit);
    int frames = 0;
};
