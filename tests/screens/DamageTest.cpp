// What is redrawn under damage equals a full redraw, and nothing else changes: for every page of the gallery.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "host/glogRec.h"
#include "tests/screens/GalleryPages.h"
#include "tools/gallery/Gallery.h"
#include <algorithm>
#include <cstdlib>
#include <gtest/gtest.h>
#include <random>
#include <sstream>
#include <tuple>

namespace {

typedef std::vector<std::uint32_t> Pixels;

// One page at one scale.
typedef std::tuple<PageFile, double> PageAtScale;

class DamagedPage : public testing::TestWithParam<PageAtScale> {
protected:
    DamagedPage()
        : desktop(DesktopOptions().Scale(std::get<1>(GetParam())))
        , gallery(desktop, GalleryFiles(), std::get<1>(GetParam())) {
        gallery.ShowPage(GalleryFiles().Find(std::get<0>(GetParam()).name));
        TheGlog().Update();
        TheGlog().DamageAll();
        TheGlog().Update();
        whole = Copy();
        garbage = Garbage(whole.size());
    }

    Glog &TheGlog() const { return Glog::From(gallery.Window()); }
    Surface &Picture() const { return *TheGlog().Pixels(); }
    Pixels Copy() const {
        std::size_t const count =
            static_cast<std::size_t>(Picture().Width()) * static_cast<std::size_t>(Picture().Height());
        return Pixels(Picture().Pixels(), Picture().Pixels() + count);
    }

    static Pixels Garbage(std::size_t count) {
        std::mt19937 random{7};
        Pixels garbage(count);
        std::generate(garbage.begin(), garbage.end(),
                      [&] { return 0xFF000000u | static_cast<std::uint32_t>(random()); });
        return garbage;
    }

    // Where a path with smooth edges is cut by the damage, the edge's shades come out a little differently.
    bool Alike(std::uint32_t a, std::uint32_t b) const {
        if (a == b)
            return true;
        std::string const &page = std::get<0>(GetParam()).name;
        if (page != "panner" && page != "envelope")
            return false;
        int const kMostBits = 32, kChannelBits = 8, kSlightly = 4; // of 255
        for (int shift = 0; shift < kMostBits; shift += kChannelBits)
            if (std::abs(static_cast<int>(a >> shift & 0xFF) - static_cast<int>(b >> shift & 0xFF)) >
                kSlightly)
                return false;
        return true;
    }

    static std::string Hex(std::uint32_t pixel) {
        std::ostringstream text;
        text << std::hex << pixel;
        return text.str();
    }

    // What the window should show when these parts of it are redrawn over garbage.
    Pixels Expected(std::vector<Rect> const &damage) const {
        Pixels expected = garbage;
        DeviceScale const scale(std::get<1>(GetParam()));
        for (Rect const &r : damage) {
            DeviceRect const part = scale.ToDevice(r.left, r.top, r.right, r.bottom);
            for (int y = part.top; y < part.bottom; ++y) {
                std::ptrdiff_t const row = static_cast<std::ptrdiff_t>(y) * Picture().Width();
                std::copy(whole.begin() + row + part.left, whole.begin() + row + part.right,
                          expected.begin() + row + part.left);
            }
        }
        return expected;
    }

    // Damages the rectangles of a window full of garbage; the first pixel that is not what it should be, or
    // nothing.
    std::string FaultAfterDamage(std::vector<Rect> const &damage) {
        std::copy(garbage.begin(), garbage.end(), Picture().Pixels());
        for (Rect const &r : damage)
            TheGlog().DamageWindowRect(r);
        TheGlog().Update();
        Pixels const expected = Expected(damage);
        auto const fault = std::mismatch(expected.begin(), expected.end(), Picture().Pixels(),
                                         [this](std::uint32_t a, std::uint32_t b) { return Alike(a, b); });
        if (fault.first == expected.end())
            return std::string();
        int const at = static_cast<int>(fault.first - expected.begin());
        bool const damaged = *fault.first == whole[static_cast<std::size_t>(at)];
        return std::string(damaged ? "redrawn otherwise" : "drawn outside of the damage") +
               " at device pixel " + std::to_string(at % Picture().Width()) + ", " +
               std::to_string(at / Picture().Width()) + ": " + Hex(*fault.second) + " instead of " +
               Hex(*fault.first);
    }

    Rect RandomRect() {
        int const width = TheGlog().Width(), height = TheGlog().Height();
        auto const upTo = [&](int limit) {
            return static_cast<int>(random() % static_cast<unsigned>(limit));
        };
        int const left = upTo(width), top = upTo(height);
        int const right = std::min(width, left + 1 + upTo(left % 2 ? 24 : width));
        int const bottom = std::min(height, top + 1 + upTo(left % 2 ? 24 : height));
        return {static_cast<short>(top), static_cast<short>(left), static_cast<short>(bottom),
                static_cast<short>(right)};
    }

    SimulatedDesktop desktop;
    Gallery gallery;
    Pixels whole;   // after a full redraw
    Pixels garbage; // what no redraw gives
    std::mt19937 random{20250101};
};

TEST_P(DamagedPage, IsRedrawnWholeUnderFullDamage) {
    Rect const all = {0, 0, static_cast<short>(TheGlog().Height()), static_cast<short>(TheGlog().Width())};
    EXPECT_EQ(FaultAfterDamage({all}), "");
}

TEST_P(DamagedPage, IsRedrawnUnderEachRectangle) {
    for (int i = 0; i < 30; ++i) {
        Rect const r = RandomRect();
        ASSERT_EQ(FaultAfterDamage({r}), "")
            << "top " << r.top << ", left " << r.left << ", bottom " << r.bottom << ", right " << r.right;
    }
}

TEST_P(DamagedPage, IsRedrawnUnderScatteredRectangles) {
    for (int i = 0; i < 4; ++i)
        ASSERT_EQ(FaultAfterDamage({RandomRect(), RandomRect(), RandomRect()}), "");
}

TEST_P(DamagedPage, IsLeftAloneWithoutDamage) { EXPECT_EQ(FaultAfterDamage({}), ""); }

INSTANTIATE_TEST_SUITE_P(Gallery, DamagedPage,
                         testing::Combine(testing::ValuesIn(GalleryFiles().Pages()),
                                          testing::Values(1.0, 1.5, 2.0)),
                         [](testing::TestParamInfo<PageAtScale> const &info) {
                             return AsTestName(
                                 std::get<0>(info.param).name + "_at_" +
                                 std::to_string(static_cast<int>(std::get<1>(info.param) * 100)));
                         });

} // namespace
