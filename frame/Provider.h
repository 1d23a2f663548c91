// How panes tell others what happened to them: a Provider keeps a list of Dependents of one listener
// class and sends each of them a message.
//
// A listener class derives from Dependent of itself, as its first base:
//
//     class MeterListener : public Dependent<MeterListener> {
//     public:
//         virtual void MeterMoved(Meter *) = 0;
//     };
//
// A sender derives from Provider<MeterListener>. Whoever listens calls DependUpon(sender). Neither owns the
// other: each takes itself out of the other's list when it dies, and a provider that dies tells its
// dependents by ProviderDying.
//
// Everything may happen while a message goes round: dependents may leave, join, send further messages, and
// destroy the provider. One thread only.
#pragma once
#include "host/TarnError.h"
#include <algorithm>
#include <boost/assert.hpp>
#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <stdexcept>
#include <typeinfo>
#include <vector>

template <class T> class Dependent;
template <class T> class DependentCastMessenger;

// The sending side: an ordered list of dependents of the listener class T.
//
// A class with several Provider bases has to name the one it means:
// Provider<MeterListener>::BroadcastChange(...).
template <class T> class Provider {
public:
    // The dependents of a provider, shared with the broadcasts that are walking it, so that it outlives a
    // provider that dies during one of them.
    struct DependentList {
        std::vector<T *> dependents;  // in order of registration; null: left while the list was walked
        bool needsCompaction = false; // dependents holds nulls to be taken out after the outermost broadcast
        bool broadcasting = false;    // a broadcast or the provider's destructor is walking dependents
        bool providerDead = false;    // broadcasts that are still running have to stop
    };

    // Allocates nothing.
    Provider() {}
    // The copy sends to the same dependents as the original: both share one list from now on. The dependents
    // know only the provider that they registered with, so a provider that has been copied must not outlive
    // its copies while it has dependents that outlive it: the first to die empties the list for all.
    Provider(Provider const &other)
        : list(other.list) {}
    // Shares the other's list, as the copy constructor does. Dependents that this provider had are dropped
    // without ProviderDying; assign to a provider without dependents.
    Provider &operator=(Provider const &other) {
        list = other.list;
        return *this;
    }
    // Tells every dependent, in order of registration: the provider is first taken out of the dependent, then
    // ProviderDying is called. Broadcasts of this provider that are still running stop.
    virtual ~Provider();

    // Appends the dependent, which must not be null; without effect for one that is in the list already. A
    // dependent that joins during a broadcast is first called by the next one. The dependent stays the
    // caller's. When memory runs out the dependent is not (or no longer) in the list, and nobody is told.
    void AddDependent(T *dependent);
    // Takes the dependent out; it is not called again, not even by a broadcast that is running. Without
    // effect for one that is not in the list. One call undoes any number of AddDependent.
    void RemoveDependent(Dependent<T> *dependent);
    // Sends the message to every dependent except `exclude`, which may be null, in order of registration.
    // What a dependent throws is swallowed, and the next one is called. The provider may be dead on return.
    void BroadcastChange(DependentCastMessenger<T> const &message, Dependent<T> *exclude);
    // What BroadcastChange does once it knows that there is a list. The list comes by value: this reference
    // keeps it alive when the provider dies on the way. Throws std::out_of_range if a dependent has vanished
    // from the list without leaving its null behind.
    static void BroadcastChangeImpl(boost::shared_ptr<DependentList> list, DependentCastMessenger<T> &message,
                                    Dependent<T> *exclude);

    // For senders: false when there is surely nobody to tell, so that no message need be built. One pointer
    // test: it tells of the list, which may be empty. It stays true after the last dependent has left during
    // a broadcast, or after a first AddDependent that ran out of memory, until one is added and leaves again
    // outside of a broadcast; and for a copy that shares the list after the last one has left the other.
    bool HasDependents() const { return list.get() != nullptr; }

private:
    friend class Dependent<T>;

    // Marks a list as being walked, and restores the former mark: an inner walk leaves the outer one's alone.
    class WithBroadcasting {
    public:
        explicit WithBroadcasting(DependentList &walked)
            : list(walked)
            , former(walked.broadcasting) {
            list.broadcasting = true;
        }
        ~WithBroadcasting() { list.broadcasting = former; }
        WithBroadcasting(WithBroadcasting const &) = delete;
        WithBroadcasting &operator=(WithBroadcasting const &) = delete;

    private:
        DependentList &list;
        bool former;
    };

    typedef typename std::vector<T *>::iterator Entry;

    static Entry Find(DependentList &list, Dependent<T> *dependent);
    static T *EntryAt(DependentList const &list, std::size_t index);
    static void CallDependents(DependentList &list, DependentCastMessenger<T> &message,
                               Dependent<T> *exclude);
    static void Send(DependentCastMessenger<T> &message, Dependent<T> *dependent);
    static void Compact(DependentList &list);

    boost::shared_ptr<DependentList> list; // null until the first AddDependent, and after the last leaves
};

