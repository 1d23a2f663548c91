// Every drawing call of the interface, as it happens.
#pragma once
#include "desktop/observe/JsonLine.h"
#include <functional>
#include <string>

// While a sink stands, each drawing call hands it one line such as
// {"op":"Draw1Icon","family":1002,"icon":4,"h":10,"v":21}: the name of the call and its arguments, in local
// coordinates. Costs one pointer test where nobody watches:
//
//     if (DrawingTrace::On())
//         DrawingTrace::Write(DrawingTrace::Call("MoveTo").Integer("h", h).Integer("v", v));
class DrawingTrace {
public:
    typedef std::function<void(std::string const &line)> Sink;
    static void SetSink(Sink); // an empty function ends the trace
    static bool On() { return on; }
    static JsonLine Call(char const *operation);
    static void Write(JsonLine const &);

private:
    static bool on;
};
