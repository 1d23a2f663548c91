// Numbers of resources by their symbolic names.
#pragma once
#include "host/UString.h"

class EnumToStringMap {
public:
    // The number of the name, or 0 when it is unknown; a name that is a whole number stands for itself.
    // Callers narrow it to 16 bits.
    int GetID(UString const &name) const;

protected:
    struct Names;
    explicit EnumToStringMap(Names *); // owned from now on
    ~EnumToStringMap();

private:
    EnumToStringMap(EnumToStringMap const &);
    EnumToStringMap &operator=(EnumToStringMap const &);
    Names *names;
};

// Names of icon families, as in the XML keys "ISetID" and "FamilyID".
class ISetIDMapper : public EnumToStringMap {
public:
    static ISetIDMapper &Instance(); // one for the process

private:
    ISetIDMapper();
};

// Names of pictures, as in the XML key "ResIDName".
class PictIDMapper : public EnumToStringMap {
public:
    static PictIDMapper &Instance(); // one for the process

private:
    PictIDMapper();
};
