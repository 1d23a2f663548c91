#pragma once
#include "artwork/compiler/IconFamily.h"
#include "artwork/compiler/IconRenderer.h"
#include "artwork/compiler/Theme.h"
#include "desktop/resources/AtlasFormat.h"
#include <string>
#include <vector>

// Draws all families in one theme at one scale and lays them out as AtlasFormat tells. The same sources give
// the same bytes.
class AtlasBuilder {
public:
    // scaleThousandths: 1500 for a scale of 1.5.
    AtlasBuilder(Theme const &, int scaleThousandths);

    // Families must come in the order of their numbers, each number once.
    void Add(IconFamily const &);
    // The finished file. Throws ArtworkError when it would outgrow its 32-bit offsets.
    std::vector<char> Finish();

private:
    AtlasFormat::IconRecord DrawIcon(IconRenderer const &, IconFamily::Icon const &);
    AtlasFormat::ImageRecord Store(RenderedImage const &);

    Theme const &theme;
    int scaleThousandths;
    std::vector<AtlasFormat::FamilyRecord> families;
    std::vector<AtlasFormat::IconRecord> icons; // their offsets count from the first block until Finish
    std::vector<char> blocks;
};
