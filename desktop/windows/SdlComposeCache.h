// Where Xlib keeps its table of composed keys.
#pragma once

// Xlib makes the table of keys that are composed to one character from half a megabyte of text, which takes
// more than all the rest of opening a display. While an object lives, Xlib finds a directory for the table in
// the user's cache (XDG_CACHE_HOME, or ~/.cache) and reads the text only the first time; the environment of
// the process tells it, so objects are for the thread that starts the desktop.
//
// What the user has settled himself stays: XCOMPOSECACHE, ~/.compose-cache, or keys of his own in
// XCOMPOSEFILE or ~/.XCompose, whose changes Xlib would not see. Without a home, without room on the disk,
// and for the superuser, for whom Xlib keeps nothing, nothing happens.
class SdlComposeCache {
public:
    explicit SdlComposeCache(unsigned int user); // the number of the system
    ~SdlComposeCache();
    SdlComposeCache(SdlComposeCache const &) = delete;
    SdlComposeCache &operator=(SdlComposeCache const &) = delete;

private:
    bool isSet;
};
