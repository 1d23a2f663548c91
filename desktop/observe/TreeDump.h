// A glog and its panes as JSON.
#pragma once
#include "desktop/observe/JsonLine.h"
#include <functional>
#include <string>

class Glog;
class GlogPane;

namespace TreeDump {
// Adds what a pane of some class shows (a label, a value) to its line; false leaves the pane to the
// describers added earlier.
typedef std::function<bool(GlogPane &, JsonLine &)> Describer;
void AddDescriber(Describer);
// The glog with its panes in drawing order: class, id, box in the coordinates of the container, visible,
// active, selected, what the describers add, and the subpanes of containers under "panes".
std::string Json(Glog &);
} // namespace TreeDump
