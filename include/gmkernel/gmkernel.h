// SPDX-License-Identifier: MIT
/// @file
/// The whole public interface of gmkernel in one include.
#ifndef GMKERNEL_GMKERNEL_H
#define GMKERNEL_GMKERNEL_H

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmApprDepData.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmBase.h"
#include "gmkernel/GmBeam.h"
#include "gmkernel/GmCircle.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmHelix.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmPoint.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmRotary.h"
#include "gmkernel/GmStretch.h"
#include "gmkernel/GmVec.h"
#include "gmkernel/KxArray.h"
#include "gmkernel/export.h"

#endif  // GMKERNEL_GMKERNEL_H
