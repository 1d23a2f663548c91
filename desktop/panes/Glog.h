// A window with panes in it.
#pragma once
#include "desktop/Desktop.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Outline.h"
#include "desktop/drawing/Surface.h"
#include "desktop/windows/InputEvent.h"
#include "desktop/windows/PlatformWindow.h"
#include "host/GlogStyleSheet.h"
#include "host/glogRec.h"
#include <map>
#include <memory>
#include <string>
#include <vector>

class EventRecordAdapter;
class PrintJob;
class UIEvent;

// The host's glogRec: owns its panes, its pixels and its window. Made by Desktop::NewGlog.
class Glog : public glogRec {
public:
    Glog(Desktop &, GlogOptions const &);
    virtual ~Glog();
    static Glog &From(glogRec *record) { return *static_cast<Glog *>(record); }

    // OSWindow and glogRec
    OSPort *GetPort() override { return &port; }
    bool IsVisible() override { return shown; }
    RGBColor GetContentColor() override;
    GlogStyleSheet *GetStyleSheet() const override { return options.styleSheet.get(); }
    void SetCurItem(GlogPane *) override;
    GlogPane *GetCurItem() const override { return current; }
    void SetMinSize(int width, int height) override;
    void SetMaxSize(int width, int height) override;
    bool IsContained() override { return false; }
    bool DidActivateWithCurrentMouseDown() const override { return activatedByMouseDown; }

    // Panes
    std::vector<GlogPane *> const &Items() const { return items; }
    void AddItem(GlogPane *);                            // at the top level; the glog owns it
    void RemoveItem(GlogPane *);                         // the caller owns it
    void PaneGone(GlogPane *);                           // forgets every mention of the pane
    void MakeCurrent(GlogPane *pane) { current = pane; } // without messages
    // Gives the place of an item that is still to be made.
    void DescribeItem(int id, Rect const &box) { described[id] = box; }
    bool DescribedBox(int id, Rect &box) const;
    void StartPanes();
    void NotePanesAdded() { hasNewPanes = true; } // they are started before the next update
    // A pane of that number answered a click with something; the innermost one comes first and counts.
    void NoteHit(int item);

    // Window
    void Show();
    void Hide();
    void Place(Rect const &screen);
    PlatformWindow *Window() const { return window.get(); }
    Surface *Pixels() const { return surface.get(); }
    DrawingPort &Port() { return port; }
    int Width() const { return width; }
    int Height() const { return height; }
    bool IsActive() const { return active; }
    GlogOptions const &Options() const { return options; }
    // The file that it was made from, for messages; empty when there was none.
    void SetSource(std::string const &file) { source = file; }
    std::string const &Source() const { return source; }

    // Drawing
    // Redraws what is damaged and presents it, and what was drawn outside an update too.
    void Update();
    // In between, Update does nothing: panes that are being made do not stand yet where they will, and have
    // not been started. Calls may be nested.
    void BeginMakingPanes() { ++makings; }
    void EndMakingPanes() { --makings; }
    void DamageAll();
    void DamageWindowRect(Rect const &);
    bool NeedsUpdate() const; // something visible waits to be redrawn
    OSRgn const *UpdateRegion() const {
        return updateRegion;
    } // in window coordinates; null outside an update
    void PresentAll();
    void PresentPart(Rect const &); // window coordinates
    // What lies over everything else; a change shows at the next update.
    OutlineLayer &OutlineShown() { return outline; }
    // Writes what the window shows; false, with the reason in `error`, when that is impossible.
    bool WritePng(std::string const &path, std::string &error);
    void SetScale(DeviceScale);

    void Print(PrintJob &); // all panes that print

    // Events; positions in window coordinates
    void Click(InputEvent const &);
    bool KeyDown(InputEvent const &);     // whether a pane has taken it
    void ComposeText(InputEvent const &); // by an input method
    void Wheel(InputEvent const &);
    void PointerMoved(Point);
    void PointerLeft();
    void Activation(bool on);
    void Resized(int width, int height);
    void Idle(); // before the application waits, for the glog in front
    void SetActivatedByMouseDown(bool on) { activatedByMouseDown = on; }
    GlogPane *TopmostAt(Point) const;

    bool layoutInvalid = false;
    bool settlingLayout = false;
    bool disposed = false; // waits to be deleted when nothing runs in it any more

private:
    bool HasItem(GlogPane *) const;
    // Calls the operation with each top-level pane, as far as it is one still. Panes may come and go
    // meanwhile.
    template <class Operation> void ForEachItem(Operation);
    void DrawDamage(OSRgn const &);
    DeviceRect DeviceBounds(OSRgn const &) const;
    void CompleteSurface();
    void Present(std::vector<DeviceRect> const &);
    void MoveShown(bool outlineChanged);
    void MakeSurface();
    void ReportHit(int value);
    int ClickFrom(GlogPane &topmost,
                  EventRecordAdapter const &); // what the first that took it answered, or 0
    bool IsGrowCorner(Point) const;
    void GrowByDragging(Point start);
    void GrowTo(int newWidth, int newHeight);
    bool OfferTab(char direction);
    bool IsOfferedTab(GlogPane &);
    std::vector<GlogPane *> TabOrder(char direction) const;
    void AddToTabOrder(GlogPane &, std::vector<GlogPane *> &) const;
    void Tell(void (TarnOSWindow::OSWindow_PlatformWindowListener::*what)(TarnOSWindow::OSWindow &));
    void TellClosing();
    bool DispatchKey(EventRecordAdapter &, InputEvent const &);
    bool RunEditCommand(InputEvent const &);

    Desktop &desktop;
    GlogOptions options;
    std::string source;
    int width, height;
    int minWidth = 0, minHeight = 0, maxWidth = 0, maxHeight = 0;
    std::vector<GlogPane *> items;
    unsigned long itemChanges = 0; // how often a pane has come or gone
    std::map<int, Rect> described;
    GlogPane *current = nullptr;
    int hitItem = 0;
    bool resizedInClick = false;
    bool hitNoted = false;
    std::unique_ptr<PlatformWindow> window;
    std::unique_ptr<Surface> surface;
    DeviceScale scale;
    DrawingPort port;
    OutlineLayer outline;
    OSRgn const *updateRegion = nullptr;
    bool started = false;
    bool shown = false;
    bool active = false;
    bool activatedByMouseDown = false;
    bool idling = false;
    bool hasNewPanes = false;
    int makings = 0;
    bool placed = false;
    Rect screenPlace{0, 0, 0, 0};
};
