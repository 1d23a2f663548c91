// Graphs in dialogs.
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "graphics/GraphPane.h"
#include "host/GlogStyleSheet.h"
#include <memory>
#include <new>
#include <vector>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0; // the loader numbers what it makes

// The points that a dialog names.
class DialogPoints : public GraphData {
public:
    explicit DialogPoints(Container const &all) {
        for (std::size_t i = 0; i < all->GetNumItems(); ++i) {
            Container const point = XMLLib::ContainerFromItem(all->GetNthItem(i));
            points.push_back({Number(point, "h"), Number(point, "v")});
        }
    }
    int CountPoints() override { return static_cast<int>(points.size()); }
    GraphDataPoint GetPoint(int index) override { return points.at(static_cast<std::size_t>(index)); }

    static int Number(Container const &item, char const *key) {
        return static_cast<int>(item->GetSIntItemValue(ResourceKey(key)));
    }

private:
    std::vector<GraphDataPoint> points;
};

bool DescribeGraph(GlogPane &pane, JsonLine &line) {
    GraphPane *const graph = dynamic_cast<GraphPane *>(&pane);
    if (!graph)
        return false;
    line.Integer("points", graph->GetGraphData() ? graph->GetGraphData()->CountPoints() : 0);
    return true;
}

// Throws KeyFault for an axis without length.
bool ReadAxis(Container const &item, char const *key, GraphAxisSetting &axis) {
    Container const described = item->GetContainerItem(ResourceKey(key));
    if (!described)
        return false;
    axis = {DialogPoints::Number(described, "min"), DialogPoints::Number(described, "max"),
            DialogPoints::Number(described, "interval"), 0, 0};
    if (axis.dataMinimum >= axis.dataMaximum)
        throw KeyFault(key, "the greatest value is not above the least");
    return true;
}

GlogPane *MakeGraph(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    std::unique_ptr<GraphPane> graph(new (std::nothrow) GraphPane(glog, kNoNumber, item));
    if (!graph || !graph->GetGlog())
        return nullptr;
    GraphAxisSetting axis;
    if (ReadAxis(item, "HorizontalAxis", axis))
        graph->SetupHorizontalAxis(axis);
    if (ReadAxis(item, "VerticalAxis", axis))
        graph->SetupVerticalAxis(axis);
    if (Container const points = item->GetContainerItem(ResourceKey("Points")))
        graph->SetGraphData(new DialogPoints(points));
    return graph.release();
}

GlogPane *MakeGraphFromRecord(glogRec *glog, RecordBytes &bytes) {
    GraphPaneResRec record;
    record.kind = bytes.Short();
    record.bounds = bytes.ReadRect();
    std::unique_ptr<GraphPane> graph(new (std::nothrow) GraphPane(glog, kNoNumber, &record));
    return graph && graph->GetGlog() ? graph.release() : nullptr;
}

KeyList AxisKeys() {
    return KeyList().Integer("min").Required().Integer("max").Required().Integer("interval", 0,
                                                                                 KeyList::kLargest);
}

KeyList PointKeys() { return KeyList().Integer("h").Required().Integer("v").Required(); }

} // namespace

void AddGraphItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeGraph);
    registry.Add(
        ItemType("Graph")
            .Keys(KeyList()
                      .Rect("BoundsRect")
                      .Attributes("HorizontalAxis", AxisKeys())
                      .Attributes("VerticalAxis", AxisKeys())
                      .Container("Points", KeyList().Attributes("DataPoint", PointKeys()).Repeated()))
            .MadeBy(MakeGraph)
            .FromRecord(GraphPaneResRec::kKind, ItemType::kWholeKind, MakeGraphFromRecord));
}
