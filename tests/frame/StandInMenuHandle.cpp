// As much of a menu handle as the message of a choice needs: which menu it names.
#include "host/OSMenuHandle.h"

struct OSMenuHandle::Rep {
    int references = 1;
};

OSMenuHandle::OSMenuHandle()
    : rep(nullptr) {}

OSMenuHandle::OSMenuHandle(OSMenuHandle const &other)
    : rep(other.rep) {
    if (rep)
        ++rep->references;
}

OSMenuHandle::~OSMenuHandle() { clear(); }

OSMenuHandle &OSMenuHandle::operator=(OSMenuHandle const &other) {
    if (other.rep)
        ++other.rep->references;
    clear();
    rep = other.rep;
    return *this;
}

bool OSMenuHandle::operator==(OSMenuHandle const &other) const { return rep == other.rep; }

void OSMenuHandle::clear() {
    if (rep && --rep->references == 0)
        delete rep;
    rep = nullptr;
}

OSMenuHandle OSMenuHandle::CreateNewHierarchicalMenu() {
    OSMenuHandle made;
    made.rep = new Rep;
    return made;
}
