// A strip along the bottom of a window that says what is wrong, as high as the text needs.
#pragma once
#include "host/GlogPane.h"
#include "host/TextLayout.h"
#include "host/UString.h"

class ErrorBanner : public GlogPane {
public:
    // Makes a banner on top of the glog's panes and damages its place; the glog owns it.
    static ErrorBanner *NewErrorBanner(glogRec *, UString const &text);

    // Shows another text.
    void SetText(UString const &);
    UString const &GetText() const { return text; }

    // Stays at the bottom.
    void Resize(Point delta) override;

protected:
    ErrorBanner() {}
    void DrawGuts(OSRgn *) override;

private:
    void Place();

    UString text;
    OS::TextLayout layout; // of the text
};
