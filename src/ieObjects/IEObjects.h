#pragma once

// The survey objects of a dataset, in one include: the common base DexObject (IEObjectBase.h), design,
// point-to-line and sheet points (IEPoints.h), polylines, areas and breaklines (IEPolyLines.h), arcs
// and circles (IEArcs.h), text labels (IETextLabel.h) and named object lists (IEObjectList.h). The
// object kinds are in IEObjectsType.h.

#include "ieObjects/IEArcs.h"
#include "ieObjects/IEObjectBase.h"
#include "ieObjects/IEObjectList.h"
#include "ieObjects/IEObjectsType.h"
#include "ieObjects/IEPoints.h"
#include "ieObjects/IEPolyLines.h"
#include "ieObjects/IETextLabel.h"
