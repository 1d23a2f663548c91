// The host's errors.
#pragma once
#include <exception>

// What the host throws. A broadcast stops it, like anything else that a listener throws.
class TarnError : public std::exception {};

// For memory that could not be had, and for a required part of a resource that is missing: throws TarnError.
// A host made for tests may record the call and return; the caller then runs into the assertion hook.
void FailMemFullError();
