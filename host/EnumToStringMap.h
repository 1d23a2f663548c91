#pragma once
#include "host/UString.h"

class EnumToStringMap {
public:
    int GetID(UString const &name) const;
protected:
    EnumToStringMap();
    ~EnumToStringMap();
};

class ISetIDMapper : public EnumToStringMap {
public:
    static ISetIDMapper &Instance();
};

class PictIDMapper : public EnumToStringMap {
public:
    static PictIDMapper &Instance();
};
