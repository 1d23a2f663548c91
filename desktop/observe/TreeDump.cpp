#include "desktop/observe/TreeDump.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "host/CompoundPane.h"
#include <vector>

namespace {

std::vector<TreeDump::Describer> &Describers() {
    static std::vector<TreeDump::Describer> describers;
    return describers;
}

std::string Joined(std::vector<std::string> const &entries, std::string const &indent) {
    std::string text = "[";
    for (std::size_t i = 0; i < entries.size(); ++i)
        text += (i ? ",\n" : "\n") + indent + entries[i];
    return text + ']';
}

std::string PaneJson(GlogPane &pane, std::string const &indent) {
    JsonLine line;
    line.Text("class", MessageTrace::ClassName(pane))
        .Integer("id", pane.GetID())
        .Box("box", pane.GetDrawRectangle());
    line.Flag("visible", PaneAccess::OwnVisibility(pane)).Flag("active", pane.IsActive());
    line.Flag("selected", pane.IsSelected());
    for (auto i = Describers().rbegin(); i != Describers().rend(); ++i)
        if ((*i)(pane, line))
            break;
    if (CompoundPane *container = dynamic_cast<CompoundPane *>(&pane)) {
        std::vector<std::string> inside;
        for (short i = 0; i < container->NumSubpanes(); ++i)
            inside.push_back(PaneJson(*container->Get(i), indent + "  "));
        line.Raw("panes", Joined(inside, indent + "  "));
    }
    return line.Finish();
}

} // namespace

void TreeDump::AddDescriber(Describer describer) { Describers().push_back(std::move(describer)); }

std::string TreeDump::Json(Glog &glog) {
    std::vector<std::string> panes;
    for (GlogPane *pane : glog.Items())
        panes.push_back(PaneJson(*pane, "  "));
    JsonLine line;
    line.Text("glog", glog.Options().title).Integer("width", glog.Width()).Integer("height", glog.Height());
    line.Flag("visible", glog.IsVisible()).Flag("active", glog.IsActive()).Raw("panes", Joined(panes, "  "));
    return line.Finish() + "\n";
}
