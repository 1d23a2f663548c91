#pragma once

class RCObject {
public:
    void AddRef() { ++refCount; }
    void Release() { if (--refCount == 0) delete this; }
protected:
    RCObject() : refCount(0) {}
    virtual ~RCObject() {}
private:
    RCObject(RCObject const &);
    RCObject &operator=(RCObject const &);
    int refCount;
};

template <class T> class RCPtr {
public:
    RCPtr() : p(0) {}
    RCPtr(T *q) : p(q) { if (p) p->AddRef(); }
    RCPtr(RCPtr const &o) : p(o.p) { if (p) p->AddRef(); }

    template <class U> RCPtr(RCPtr<U> const &o) : p(o.get()) { if (p) p->AddRef(); }
    ~RCPtr() { if (p) p->Release(); }
    RCPtr &operator=(RCPtr const &o) { RCPtr t(o); T *q = p; p = t.p; t.p = q; return *this; }
    T *operator->() const { return p; }
    T &operator*() const { return *p; }
    T *get() const { return p; }
private:
    T *p;
};
