// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "Answer.h"
#include "Dice.h"

namespace net {

/// One operation of each family: draws its input and adds it and all answers.
void AskValues(Dice& dice, Answer& answer);
void AskLines(Dice& dice, Answer& answer);
void AskCircles(Dice& dice, Answer& answer);
void AskRects(Dice& dice, Answer& answer);
void AskTangents(Dice& dice, Answer& answer);
void AskPairs(Dice& dice, Answer& answer);
void AskContours(Dice& dice, Answer& answer);
void AskBuilding(Dice& dice, Answer& answer);
void AskSplitting(Dice& dice, Answer& answer);
void AskCorners(Dice& dice, Answer& answer);
void AskLeads(Dice& dice, Answer& answer);
void AskOffsets(Dice& dice, Answer& answer);
void AskPlates(Dice& dice, Answer& answer);
void AskFaulty(Dice& dice, Answer& answer);
void AskTorn(Dice& dice, Answer& answer);
void AskAlongAxes(Dice& dice, Answer& answer);
void AskLarge(Dice& dice, Answer& answer);
void AskVarParallels(Dice& dice, Answer& answer);
void AskMelts(Dice& dice, Answer& answer);

/// The questions that every curve answers.
void AskCurve(Dice& dice, Answer& answer, GmCurve& curve);

/// Operations that are drawn and asked in one way, how many of them, and by how many they are
/// hashed together.
struct Family {
    char const* name;
    long operations;
    long block;
    void (*ask)(Dice&, Answer&);
};

std::vector<Family> const& Families();

}  // namespace net
