// Masks for setting an entity's extents: which dimensions of a given block to leave as they are.
#pragma once

struct ZyrExtentsOptions {
    static constexpr int sAcceptAll = 0;
    static constexpr int sIgnoreX = 1;
    static constexpr int sIgnoreY = 2;
    static constexpr int sIgnoreZ = 4;
};
