// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <exception>
#include <iosfwd>
#include <map>
#include <string>
#include <typeinfo>
#include <vector>

#include "gmkernel/gmkernel.h"

namespace net {

/// How often a question was asked, and how often something came of it: a point, a curve, a number
/// other than 0, a yes.
struct Tally {
    long asked = 0;
    long answered = 0;
};

/// Takes in what operations are given and what they answer: every value goes into a 64-bit FNV-1a
/// hash by its bits, and into a readable text where one is wanted. All NaNs count as the same
/// value, since their sign and payload depend on how an expression was compiled.
class Answer {
public:
    /// `text` receives every value, doubles in hexadecimal; null for the hash alone.
    explicit Answer(std::ostream* text) : m_pText(text) {}

    /// Starts the next operation; what follows until the first question is its input.
    void Begin(std::string const& family, long index);
    /// Asks a question: a function that adds its answers here. An exception is an answer, too.
    template <class QUESTION>
    void Ask(char const* name, QUESTION&& question);

    void Add(char const* name, double value);
    void Add(char const* name, bool value);
    void Add(char const* name, int value) { Add(name, static_cast<long>(value)); }
    void Add(char const* name, long value);
    void Add(char const* name, std::string const& text);
    void Add(char const* name, GmVec const& v);
    void Add(char const* name, GmDir const& d);
    void Add(char const* name, GmAngle const& a);
    void Add(char const* name, GmMatrix const& m);
    /// With everything that its class knows of itself.
    void Add(char const* name, GmCurve const& c);
    /// Null is an answer as well.
    void Add(char const* name, GmCurve const* c);
    /// A result that the caller owns, which is deleted here.
    void AddOwned(char const* name, GmCurve* c);
    /// The points of a curve's solution list in their order.
    void AddSolutions(GmCurve const& c);
    void AddPoints(char const* name, std::vector<GmPoint> const& points);
    /// A contour's sub-contours in their order.
    void AddSubContours(GmContour const& c);

    /// Says what came of the question where its values do not; the last thing that it does.
    void Answered(bool bFound) { m_bFound = bFound; }

    std::uint64_t Hash() const { return m_nHash; }
    /// Back to the hash of nothing.
    void ResetHash();
    std::map<std::string, Tally> const& Tallies() const { return m_tallies; }

private:
    void BeginQuestion(char const* name);
    void EndQuestion();
    void Mix(void const* bytes, std::size_t count);
    void MixNumber(double value);
    void MixPoint(GmVec const& v);
    void Line(char const* name, std::string const& text);
    void Found(bool bFound) { m_bFound = m_bFound || bFound; }
    void AddFields(GmCurve const& c);
    void AddStraight(GmLine const& line);
    void AddRound(GmCircle const& circle);
    void AddHelix(GmHelix const& helix);
    void AddContour(GmContour const& contour);

    static constexpr std::uint64_t kOffsetBasis = 0xCBF29CE484222325U;

    std::ostream* m_pText;
    std::uint64_t m_nHash = kOffsetBasis;
    Tally* m_pTally = nullptr;
    bool m_bFound = false;
    std::map<std::string, Tally> m_tallies;
};

template <class QUESTION>
void Answer::Ask(char const* name, QUESTION&& question) {
    BeginQuestion(name);
    try {
        question();
    } catch (std::exception const& error) {
        Add("throws", std::string(typeid(error).name()) + ": " + error.what());
    }
    EndQuestion();
}

}  // namespace net
