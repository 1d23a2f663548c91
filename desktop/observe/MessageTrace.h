// Every message between panes and the rest, as it happens.
#pragma once
#include "desktop/observe/JsonLine.h"
#include <functional>
#include <string>
#include <typeinfo>

class GlogPane;

// While a sink stands, each message hands it one line such as
// {"time":0.125,"pane":"CheckBoxPane","id":3,"message":"ButtonValueChanged","index":1,"value":true}.
class MessageTrace {
public:
    typedef std::function<void(std::string const &line)> Sink; // gets a line without line end
    static void SetSink(Sink);                                 // an empty function ends the trace
    static bool On() { return on; }    // whether a sink stands; ask before building a line
    static JsonLine Begin();           // with the time
    static JsonLine Begin(GlogPane &); // with time, class and number of the pane
    static JsonLine Begin(std::string const &className, int id); // the same of a pane that may be gone
    static void Write(JsonLine const &);                         // to the sink
    static std::string ClassName(GlogPane &);                    // of the most derived class
    static std::string ClassName(std::type_info const &);        // as sources write it

private:
    static bool on;
};
