#pragma once
#include <utility>
#include <boost/optional.hpp>
#include <boost/shared_ptr.hpp>
#include "frame/Provider.h"
#include "host/Geometry.h"
#include "host/OSWindow.h"
#include "host/RGBColor.h"
#include "host/TextSettings.h"
#include "host/TextStyle.h"
#include "host/UString.h"
class EventRecordAdapter;
class OSPort;
class OSTextEdit;

namespace OS {

class TextEditListener : public Dependent<TextEditListener> {
public:
    virtual void TextEditListener_TextChanged() {}
    virtual void TextEditListener_AutoScrolled() {}
};

class TextEditAction;

class TextEditClient {
public:
    enum DispatchPath { kPlatformPath = 0, kOwnPath = 2 };
    virtual ~TextEditClient() {}
    virtual DispatchPath TextEditClient_HandleEvent(OSTextEdit &, EventRecordAdapter *) { return kPlatformPath; }
    virtual DispatchPath TextEditClient_HandleTextEntry(OSTextEdit &, EventRecordAdapter *, UString const &) { return kPlatformPath; }
    virtual DispatchPath TextEditClient_HandleTextAction(OSTextEdit &, EventRecordAdapter *, TextEditAction const &) { return kPlatformPath; }
};

class TextEditLayoutInfo {
public:
    virtual ~TextEditLayoutInfo() {}
    virtual unsigned int GetCharacterIndexForPoint(Point const &) const = 0;
};

namespace TextEditActions {
enum Magnitude { kCharacter = 0 };
void Cut(OSTextEdit &);
void Copy(OSTextEdit &);
void Paste(OSTextEdit &);
void DeleteBackward(OSTextEdit &, Magnitude);
}

}

class OSTextEdit : public Provider<OS::TextEditListener> {
public:
    typedef boost::optional<TarnOSWindow::OSWindow &> Window;

    static OSTextEdit *Create(Window, unsigned int flags);
    virtual ~OSTextEdit() {}

    virtual void SetWindow(Window) = 0;
    virtual void SetBounds(OS::RectBase<OS::RectTag> const &) = 0;
    virtual OS::RectBase<OS::RectTag> GetBounds() const = 0;
    virtual void SetClient(boost::shared_ptr<OS::TextEditClient>) = 0;
    virtual OS::TextEditLayoutInfo const &GetLayoutInfo() const = 0;

    virtual void SetText(UString const &) = 0;
    virtual UString GetText() const = 0;
    virtual void Activate() = 0;
    virtual void Deactivate() = 0;
    virtual bool IsActive() const = 0;
    virtual void SetAlignment(TextSettings::Alignment) = 0;
    virtual void SetBaselineOffset(int) = 0;

    virtual void GetStyle(unsigned int mask, OS::TextStyle &) const = 0;
    virtual void SetStyle(unsigned int mask, OS::TextStyle const &) = 0;
    virtual unsigned int GetNumberStyleRuns() const = 0;
    virtual void GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end, OS::TextStyle &) const = 0;
    virtual void SetBackgroundColor(RGBColor const &) = 0;
    virtual void SetDefaultColors(OS::RGBAColor const &text, OS::RGBAColor const &selection) = 0;
    virtual void DrawBackgroundWhenNotSelected(bool) = 0;

    virtual bool HasSelection() const = 0;
    virtual void SelectAll() = 0;
    virtual void DeselectAll() = 0;
    virtual void SetSelection(unsigned int start, unsigned int end) = 0;
    virtual void GetSelection(unsigned int &start, unsigned int &end) const = 0;
    virtual boost::optional<std::pair<unsigned int, unsigned int> > GetMarkedRange() const = 0;

    virtual int GetScrollDelta() const = 0;
    virtual int GetCurrentScrolledOffset() const = 0;
    virtual int GetTextHeight() const = 0;
    virtual void SetVScrollPos(int, int) = 0;
    virtual void VScrollToCharacterPosition(unsigned int) = 0;
    virtual void SetAutoScroll(bool) = 0;

    virtual bool HandleEvent(EventRecordAdapter *) = 0;
    virtual void Draw(OSPort &) = 0;
};
