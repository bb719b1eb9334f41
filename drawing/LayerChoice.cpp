// SPDX-License-Identifier: MIT
#include "drawing/LayerChoice.h"

#include <fnmatch.h>

#include <algorithm>
#include <utility>

namespace gmdrawing {

bool fitsAny(const std::vector<std::string>& patterns, const std::string& layer) {
    return std::any_of(patterns.begin(), patterns.end(), [&](const std::string& pattern) {
        return fnmatch(pattern.c_str(), layer.c_str(), FNM_CASEFOLD) == 0;
    });
}

LayerChoice::LayerChoice(LayerPatterns patterns, HiddenLayers hidden)
    : m_patterns(std::move(patterns)), m_hidden(std::move(hidden)) {}

std::string LayerChoice::reasonAgainst(const std::string& layer) const {
    const std::vector<std::string>& wanted = m_patterns.wanted;
    if (!wanted.empty() && !fitsAny(wanted, layer)) return "its layer is not wanted";
    if (fitsAny(m_patterns.unwanted, layer)) return "its layer is not wanted";
    const auto hidden = m_hidden.find(layer);
    const bool isNamed = std::find(wanted.begin(), wanted.end(), layer) != wanted.end();
    return hidden == m_hidden.end() || isNamed ? std::string() : hidden->second;
}

bool LayerChoice::isFrozen(const std::string& layer) const {
    return reasonAgainst(layer) == kFrozenLayer;
}

}  // namespace gmdrawing
