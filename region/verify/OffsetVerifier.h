// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <vector>

#include "gmregion/Offset.h"
#include "region/verify/Alongside.h"
#include "region/verify/Cuts.h"
#include "region/verify/FaultList.h"

namespace gmregion {

/// Checks an offset against its source, both as plain loops.
class OffsetVerifier {
public:
    /// @param distance positive outward
    /// @param tolerance in length units, positive
    void verify(const LoopsView& source, double distance, const LoopsView& result,
                const OffsetOptions& options, double tolerance, FaultList& faults);

private:
    /// What a piece of the source, and its start, ask for.
    struct Feature {
        std::optional<Carrier> wanted;  ///< the parallel at the distance
        Vec2 startNormal, endNormal;    ///< of length 1, to the left
        Index before = 0;               ///< the piece that ends at its start
        Index after = 0;                ///< the piece that starts at its end
        bool opens = false;       ///< whether the corner at its start opens to the distance's side
        int found = 0;            ///< how many pieces of the result run along the parallel
        Vec2 foundFrom, foundTo;  ///< the ends of the last one
        bool arcFound = false;    ///< whether one runs along the whole arc about the start
    };
    /// What is known of a piece of the result.
    struct State {
        bool covered = false;   ///< lies on a wanted curve over its whole length
        bool doubtful = false;  ///< comes too near to something, maybe
    };

    void makeFeatures();
    void linkFeatures();
    void probe(std::size_t piece, std::size_t feature, const Probe& p);
    bool staysAway(const BoundaryPiece& piece, const BoundaryPiece& s, const Feature& f,
                   const Probe& p) const;
    bool isClear(const Element& part, const Carrier& carrier, const BoundaryPiece& s,
                 const Feature& f, const Probe& p, int halvings) const;
    bool isBeyond(const BoundaryPiece& s, const Probe& p) const;
    bool isBeside(const BoundaryPiece& s, const Feature& f, const Probe& p) const;
    bool runsAlong(const BoundaryPiece& s, Feature& f, const Probe& p) const;
    bool runsAbout(const BoundaryPiece& s, Feature& f, const Probe& p) const;
    void probeAll();
    void judge(std::size_t number);
    void judgePart(const BoundaryPiece& piece, Vec2 from, Vec2 q, Vec2 to);
    bool isCutOff(const BoundaryIndex::Near& near) const;
    bool isCutOff(Index feature) const;
    void findMissing();
    void findMissing(Index feature);
    void findMissingOnParallel(Index feature);
    bool isHidden(const Element& e, const Carrier& c, Index by) const;
    void findMissing(const Element& wanted, Index feature, int halvings);
    void cutMissing(const Element& wanted, Index feature);
    bool isMissing(Vec2 q, Vec2 outward, Index feature);

    double m_distance = 0.0;
    double m_radius = 0.0;  ///< the distance without its sign
    double m_margin = 0.0;  ///< how far the result may be beside the true one
    double m_tolerance = 0.0;
    OffsetOptions m_options;
    BoundaryIndex m_source;
    BoundaryIndex m_result;
    std::vector<Feature> m_features;  ///< one a piece of the source
    std::vector<State> m_states;      ///< one a piece of the result
    Cuts m_cuts;
    FaultList* m_faults = nullptr;
    Index m_guess = kNone;  ///< the piece of the source that was near last
};

}  // namespace gmregion
