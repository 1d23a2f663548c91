#include "buttons/StudButtonPane.h"
#include "buttons/ButtonLabel.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/PortSavers.h"
#include "host/glogRec.h"
#include <algorithm>
#include <iterator>
#include <memory>
#include <new>

namespace {

short const kLabelList = 4333;
int const kLabelFont = 1;

// Each look of the face is a left cap, a middle and a right cap.
short const kFaceFamily = 1004;
short const kNormalFace = 0, kPressedFace = 3, kDisabledFace = 6;

short const kLabelInset = 2; // pixels off the left, right and bottom edge; the top has none

struct FormerText {
    short former, present;
};

// Numbers of the former string list, in ascending order. What is not here has kept its number.
FormerText const kFormerTexts[] = {
    {1, 1},   {2, 2},   {3, 3},   {4, 4},   {6, 5},   {8, 6},   {9, 7},   {10, 8},  {11, 9},  {12, 10},
    {13, 11}, {15, 13}, {19, 16}, {21, 17}, {22, 18}, {23, 19}, {24, 20}, {25, 21}, {27, 22}, {28, 23},
    {29, 24}, {30, 25}, {32, 26}, {33, 27}, {34, 28}, {35, 29}, {36, 30}, {37, 31}, {38, 32}, {39, 33},
    {40, 34}, {41, 35}, {42, 36}, {43, 37}, {44, 38}, {45, 39}, {46, 40}, {47, 41},
};

short PresentText(short text) {
    FormerText const *const end = std::end(kFormerTexts);
    FormerText const *const found = std::find_if(
        std::begin(kFormerTexts), end, [text](FormerText const &entry) { return entry.former == text; });
    return found == end ? text : found->present;
}

} // namespace

const short StudButtonPane::kGStud_Left;
const short StudButtonPane::kGStud_Left2;
const short StudButtonPane::kGStud_Left3;
const short StudButtonPane::kGStud_Left4;
const short StudButtonPane::kGStud_Left5;

StudButtonPane::StudButtonPane() {}

StudButtonPane *StudButtonPane::NewStudButtonPane(glogRec *owner, studResRec *resource) {
    std::unique_ptr<StudButtonPane> pane(new (std::nothrow) StudButtonPane);
    if (!pane || !pane->InitStudButtonPane(owner, resource))
        return nullptr;
    return pane.release();
}

StudButtonPane *StudButtonPane::NewStudButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect const bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    studResRec resource;
    resource.kind = studResRec::kKind;
    resource.top = bounds.top;
    resource.left = bounds.left;
    resource.text = PresentText(static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("TextID"))));
    resource.width = static_cast<short>(bounds.right - bounds.left);
    return NewStudButtonPane(owner, &resource);
}

StudButtonPane *StudButtonPane::InitStudButtonPane(glogRec *owner, studResRec *resource) {
    if (!InitGlogButtonPane(owner, kEnabled))
        return nullptr;
    Rect const face = GetIconBounds(kFaceFamily);
    Rect box;
    box.top = static_cast<short>(resource->top < 0 ? resource->top + GetGlogHeight(owner) : resource->top);
    box.left = static_cast<short>(resource->left < 0 ? resource->left + GetGlogWidth(owner) : resource->left);
    box.bottom = static_cast<short>(box.top + face.bottom - face.top);
    box.right = static_cast<short>(box.left + resource->width);
    SetBox(&box);
    SetLabel(resource->text);
    return this;
}

void StudButtonPane::SetLabel(const UString &text) {
    if (text == label)
        return;
    label = text;
    ButtonLabel::Update(layout, label, kLabelFont);
    Inval();
}

void StudButtonPane::SetLabel(short id) { SetLabel(LocalizedStrings::GetString(kLabelList, id)); }

void StudButtonPane::GetButtonText(UString &text) const { text = label; }

short StudButtonPane::FirstFaceIcon() const {
    if (GetMode() == kDisabled)
        return kDisabledFace;
    return ButtonIsDown() ? kPressedFace : kNormalFace;
}

void StudButtonPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    if (GetMode() == kInvisible)
        return;
    Rect box;
    GetBox(&box);
    TileIconInRectWithEndCaps(box, kFaceFamily, FirstFaceIcon());
    ButtonLabel::SetColor(GetMode());

    Rect textRect = box;
    textRect.bottom = static_cast<short>(box.bottom - kLabelInset);
    textRect.left = static_cast<short>(box.left + kLabelInset);
    textRect.right = static_cast<short>(box.right - kLabelInset);
    UString text;
    GetButtonText(text);
    ButtonLabel::Draw(layout, text, textRect, kLabelFont);
}
