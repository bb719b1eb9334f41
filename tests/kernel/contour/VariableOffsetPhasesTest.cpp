// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <unistd.h>

#include <memory>
#include <string>
#include <vector>

#include "kernel/contour/variable_offset/ShiftedElements.h"
#include "tests/support/Contours.h"

/// The phases of variable parallels: moved elements, then the gaps between them.
namespace {

using namespace gmkernel_detail;

/// Curves one after another that need not meet, each in words as a path of its own.
using Words = std::vector<std::string>;

void fill(CurveList& curves, Words const& words) {
    for (std::string const& path : words)
        curves.Add(std::unique_ptr<GmCurve>(shapes::Path(path).GetElement(0)->Clone()));
}

void expectCurves(CurveList const& curves, Words const& words) {
    CurveList expected;
    fill(expected, words);
    ASSERT_EQ(curves.Count(), expected.Count());
    for (int i = 0; i < curves.Count(); ++i) {
        EXPECT_EQ(curves[i].IsArc(), expected[i].IsArc()) << i;
        EXPECT_EQ(curves[i].SP(), expected[i].SP()) << i;
        EXPECT_EQ(curves[i].EP(), expected[i].EP()) << i;
    }
}

/// Ends the process, by a signal when the gaps are not closed in time: behind a bridge that leaves
/// its gap open there would come another one for ever.
[[noreturn]] void closeGapsInTime(CurveList& curves, bool closed) {
    constexpr unsigned kSeconds = 3;
    alarm(kSeconds);
    closeGaps(curves, closed);
    _exit(0);
}

}  // namespace

TEST(VariableOffsetPhases, ElementsMoveByTheQuadrantOfTheirDirection) {
    struct {
        char const* element;
        char const* moved;
    } const rows[] = {
        {"0 0  4 2", "1 -2  5 0"},
        {"0 0  -4 2", "1 2  -3 4"},
        {"0 0  -4 -2", "-1 2  -5 0"},
        {"0 0  4 -2", "-1 -2  3 -4"},
        {"0 0  4 0", "-1 -2  3 -2"},
        {"0 0  0 4", "1 2  1 6"},
        {"0 0  -4 0", "1 2  -3 2"},
        {"0 0  0 -4", "-1 -2  -1 -6"},
        {"4 0  ccw 0 0 0 4", "5 2  ccw 1 2 1 6"},
    };
    for (auto const& row : rows) {
        SCOPED_TRACE(row.element);
        CurveList curves;
        shiftElements(shapes::Path(row.element), GmVec(1, 2, 0), curves);
        expectCurves(curves, {row.moved});
    }
}

TEST(VariableOffsetPhases, GapsAreTrimmedOrBridged) {
    struct {
        char const* name;
        bool closed;
        Words curves, expected;
    } const rows[] = {
        {"a joint", false, {"0 0  9 0", "9 0  9 9"}, {"0 0  9 0", "9 0  9 9"}},
        {"a crossing", false, {"0 0  10 0", "9 -1  9 9"}, {"0 0  9 0", "9 0  9 9"}},
        {"a gap", false, {"0 0  9 0", "10 1  10 9"}, {"0 0  9 0", "9 0  10 1", "10 1  10 9"}},
        {"a gap behind an arc",
         false,
         {"0 0  ccw 0 5 5 5", "6 6  6 9"},
         {"0 0  ccw 0 5 5 5", "5 5  6 6", "6 6  6 9"}},
        {"two gaps and a crossing",
         false,
         {"0 0  9 0", "10 1  10 9", "9 10  5 10", "6 11  6 0"},
         {"0 0  9 0", "9 0  10 1", "10 1  10 9", "10 9  9 10", "9 10  6 10", "6 10  6 0"}},
        {"the ends of an open chain", false, {"0 0  9 0", "9 0  0 9"}, {"0 0  9 0", "9 0  0 9"}},
        {"a gap from the last to the first",
         true,
         {"1 0  9 0", "9 0  0 9", "0 9  0 1"},
         {"0 1  1 0", "1 0  9 0", "9 0  0 9", "0 9  0 1"}},
        {"a crossing of the last with the first",
         true,
         {"-1 0  9 0", "9 0  0 9", "0 9  0 -1"},
         {"0 0  9 0", "9 0  0 9", "0 9  0 0"}},
        {"gaps all round",
         true,
         {"1 0  8 0", "9 1  9 9", "8 9  0 1"},
         {"0 1  1 0", "1 0  8 0", "8 0  9 1", "9 1  9 9", "9 9  8 9", "8 9  0 1"}},
    };
    for (auto const& row : rows) {
        SCOPED_TRACE(row.name);
        CurveList curves;
        fill(curves, row.curves);
        ASSERT_EXIT(closeGapsInTime(curves, row.closed), testing::ExitedWithCode(0), "");
        closeGaps(curves, row.closed);
        expectCurves(curves, row.expected);
    }
}

TEST(VariableOffsetPhases, WhatEndsWhereItStartsIsRemoved) {
    CurveList curves;
    fill(curves, {"0 0  9 0", "9 0  9 9", "9 9  0 0", "0 0  5 5"});
    for (int const i : {0, 2, 3})
        curves[i].SetEP(curves[i].SP());
    removeCollapsed(curves);
    expectCurves(curves, {"9 0  9 9"});
}
