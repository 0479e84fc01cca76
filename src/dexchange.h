#pragma once

// Umbrella header of libdexchange: every public header.

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynFormats.h"
#include "hostlibs/VynLibrary.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynThread.h"
#include "hostlibs/VynTime.h"
#include "hostlibs/VynUi.h"
#include "hostlibs/vynmath.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsUnitWords.h"
#include "ieUtils/IEUtilsUnits.h"
#include "ieUtils/IEVersion.h"
