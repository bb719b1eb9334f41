// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>
#include <vector>

namespace gmdrawing {

/// Why nothing of a layer is made, as the drawing says: "its layer is off" and the like.
using HiddenLayers = std::map<std::string, std::string>;

/// The reason that hides more than the others.
constexpr const char* kFrozenLayer = "its layer is frozen";

/// The layers that whoever reads a drawing wants. Patterns have * for any text and ? for any
/// character; upper and lower case letters of ASCII are the same.
struct LayerPatterns {
    std::vector<std::string> wanted;    ///< none for all
    std::vector<std::string> unwanted;  ///< of the wanted ones
};

/// Whether one of the patterns fits the layer.
bool fitsAny(const std::vector<std::string>& patterns, const std::string& layer);

/// Decides which layers are read.
class LayerChoice {
public:
    LayerChoice() = default;
    LayerChoice(LayerPatterns patterns, HiddenLayers hidden);

    /// Why the layer is left out, empty for one that is read. Layers that are named without
    /// wildcards are read even where the drawing hides them.
    std::string reasonAgainst(const std::string& layer) const;

    /// Whether the layer is left out as frozen, which hides all of a block that is placed on it.
    bool isFrozen(const std::string& layer) const;

private:
    LayerPatterns m_patterns;
    HiddenLayers m_hidden;
};

}  // namespace gmdrawing
