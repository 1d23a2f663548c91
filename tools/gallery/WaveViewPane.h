// A recording as a waveform, zoomed by a slider and a pair of buttons, and scrolled by a bar.
#pragma once
#include "graphics/ZoomControlPane.h"
#include "host/CompoundPane.h"
#include "scrolling/ScrollBarClient.h"
#include "tools/gallery/WaveFile.h"

class GlogStyleSheet;
class ScrollBarPane;

class WaveViewPane : public CompoundPane, public ScrollBarClient {
public:
    // From "BoundsRect"; "TextID", the number of a label that tells which part is seen; and "CmdID", the
    // number of a progress bar that shows how far it goes. Null when memory or glog is wanting.
    static WaveViewPane *NewWaveViewPane(glogRec *, GlogStyleSheet *);
    ~WaveViewPane() override;

    // 0.0 shows all of the recording, 1.0 a few samples; the middle stays.
    float Zoom() const { return zoom; }
    void SetZoom(float);
    void ZoomStep(bool in); // a twelfth of the way

    // Overridden operations of panes and of what a bar scrolls; positions count samples.
    void GlogItemInit() override;
    int GetMaxScrollValue(ScrollBarPane *) override;
    void ScrollTo(ScrollBarPane *, int position) override;
    double GetThumbRatio(ScrollBarPane *) override;
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override;

private:
    class Wave;
    class Slider;
    class ButtonPair;
    class Buttons : public ZoomControlPane::Client {
    public:
        explicit Buttons(WaveViewPane &zoomed)
            : view(zoomed) {}
        void Zoom(bool zoomIn, bool optionKey) override;
        bool CanZoom(bool zoomIn) override;

    private:
        WaveViewPane &view;
    };

    WaveViewPane(glogRec *, GlogStyleSheet *);
    void AddParts();
    int Shown() const; // samples
    int All() const { return static_cast<int>(file.Samples().size()); }
    void ShowPlace();

    WaveFile file;
    int labelID, progressID;
    float zoom = 0.0f;
    int first = 0; // the leftmost sample
    Buttons buttons{*this};
    ScrollBarPane *bar = nullptr; // subpanes from here
    Wave *wave = nullptr;
};
