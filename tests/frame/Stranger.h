// Objects of which only the address matters.
#pragma once

// An address that passes for a T, of which nothing else is known here; the same at each call.
template <class T> T *Stranger() {
    static long long place;
    return reinterpret_cast<T *>(&place);
}
