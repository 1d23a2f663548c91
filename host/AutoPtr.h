// The owning pointer by which some operations of the host take an object over.
#pragma once

// C++17 has dropped std::auto_ptr. libc++ still has it for those who ask before the first standard header;
// programs on libc++ that include <memory> earlier define this on the command line.
#ifndef _LIBCPP_ENABLE_CXX17_REMOVED_AUTO_PTR
#define _LIBCPP_ENABLE_CXX17_REMOVED_AUTO_PTR
#endif
#include <memory>

#if defined(__GNUC__)
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#endif

// std::auto_ptr under a name that may be used without a deprecation warning: copying it hands the object over
// and leaves the source empty. Signatures take it by value, and the callee owns the object from the call on.
//
// Never write std::auto_ptr: libstdc++ marks the name as deprecated, and only this alias is exempt.
template <class T> using AutoPtr = std::auto_ptr<T>;

#if defined(__GNUC__)
#pragma GCC diagnostic pop
#endif