// The listening side: remembers the providers that it hangs on, so that it can leave them when it dies.
//
// A class with several Dependent bases has to name the one it means: MeterListener::DependUpon(meter).
template <class T> class Dependent {
public:
    // Allocates nothing; depends on nobody.
    Dependent() {}
    // A copy depends on nobody, whatever the original depends on.
    Dependent(Dependent const &) {}
    // Leaves what this object depends on as it is.
    Dependent &operator=(Dependent const &) { return *this; }
    // Leaves every provider. Safe also during a broadcast of one of them.
    virtual ~Dependent();

    // Subscribes to the provider, which must not be null. Without effect when it is done already, or when
    // this object is not a T (yet: the constructor of T has to be running or done). A dependent can hang on
    // at most 65535 providers of one listener class.
    void DependUpon(Provider<T> *provider);
    // Unsubscribes from the provider, which must not be null. Without effect when it is not subscribed.
    void CancelDependency(Provider<T> *provider);

    // The provider's part of subscribing and unsubscribing; nobody else calls these two.
    void AddProvider(Provider<T> *provider);
    void RemoveProvider(Provider<T> *provider);

private:
    friend class Provider<T>;

    // The provider is being destroyed and has already been taken out of this object: neither DependUpon nor
    // CancelDependency is wanted. The provider's derived classes are gone; only its address is of use. May
    // destroy this object.
    virtual void ProviderDying(Provider<T> *) {}

    // Null while the object hangs on nobody: most listeners never do, and pay one pointer.
    std::unique_ptr<std::vector<Provider<T> *>> providers;
};

// A message on its way: knows how to call one operation of the listener class T. Built on the sender's stack
// for one broadcast.
template <class T> class DependentCastMessenger {
public:
    virtual ~DependentCastMessenger() {}
    // Delivers the message to the dependent if it is a T; otherwise does nothing, as for a dependent whose
    // derived part is already destroyed. The dependent must not be null.
    virtual void CastAndBroadcast(Dependent<T> *dependent);
    // Calls the message's operation on the listener.
    virtual void BroadcastChange(T *listener) = 0;
};

template <class T> Provider<T>::~Provider() {
    if (!list)
        return;
    {
        WithBroadcasting walking(*list);
        std::vector<T *> &dependents = list->dependents;
        std::size_t const count = dependents.size();
        for (std::size_t i = 0; i < count && i < dependents.size(); ++i) {
            // By the base: a listener may have its own private ProviderDying.
            Dependent<T> *const dependent = dependents[i];
            if (!dependent)
                continue;
            dependent->RemoveProvider(this);
            dependent->ProviderDying(this);
        }
        dependents.clear();
        list->providerDead = true;
    }
    list.reset();
}

template <class T> void Provider<T>::AddDependent(T *dependent) {
    BOOST_ASSERT(dependent != nullptr);
    try {
        if (!list)
            list = boost::make_shared<DependentList>();
        std::vector<T *> &dependents = list->dependents;
        if (std::find(dependents.begin(), dependents.end(), dependent) == dependents.end())
            dependents.push_back(dependent);
        dependent->AddProvider(this);
    } catch (...) {
        if (!list)
            return;
        // A half-made subscription would leave a pointer that nobody clears. The entry goes at once, even
        // during a broadcast, which then finds its list shorter than it was.
        Entry const entry = Find(*list, dependent);
        if (entry != list->dependents.end())
            list->dependents.erase(entry);
    }
}

template <class T> void Provider<T>::RemoveDependent(Dependent<T> *dependent) {
    if (!list)
        return;
    Entry const entry = Find(*list, dependent);
    if (entry == list->dependents.end())
        return;
    dependent->RemoveProvider(this);
    if (list->broadcasting) {
        // A walk is under way and counts by index: the length must not change under it.
        *entry = nullptr;
        list->needsCompaction = true;
        return;
    }
    list->dependents.erase(entry);
    if (list->dependents.empty())
        list.reset();
}

template <class T>
void Provider<T>::BroadcastChange(DependentCastMessenger<T> const &message, Dependent<T> *exclude) {
    if (!list)
        return;
    // A message is const for its sender, who may pass a temporary; delivering is not a const operation.
    BroadcastChangeImpl(list, const_cast<DependentCastMessenger<T> &>(message), exclude);
}

