#include "artwork/compiler/IconRenderer.h"
#include "artwork/compiler/ArtworkError.h"
#include "artwork/compiler/GridFit.h"
#include <cairo.h>
#include <cstdio>
#include <librsvg/rsvg.h>
#include <memory>
#include <sstream>

namespace {

constexpr char kFrameClass[] = "frame";

struct ReleaseHandle {
    void operator()(RsvgHandle *handle) const { g_object_unref(handle); }
};
struct ReleaseError {
    void operator()(GError *error) const { g_error_free(error); }
};
struct ReleaseContext {
    void operator()(cairo_t *context) const { cairo_destroy(context); }
};

[[noreturn]] void FailWith(GError *raw, IconFamily const &family, IconFamily::Icon const &icon) {
    std::unique_ptr<GError, ReleaseError> const error(raw);
    family.Source().Fail(icon.group, error ? error->message : "cannot be drawn");
}

void SetAttribute(pugi::xml_node node, std::string const &name, std::string const &value) {
    pugi::xml_attribute attribute = node.attribute(name.c_str());
    if (!attribute)
        attribute = node.append_attribute(name.c_str());
    attribute.set_value(value.c_str());
}

std::string HexColour(Theme::Colour colour) {
    char text[8];
    std::snprintf(text, sizeof text, "#%02x%02x%02x", colour.red, colour.green, colour.blue);
    return text;
}

} // namespace

IconRenderer::IconRenderer(IconFamily const &f, Theme const &t)
    : family(f)
    , theme(t) {}

RenderedImage IconRenderer::Render(IconFamily::Icon const &icon, int deviceWidth, int deviceHeight) const {
    std::string const document = Compose(icon, deviceWidth, deviceHeight);
    GError *error = nullptr;
    std::unique_ptr<RsvgHandle, ReleaseHandle> const handle(rsvg_handle_new_from_data(
        reinterpret_cast<guint8 const *>(document.data()), document.size(), &error));
    if (!handle)
        FailWith(error, family, icon);

    RenderedImage image(deviceWidth, deviceHeight);
    RenderedImage::Surface const surface = image.MakeSurface();
    std::unique_ptr<cairo_t, ReleaseContext> const context(cairo_create(surface.get()));
    RsvgRectangle const viewport{0, 0, double(deviceWidth), double(deviceHeight)};
    if (!rsvg_handle_render_document(handle.get(), context.get(), &viewport, &error))
        FailWith(error, family, icon);
    cairo_surface_flush(surface.get());
    return image;
}

std::string IconRenderer::Compose(IconFamily::Icon const &icon, int deviceWidth, int deviceHeight) const {
    pugi::xml_document document;
    pugi::xml_node root = document.append_child("svg");
    root.append_attribute("xmlns") = "http://www.w3.org/2000/svg";
    root.append_attribute("xmlns:xlink") = "http://www.w3.org/1999/xlink";
    root.append_attribute("width") = deviceWidth;
    root.append_attribute("height") = deviceHeight;
    root.append_attribute("viewBox") =
        ("0 0 " + std::to_string(icon.width) + " " + std::to_string(icon.height)).c_str();
    // The two axes may scale differently by a part of a pixel.
    root.append_attribute("preserveAspectRatio") = "none";
    if (family.Definitions())
        root.append_copy(family.Definitions());
    pugi::xml_node group = root.append_copy(icon.group);
    group.remove_attribute("transform");
    GridFit(icon.width, icon.height, deviceWidth, deviceHeight, icon.height - family.ShadowHeight())
        .Fit(group);
    ApplyPaints(root, icon.group);
    std::ostringstream out;
    document.save(out, "", pugi::format_raw);
    return out.str();
}

void IconRenderer::ApplyPaints(pugi::xml_node root, pugi::xml_node blamed) const {
    struct Walker : pugi::xml_tree_walker {
        bool for_each(pugi::xml_node &node) override {
            std::istringstream classes(node.attribute("class").value());
            for (std::string className; classes >> className;)
                renderer->ApplyPaint(node, className, blamed);
            node.remove_attribute("class");
            return true;
        }
        IconRenderer const *renderer;
        pugi::xml_node blamed;
    } walker;
    walker.renderer = this;
    walker.blamed = blamed;
    root.traverse(walker);
}

void IconRenderer::ApplyPaint(pugi::xml_node node, std::string const &className,
                              pugi::xml_node blamed) const {
    if (className == kFrameClass)
        return;
    struct Property {
        char const *prefix, *colour, *opacity;
    };
    static constexpr Property kProperties[] = {{"fill-", "fill", "fill-opacity"},
                                               {"stroke-", "stroke", "stroke-opacity"},
                                               {"stop-", "stop-color", "stop-opacity"}};
    for (Property const &property : kProperties) {
        std::string const prefix = property.prefix;
        if (className.compare(0, prefix.size(), prefix) != 0)
            continue;
        Theme::Colour const *const paint = theme.Paint(className.substr(prefix.size()));
        if (!paint)
            break;
        SetAttribute(node, property.colour, HexColour(*paint));
        double const ownOpacity = node.attribute(property.opacity).as_double(1);
        SetAttribute(node, property.opacity, std::to_string(ownOpacity * paint->alpha / 255.0));
        return;
    }
    family.Source().Fail(blamed, "the class \"" + className + "\" names no paint of the theme \"" +
                                     theme.Name() + "\"");
}
