#include "scrolling/ScrollBarClient.h"

namespace {

int const kArrowDelay = 3, kPageDelay = 5; // ticks

} // namespace

ScrollBarClient::~ScrollBarClient() {}

void ScrollBarClient::InhibitAutoScroll(glogRec *) {}

int ScrollBarClient::GetArrowScrollDelay() { return kArrowDelay; }

int ScrollBarClient::GetPageScrollDelay() { return kPageDelay; }

void ScrollBarClient::DoneScrolling(ScrollBarPane *) {}
