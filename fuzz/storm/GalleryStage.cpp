// A page of the gallery.
#include "fuzz/storm/OpenWindow.h"
#include "fuzz/storm/Stage.h"
#include "fuzz/storm/StormWindows.h"
#include "host/CompoundPane.h"
#include "host/glogRec.h"
#include "tools/gallery/Gallery.h"

namespace {

short const kPageList = 9000;  // the buttons of all pages
short const kPagePlace = 9001; // the container of the page

class GalleryStage : public Stage {
public:
    GalleryStage(StormDesktop &desktop_, std::string const &directory, std::string const &page_)
        : desktop(desktop_)
        , files(directory)
        , page(files.Find(page_)) {
        Open();
    }

    glogRec *Window() const override { return window.Get(); }

    void Change(Chance &) override {
        if (Window())
            gallery->ShowPage(page);
    }
    void Reopen(Chance &) override { Open(); }

    std::vector<GlogPane *> Panes() const override {
        std::vector<GlogPane *> panes;
        CompoundPane *const place =
            Window() ? dynamic_cast<CompoundPane *>(GetGlogItem(Window(), kPagePlace)) : nullptr;
        for (short i = 0; place && i < place->NumSubpanes(); ++i)
            panes.push_back(place->Get(i));
        return panes;
    }

    // The panes of a page rely on each other.
    std::vector<GlogPane *> Loose() const override { return {}; }
    GlogPane *AddPane(Chance &) override { return nullptr; }

private:
    void Open() {
        gallery = nullptr; // it stands in for the application's object, which the next one is to find
        gallery = std::make_unique<Gallery>(desktop, files, 1);
        window.Watch(gallery->Window());
        gallery->ShowPage(page);
        // Nobody leaves the page by its list.
        GetGlogItem(Window(), kPageList)->Hide();
    }

    StormDesktop &desktop;
    PageFiles files;
    std::size_t page;
    std::unique_ptr<Gallery> gallery;
    OpenWindow window;
};

} // namespace

std::unique_ptr<Stage> Stages::GalleryPage(StormDesktop &desktop, std::string const &directory,
                                           std::string const &page) {
    return std::make_unique<GalleryStage>(desktop, directory, page);
}
