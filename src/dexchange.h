#pragma once

// Umbrella header of libdexchange: every public header.

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynFormats.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "hostlibs/vynmath.h"
#include "hostlibs/winport.h"
#include "ieUtils/IEVersion.h"
