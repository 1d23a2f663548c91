// A process-wide table of strings under short keys, for records that have room for a number only.
#pragma once
#include "host/UString.h"

class StringMgr {
public:
    static StringMgr &Instance(); // one for the process

    // Keeps a copy and answers its key, never 0. Each call gives a key of its own, to be freed once by the
    // caller. When all 32767 keys are taken, FailMemFullError is called.
    short Store(UString const &);
    // The string under the key; valid until the key is freed. An unknown key gives the empty string.
    UString const &Lookup(short key) const;
    // Gives the key up. An unknown key has no effect.
    void Free(short key);
};
