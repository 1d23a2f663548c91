// Shows the page of the start benchmark with SDL, pixman, Pango and nothing else, until it is told to end:
// what a program made for this one window would do.
#include "bench/start/StartPage.h"
#include "desktop/resources/AtlasFormat.h"
#include <SDL.h>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <fontconfig/fontconfig.h>
#include <pango/pangocairo.h>
#include <pango/pangofc-fontmap.h>
#include <pixman.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace AtlasFormat;

namespace {

char const kAtlas[] = BARE_ARTWORK_DIR "/atlas-light-100.glogatlas";
char const kFontFile[] = "/usr/share/fonts/truetype/roboto/unhinted/RobotoTTF/Roboto-Regular.ttf";
char const kFontName[] = "Roboto";
int const kFontSize = 12;
std::uint32_t const kGround = 0xFFE8EAED, kText = 0xFF1D1F23; // of the light theme
int const kBitsPerPixel = 32, kWordSize = 4;
double const kFull = 255.0;

[[noreturn]] void Fail(char const *what) {
    std::fprintf(stderr, "start_bare: %s\n", what);
    std::exit(EXIT_FAILURE);
}

SDL_Window *OpenWindow() {
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "x11");
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    if (SDL_InitSubSystem(SDL_INIT_VIDEO) != 0)
        Fail(SDL_GetError());
    SDL_StopTextInput();
    SDL_Window *const window =
        SDL_CreateWindow(StartPage::kTitle, SDL_WINDOWPOS_UNDEFINED, SDL_WINDOWPOS_UNDEFINED,
                         StartPage::kWidth, StartPage::kHeight, SDL_WINDOW_SHOWN);
    if (!window)
        Fail(SDL_GetError());
    return window;
}

unsigned char const *MapAtlas() {
    int const file = open(kAtlas, O_RDONLY | O_CLOEXEC);
    struct stat status;
    if (file < 0 || fstat(file, &status) != 0)
        Fail(kAtlas);
    void *const start =
        mmap(nullptr, static_cast<std::size_t>(status.st_size), PROT_READ, MAP_PRIVATE, file, 0);
    close(file);
    if (start == MAP_FAILED)
        Fail("the atlas cannot be mapped");
    return static_cast<unsigned char const *>(start);
}

IconRecord const *IconsOf(unsigned char const *atlas, short number) {
    Header const &header = *reinterpret_cast<Header const *>(atlas);
    FamilyRecord const *const families = reinterpret_cast<FamilyRecord const *>(atlas + header.familyTable);
    for (std::uint32_t i = 0; i < header.familyCount; ++i)
        if (families[i].number == number)
            return reinterpret_cast<IconRecord const *>(atlas + header.iconTable) + families[i].firstIcon;
    Fail("the atlas lacks the icons");
}

void DrawIcons(pixman_image_t *target) {
    unsigned char const *const atlas = MapAtlas();
    IconRecord const *const icons = IconsOf(atlas, StartPage::kIconFamily);
    pixman_image_t *images[StartPage::kIconKinds];
    for (int kind = 0; kind < StartPage::kIconKinds; ++kind) {
        ImageRecord const &image = icons[kind].images[0];
        void const *const pixels = atlas + image.offset;
        images[kind] = pixman_image_create_bits_no_clear(
            PIXMAN_a8r8g8b8, image.width, image.height,
            const_cast<std::uint32_t *>(static_cast<std::uint32_t const *>(pixels)), image.width * kWordSize);
    }
    for (int i = 0; i < StartPage::kIcons; ++i) {
        StartPage::Place const place = StartPage::OfIcon(i);
        int const kind = StartPage::KindOfIcon(i);
        ImageRecord const &image = icons[kind].images[0];
        pixman_image_composite32(PIXMAN_OP_OVER, images[kind], nullptr, target, 0, 0, 0, 0, place.h, place.v,
                                 image.width, image.height);
    }
    for (pixman_image_t *image : images)
        pixman_image_unref(image);
}

// One font file instead of all that the system has.
PangoContext *NewTextContext() {
    FcConfig *const config = FcConfigCreate();
    FcConfigSetCurrent(config);
    if (!FcConfigAppFontAddFile(config, reinterpret_cast<FcChar8 const *>(kFontFile)))
        Fail(kFontFile);
    PangoFontMap *const map = pango_cairo_font_map_new_for_font_type(CAIRO_FONT_TYPE_FT);
    pango_fc_font_map_set_config(PANGO_FC_FONT_MAP(map), config);
    PangoContext *const context = pango_font_map_create_context(map);
    pango_context_set_round_glyph_positions(context, TRUE);
    cairo_font_options_t *const options = cairo_font_options_create();
    cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
    cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_SLIGHT);
    cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
    pango_cairo_context_set_font_options(context, options);
    cairo_font_options_destroy(options);
    return context;
}

double Component(std::uint32_t pixel, int shift) { return (pixel >> shift & 0xFF) / kFull; }

void DrawLabels(SDL_Surface &screen) {
    PangoContext *const context = NewTextContext();
    PangoFontDescription *const font = pango_font_description_new();
    pango_font_description_set_family(font, kFontName);
    pango_font_description_set_absolute_size(font, kFontSize * PANGO_SCALE);
    cairo_surface_t *const surface = cairo_image_surface_create_for_data(
        static_cast<unsigned char *>(screen.pixels), CAIRO_FORMAT_RGB24, screen.w, screen.h, screen.pitch);
    cairo_t *const cairo = cairo_create(surface);
    cairo_set_source_rgb(cairo, Component(kText, 16), Component(kText, 8), Component(kText, 0));
    for (int i = 0; i < StartPage::kLabels; ++i) {
        PangoLayout *const layout = pango_layout_new(context);
        pango_layout_set_font_description(layout, font);
        pango_layout_set_text(layout, StartPage::TextOfLabel(i).c_str(), -1);
        StartPage::Place const place = StartPage::OfLabel(i);
        cairo_move_to(cairo, place.h, place.v);
        pango_cairo_show_layout_line(cairo, pango_layout_get_line_readonly(layout, 0));
        g_object_unref(layout);
    }
    cairo_destroy(cairo);
    cairo_surface_destroy(surface);
}

void Draw(SDL_Surface &screen) {
    if (screen.format->BytesPerPixel != kWordSize)
        Fail("the display has no pixels of 32 bits");
    pixman_image_t *const target = pixman_image_create_bits_no_clear(
        PIXMAN_x8r8g8b8, screen.w, screen.h, static_cast<std::uint32_t *>(screen.pixels), screen.pitch);
    pixman_fill(static_cast<std::uint32_t *>(screen.pixels), screen.pitch / kWordSize, kBitsPerPixel, 0, 0,
                screen.w, screen.h, kGround);
    DrawIcons(target);
    pixman_image_unref(target);
    DrawLabels(screen);
}

void ShowAll(SDL_Window *window, SDL_Surface &screen) {
    SDL_Rect const all = {0, 0, screen.w, screen.h};
    SDL_UpdateWindowSurfaceRects(window, &all, 1);
}

} // namespace

int main(int, char **) {
    SDL_Window *const window = OpenWindow();
    SDL_Surface *const screen = SDL_GetWindowSurface(window);
    if (!screen)
        Fail(SDL_GetError());
    Draw(*screen);
    ShowAll(window, *screen);
    SDL_Event event;
    while (SDL_WaitEvent(&event) && event.type != SDL_QUIT)
        if (event.type == SDL_WINDOWEVENT && event.window.event == SDL_WINDOWEVENT_EXPOSED)
            ShowAll(window, *screen);
    SDL_Quit();
}
