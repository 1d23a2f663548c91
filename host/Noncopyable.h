// A base for classes whose objects must not be copied.
#pragma once

// The parameter makes bases of one object distinct types, so that two base classes may both be noncopyable.
template <class T> class Noncopyable {
protected:
    Noncopyable() {}
    ~Noncopyable() {}

private:
    Noncopyable(Noncopyable const &);
    Noncopyable &operator=(Noncopyable const &);
};
