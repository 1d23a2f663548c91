// SDL's video part, opened and closed.
#pragma once

// Opens SDL on the X server that DISPLAY names; one at a time. What the environment sets for SDL does not
// count: it would change how panes behave.
class SdlSession {
public:
    SdlSession(); // throws std::runtime_error, "no display: ...", when there is none
    ~SdlSession();
    SdlSession(SdlSession const &) = delete;
    SdlSession &operator=(SdlSession const &) = delete;
};
