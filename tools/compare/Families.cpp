// SPDX-License-Identifier: MIT
#include "Families.h"

namespace net {

std::vector<Family> const& Families() {
    constexpr long kBlock = 500;
    constexpr long kFewer = 100;
    static const std::vector<Family> families{
        {"values", 12000, kBlock, AskValues},
        {"lines", 14000, kBlock, AskLines},
        {"circles", 16000, kBlock, AskCircles},
        {"rects", 6000, kBlock, AskRects},
        {"tangents", 16000, kBlock, AskTangents},
        {"pairs", 26000, kBlock, AskPairs},
        {"contours", 16000, kBlock, AskContours},
        {"building", 10000, kBlock, AskBuilding},
        {"splitting", 14000, kBlock, AskSplitting},
        {"corners", 14000, kBlock, AskCorners},
        {"leads", 10000, kBlock, AskLeads},
        {"offsets", 12000, kFewer, AskOffsets},
        {"plates", 10000, kFewer, AskPlates},
        {"faulty", 8000, kFewer, AskFaulty},
        {"torn", 6000, kFewer, AskTorn},
        {"axes", 6000, kFewer, AskAlongAxes},
        {"large", 1000, 20, AskLarge},
        {"varparallels", 8000, kFewer, AskVarParallels},
        {"melts", 7000, kFewer, AskMelts},
    };
    return families;
}

}  // namespace net
