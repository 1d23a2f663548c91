#include "host/OSFont.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Resources.h"
#include "desktop/type/FontFamilies.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/FontTable.h"
#include "desktop/type/PortFont.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <limits>
#include <map>

namespace {

// Resources name these whether or not the font file has them.
constexpr int kFewestFonts = 10;
constexpr short kPlainFace = 0, kDefaultSize = 12;

// The records that callers keep pointers to: they change in place and never go.
std::map<int, fontSaveRec> &TheRecords() {
    static std::map<int, fontSaveRec> *records = new std::map<int, fontSaveRec>;
    return *records;
}

void FillRecords() {
    // Brings the dialog family up to date.
    FontLibrary::Instance().Generation();
    std::map<int, fontSaveRec> &records = TheRecords();
    for (int index = 0; index < kFewestFonts; ++index)
        records[index] = {OS::Font::FamilyID(), kPlainFace, kDefaultSize};
    for (auto const &[index, entry] : TheFontTable().Entries())
        records[index] = {FontFamilies::Named(entry.family), static_cast<short>(entry.face),
                          static_cast<short>(entry.size)};
}

short Narrow(int pixels) {
    return static_cast<short>(std::min<int>(pixels, std::numeric_limits<short>::max()));
}

} // namespace

fontSaveRec const *GetIndVelaFont(int index) {
    static unsigned int generation = 0;
    if (generation != Resources::Instance().Generation()) {
        FillRecords();
        generation = Resources::Instance().Generation();
    }
    std::map<int, fontSaveRec> const &records = TheRecords();
    auto const found = records.find(index);
    return found == records.end() ? &records.at(0) : &found->second;
}

void SetFontData(fontSaveRec const *font) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("SetFontData")
                                .Text("family", FontFamilies::NameOf(font->family))
                                .Integer("face", font->face)
                                .Integer("size", font->size));
    PortFont::Set(font->family, font->face, font->size);
}

void tarn::GetFontInfo(TarnQuickDrawText::FontInfo &info) {
    FontMetrics const &metrics = FontLibrary::Instance().Metrics(PortFont::Current());
    info.ascent = Narrow(metrics.ascent);
    info.descent = Narrow(metrics.descent);
    info.widMax = Narrow(metrics.maxWidth);
    info.leading = 0; // a line is ascent plus descent high
}

void VelaDrawing::GetFontInfo(TarnQuickDrawText::FontInfo *info) {
    if (info)
        tarn::GetFontInfo(*info);
}
