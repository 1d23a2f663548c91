// While the host is inside a pane.
#pragma once

// Stands on the stack wherever the host calls panes, chores or handlers, so that nothing is deleted that such
// a call came from. What is disposed of meanwhile goes when the main loop has come back to itself.
class HostCall {
public:
    HostCall() { ++depth; }
    ~HostCall() { --depth; }
    HostCall(HostCall const &) = delete;
    HostCall &operator=(HostCall const &) = delete;
    static bool Running() { return depth > 0; }

private:
    static int depth;
};
