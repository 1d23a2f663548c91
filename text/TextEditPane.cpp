#include "text/TextEditPane.h"
#include "host/Coordinate.h"
#include "host/OSPort.h"
#include "host/OSWindow.h"
#include "host/TarnError.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include <cmath>

namespace {

typedef OS::RectBase<OS::RectTag> PlaneRect;

OSTextEdit::Window WindowOf(glogRec *glog) {
    return glog ? OSTextEdit::Window(static_cast<TarnOSWindow::OSWindow &>(*glog)) : OSTextEdit::Window();
}

short Edge(double place) { return Pixel16(Truncated(place)); }

// The whole number below one end of a side, and above the other, whichever way it goes.
double LowEnd(double from, double size) { return std::floor(size >= 0 ? from : from + size); }

double HighEnd(double from, double size) { return std::ceil(size >= 0 ? from + size : from); }

} // namespace

// The engine, and what it and the window tell the pane.
class TextEditPane::Impl : public OS::TextEditListener, public TarnOSWindow::OSWindow_PlatformWindowListener {
public:
    Impl(TextEditPane &owner_, glogRec *glog, unsigned int flags)
        : owner(owner_)
        , textEdit(OSTextEdit::Create(WindowOf(glog), flags)) {
        if (!textEdit)
            FailMemFullError();
    }

    void TextEditListener_TextChanged() override { Tell(&TextEditPane_Listener::TextEditPane_TextChanged); }
    void TextEditListener_AutoScrolled() override { Tell(&TextEditPane_Listener::TextEditPane_Autoscrolled); }
    void PlatformWindow_Opened(TarnOSWindow::OSWindow &window) override {
        owner.SetGlog(dynamic_cast<glogRec *>(&window));
        textEdit->SetWindow(window);
    }
    void PlatformWindow_Closing(TarnOSWindow::OSWindow &) override {
        textEdit->SetWindow(OSTextEdit::Window());
        owner.SetGlog(nullptr);
    }

    TextEditPane &owner;
    boost::scoped_ptr<OSTextEdit> textEdit;
    OS::Point offset; // of the text from the box
    OS::Size size;    // of the text beyond the box

private:
    // The pane may be gone afterwards.
    void Tell(void (TextEditPane_Listener::*what)(TextEditPane &)) {
        typedef Provider<TextEditPane_Listener> PaneProvider;
        if (!owner.PaneProvider::HasDependents())
            return;
        boost::reference_wrapper<TextEditPane> const self(owner);
        Message1<TextEditPane_Listener, TextEditPane &, boost::reference_wrapper<TextEditPane>> const message(
            what, &self);
        owner.PaneProvider::BroadcastChange(message, nullptr);
    }
};

TextEditPane::TextEditPane(glogRec *owner, short id, unsigned int flags)
    : impl(new Impl(*this, owner, flags)) {
    typedef TarnOSWindow::OSWindow_PlatformWindowListener WindowListener;
    CompoundPaneInit(owner, id);
    if (owner)
        impl->WindowListener::DependUpon(owner);
    impl->OS::TextEditListener::DependUpon(impl->textEdit.get());
}

TextEditPane::~TextEditPane() {}

OSTextEdit &TextEditPane::GetTextEdit() const { return *impl->textEdit; }

void TextEditPane::BeginEditing() { impl->textEdit->Activate(); }

void TextEditPane::EndEditing() { impl->textEdit->Deactivate(); }

// The place

std::pair<OS::Point, OS::Size> TextEditPane::GetFractionalOffset() const {
    return std::make_pair(impl->offset, impl->size);
}

void TextEditPane::SetFractionalOffset(OS::Point const &offset, OS::Size const &size) {
    impl->offset = offset;
    impl->size = size;
    PanePositionChanged();
}

PlaneRect TextEditPane::GetFractionalBounds() {
    Rect const box = GetDrawRectangle();
    return PlaneRect(box.left + impl->offset.x, box.top + impl->offset.y,
                     box.right - box.left + impl->size.width, box.bottom - box.top + impl->size.height);
}

void TextEditPane::SetFractionalBounds(PlaneRect const &bounds) {
    double const left = LowEnd(bounds.origin.x, bounds.size.width);
    double const top = LowEnd(bounds.origin.y, bounds.size.height);
    double const width = HighEnd(bounds.origin.x, bounds.size.width) - left;
    double const height = HighEnd(bounds.origin.y, bounds.size.height) - top;
    impl->offset = OS::Point(bounds.origin.x - left, bounds.origin.y - top);
    impl->size = OS::Size(bounds.size.width - width, bounds.size.height - height);
    PanePositionChanged();
    Rect box{Edge(LowEnd(top, height)), Edge(LowEnd(left, width)), Edge(HighEnd(top, height)),
             Edge(HighEnd(left, width))};
    Inval();
    SetBox(&box);
    Inval();
}

void TextEditPane::PanePositionChanged() {
    CompoundPane::PanePositionChanged();
    if (GetGlog())
        impl->textEdit->SetBounds(Coordinate::PaneToWindow(*this, GetFractionalBounds()));
}

// Drawing and commands

void TextEditPane::DrawGuts(OSRgn *) { impl->textEdit->Draw(OSPort::Current()); }

bool TextEditPane::CanDoOp(CommandSpecifier const &command) { return KnowsCommand(command); }

void TextEditPane::Cut(bool &commits) {
    commits = false;
    OS::TextEditActions::Cut(*impl->textEdit);
}

void TextEditPane::Copy() { OS::TextEditActions::Copy(*impl->textEdit); }

void TextEditPane::Paste(bool &commits) {
    commits = false;
    OS::TextEditActions::Paste(*impl->textEdit);
}

bool TextEditPane::Clear(bool &commits) {
    if (!impl->textEdit->HasSelection())
        return false;
    commits = false;
    OS::TextEditActions::DeleteBackward(*impl->textEdit, OS::TextEditActions::kCharacter);
    return true;
}

void TextEditPane::SelectAll() { impl->textEdit->SelectAll(); }
