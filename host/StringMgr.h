#pragma once
#include "host/UString.h"

class StringMgr {
public:
    static StringMgr &Instance();
    short Store(UString const &);
    UString const &Lookup(short key) const;
    void Free(short key);
};
