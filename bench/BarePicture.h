// A picture of texts as a program draws it that has nothing but the bare libraries.
#pragma once
#include "bench/BarePangoText.h"
#include "tests/drawing/Canvas.h"
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

// A white ground, laid-out texts on it, and what a window would then take over. Everything is made beforehand
// and kept.
class BarePicture {
public:
    BarePicture(int width, int height); // pixels
    // Shaped in the entry of the desktop's font table; left of and above the point nothing is drawn.
    void Add(std::string const &text, int font, int left, int top);
    Canvas &Pixels() { return canvas; }

    // The three parts of a repaint.
    void Clear();
    void DrawTexts();
    void Show();
    void Repaint() {
        Clear();
        DrawTexts();
        Show();
    }
    bool IsBlank() const; // only the ground has been drawn

private:
    struct Placed {
        std::unique_ptr<BarePangoText> text;
        int left, top;
    };
    Canvas canvas;
    std::vector<Placed> texts;
    std::vector<std::uint32_t> shown;
};
