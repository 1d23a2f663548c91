// A bare text engine as a pane, which may lie between whole pixels.
//
// It has no frame, no colours and no selection of its own, and takes neither clicks nor keys by itself:
// whoever made it drives the engine.
#pragma once
#include "frame/TextEditPane_Listener.h"
#include "host/CompoundPane.h"
#include "host/Geometry.h"
#include "host/OSTextEdit.h"
#include "text/EditOpInterface.h"
#include <boost/scoped_ptr.hpp>
#include <utility>

// The order of bases is fixed.
class TextEditPane : public Provider<TextEditPane_Listener>, public CompoundPane, public EditOpInterface {
public:
    // Attaches the pane to the glog under the number; it belongs to the glog from then on. The flags are
    // those of OSTextEdit::Create. Without a glog the engine has no window yet. Calls FailMemFullError when
    // there is no engine.
    TextEditPane(glogRec *, short id, unsigned int flags);
    virtual ~TextEditPane();

    // Stays the pane's.
    OSTextEdit &GetTextEdit() const;
    // Makes the engine the one that gets the window's keys, and ends that.
    void BeginEditing();
    void EndEditing();

    // How far the text lies from the box: of its top left corner, and of its size. Setting them repaints
    // nothing.
    std::pair<OS::Point, OS::Size> GetFractionalOffset() const;
    void SetFractionalOffset(OS::Point const &, OS::Size const &);
    // Where the text lies, in the pane's coordinates. Setting it makes the box the pixels that cover it and
    // repaints the old and the new one. Width and height may be negative: the box then lies on the other side
    // of the origin.
    OS::RectBase<OS::RectTag> GetFractionalBounds();
    void SetFractionalBounds(OS::RectBase<OS::RectTag> const &);

    // CompoundPane
    void PanePositionChanged() override;

    // EditOpInterface. The flag always becomes false; Clear leaves it when nothing is selected.
    bool CanDoOp(CommandSpecifier const &) override;
    void Cut(bool &commits) override;
    void Copy() override;
    void Paste(bool &commits) override;
    bool Clear(bool &commits) override;
    void SelectAll() override;

protected:
    void DrawGuts(OSRgn *) override;

private:
    class Impl;
    boost::scoped_ptr<Impl> impl;
};
