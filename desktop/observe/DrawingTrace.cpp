#include "desktop/observe/DrawingTrace.h"
#include <utility>

namespace {
DrawingTrace::Sink theSink;
}

bool DrawingTrace::on = false;

void DrawingTrace::SetSink(Sink sink) {
    theSink = std::move(sink);
    on = static_cast<bool>(theSink);
}

JsonLine DrawingTrace::Call(char const *operation) {
    JsonLine line;
    line.Text("op", std::string(operation));
    return line;
}

void DrawingTrace::Write(JsonLine const &line) {
    if (theSink)
        theSink(line.Finish());
}
