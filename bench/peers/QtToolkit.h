// What every comparison with Qt 6 Widgets begins with.
#pragma once
#include <QApplication>

class QWidget;

class QtToolkit {
public:
    // With the platform "xcb" or "offscreen", and the font that all toolkits use.
    QtToolkit(char const *platform, int &argc, char **argv);

    // Waits until the shown window is on the screen.
    static void WaitUntilExposed(QWidget &);
    // Handles what has come, what has been posted too, and waits for the server.
    static void Settle() { QGuiApplication::sync(); }
    // Waits for events and handles them, until `over` or for a while.
    static void WaitUntil(bool const &over);

private:
    QApplication application;
};
