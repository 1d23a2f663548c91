#include "lists/GListPane.h"
#include "frame/ResourceReading.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarPane.h"
#include <limits>
#include <new>

namespace {

short const kNoNumber = 0;
int const kNoClick = std::numeric_limits<int>::min();
int const kNoRow = -1;
long long const kEveryIdleTime = 0;

} // namespace

GListPane::GListPane()
    : CIdleChore(kEveryIdleTime, kNoInitialDelay)
    , selColumn(0)
    , res()
    , savedColors()
    , selFirst(kNoRow)
    , selLast(kNoRow)
    , topLine(0)
    , numDisplayed(0)
    , numFullLines(0)
    , numItems(0)
    , protectedLine(kNoRow)
    , scrollWithNoBar(false)
    , lineDrawer(nullptr)
    , ownsLineDrawer(false)
    , inhibitScrolling(false)
    , clickLine(kNoClick)
    , clickColumn(kNoClick)
    , selectionListener(nullptr)
    , drawSelectionInactive(false) {}

// Only the bar of the record is let go: whoever gave one by SetScrollBar takes it back.
GListPane::~GListPane() {
    if (ScrollBarPane *const bar = NamedScrollBar())
        bar->SetClient(nullptr);
    ForgetSetup();
    if (ownsLineDrawer)
        delete lineDrawer;
}

GListPane *GListPane::NewGListPane(glogRec *owner, glistResRec *record) {
    GListPane *const list = new (std::nothrow) GListPane;
    if (!list || list->InitGListPane(owner, record, kNoNumber))
        return list;
    delete list;
    return nullptr;
}

GListPane *GListPane::NewGListPane(glogRec *owner, boost::shared_ptr<XMLLib::ContainerItem> item) {
    glistResRec record;
    ListResRecFromXMLRes(item, record);
    return NewGListPane(owner, &record);
}

void GListPane::ListResRecFromXMLRes(boost::shared_ptr<XMLLib::ContainerItem> item, glistResRec &record) {
    auto const number = [&item](char const *key) { return item->GetSIntItemValue(ResourceKey(key)); };
    auto const number16 = [&number](char const *key) { return static_cast<short>(number(key)); };
    record.type = glistResRec::kType;
    record.bounds = OptionalRect(item, "BoundsRect");
    record.scrollItem = number16("ScrollItem");
    record.selMode = static_cast<GListSelectionMode>(number("SelMode"));
    record.lineHeight = number16("LineHeight");
    record.firstLineOffset = number16("FirstLineOffset");
    record.edgeH = number16("EdgeH");
    record.edgeV = number16("EdgeV");
    record.selKeyMask = number16("SelKeyMask");
    record.selReturn = number("SelReturn") != 0;
    record.autoEdge = static_cast<int>(number("AutoEdge"));
    record.style = static_cast<int>(number("Style"));
}

GListPane *GListPane::InitGListPane(glogRec *owner, glistResRec *record, int id) {
    if (!GlogPaneInit(owner, static_cast<short>(id)))
        return nullptr;
    clickLine = clickColumn = kNoClick;
    scrollWithNoBar = inhibitScrolling = false;
    res = *record;
    if (res.selMode == kListSelectNothing)
        res.selMode = kListSelectSeveral;
    if (!IsInLayout())
        SetBox(&record->bounds);
    if (HasFlags())
        selected.Clear();
    if (res.style == glistResRec::kSmallStyle)
        GetColors(&savedColors);
    Resize({GetGlogHeight(glog), GetGlogWidth(glog)});
    if (res.scrollItem > 0)
        CIdleChore::Assign();
    return this;
}

// The bar

// A bar may be made after its list, so the list takes it at the first idle time.
void GListPane::DoIdle() { SetScrollBar(GetScrollBar()); }

void GListPane::SetScrollBar(ScrollBarPane *bar) {
    CIdleChore::Cancel();
    if (scrollBar)
        scrollBar->SetClient(nullptr);
    scrollBar = bar;
    if (bar)
        bar->SetClient(this);
}

ScrollBarPane *GListPane::GetScrollBar() const { return scrollBar ? scrollBar.Get() : NamedScrollBar(); }

ScrollBarPane *GListPane::NamedScrollBar() const {
    if (!glog || res.scrollItem < 1 || res.scrollItem > CountGlogItems(glog))
        return nullptr;
    return dynamic_cast<ScrollBarPane *>(GetGlogItem(glog, res.scrollItem));
}

// The drawer

void GListPane::SetLineDrawer(ListLineDrawer *drawer, bool takeOwnership) {
    ListLineDrawer *const former = ownsLineDrawer && lineDrawer != drawer ? lineDrawer : nullptr;
    lineDrawer = drawer;
    ownsLineDrawer = takeOwnership;
    delete former;
}

// Activation: what is selected looks another way.

void GListPane::Activate() {
    if (!IsActive() && GetVisibility()) {
        InvalInactiveSelectionDisplay();
        InvertSelection();
    }
    GlogPane::Activate();
}

void GListPane::Deactivate() {
    if (IsActive() && GetVisibility()) {
        InvertSelection();
        InvalInactiveSelectionDisplay();
    }
    GlogPane::Deactivate();
}
