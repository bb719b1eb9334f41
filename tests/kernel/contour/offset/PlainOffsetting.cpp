// SPDX-License-Identifier: MIT
#include "tests/kernel/contour/offset/PlainOffsetting.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/offset/BandPieces.h"
#include "kernel/contour/offset/ResultContour.h"
#include "kernel/curves/dispatch/Distance.h"

namespace {

using Pieces = std::vector<GmOffsetElement>;
using Points = std::vector<GmPoint>;

GmPoint Middle(GmCurve const& curve) {
    if (curve.IsArc()) return static_cast<GmArc const&>(curve).HP();
    return static_cast<GmStretch const&>(curve).HP();
}

Pieces Split(GmOffsetElement piece, Points points) {
    Pieces parts;
    std::stable_sort(points.begin(), points.end(), less_than_curve(&piece.curve()));
    for (GmPoint const& p : points) {
        if (p == piece.curve().SP() || p == piece.curve().EP()) continue;
        parts.push_back(piece);
        parts.back().curve().SetEP(p);
        piece.curve().SetSP(p);
    }
    parts.push_back(piece);
    return parts;
}

void Insert(Pieces& active, GmOffsetElement const& added) {
    Pieces cut;
    Points all;
    for (GmOffsetElement const& old : active) {
        Points points;
        ::Intersection(added.curve(), old.curve(), points);
        all.insert(all.end(), points.begin(), points.end());
        for (GmOffsetElement const& part : Split(old, points))
            cut.push_back(part);
    }
    for (GmOffsetElement const& part : Split(added, all))
        cut.push_back(part);
    active.swap(cut);
}

bool ComesTooNear(GmOffsetElement const& piece, GmContour const& span, double d) {
    double nearest = std::numeric_limits<double>::max();
    for (int i = 0; i < span.ElementCount(); ++i) {
        nearest = std::min(nearest, Distance(Middle(piece.curve()), *span.GetElement(i)));
    }
    return nearest < std::fabs(std::fabs(d) - GmBase::m_scdPrecCalc);
}

GmOffsetElement Take(Pieces& pieces, size_t i) {
    const GmOffsetElement taken(pieces[i]);
    pieces.erase(pieces.begin() + static_cast<long>(i));
    return taken;
}

std::vector<size_t> StartingAt(Pieces const& pieces, GmPoint const& p) {
    std::vector<size_t> found;
    for (size_t i = 0; i < pieces.size(); ++i) {
        if (pieces[i].curve().SP().Dist(p) < 3.0 * GmBase::m_scdPrec) found.push_back(i);
    }
    return found;
}

Pieces TakeChain(Pieces& pieces) {
    size_t first = 0;
    for (size_t i = 1; i < pieces.size(); ++i) {
        if (pieces[i].id() < pieces[first].id()) first = i;
    }
    Pieces chain{Take(pieces, first)};
    for (size_t i = 0; i < pieces.size();) {
        const bool joins =
            pieces[i].id() == chain[0].id() && pieces[i].curve().EP() == chain[0].curve().SP();
        if (joins) {
            chain.insert(chain.begin(), Take(pieces, i));
        } else {
            ++i;
        }
    }
    while (true) {
        const std::vector<size_t> candidates = StartingAt(pieces, chain.back().curve().EP());
        if (candidates.empty()) break;
        size_t next = candidates[0];
        for (auto c = candidates.rbegin(); candidates.size() > 1 && c != candidates.rend(); ++c) {
            if (!StartingAt(pieces, pieces[*c].curve().EP()).empty()) next = *c;
        }
        chain.push_back(Take(pieces, next));
    }
    return chain;
}

/// The pieces of the kept side that keep their distance, in the order in which they leave the span.
Pieces Sweep(GmContour const& source, double d, int span) {
    Pieces active;
    Pieces final;
    GmContour recent;
    for (int i = 0; i < source.ElementCount(); ++i) {
        GmContElement const& record = *source.GetContElement(i);
        recent.AddElement(record.pCurve, false, 0);
        if (i >= span) recent.RemoveElement(0);
        const int id = static_cast<int>(record.lId);
        for (GmOffsetElement const& piece : gmkernel_detail::bandPieces(*record.pCurve, i, id, d))
            Insert(active, piece);
        Pieces staying;
        for (GmOffsetElement const& piece : active) {
            if (ComesTooNear(piece, recent, d)) continue;
            (piece.source() > i - span + 1 ? staying : final).push_back(piece);
        }
        active.swap(staying);
    }
    final.insert(final.end(), active.begin(), active.end());
    const auto dropped = [](GmOffsetElement const& piece) { return !piece.kept(); };
    final.erase(std::remove_if(final.begin(), final.end(), dropped), final.end());
    return final;
}

}  // namespace

std::vector<std::unique_ptr<GmContour>> PlainOffsetting(GmContour& source, double d, int nSpan,
                                                        bool bKeepOpen) {
    const GmBase::eRotDir sense = source.Dir(GmPoint(0, 0, 0));
    const bool inside = (sense == GmBase::eRotCW && d > 0) || (sense == GmBase::eRotCCW && d < 0);
    const bool insideOnly = source.IsClosed() && !bKeepOpen && inside;
    Pieces pieces = Sweep(source, d, insideOnly ? 1000000 : nSpan);
    std::vector<std::unique_ptr<GmContour>> results;
    while (!pieces.empty()) {
        Pieces chain = TakeChain(pieces);
        const auto tooShort = [](GmOffsetElement const& p) { return p.curve().Length() < 0.001; };
        chain.erase(std::remove_if(chain.begin(), chain.end(), tooShort), chain.end());
        const bool hasOffset =
            std::any_of(chain.begin(), chain.end(), [](auto const& p) { return !p.auxiliary(); });
        auto contour = gmkernel_detail::resultContour(std::move(chain));
        const bool dropped = insideOnly && !contour->IsClosed();
        if (hasOffset && !dropped) results.push_back(std::move(contour));
    }
    return results;
}
