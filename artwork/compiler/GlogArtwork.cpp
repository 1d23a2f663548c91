#include "artwork/compiler/GlogArtwork.h"
#include "artwork/compiler/ArtworkError.h"
#include "artwork/compiler/ArtworkSource.h"
#include "artwork/compiler/AtlasBuilder.h"
#include "artwork/compiler/ContactSheet.h"
#include <CLI/CLI.hpp>
#include <cmath>
#include <fstream>
#include <ostream>

namespace {

constexpr int kBadArtwork = 1;
constexpr int kBadCommandLine = 2;
constexpr double kLeastScale = 0.5;
constexpr double kGreatestScale = 4;
// Pictures are drawn at these scales; the desktop takes the first that is large enough.
constexpr int kPictureScales[] = {1, 2};

struct Options {
    std::string source;
    std::string output;
    std::string sheet;
    std::string theme = "light";
    std::vector<double> scales{1, 1.25, 1.5, 2, 3};
    bool listUndrawn = false;
};

// A message when the text is no usable scale; a plain range would let "nan" through.
std::string CheckScale(std::string const &text) {
    double scale = 0;
    if (CLI::detail::lexical_cast(text, scale) && scale >= kLeastScale && scale <= kGreatestScale)
        return {};
    return text + " is no scale from 0.5 to 4";
}

int Thousandths(double scale) { return static_cast<int>(std::lround(scale * 1000)); }

void WriteFile(std::filesystem::path const &path, std::vector<char> const &content) {
    std::ofstream out(path, std::ios::binary);
    out.write(content.data(), static_cast<std::streamsize>(content.size()));
    if (!out.flush())
        throw ArtworkError(path.string() + ": cannot be written");
}

void WriteAtlases(ArtworkSource const &source, Options const &options) {
    for (Theme const &theme : source.Themes())
        for (double const scale : options.scales) {
            AtlasBuilder atlas(theme, Thousandths(scale));
            for (IconFamily const &family : source.Families())
                atlas.Add(family);
            std::string const name =
                "atlas-" + theme.Name() + "-" + std::to_string(Thousandths(scale) / 10) + ".glogatlas";
            WriteFile(std::filesystem::path(options.output) / name, atlas.Finish());
        }
}

void WritePictures(ArtworkSource const &source, Options const &options) {
    for (Theme const &theme : source.Themes()) {
        std::filesystem::path const folder =
            std::filesystem::path(options.output) / "pictures" / theme.Name();
        std::filesystem::create_directories(folder);
        for (IconFamily const &picture : source.Pictures())
            for (int const scale : kPictureScales) {
                IconFamily::Icon const &icon = *picture.Find(0);
                RenderedImage image =
                    IconRenderer(picture, theme).Render(icon, icon.width * scale, icon.height * scale);
                std::string const suffix = scale == 1 ? "" : "@" + std::to_string(scale) + "x";
                image.WritePng(folder / (std::to_string(picture.Number()) + suffix + ".png"));
            }
    }
}

void ListUndrawn(ArtworkSource const &source, std::ostream &out) {
    std::vector<IconIndex::Undrawn> const undrawn = source.FindUndrawn();
    for (IconIndex::Undrawn const &icon : undrawn)
        out << icon.family << ' ' << icon.index << ' ' << icon.shows << '\n';
    out << undrawn.size() << " undrawn\n";
}

void Compile(Options const &options, std::ostream &out) {
    ArtworkSource const source(options.source);
    if (!options.output.empty()) {
        std::filesystem::create_directories(options.output);
        WriteAtlases(source, options);
        WritePictures(source, options);
    }
    if (!options.sheet.empty())
        ContactSheet(source.Families(), source.FindTheme(options.theme), options.scales.front())
            .Write(options.sheet);
    if (options.listUndrawn)
        ListUndrawn(source, out);
}

} // namespace

int RunGlogArtwork(int argc, char const *const *argv, std::ostream &out, std::ostream &err) {
    Options options;
    CLI::App app("Draws the SVG artwork into the atlases that the desktop maps at start.", "glog-artwork");
    app.add_option("source", options.source, "artwork folder with icons/, pictures/ and themes/")->required();
    app.add_option("--out", options.output, "folder that gets the atlases and pictures");
    app.add_option("--scale", options.scales, "device pixels per logical pixel; of the sheet, the first")
        ->check(CheckScale);
    app.add_option("--sheet", options.sheet, "PNG file that gets every icon with its number");
    app.add_option("--theme", options.theme, "theme of the sheet");
    app.add_flag("--undrawn", options.listUndrawn, "list the icons of icons/index.xml that have no drawing");
    try {
        app.parse(argc, argv);
        if (options.output.empty() && options.sheet.empty() && !options.listUndrawn)
            throw CLI::RequiredError("--out, --sheet or --undrawn");
    } catch (CLI::ParseError const &error) {
        return app.exit(error, out, err) == 0 ? 0 : kBadCommandLine;
    }
    try {
        Compile(options, out);
    } catch (ArtworkError const &error) {
        err << "glog-artwork: " << error.what() << '\n';
        return kBadArtwork;
    } catch (std::filesystem::filesystem_error const &error) {
        err << "glog-artwork: " << error.what() << '\n';
        return kBadArtwork;
    }
    return 0;
}
