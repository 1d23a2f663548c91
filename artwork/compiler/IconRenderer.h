#pragma once
#include "artwork/compiler/IconFamily.h"
#include "artwork/compiler/RenderedImage.h"
#include "artwork/compiler/Theme.h"
#include <string>

// Draws icons of one family in the colours of one theme.
class IconRenderer {
public:
    // Both must outlive the renderer.
    IconRenderer(IconFamily const &, Theme const &);

    // The icon at exactly this size in device pixels. Throws ArtworkError when a class names no paint of the
    // theme or when the SVG is not accepted.
    RenderedImage Render(IconFamily::Icon const &, int deviceWidth, int deviceHeight) const;

private:
    // A document of this one icon, its colours put in and its edges fitted.
    std::string Compose(IconFamily::Icon const &, int deviceWidth, int deviceHeight) const;
    // Replaces class="fill-NAME stroke-NAME stop-NAME" below the node by the theme's colours.
    void ApplyPaints(pugi::xml_node root, pugi::xml_node blamed) const;
    void ApplyPaint(pugi::xml_node, std::string const &className, pugi::xml_node blamed) const;

    IconFamily const &family;
    Theme const &theme;
};
