// Ready-made messages: each calls one member function of a listener, with up to three arguments.
//
// L is the listener. A, B and C are the parameter types of the member function; S, T and U are the types that
// hold the arguments at the sender's. The two differ where a parameter is a reference:
//
//     Message1<SearchFieldPane_Listener, UString const &, UString> message(
//         &SearchFieldPane_Listener::TextChanged, &text);
//     Provider<SearchFieldPane_Listener>::BroadcastChange(message, nullptr);
//
// The arguments are given by address and stay the sender's. They are read anew for each listener, so they
// have to outlive the broadcast; a reference parameter gets the sender's own object, not a copy.
#pragma once
#include "frame/Provider.h"

// Calls an operation without arguments.
template <class L> class Message0 : public DependentCastMessenger<L> {
public:
    typedef void (L::*Function)(); // of the listener

    explicit Message0(Function operation)
        : function(operation) {}
    void BroadcastChange(L *listener) override { (listener->*function)(); }

private:
    Function function;
};

// Calls an operation with one argument.
template <class L, class A, class S> class Message1 : public DependentCastMessenger<L> {
public:
    typedef void (L::*Function)(A); // of the listener

    Message1(Function operation, S const *first)
        : function(operation)
        , argument(first) {}
    void BroadcastChange(L *listener) override { (listener->*function)(*argument); }

private:
    Function function;
    S const *argument;
};

// Calls an operation with two arguments.
template <class L, class A, class S, class B, class T> class Message2 : public DependentCastMessenger<L> {
public:
    typedef void (L::*Function)(A, B); // of the listener

    Message2(Function operation, S const *first, T const *second)
        : function(operation)
        , argument1(first)
        , argument2(second) {}
    void BroadcastChange(L *listener) override { (listener->*function)(*argument1, *argument2); }

private:
    Function function;
    S const *argument1;
    T const *argument2;
};

// Calls an operation with three arguments.
template <class L, class A, class S, class B, class T, class C, class U>
class Message3 : public DependentCastMessenger<L> {
public:
    typedef void (L::*Function)(A, B, C); // of the listener

    Message3(Function operation, S const *first, T const *second, U const *third)
        : function(operation)
        , argument1(first)
        , argument2(second)
        , argument3(third) {}
    void BroadcastChange(L *listener) override { (listener->*function)(*argument1, *argument2, *argument3); }

private:
    Function function;
    S const *argument1;
    T const *argument2;
    U const *argument3;
};
