// Objects that count their references, and the pointer that counts them.
#pragma once

// An object that destroys itself when its last reference is released. Made with new and held by RCPtr only.
// The count is a plain integer: one thread.
class RCObject {
public:
    void AddRef() { ++refCount; } // one more holder
    // The object may be gone afterwards.
    void Release() {
        if (--refCount == 0)
            delete this;
    }

protected:
    RCObject()
        : refCount(0) {}
    virtual ~RCObject() {}

private:
    RCObject(RCObject const &);
    RCObject &operator=(RCObject const &);

    int refCount;
};

// A counted reference to an RCObject, or null.
template <class T> class RCPtr {
public:
    RCPtr()
        : p(0) {}
    // Not explicit: a fresh object is handed over as a plain pointer. May be null.
    RCPtr(T *q)
        : p(q) {
        if (p)
            p->AddRef();
    }
    RCPtr(RCPtr const &o)
        : p(o.p) {
        if (p)
            p->AddRef();
    }
    // Takes the reference over; the other pointer is null afterwards.
    RCPtr(RCPtr &&o) noexcept
        : p(o.p) {
        o.p = 0;
    }
    // From a pointer to a derived class.
    template <class U>
    RCPtr(RCPtr<U> const &o)
        : p(o.get()) {
        if (p)
            p->AddRef();
    }
    ~RCPtr() {
        if (p)
            p->Release();
    }
    // Releases the former object last, so that assigning what only that object holds is safe.
    RCPtr &operator=(RCPtr const &o) {
        RCPtr t(o);
        Swap(t);
        return *this;
    }
    RCPtr &operator=(RCPtr &&o) noexcept {
        RCPtr t(static_cast<RCPtr &&>(o));
        Swap(t);
        return *this;
    }

    // The object; neither operator may be used on null.
    T *operator->() const { return p; }
    T &operator*() const { return *p; }
    // The object or null, without a reference of the caller's own.
    T *get() const { return p; }

private:
    void Swap(RCPtr &o) noexcept {
        T *const q = p;
        p = o.p;
        o.p = q;
    }

    T *p;
};
