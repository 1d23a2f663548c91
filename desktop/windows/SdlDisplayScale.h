// The scale factor that suits a display.
#pragma once
#include <optional>

// Asks for the user's setting (Xft.dpi) once, when a scale is first needed. SDL's video part must be open.
class SdlDisplayScale {
public:
    // For the display of the index: by the user's setting if there is one, by the display's own density
    // otherwise, and 1 when both are unknown.
    double OfDisplay(int display) const;

    // The scale for a text resolution that a user has set, in dots per inch of which 96 are scale 1: to the
    // nearest quarter, from 1 to 4; 1 for what is no resolution.
    static double FromTextResolution(double dotsPerInch);
    // The scale for what a display says of its density. Displays state it so roughly that anything below one
    // and a half is taken for 1; beyond that as above.
    static double FromDisplayDensity(double dotsPerInch);

private:
    mutable std::optional<double> textResolution; // once asked for; 0 when the user has set none
};
