#include "desktop/observe/MessageTrace.h"
#include "host/GlogPane.h"
#include "host/Services.h"
#include <cstdlib>
#include <cxxabi.h>
#include <memory>
#include <utility>

namespace {
MessageTrace::Sink theSink;
}

bool MessageTrace::on = false;

void MessageTrace::SetSink(Sink sink) {
    theSink = std::move(sink);
    on = static_cast<bool>(theSink);
}

JsonLine MessageTrace::Begin() {
    JsonLine line;
    line.Number("time", TarnSystemTime::GetCurrentEventTime());
    return line;
}

JsonLine MessageTrace::Begin(GlogPane &pane) { return Begin(ClassName(pane), pane.GetID()); }

JsonLine MessageTrace::Begin(std::string const &className, int id) {
    JsonLine line = Begin();
    line.Text("pane", className).Integer("id", id);
    return line;
}

void MessageTrace::Write(JsonLine const &line) {
    if (theSink)
        theSink(line.Finish());
}

std::string MessageTrace::ClassName(GlogPane &pane) { return ClassName(typeid(pane)); }

std::string MessageTrace::ClassName(std::type_info const &type) {
    int status = 0;
    std::unique_ptr<char, decltype(&std::free)> const name(
        abi::__cxa_demangle(type.name(), nullptr, nullptr, &status), std::free);
    std::string result = status == 0 ? name.get() : type.name();
    // Where a class was written down says nothing to who reads the trace.
    static std::string const kUnnamed = "(anonymous namespace)::";
    for (std::size_t at = result.find(kUnnamed); at != std::string::npos; at = result.find(kUnnamed))
        result.erase(at, kUnnamed.size());
    return result;
}