template <class T>
void Provider<T>::BroadcastChangeImpl(boost::shared_ptr<DependentList> list,
                                      DependentCastMessenger<T> &message, Dependent<T> *exclude) {
    {
        WithBroadcasting walking(*list);
        CallDependents(*list, message, exclude);
    }
    // An emptied list is kept here, though RemoveDependent releases it: only the provider can let go of it,
    // and the provider may have died.
    if (list->needsCompaction && !list->broadcasting && !list->providerDead)
        Compact(*list);
}

template <class T>
void Provider<T>::CallDependents(DependentList &list, DependentCastMessenger<T> &message,
                                 Dependent<T> *exclude) {
    // Those who join on the way are beyond the count and wait for the next broadcast.
    std::size_t const count = list.dependents.size();
    for (std::size_t i = 0; i < count && !list.providerDead; ++i) {
        Dependent<T> *const dependent = EntryAt(list, i);
        if (dependent && dependent != exclude)
            Send(message, dependent);
    }
}

// One failing dependent must not keep the others from hearing.
template <class T> void Provider<T>::Send(DependentCastMessenger<T> &message, Dependent<T> *dependent) {
    try {
        message.CastAndBroadcast(dependent);
    } catch (TarnError const &) {
    } catch (...) {
    }
}

template <class T> void Provider<T>::Compact(DependentList &list) {
    list.needsCompaction = false;
    std::vector<T *> &dependents = list.dependents;
    dependents.erase(std::remove(dependents.begin(), dependents.end(), static_cast<T *>(nullptr)),
                     dependents.end());
}

template <class T>
typename Provider<T>::Entry Provider<T>::Find(DependentList &list, Dependent<T> *dependent) {
    return std::find_if(list.dependents.begin(), list.dependents.end(),
                        [dependent](Dependent<T> *entry) { return entry == dependent; });
}

// Thrown by hand: the text is part of the interface, and std::vector::at has its own.
template <class T> T *Provider<T>::EntryAt(DependentList const &list, std::size_t index) {
    if (index >= list.dependents.size())
        throw std::out_of_range("invalid vector<T> subscript");
    return list.dependents[index];
}

template <class T> Dependent<T>::~Dependent() {
    if (!providers)
        return;
    // Each call takes its provider out of the vector, and the last one frees it. Counted, not "until empty":
    // a provider that has lost its list to a dying copy takes nothing out.
    std::uint16_t const count = static_cast<std::uint16_t>(providers->size());
    for (std::uint16_t i = 0; i < count; ++i)
        providers->front()->RemoveDependent(this);
}

template <class T> void Dependent<T>::DependUpon(Provider<T> *provider) {
    if (T *const listener = dynamic_cast<T *>(this))
        provider->AddDependent(listener);
}

template <class T> void Dependent<T>::CancelDependency(Provider<T> *provider) {
    if (provider->list && !provider->list->dependents.empty())
        provider->RemoveDependent(this);
}

template <class T> void Dependent<T>::AddProvider(Provider<T> *provider) {
    if (!providers)
        providers = std::make_unique<std::vector<Provider<T> *>>();
    if (std::find(providers->begin(), providers->end(), provider) == providers->end())
        providers->push_back(provider);
}

template <class T> void Dependent<T>::RemoveProvider(Provider<T> *provider) {
    if (!providers)
        return;
    auto const entry = std::find(providers->begin(), providers->end(), provider);
    if (entry == providers->end())
        return;
    providers->erase(entry);
    if (providers->empty())
        providers.reset();
}

template <class T> void DependentCastMessenger<T>::CastAndBroadcast(Dependent<T> *dependent) {
    // Listeners of one class often follow each other, and a cast takes longer than all the rest. What it
    // comes to is the same for the same place in the same class of object; the class tells of a derived part
    // that is destroyed, too.
    static std::type_info const *knownClass = nullptr;
    static std::ptrdiff_t knownPlace = 0, toListener = 0;
    char *const address = reinterpret_cast<char *>(dependent);
    std::type_info const &type = typeid(*dependent);
    std::ptrdiff_t const place = address - static_cast<char *>(dynamic_cast<void *>(dependent));
    if (&type == knownClass && place == knownPlace) {
        BroadcastChange(reinterpret_cast<T *>(address + toListener));
        return;
    }
    T *const listener = dynamic_cast<T *>(dependent);
    if (!listener)
        return;
    knownClass = &type;
    knownPlace = place;
    toListener = reinterpret_cast<char *>(listener) - address;
    BroadcastChange(listener);
}
