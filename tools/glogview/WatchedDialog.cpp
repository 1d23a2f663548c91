#include "tools/glogview/WatchedDialog.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/Utf8.h"
#include "host/glogRec.h"
#include "tools/glogview/ErrorBanner.h"

WatchedDialog::WatchedDialog(std::string const &path_)
    : path(path_)
    , file(path_)
    , shown(LoadGlog(path_)) {
    ShowGlog(shown, kShowGlog);
}

void WatchedDialog::Follow() {
    if (!file.HasChanged())
        return;
    try {
        shown = ReloadGlog(shown, path);
        banner = nullptr; // went with its glog
    } catch (LoadError const &error) {
        ShowError(error.what());
    }
}

void WatchedDialog::ShowError(std::string const &text) {
    if (banner)
        banner->SetText(Utf8::ToUString(text));
    else
        banner = ErrorBanner::NewErrorBanner(shown, Utf8::ToUString(text));
}
