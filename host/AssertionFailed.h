// What happens when an invariant is broken.
//
// The hook is supplied by the host. BOOST_ENABLE_ASSERT_HANDLER has to be defined for every source file of
// library, host and program alike; otherwise this is not the hook that is called.
#pragma once

namespace boost {

// A shared_ptr or scoped_ptr was used while null ("px != 0"), a scoped_ptr was reset to what it holds ("p ==
// 0 || p != px"), or some other expression that had to be true was not. Reports it and aborts the program, or
// throws in tests; it must not return, for the caller goes on to use what it should not. Smart pointers drop
// their noexcept for it.
void assertion_failed(char const *expr, char const *function, char const *file, long line);
// The same for assertions that carry a message.
void assertion_failed_msg(char const *expr, char const *msg, char const *function, char const *file,
                          long line);

} // namespace boost
