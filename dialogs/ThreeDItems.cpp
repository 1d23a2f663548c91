// The point in a cube in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "graphics/ThreeDPane.h"
#include "host/GlogStyleSheet.h"
#include <memory>
#include <new>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0;             // the loader numbers what it makes
double const kUnit = 1000.0;           // dialogs count in thousandths
long long const kCubeEnd = 1000;       // thousandths
long long const kLargestRadius = 1000; // thousandths
long long const kFullTurn = 360;       // degrees

// The view from which the cube's picture is drawn.
double const kUsualAngle = -20.0, kUsualRadius = 0.16;
Point3D const kUsualViewpoint = {1.2, 1.8, -5.5};
Rect const kUsualMargins = {7, 7, 7, 7};

Point3D PointIn(Container const &item) {
    auto const number = [&](char const *key) { return item->GetSIntItemValue(ResourceKey(key)) / kUnit; };
    return {number("x"), number("y"), number("z")};
}

double NumberOr(Container const &item, char const *key, double unit, double usual) {
    boost::shared_ptr<XMLLib::SIntItem> const found = item->GetSInt32Item(ResourceKey(key));
    return found ? static_cast<double>(found->Get()) / unit : usual;
}

// Follows its box, which a layout may change.
class DialogCube : public ThreeDPane {
public:
    explicit DialogCube(Container const &item)
        : angle(NumberOr(item, "Angle", 1.0, kUsualAngle))
        , viewpoint(kUsualViewpoint)
        , margins(kUsualMargins) {
        if (Container const named = item->GetContainerItem(ResourceKey("Viewpoint")))
            viewpoint = PointIn(named);
        if (item->GetContainerItem(ResourceKey("Margins")))
            margins = OptionalRect(item, "Margins");
    }

    bool Init(glogRec *owner, Container const &item) {
        if (!ThreeDPaneInit(owner, kNoNumber, angle, viewpoint, NumberOr(item, "Radius", kUnit, kUsualRadius),
                            margins))
            return false;
        Rect bounds = OptionalRect(item, "BoundsRect");
        SetBox(&bounds);
        if (Container const place = item->GetContainerItem(ResourceKey("Location")))
            SetValue(PointIn(place));
        return true;
    }

    void PanePositionChanged() override {
        ThreeDPane::PanePositionChanged();
        BuildMatrix(angle, viewpoint, margins);
        MakeWallsPath();
    }

private:
    double angle; // degrees
    Point3D viewpoint;
    Rect margins;
};

void WritePoint(JsonLine &line, Point3D const &point) {
    line.Number("x", point.x).Number("y", point.y).Number("z", point.z);
}

// The pane's one hook, until the program installs its own.
void ReportMove(void *pane) {
    if (!MessageTrace::On())
        return;
    ThreeDPane &cube = *static_cast<ThreeDPane *>(pane);
    JsonLine line = MessageTrace::Begin(cube).Text("message", std::string("PointMoved"));
    WritePoint(line, cube.GetValue());
    MessageTrace::Write(line);
}

void ReportMoves(GlogPane *pane) {
    if (ThreeDPane *const cube = dynamic_cast<ThreeDPane *>(pane))
        cube->InstallHook(ReportMove, cube);
}

bool DescribeCube(GlogPane &pane, JsonLine &line) {
    ThreeDPane *const cube = dynamic_cast<ThreeDPane *>(&pane);
    if (!cube)
        return false;
    WritePoint(line, cube->GetValue());
    return true;
}

GlogPane *MakeCube(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    std::unique_ptr<DialogCube> cube(new (std::nothrow) DialogCube(item));
    return cube && cube->Init(glog, item) ? cube.release() : nullptr;
}

KeyList PointKeys(long long least, long long greatest) {
    KeyList keys;
    for (char const *axis : {"x", "y", "z"})
        keys.Integer(axis, least, greatest).Required();
    return keys;
}

} // namespace

void AddThreeDItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeCube);
    registry.Add(ItemType("ThreeD")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("Angle", -kFullTurn, kFullTurn)
                               .Attributes("Viewpoint", PointKeys(KeyList::kSmallest, KeyList::kLargest))
                               .Integer("Radius", 0, kLargestRadius)
                               .Rect("Margins")
                               .AnyCorners()
                               .Attributes("Location", PointKeys(-kCubeEnd, kCubeEnd)))
                     .MadeBy(MakeCube)
                     .ReportedBy(ReportMoves));
}
