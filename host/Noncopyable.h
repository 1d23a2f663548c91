#pragma once

template <class T> class Noncopyable {
protected:
    Noncopyable() {}
    ~Noncopyable() {}
private:
    Noncopyable(Noncopyable const &);
    Noncopyable &operator=(Noncopyable const &);
};
